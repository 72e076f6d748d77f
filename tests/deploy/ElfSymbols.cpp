#include "ElfSymbols.h"

#include <elf.h>

#include <cstring>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace tvr::test {

namespace {

template <typename T>
T readAt(const std::string& image, std::size_t offset, const std::string& path) {
  if (offset > image.size() || image.size() - offset < sizeof(T))
    throw std::runtime_error(path + ": truncated ELF file");
  T value;
  std::memcpy(&value, image.data() + offset, sizeof(T));
  return value;
}

} // namespace

std::vector<std::string> exportedFunctions(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  if (!in) throw std::runtime_error("cannot read " + path);
  const std::string image((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());

  const auto header = readAt<Elf64_Ehdr>(image, 0, path);
  if (std::memcmp(header.e_ident, ELFMAG, SELFMAG) != 0 || header.e_ident[EI_CLASS] != ELFCLASS64)
    throw std::runtime_error(path + ": not a 64-bit ELF file");

  std::vector<Elf64_Shdr> sections;
  for (unsigned i = 0; i < header.e_shnum; ++i)
    sections.push_back(readAt<Elf64_Shdr>(image, header.e_shoff + std::size_t{i} * header.e_shentsize, path));

  std::vector<std::string> names;
  for (const Elf64_Shdr& section : sections) {
    if (section.sh_type != SHT_DYNSYM) continue;
    if (section.sh_link >= sections.size() || section.sh_entsize == 0)
      throw std::runtime_error(path + ": malformed dynamic symbol table");
    const Elf64_Shdr& strings = sections[section.sh_link];
    if (strings.sh_offset > image.size() || image.size() - strings.sh_offset < strings.sh_size)
      throw std::runtime_error(path + ": truncated string table");
    for (std::size_t offset = 0; offset + section.sh_entsize <= section.sh_size; offset += section.sh_entsize) {
      const auto symbol = readAt<Elf64_Sym>(image, section.sh_offset + offset, path);
      const unsigned binding = ELF64_ST_BIND(symbol.st_info);
      const unsigned visibility = ELF64_ST_VISIBILITY(symbol.st_other);
      if (ELF64_ST_TYPE(symbol.st_info) != STT_FUNC || symbol.st_shndx == SHN_UNDEF) continue;
      if (binding != STB_GLOBAL && binding != STB_WEAK) continue;
      if (visibility != STV_DEFAULT && visibility != STV_PROTECTED) continue;
      if (symbol.st_name >= strings.sh_size) throw std::runtime_error(path + ": symbol name out of range");
      const char* name = image.data() + strings.sh_offset + symbol.st_name;
      names.emplace_back(name, strnlen(name, strings.sh_size - symbol.st_name));
    }
  }
  return names;
}

} // namespace tvr::test
