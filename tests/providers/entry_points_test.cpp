// The provider library as an object manager finds it: the entry points its
// dynamic symbol table exports, and the registration that names them.
//
// The library holds seventeen providers: six instance providers with one
// entry point each, and eleven that are instance and association providers
// with two. It exports exactly these twenty-eight entry points, under their
// plain (undecorated) names, and each provider is registered for its class
// with the kinds of MI it has.
#include "ProviderHarness.h"

#include "tvr/broker/Registration.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <elf.h>

#include <cstddef>
#include <cstring>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <vector>

namespace tvr::test {
namespace {

using ::testing::IsEmpty;

const char* const kLibraryLocation = "tvrkvphysicalassetprofileprovider";

/// One provider of the library: the name its entry points begin with, the
/// class it is registered for, and whether it is an association provider.
struct Provider {
  const char* name;
  const char* className;
  bool association;
};

const Provider kProviders[] = {
    {"ChassisProvider", "TVRHX_Chassis", false},
    {"SlotProvider", "TVRHX_Slot", false},
    {"NetworkCardProvider", "TVRHX_NetworkCard", false},
    {"DiskControllerProvider", "TVRHX_DiskController", false},
    {"SASPortControllerProvider", "TVRHX_SASPortController", false},
    {"ConnectorProvider", "TVRHX_Connector", false},
    {"PackageInSlotProvider", "TVRHX_PackageInSlot", true},
    {"SlotOnChassisProvider", "TVRHX_SlotOnChassis", true},
    {"ConnectorOnPackageProvider", "TVRHX_ConnectorOnPackage", true},
    {"ConnectedToProvider", "TVRHX_ConnectedTo", true},
    {"UnitaryComputerSystemPackageProvider", "TVRHX_UnitaryComputerSystemPackage", true},
    {"CardComputerSystemPackageProvider", "TVRHX_CardCSPackage", true},
    {"NetPortRealizesNetCardProvider", "TVRHX_NPRealizesNC", true},
    {"DiskControllerCSPackageProvider", "TVRHX_DiskControllerCSPackage", true},
    {"ChipSystemPackagingProvider", "TVRHX_ChipSystemPackaging", true},
    {"SASPortRealizesDiskProvider", "TVRHX_SASPortRealizesDisk", true},
    {"IDEDiskRealizesIDEChipCtlrProvider", "TVRHX_ICRealizesChip", true},
};

std::set<std::string> expectedEntryPoints() {
  std::set<std::string> names;
  for (const Provider& p : kProviders) {
    names.insert(std::string(p.name) + "_Create_InstanceMI");
    if (p.association) names.insert(std::string(p.name) + "_Create_AssociationMI");
  }
  return names;
}

std::string libraryFile() { return providerDirectory() + "/lib" + kLibraryLocation + ".so"; }

/// A defined symbol of a shared object's dynamic symbol table.
struct ExportedSymbol {
  std::string name;
  bool function;
};

/// Reads the defined global and weak symbols of a 64-bit ELF shared object's
/// dynamic symbol table (what the dynamic linker, and so dlsym, can find).
/// Fails the test and returns nothing when the file is not such an object.
std::vector<ExportedSymbol> exportedSymbols(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  const std::string image((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  std::vector<ExportedSymbol> out;
  if (image.size() < sizeof(Elf64_Ehdr)) {
    ADD_FAILURE() << "cannot read " << path;
    return out;
  }
  const auto* header = reinterpret_cast<const Elf64_Ehdr*>(image.data());
  if (std::memcmp(header->e_ident, ELFMAG, SELFMAG) != 0 || header->e_ident[EI_CLASS] != ELFCLASS64) {
    ADD_FAILURE() << path << " is no 64-bit ELF object";
    return out;
  }
  const auto* sections = reinterpret_cast<const Elf64_Shdr*>(image.data() + header->e_shoff);
  for (unsigned i = 0; i < header->e_shnum; ++i) {
    if (sections[i].sh_type != SHT_DYNSYM) continue;
    const Elf64_Shdr& strings = sections[sections[i].sh_link];
    const auto* symbols = reinterpret_cast<const Elf64_Sym*>(image.data() + sections[i].sh_offset);
    const std::size_t count = sections[i].sh_size / sizeof(Elf64_Sym);
    for (std::size_t s = 1; s < count; ++s) {
      const Elf64_Sym& symbol = symbols[s];
      const unsigned binding = ELF64_ST_BIND(symbol.st_info);
      if (symbol.st_shndx == SHN_UNDEF || (binding != STB_GLOBAL && binding != STB_WEAK)) continue;
      out.push_back({image.data() + strings.sh_offset + symbol.st_name, ELF64_ST_TYPE(symbol.st_info) == STT_FUNC});
    }
  }
  return out;
}

bool isMangled(const std::string& name) { return name.rfind("_Z", 0) == 0; }

bool endsWith(const std::string& text, const std::string& tail) {
  return text.size() >= tail.size() && text.compare(text.size() - tail.size(), tail.size(), tail) == 0;
}

// Names the toolchain reserves (a leading underscore), such as those of a
// sanitizer runtime, are not the library's own.
bool isReserved(const std::string& name) { return !name.empty() && name[0] == '_'; }

TEST(EntryPointsTest, TheLibraryExportsExactlyTheTwentyEightEntryPointsUndecorated) {
  std::set<std::string> undecoratedFunctions;
  for (const ExportedSymbol& symbol : exportedSymbols(libraryFile()))
    if (symbol.function && !isMangled(symbol.name) && !isReserved(symbol.name))
      undecoratedFunctions.insert(symbol.name);
  EXPECT_EQ(expectedEntryPoints().size(), 28u);
  EXPECT_EQ(undecoratedFunctions, expectedEntryPoints());
}

TEST(EntryPointsTest, NoEntryPointIsExportedUnderADecoratedName) {
  std::vector<std::string> decorated;
  for (const ExportedSymbol& symbol : exportedSymbols(libraryFile()))
    if (isMangled(symbol.name) && (symbol.name.find("_Create_InstanceMI") != std::string::npos ||
                                   symbol.name.find("_Create_AssociationMI") != std::string::npos))
      decorated.push_back(symbol.name);
  EXPECT_THAT(decorated, IsEmpty());
}

TEST(EntryPointsTest, EveryEntryPointGivesItsMiThroughTheObjectManager) {
  ProviderHarness harness;
  for (const Provider& p : kProviders) {
    std::string error;
    CMPIInstanceMI* instance = harness.om().instanceMI(p.name, &error);
    ASSERT_NE(instance, nullptr) << error;
    EXPECT_EQ(std::string(instance->ft->miName), std::string("instance") + p.name);
    if (!p.association) continue;
    CMPIAssociationMI* association = harness.om().associationMI(p.name, &error);
    ASSERT_NE(association, nullptr) << error;
    EXPECT_EQ(std::string(association->ft->miName), std::string("association") + p.name);
  }
}

class EntryPointRegistrationTest : public ::testing::Test {
protected:
  void SetUp() override {
    std::string error;
    auto loaded = broker::RegistrationTable::load(registrationFile(), &error);
    ASSERT_TRUE(loaded.has_value()) << error;
    table = std::move(*loaded);
  }
  broker::RegistrationTable table;
};

TEST_F(EntryPointRegistrationTest, EveryProviderIsRegisteredForItsClassWithTheKindsOfMiItHas) {
  for (const Provider& p : kProviders) {
    const broker::ClassRegistration* reg = table.find(p.className);
    ASSERT_NE(reg, nullptr) << p.className << " is not registered";
    EXPECT_EQ(reg->provider, p.name) << p.className;
    EXPECT_EQ(reg->location, kLibraryLocation) << p.className;
    EXPECT_TRUE(reg->instance) << p.className;
    EXPECT_EQ(reg->association, p.association) << p.className;
    EXPECT_FALSE(reg->method) << p.className;
    EXPECT_FALSE(reg->indication) << p.className;
    EXPECT_EQ(reg->namespaces, std::vector<std::string>{"root/cimv2"}) << p.className;
  }
}

TEST_F(EntryPointRegistrationTest, EveryRegistrationNamesAnExportedEntryPointOfItsKind) {
  std::set<std::string> exported;
  for (const ExportedSymbol& symbol : exportedSymbols(libraryFile())) exported.insert(symbol.name);
  for (const broker::ClassRegistration& reg : table.classes()) {
    EXPECT_EQ(reg.location, kLibraryLocation) << reg.className;
    if (reg.instance) {
      EXPECT_EQ(exported.count(reg.provider + "_Create_InstanceMI"), 1u) << reg.className;
    }
    if (reg.association) {
      EXPECT_EQ(exported.count(reg.provider + "_Create_AssociationMI"), 1u) << reg.className;
    }
    EXPECT_TRUE(reg.instance || reg.association) << reg.className;
  }
}

TEST_F(EntryPointRegistrationTest, EveryAssociationClassIsServedByAnAssociationProvider) {
  std::set<std::string> associationEntryPoints;
  for (const std::string& name : expectedEntryPoints())
    if (endsWith(name, "_Create_AssociationMI")) associationEntryPoints.insert(name);
  std::set<std::string> registered;
  for (const broker::ClassRegistration* reg : table.associationClasses())
    registered.insert(reg->provider + "_Create_AssociationMI");
  EXPECT_EQ(registered, associationEntryPoints);
}

} // namespace
} // namespace tvr::test
