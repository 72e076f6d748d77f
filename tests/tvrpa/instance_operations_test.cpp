// ei, ein and gi on the real providers and the example blade system, as a
// user types them.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::StartsWith;

const char* const kBladeChassis =
    "root/cimv2:TVRHX_Chassis.Tag=\"/System/Blade Chassis\",CreationClassName=\"TVRHX_Chassis\"";
const char* const kExpansionChassis =
    "root/cimv2:TVRHX_Chassis.Tag=\"/System/PCIe Expansion Unit\",CreationClassName=\"TVRHX_Chassis\"";

TEST(TvrpaInstanceOperations, EnumerateInstancesPrintsEachInstanceUnderItsPath) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(
      r.out, StartsWith(std::string(kBladeChassis) + "\n    Tag                        = \"/System/Blade Chassis\"\n"));
  EXPECT_THAT(r.out, HasSubstr("    ChassisPackageType         = 17\n"));
  EXPECT_THAT(r.out, HasSubstr("\n\n" + std::string(kExpansionChassis) + "\n"));
  EXPECT_EQ(r.err, "");
}

TEST(TvrpaInstanceOperations, EnumerateInstanceNamesPrintsOnePathPerLineInProviderOrder) {
  const ProgramResult r = tvrpa({"ein", "TVRHX_Chassis", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(linesOf(r.out), ElementsAre(kBladeChassis, kExpansionChassis));
}

TEST(TvrpaInstanceOperations, ClassNameMayCarryItsNamespace) {
  const ProgramResult r = tvrpa({"ein", "root/cimv2:TVRHX_Chassis", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(linesOf(r.out), ElementsAre(kBladeChassis, kExpansionChassis));
}

TEST(TvrpaInstanceOperations, EveryPrintedPathCanBePastedIntoGetInstance) {
  const ProgramResult names = tvrpa({"ein", "TVRHX_Slot", "--tree", bladeTree()});
  ASSERT_EQ(names.exitStatus, 0) << names.err;
  const std::vector<std::string> paths = linesOf(names.out);
  ASSERT_EQ(paths.size(), 5u);
  for (const std::string& path : paths) {
    const ProgramResult one = tvrpa({"gi", path, "--tree", bladeTree()});
    EXPECT_EQ(one.exitStatus, 0) << one.err;
    EXPECT_THAT(one.out, StartsWith(path + "\n")) << path;
  }
}

TEST(TvrpaInstanceOperations, GetInstanceTakesKeysAsWords) {
  const ProgramResult r = tvrpa({"gi", "TVRHX_Chassis", "Tag=/System/PCIe Expansion Unit", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, HasSubstr("Model                      = \"PXU-4\""));
}

TEST(TvrpaInstanceOperations, GetInstanceOfNothingPrintsNothingAndSucceeds) {
  const ProgramResult r = tvrpa({"gi", "TVRHX_Chassis", "Tag=/Nowhere", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "");
}

TEST(TvrpaInstanceOperations, PropertyListIsReadAsCommaSeparatedNames) {
  const ProgramResult r =
      tvrpa({"gi", kBladeChassis, "--tree", bladeTree(), "--properties", "Model, Tag,,", "--format", "json"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(parseJson(r.out)["request"]["properties"], nlohmann::json({"Model", "Tag"}));
}

TEST(TvrpaInstanceOperations, EmptyPropertyListAsksForNoProperties) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--properties", "", "--format", "json"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(parseJson(r.out)["request"]["properties"], nlohmann::json::array());
}

TEST(TvrpaInstanceOperations, NoPropertyListIsANullList) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--format", "json"});
  EXPECT_TRUE(parseJson(r.out)["request"]["properties"].is_null());
}

TEST(TvrpaInstanceOperations, ClassOfAnotherNamespaceIsRefusedByTheObjectManager) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--namespace", "root/other", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_THAT(r.err, HasSubstr("CMPI_RC_ERR_INVALID_NAMESPACE"));
  EXPECT_THAT(r.err, HasSubstr("root/other"));
}

TEST(TvrpaInstanceOperations, FixtureElementsComeInProviderOrder) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"ein", "FIX_Rack"} + fixture.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(linesOf(r.out),
              ElementsAre("root/cimv2:FIX_Rack.Name=\"R1\",CreationClassName=\"FIX_Rack\"",
                          "root/cimv2:FIX_Rack.Name=\"Rack \\\"B\\\" \\\\ 2\",CreationClassName=\"FIX_Rack\""));
}

} // namespace
} // namespace tvr::test
