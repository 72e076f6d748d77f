// The SFCB registration file against the built provider library: every entry
// point the library exports is registered, and every registration names
// entry points the library exports, for exactly the MI kinds it lists. An
// object manager fails every request for a class whose registered kind has
// no entry point, and never calls an entry point nobody registered.
#include "ElfSymbols.h"

#include "tvr/broker/Registration.h"

#include <cmpift.h>

#include <dlfcn.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>

namespace tvr::test {
namespace {

const std::string kInstanceSuffix = "_Create_InstanceMI";
const std::string kAssociationSuffix = "_Create_AssociationMI";

bool endsWith(const std::string& text, const std::string& suffix) {
  return text.size() > suffix.size() && text.compare(text.size() - suffix.size(), suffix.size(), suffix) == 0;
}

std::string baseName(const std::string& path) { return path.substr(path.find_last_of('/') + 1); }

/// The providers the library exports entry points for, by kind.
struct ExportedProviders {
  std::set<std::string> instance;
  std::set<std::string> association;
};

ExportedProviders exportedProviders() {
  ExportedProviders out;
  for (const std::string& name : exportedFunctions(TVR_PROVIDER_LIBRARY)) {
    if (endsWith(name, kInstanceSuffix)) out.instance.insert(name.substr(0, name.size() - kInstanceSuffix.size()));
    if (endsWith(name, kAssociationSuffix))
      out.association.insert(name.substr(0, name.size() - kAssociationSuffix.size()));
  }
  return out;
}

class RegistrationEntryPointsTest : public ::testing::Test {
protected:
  static void SetUpTestSuite() {
    std::string error;
    auto table = broker::RegistrationTable::load(TVR_REGISTRATION_FILE, &error);
    ASSERT_TRUE(table) << error;
    table_ = new broker::RegistrationTable(std::move(*table));
    library_ = dlopen(TVR_PROVIDER_LIBRARY, RTLD_NOW | RTLD_LOCAL);
    ASSERT_NE(library_, nullptr) << dlerror();
  }
  static void TearDownTestSuite() {
    if (library_) dlclose(library_);
    delete table_;
    library_ = nullptr;
    table_ = nullptr;
  }
  void SetUp() override {
    ASSERT_NE(table_, nullptr);
    ASSERT_NE(library_, nullptr);
  }

  using CreateInstanceMI = CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  using CreateAssociationMI = CMPIAssociationMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);

  static void* entryPoint(const std::string& name) { return dlsym(library_, name.c_str()); }

