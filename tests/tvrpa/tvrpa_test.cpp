// tvrpa as a user meets it: operations, formats, exit status and messages.
#include "ProviderHarness.h"
#include "RunProgram.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;
using ::testing::StartsWith;

const std::string kBlade = std::string(TVR_EXAMPLES_DIR) + "/blade-system.json";

ProgramResult tvrpa(std::vector<std::string> args) { return runProgram(TVRPA_BINARY, args); }

TEST(TvrpaTest, EnumerateInstancesPrintsEachChassisWithItsProperties) {
  ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, StartsWith("root/cimv2:TVRHX_Chassis.Tag=\"/System/Blade Chassis\","
                                "CreationClassName=\"TVRHX_Chassis\"\n"));
  EXPECT_THAT(r.out, HasSubstr("    ChassisPackageType         = 17\n"));
  EXPECT_THAT(r.out, HasSubstr("root/cimv2:TVRHX_Chassis.Tag=\"/System/PCIe Expansion Unit\""));
  EXPECT_EQ(r.err, "");
}

TEST(TvrpaTest, EnumerateInstanceNamesPrintsOnePathPerLine) {
  ProgramResult r = tvrpa({"ein", "TVRHX_Chassis", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out,
            "root/cimv2:TVRHX_Chassis.Tag=\"/System/Blade Chassis\",CreationClassName=\"TVRHX_Chassis\"\n"
            "root/cimv2:TVRHX_Chassis.Tag=\"/System/PCIe Expansion Unit\",CreationClassName=\"TVRHX_Chassis\"\n");
}

TEST(TvrpaTest, PrintedPathCanBePastedIntoGetInstance) {
  ProgramResult names = tvrpa({"ein", "TVRHX_Chassis", "--tree", kBlade});
  const std::string firstPath = names.out.substr(0, names.out.find('\n'));
  ProgramResult one = tvrpa({"gi", firstPath, "--tree", kBlade});
  EXPECT_EQ(one.exitStatus, 0) << one.err;
  EXPECT_THAT(one.out, StartsWith(firstPath + "\n"));
  EXPECT_THAT(one.out, HasSubstr("Model                      = \"BX-920\""));
}

TEST(TvrpaTest, GetInstanceTakesKeysAsWords) {
  ProgramResult r = tvrpa({"gi", "TVRHX_Chassis", "Tag=/System/PCIe Expansion Unit", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, HasSubstr("Model                      = \"PXU-4\""));
}

TEST(TvrpaTest, GetInstanceOfNothingPrintsNothingAndSucceeds) {
  ProgramResult r = tvrpa({"gi", "TVRHX_Chassis", "Tag=/Nowhere", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "");
}

TEST(TvrpaTest, JsonGivesStatusDoneAndTypedProperties) {
  ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", kBlade, "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const auto doc = nlohmann::json::parse(r.out);
  EXPECT_EQ(doc["status"]["code"], 0);
  EXPECT_EQ(doc["status"]["name"], "CMPI_RC_OK");
  EXPECT_TRUE(doc["status"]["message"].is_null());
  EXPECT_EQ(doc["done"], true);
  ASSERT_EQ(doc["items"].size(), 2u);
  const auto& first = doc["items"][0];
  EXPECT_EQ(first["kind"], "instance");
  EXPECT_EQ(first["path"]["className"], "TVRHX_Chassis");
  EXPECT_EQ(first["path"]["host"], "blade-07.lab.example.com");
  EXPECT_EQ(first["properties"][0]["name"], "Tag");
  EXPECT_EQ(first["properties"][0]["type"], "string");
  EXPECT_EQ(first["properties"][0]["cmpiType"], "CMPI_chars");
  EXPECT_EQ(first["properties"][2]["name"], "ChassisPackageType");
  EXPECT_EQ(first["properties"][2]["type"], "uint16");
  EXPECT_EQ(first["properties"][2]["value"], 17);
  EXPECT_EQ(first["properties"][13]["name"], "VendorCompatibilityStrings");
  EXPECT_EQ(first["properties"][13]["type"], "string[]");
  EXPECT_EQ(first["properties"][13]["value"][0], "TVR:/System/Blade Chassis");
}

TEST(TvrpaTest, UnregisteredClassIsAProviderErrorWithItsStatusName) {
  ProgramResult r = tvrpa({"ei", "CIM_Nothing", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_THAT(r.err, HasSubstr("CMPI_RC_ERR_INVALID_CLASS"));
  EXPECT_THAT(r.err, HasSubstr("CIM_Nothing"));
}

TEST(TvrpaTest, RefusedTreeFileShowsTheAgentsMessage) {
  TreeFile broken(R"({"nodes": [{"type": "ChassisNode", "status": -1}]})");
  ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", broken.path()});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr(broken.path()));
  EXPECT_THAT(r.err, HasSubstr("/nodes/0/status"));
}

TEST(TvrpaTest, UsageErrorsSayWhatWasExpected) {
  struct Case {
    std::vector<std::string> args;
    const char* message;
  };
  const Case cases[] = {
      {{}, "no operation given"},
      {{"frobnicate"}, "unknown operation 'frobnicate'"},
      {{"ei"}, "ei needs a class name"},
      {{"gi"}, "gi needs an object path"},
      {{"ei", "TVRHX_Chassis", "--format", "xml"}, "--format takes text or json"},
      {{"ei", "TVRHX_Chassis", "--bogus"}, "unknown option --bogus"},
      {{"ei", "A", "B"}, "ei takes one class name"},
  };
  for (const Case& c : cases) {
    ProgramResult r = tvrpa(c.args);
    EXPECT_EQ(r.exitStatus, 1) << c.message;
    EXPECT_THAT(r.err, HasSubstr(c.message));
  }
}

TEST(TvrpaTest, BadObjectPathNamesTheColumn) {
  ProgramResult r = tvrpa({"gi", "TVRHX_Chassis.Tag=\"open", "--tree", kBlade});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("bad object path at column 19: unterminated quoted value"));
}

TEST(TvrpaTest, HelpListsTheOperations) {
  ProgramResult r = tvrpa({"--help"});
  EXPECT_EQ(r.exitStatus, 0);
  EXPECT_THAT(r.out, HasSubstr("ei CLASS"));
  EXPECT_THAT(r.out, HasSubstr("ein CLASS"));
  EXPECT_THAT(r.out, HasSubstr("gi PATH"));
}

} // namespace
} // namespace tvr::test
