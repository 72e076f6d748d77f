// What the providers set agrees with the class file: every registered class
// is enumerated on the example blade system through the embedded object
// manager, and each property an instance carries must be declared for its
// class (or inherited from the DMTF class) with the CIM type of the CMPI type
// the provider set it as. The keys on the paths of EnumerateInstanceNames
// must be the class's keys with their types.
#include "SchemaFiles.h"

#include "ProviderHarness.h"

#include <HX/HardwareSource.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <set>
#include <stdexcept>

namespace tvr::test {
namespace {

using broker::Instance;
using broker::MofProperty;
using broker::ObjectPath;

/// The CIM type a value of this CMPI type stands for in MOF, e.g. "string"
/// for CMPI_chars and CMPI_string, "uint16[]" for CMPI_uint16A.
std::string mofTypeOf(CMPIType type) {
  static const std::map<CMPIType, std::string> names = {
      {CMPI_chars, "string"},     {CMPI_string, "string"},   {CMPI_boolean, "boolean"},
      {CMPI_uint8, "uint8"},      {CMPI_uint16, "uint16"},   {CMPI_uint32, "uint32"},
      {CMPI_uint64, "uint64"},    {CMPI_sint8, "sint8"},     {CMPI_sint16, "sint16"},
      {CMPI_sint32, "sint32"},    {CMPI_sint64, "sint64"},   {CMPI_real32, "real32"},
      {CMPI_real64, "real64"},    {CMPI_dateTime, "datetime"}, {CMPI_ref, "ref"},
      {CMPI_char16, "char16"},
  };
  const auto found = names.find(static_cast<CMPIType>(type & ~CMPI_ARRAY));
  if (found == names.end()) return "(" + broker::typeName(type) + ")";
  return found->second + ((type & CMPI_ARRAY) ? "[]" : "");
}

std::string typeText(const MofProperty& p) { return p.type + (p.array ? "[]" : ""); }

// Where the provider sets a property with another type than the class file
// and the DMTF class give it. TVRHX_IDEController.OtherIdentifyingInfo is an
// array of strings in CIM_LogicalDevice, which a subclass cannot change, and
// the provider sets one string. Pinned so that a change on either side shows.
const std::map<std::pair<std::string, std::string>, std::string> kKnownTypeDeviations = {
    {{"TVRHX_IDEController", "OtherIdentifyingInfo"}, "string"},
};

/// The project's registration and the companion providers', so that the
/// associations to the companion classes have instances too.
broker::RegistrationTable registrations() {
  std::string error;
  auto table = broker::RegistrationTable::load(registrationFile(), &error);
  if (!table) throw std::runtime_error(error);
  auto companion = broker::RegistrationTable::load(TVR_COMPANION_REGISTRATION_FILE, &error);
  if (!companion) throw std::runtime_error(error);
  for (const broker::ClassRegistration& r : companion->classes()) table->add(r);
  return std::move(*table);
}

std::vector<std::string> registeredClasses() {
  std::string error;
  auto table = broker::RegistrationTable::load(registrationFile(), &error);
  std::vector<std::string> names;
  if (table)
    for (const broker::ClassRegistration& r : table->classes()) names.push_back(r.className);
  return names;
}

class ProviderPropertyTypesTest : public ::testing::TestWithParam<std::string> {
protected:
  ProviderPropertyTypesTest() {
    broker::ObjectManagerOptions options;
    options.registration = registrations();
    options.classKeys = broker::classKeysOf(projectSchema());
    options.providerDirectories = {providerDirectory(), TVR_COMPANION_PROVIDER_DIR};
    om_ = std::make_unique<broker::ObjectManager>(std::move(options));
    HX::useHardwareTree(TVR_EXAMPLE_TREE);
  }
  ~ProviderPropertyTypesTest() override {
    om_.reset();
    HX::useLiveMachine();
  }

  const broker::MofSchema& schema() const { return combinedSchema() ? *combinedSchema() : projectSchema(); }

  std::unique_ptr<broker::ObjectManager> om_;
};

TEST_P(ProviderPropertyTypesTest, EveryPropertySetIsDeclaredWithTheTypeSet) {
  const std::string className = GetParam();
  ASSERT_NE(projectSchema().find(className), nullptr) << className << " is registered but not in the class file";
  const broker::Response r = om_->enumerateInstances(classPath(className));
  ASSERT_TRUE(r.ok()) << broker::statusName(r.rc) << " " << r.message.value_or("");
  const std::vector<Instance> instances = r.instances();
  ASSERT_FALSE(instances.empty()) << "the example blade system has no " << className;

  std::set<std::string> deviationsSeen;
  for (const Instance& instance : instances) {
    for (const broker::Binding& b : instance.properties) {
      const MofProperty* declared = schema().findProperty(className, b.name);
      ASSERT_NE(declared, nullptr) << className << "." << b.name << " is set but not declared";
      const std::string set = mofTypeOf(b.value.type);
      const auto deviation = kKnownTypeDeviations.find({className, b.name});
      if (deviation != kKnownTypeDeviations.end()) {
        deviationsSeen.insert(b.name);
        EXPECT_EQ(set, deviation->second) << className << "." << b.name;
        EXPECT_NE(set, typeText(*declared)) << className << "." << b.name << " now agrees: drop its deviation";
        continue;
      }
      EXPECT_EQ(set, typeText(*declared)) << className << "." << b.name << " set as "
                                          << broker::typeName(b.value.type);
    }
  }
  for (const auto& [where, type] : kKnownTypeDeviations) {
    if (where.first != className) continue;
    EXPECT_EQ(deviationsSeen.count(where.second), 1u) << where.second << " no longer set: drop its deviation";
  }
}

TEST_P(ProviderPropertyTypesTest, PathsCarryTheClassKeysWithTheirTypes) {
  const std::string className = GetParam();
  ASSERT_NE(projectSchema().find(className), nullptr);
  // The two IDE classes are served by the disk controller provider, whose
  // EnumInstanceNames answers only for its own class: their paths come with
  // their instances.
  const bool servedByInstancesOnly = className == "TVRHX_IDEController" || className == "TVRHX_ChipIDECont";
  const broker::Response r = servedByInstancesOnly ? om_->enumerateInstances(classPath(className))
                                                   : om_->enumerateInstanceNames(classPath(className));
  ASSERT_TRUE(r.ok()) << broker::statusName(r.rc) << " " << r.message.value_or("");
  const std::vector<ObjectPath> paths = r.paths();
  ASSERT_FALSE(paths.empty()) << "the example blade system has no path of " << className;

  std::set<std::string> keys;
  for (const std::string& key : projectSchema().keysOf(className)) keys.insert(lowerCase(key));
  for (const ObjectPath& path : paths) {
    std::set<std::string> onPath;
    for (const broker::Binding& key : path.keys) {
      onPath.insert(lowerCase(key.name));
      const MofProperty* declared = projectSchema().findProperty(className, key.name);
      ASSERT_NE(declared, nullptr) << className << " path key " << key.name;
      EXPECT_EQ(mofTypeOf(key.value.type), typeText(*declared)) << className << " path key " << key.name;
    }
    EXPECT_EQ(onPath, keys) << className;
  }
}

INSTANTIATE_TEST_SUITE_P(RegisteredClasses, ProviderPropertyTypesTest, ::testing::ValuesIn(registeredClasses()),
                         [](const ::testing::TestParamInfo<std::string>& info) { return info.param; });

TEST(ProviderPropertyTypesRegistrationTest, RegistrationServesClasses) {
  EXPECT_FALSE(registeredClasses().empty()) << registrationFile();
}

} // namespace
} // namespace tvr::test