  static broker::RegistrationTable* table_;
  static void* library_;
};

broker::RegistrationTable* RegistrationEntryPointsTest::table_ = nullptr;
void* RegistrationEntryPointsTest::library_ = nullptr;

TEST_F(RegistrationEntryPointsTest, LibraryExportsEntryPoints) {
  EXPECT_FALSE(exportedProviders().instance.empty()) << TVR_PROVIDER_LIBRARY;
}

TEST_F(RegistrationEntryPointsTest, EveryExportedInstanceEntryPointIsRegistered) {
  for (const std::string& provider : exportedProviders().instance) {
    bool registered = false;
    for (const broker::ClassRegistration& r : table_->classes())
      registered = registered || (r.provider == provider && r.instance);
    EXPECT_TRUE(registered) << provider << kInstanceSuffix << " is exported but no class registers it";
  }
}

TEST_F(RegistrationEntryPointsTest, EveryExportedAssociationEntryPointIsRegistered) {
  for (const std::string& provider : exportedProviders().association) {
    bool registered = false;
    for (const broker::ClassRegistration& r : table_->classes())
      registered = registered || (r.provider == provider && r.association);
    EXPECT_TRUE(registered) << provider << kAssociationSuffix << " is exported but no class registers it";
  }
}

TEST_F(RegistrationEntryPointsTest, EveryRegistrationListsExactlyTheKindsItsProviderExports) {
  const ExportedProviders exported = exportedProviders();
  for (const broker::ClassRegistration& r : table_->classes()) {
    EXPECT_EQ(r.instance, exported.instance.count(r.provider) == 1) << r.className << " -> " << r.provider;
    EXPECT_EQ(r.association, exported.association.count(r.provider) == 1) << r.className << " -> " << r.provider;
    EXPECT_FALSE(r.method) << r.className;
    EXPECT_FALSE(r.indication) << r.className;
  }
}

TEST_F(RegistrationEntryPointsTest, RegisteredInstanceEntryPointsReturnTheirProvidersInstanceMI) {
  for (const broker::ClassRegistration& r : table_->classes()) {
    if (!r.instance) continue;
    auto create = reinterpret_cast<CreateInstanceMI>(entryPoint(r.provider + kInstanceSuffix));
    ASSERT_NE(create, nullptr) << r.className << ": " << r.provider << kInstanceSuffix;
    const CMPIInstanceMI* mi = create(nullptr, nullptr, nullptr);
    ASSERT_TRUE(mi && mi->ft) << r.provider;
    EXPECT_EQ(mi->ft->ftVersion, 200) << r.provider;
    EXPECT_EQ(mi->ft->miVersion, 200) << r.provider;
    EXPECT_STREQ(mi->ft->miName, ("instance" + r.provider).c_str());
  }
}

TEST_F(RegistrationEntryPointsTest, RegisteredAssociationEntryPointsReturnTheirProvidersAssociationMI) {
  for (const broker::ClassRegistration& r : table_->classes()) {
    if (!r.association) continue;
    auto create = reinterpret_cast<CreateAssociationMI>(entryPoint(r.provider + kAssociationSuffix));
    ASSERT_NE(create, nullptr) << r.className << ": " << r.provider << kAssociationSuffix;
    const CMPIAssociationMI* mi = create(nullptr, nullptr, nullptr);
    ASSERT_TRUE(mi && mi->ft) << r.provider;
    EXPECT_EQ(mi->ft->ftVersion, 200) << r.provider;
    EXPECT_EQ(mi->ft->miVersion, 200) << r.provider;
    EXPECT_STREQ(mi->ft->miName, ("association" + r.provider).c_str());
  }
}

TEST_F(RegistrationEntryPointsTest, EveryRegistrationNamesTheLibraryAsItsLocation) {
  // SFCB loads exactly lib<location>.so.
  const std::string library = baseName(TVR_PROVIDER_LIBRARY);
  const std::string location = library.substr(3, library.find(".so") - 3);
  for (const broker::ClassRegistration& r : table_->classes()) EXPECT_EQ(r.location, location) << r.className;
}

TEST_F(RegistrationEntryPointsTest, EveryClassIsRegisteredInRootCimv2Once) {
  std::map<std::string, int> sections;
  for (const broker::ClassRegistration& r : table_->classes()) {
    ++sections[r.className];
    EXPECT_THAT(r.namespaces, ::testing::ElementsAre("root/cimv2")) << r.className;
  }
  for (const auto& [className, count] : sections) EXPECT_EQ(count, 1) << className;
}

TEST_F(RegistrationEntryPointsTest, IdeClassesAreServedByTheDiskControllerProvider) {
  // The IDE controller and its chip have no provider of their own:
  // DiskController_EnumInstances builds them by the class of the request.
  for (const char* ideClass : {"TVRHX_IDEController", "TVRHX_ChipIDECont"}) {
    const broker::ClassRegistration* r = table_->find(ideClass);
    ASSERT_NE(r, nullptr) << ideClass;
    EXPECT_EQ(r->provider, "DiskControllerProvider") << ideClass;
    EXPECT_TRUE(r->instance) << ideClass;
    EXPECT_FALSE(r->association) << ideClass;
  }
}

} // namespace
} // namespace tvr::test
