// The OpenPegasus registration the build writes from the SFCB registration
// file: one CMPI 2.0 provider module at the provider library, one provider
// per registered provider name, one capability per registered class with the
// same kinds and namespaces.
#include "RunCommand.h"

#include "tvr/broker/Mof.h"
#include "tvr/broker/Registration.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <fstream>
#include <map>
#include <set>
#include <sstream>

namespace tvr::test {
namespace {

using broker::MofInstance;
using ::testing::HasSubstr;

const char* const kModule = "TVRPhysicalAssetProviderModule";

std::map<std::string, std::string> valuesOf(const MofInstance& instance) {
  std::map<std::string, std::string> out;
  for (const auto& [name, value] : instance.values) out[name] = value;
  return out;
}

std::vector<std::map<std::string, std::string>> instancesOf(const broker::MofSchema& mof,
                                                            const std::string& className) {
  std::vector<std::map<std::string, std::string>> out;
  for (const MofInstance& instance : mof.instances())
    if (instance.className == className) out.push_back(valuesOf(instance));
  return out;
}

std::string kindsOf(const broker::ClassRegistration& r) {
  std::string codes;
  auto add = [&codes](bool listed, const char* code) {
    if (listed) codes += (codes.empty() ? "" : ",") + std::string(code);
  };
  add(r.instance, "2");
  add(r.association, "3");
  add(r.indication, "4");
  add(r.method, "5");
  return "{" + codes + "}";
}

class PegasusRegistrationTest : public ::testing::Test {
protected:
  void SetUp() override {
    std::string error;
    auto table = broker::RegistrationTable::load(TVR_REGISTRATION_FILE, &error);
    ASSERT_TRUE(table) << error;
    table_ = std::move(*table);
    broker::MofError mofError;
    auto mof = broker::MofSchema::load(TVR_PEGASUS_REGISTRATION_FILE, &mofError);
    ASSERT_TRUE(mof) << mofError.str();
    mof_ = std::move(*mof);
  }

  broker::RegistrationTable table_;
  broker::MofSchema mof_;
};

TEST_F(PegasusRegistrationTest, DeclaresOneCmpi20ModuleAtTheProviderLibrary) {
  const auto modules = instancesOf(mof_, "PG_ProviderModule");
  ASSERT_EQ(modules.size(), 1u);
  EXPECT_EQ(modules[0].at("Name"), kModule);
  EXPECT_EQ(modules[0].at("InterfaceType"), "CMPI");
  EXPECT_EQ(modules[0].at("InterfaceVersion"), "2.0.0");
  EXPECT_EQ(modules[0].at("Location"), table_.classes().at(0).location);
  EXPECT_EQ(modules[0].at("Version"), TVR_PROJECT_VERSION);
}

TEST_F(PegasusRegistrationTest, DeclaresEachRegisteredProviderOnceInTheModule) {
  std::set<std::string> registered;
  for (const broker::ClassRegistration& r : table_.classes()) registered.insert(r.provider);
  std::multiset<std::string> declared;
  for (const auto& provider : instancesOf(mof_, "PG_Provider")) {
    declared.insert(provider.at("Name"));
    EXPECT_EQ(provider.at("ProviderModuleName"), kModule);
  }
  EXPECT_EQ(declared, std::multiset<std::string>(registered.begin(), registered.end()));
}

TEST_F(PegasusRegistrationTest, GivesEachRegisteredClassACapabilityOfItsKindsAndNamespaces) {
  const auto capabilities = instancesOf(mof_, "PG_ProviderCapabilities");
  ASSERT_EQ(capabilities.size(), table_.classes().size());
  for (std::size_t i = 0; i < capabilities.size(); ++i) {
    const broker::ClassRegistration& r = table_.classes()[i];
    const auto& c = capabilities[i];
    EXPECT_EQ(c.at("ClassName"), r.className);
    EXPECT_EQ(c.at("CapabilityID"), r.className);
    EXPECT_EQ(c.at("ProviderName"), r.provider) << r.className;
    EXPECT_EQ(c.at("ProviderModuleName"), kModule) << r.className;
    EXPECT_EQ(c.at("ProviderType"), kindsOf(r)) << r.className;
    EXPECT_EQ(c.at("Namespaces"), "{root/cimv2}") << r.className;
  }
}

/// Runs the registration writer on a registration text; the written MOF
/// goes to `mof`.
class RegistrationWriterTest : public ::testing::Test {
protected:
  void SetUp() override {
    char dir[] = "/tmp/tvr-pegasus-XXXXXX";
    ASSERT_NE(mkdtemp(dir), nullptr);
    dir_ = dir;
  }
  void TearDown() override {
    std::remove((dir_ + "/in.reg").c_str());
    std::remove((dir_ + "/out.mof").c_str());
    rmdir(dir_.c_str());
  }

