//===- SmbiosTable.cpp - Walking the structures of an SMBIOS table --------===//

#include "live/SmbiosTable.h"

#include "live/LittleEndian.h"

#include <cstdio>

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::size_t HeaderLength = 4;
constexpr std::uint8_t EndOfTable = 127;

std::string hex(std::size_t value, int digits) {
  char text[24];
  std::snprintf(text, sizeof text, "0x%0*zx", digits, value);
  return text;
}

std::string at(std::size_t offset) { return " at offset " + hex(offset, 4); }

/// Where the string set that starts at \p start ends (one past its closing
/// empty string), with its strings; nullopt when the table ends first.
std::optional<std::size_t> readStrings(std::string_view table,
                                       std::size_t start,
                                       std::vector<std::string_view> &strings) {
  // A structure without strings still ends with two zero bytes.
  if (start + 1 < table.size() && table[start] == '\0' &&
      table[start + 1] == '\0')
    return start + 2;
  std::size_t position = start;
  while (position < table.size()) {
    const std::size_t zero = table.find('\0', position);
    if (zero == std::string_view::npos)
      return std::nullopt;
    strings.push_back(table.substr(position, zero - position));
    position = zero + 1;
    if (position < table.size() && table[position] == '\0')
      return position + 1;
  }
  return std::nullopt;
}

} // namespace

std::optional<std::uint8_t>
SmbiosStructure::byteField(std::size_t field) const {
  if (field + 1 > formatted.size())
    return std::nullopt;
  return byteAt(formatted, field);
}

std::optional<std::uint16_t>
SmbiosStructure::wordField(std::size_t field) const {
  if (field + 2 > formatted.size())
    return std::nullopt;
  return wordAt(formatted, field);
}

std::optional<std::uint32_t>
SmbiosStructure::dwordField(std::size_t field) const {
  if (field + 4 > formatted.size())
    return std::nullopt;
  return dwordAt(formatted, field);
}

std::string SmbiosStructure::label() const {
  return "type " + std::to_string(type) + ", handle " + hex(handle, 4);
}

SmbiosTableWalk walkSmbiosTable(std::string_view table,
                                std::optional<unsigned> announcedCount) {
  SmbiosTableWalk walk;
  std::size_t offset = 0;
  const auto ignoringTheRest = "; the rest of the table is ignored";
  for (;;) {
    if (announcedCount && walk.structures.size() >= *announcedCount)
      break;
    if (offset == table.size()) {
      if (announcedCount)
        walk.problems.push_back("the entry point announces " +
                                std::to_string(*announcedCount) +
                                " structures, but the table ends after " +
                                std::to_string(walk.structures.size()));
      break;
    }
    if (table.size() - offset < HeaderLength) {
      walk.problems.push_back("the table ends in the middle of a structure "
                              "header" +
                              at(offset));
      break;
    }
    SmbiosStructure structure;
    structure.type = byteAt(table, offset);
    structure.handle = wordAt(table, offset + 2);
    structure.offset = offset;
    const std::size_t length = byteAt(table, offset + 1);
    if (length < HeaderLength) {
      walk.problems.push_back("the structure" + at(offset) + " (" +
                              structure.label() + ") gives its length as " +
                              std::to_string(length) +
                              ", shorter than its header" + ignoringTheRest);
      break;
    }
    if (length > table.size() - offset) {
      walk.problems.push_back("the structure" + at(offset) + " (" +
                              structure.label() + ") is " +
                              std::to_string(length) +
                              " bytes long and runs past the end of the "
                              "table" +
                              ignoringTheRest);
      break;
    }
    structure.formatted = table.substr(offset, length);
    std::optional<std::size_t> end =
        readStrings(table, offset + length, structure.strings);
    const bool unterminated = !end;
    walk.structures.push_back(std::move(structure));
    if (unterminated) {
      walk.problems.push_back("the strings of the structure" + at(offset) +
                              " (" + walk.structures.back().label() +
                              ") run past the end of the table" +
                              ignoringTheRest);
      break;
    }
    if (walk.structures.back().type == EndOfTable)
      break;
    offset = *end;
  }
  return walk;
}

} // namespace live
} // namespace detail
} // namespace HX