  CommandResult write(const std::string& registration) {
    std::ofstream(dir_ + "/in.reg") << registration;
    return runCommand({TVR_CMAKE_COMMAND, "-DREGISTRATION=" + dir_ + "/in.reg", "-DOUTPUT=" + dir_ + "/out.mof",
                       "-DMODULE=FixModule", "-DVENDOR=TVR", "-DVERSION=9.8.7", "-P", TVR_PEGASUS_WRITER});
  }
  std::string written() const {
    std::ifstream in(dir_ + "/out.mof");
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
  }

  std::string dir_;
};

TEST_F(RegistrationWriterTest, WritesModuleProvidersAndCapabilitiesInRegistrationOrder) {
  const CommandResult r = write(R"(# a comment
[FIX_Element]
   provider: FixProvider
   location: fixlibrary
   type: instance
   namespace: root/cimv2

[FIX_Link]
   provider: FixLinkProvider
   location: fixlibrary
   type: instance association
   namespace: root/cimv2 root/other

[FIX_Other]
   provider: FixProvider
   location: fixlibrary
   type: instance
   namespace: root/cimv2
)");
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(written(), R"(// OpenPegasus registration of the provider module FixModule, written by the
// build from in.reg; edit that file, not this one.
// Compile into the interop namespace: cimmof -n root/PG_InterOp <this file>

#pragma locale ("en_US")

instance of PG_ProviderModule
{
   Name = "FixModule";
   Vendor = "TVR";
   Version = "9.8.7";
   InterfaceType = "CMPI";
   InterfaceVersion = "2.0.0";
   Location = "fixlibrary";
};

instance of PG_Provider
{
   Name = "FixProvider";
   ProviderModuleName = "FixModule";
};

instance of PG_Provider
{
   Name = "FixLinkProvider";
   ProviderModuleName = "FixModule";
};

instance of PG_ProviderCapabilities
{
   ProviderModuleName = "FixModule";
   ProviderName = "FixProvider";
   CapabilityID = "FIX_Element";
   ClassName = "FIX_Element";
   Namespaces = {"root/cimv2"};
   ProviderType = {2};
   SupportedProperties = NULL;
   SupportedMethods = NULL;
};

instance of PG_ProviderCapabilities
{
   ProviderModuleName = "FixModule";
   ProviderName = "FixLinkProvider";
   CapabilityID = "FIX_Link";
   ClassName = "FIX_Link";
   Namespaces = {"root/cimv2", "root/other"};
   ProviderType = {2, 3};
   SupportedProperties = NULL;
   SupportedMethods = NULL;
};

instance of PG_ProviderCapabilities
{
   ProviderModuleName = "FixModule";
   ProviderName = "FixProvider";
   CapabilityID = "FIX_Other";
   ClassName = "FIX_Other";
   Namespaces = {"root/cimv2"};
   ProviderType = {2};
   SupportedProperties = NULL;
   SupportedMethods = NULL;
};
)");
}

TEST_F(RegistrationWriterTest, RefusesTwoLibrariesInOneFile) {
  const CommandResult r = write(R"([FIX_A]
   provider: A
   location: first
   type: instance
   namespace: root/cimv2
[FIX_B]
   provider: B
   location: second
   type: instance
   namespace: root/cimv2
)");
  EXPECT_NE(r.exitStatus, 0);
  EXPECT_THAT(r.err, HasSubstr("[FIX_B] names location 'second'"));
}

TEST_F(RegistrationWriterTest, RefusesAnUnknownKind) {
  const CommandResult r = write(R"([FIX_A]
   provider: A
   location: first
   type: instance querying
   namespace: root/cimv2
)");
  EXPECT_NE(r.exitStatus, 0);
  EXPECT_THAT(r.err, HasSubstr("[FIX_A] has the unknown type 'querying'"));
}

TEST_F(RegistrationWriterTest, RefusesASectionWithoutProvider) {
  const CommandResult r = write(R"([FIX_A]
   location: first
   type: instance
   namespace: root/cimv2
)");
  EXPECT_NE(r.exitStatus, 0);
  EXPECT_THAT(r.err, HasSubstr("[FIX_A] has no provider"));
}

} // namespace
} // namespace tvr::test
