// Object paths in text, both ways: what tvrpa prints reads back to the same
// path, quotes and backslashes are escaped, reference keys nest whole paths,
// and a path that cannot be read names the column.
#include "TvrpaRun.h"

#include <algorithm>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::StartsWith;

// Every path `ein` prints, pasted into `gi`, names the instance it came from.
void expectEachPrintedPathReadsBack(const std::vector<std::string>& ein, const std::vector<std::string>& setup) {
  const ProgramResult names = tvrpa(ein + setup);
  ASSERT_EQ(names.exitStatus, 0) << names.err;
  const std::vector<std::string> paths = linesOf(names.out);
  ASSERT_FALSE(paths.empty());
  for (const std::string& path : paths) {
    const ProgramResult one = tvrpa(std::vector<std::string>{"gi", path} + setup);
    EXPECT_EQ(one.exitStatus, 0) << one.err;
    EXPECT_EQ(linesOf(one.out).at(0), path);
  }
}

TEST(TvrpaPathText, QuotesAndBackslashesInKeysAreEscaped) {
  const TextFile tree(R"({"systemName": "x", "nodes": [
      {"type": "ChassisNode", "name": "Rack \"7\" \\ left", "segment": "Rack \"7\" \\ left"}]})",
                      ".json");
  const ProgramResult r = tvrpa({"ein", "TVRHX_Chassis", "--tree", tree.path()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "root/cimv2:TVRHX_Chassis.Tag=\"/Rack \\\"7\\\" \\\\ left\",CreationClassName=\"TVRHX_Chassis\"\n");
}

TEST(TvrpaPathText, EscapedPathsOfTheRealProvidersReadBack) {
  const TextFile tree(R"({"systemName": "x", "nodes": [
      {"type": "ChassisNode", "name": "Rack \"7\" \\ left", "segment": "Rack \"7\" \\ left"},
      {"type": "ChassisNode", "name": "\\\\server\\share", "segment": "\\\\server\\share"}]})",
                      ".json");
  expectEachPrintedPathReadsBack({"ein", "TVRHX_Chassis"}, {"--tree", tree.path()});
}

TEST(TvrpaPathText, ElementPathsOfTheExampleReadBack) {
  expectEachPrintedPathReadsBack({"ein", "TVRHX_Chassis"}, {"--tree", bladeTree()});
  expectEachPrintedPathReadsBack({"ein", "TVRHX_SASPortController"}, {"--tree", bladeTree()});
}

TEST(TvrpaPathText, ReferenceKeysArePrintedAsQuotedNestedPaths) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r = tvrpa(std::vector<std::string>{"ein", "FIX_Holds"} + fixture.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(linesOf(r.out),
              ElementsAre("root/cimv2:FIX_Holds.GroupComponent=\"root/cimv2:FIX_Rack.Name=\\\"R1\\\","
                          "CreationClassName=\\\"FIX_Rack\\\"\",PartComponent=\"root/cimv2:FIX_Card.Name=\\\"C1\\\","
                          "CreationClassName=\\\"FIX_Card\\\"\"",
                          // A quote inside the nested path's own quoted value is escaped twice.
                          "root/cimv2:FIX_Holds.GroupComponent=\"root/cimv2:FIX_Rack.Name=\\\"Rack \\\\\\\"B\\\\\\\" "
                          "\\\\\\\\ 2\\\",CreationClassName=\\\"FIX_Rack\\\"\",PartComponent=\"root/cimv2:FIX_Card."
                          "Name=\\\"C2\\\",CreationClassName=\\\"FIX_Card\\\"\"",
                          "root/cimv2:FIX_Holds.GroupComponent=\"root/cimv2:FIX_Card.Name=\\\"C2\\\","
                          "CreationClassName=\\\"FIX_Card\\\"\",PartComponent=\"root/cimv2:FIX_Rack.Name=\\\"Rack "
                          "\\\\\\\"B\\\\\\\" \\\\\\\\ 2\\\",CreationClassName=\\\"FIX_Rack\\\"\""));
}

TEST(TvrpaPathText, AssociationPathsWithNestedReferencesReadBack) {
  const FixtureRegistration fixture(fixtureMachine());
  expectEachPrintedPathReadsBack({"ein", "FIX_Holds"}, fixture.args());
  expectEachPrintedPathReadsBack({"ein", "FIX_Plugs"}, fixture.args());
}

TEST(TvrpaPathText, QuotedValueThatIsAPathWithKeysIsReadAsAReference) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r =
      tvrpa(std::vector<std::string>{
                "gi", "FIX_Holds.GroupComponent=\"FIX_Rack.Name=\\\"R1\\\"\",PartComponent=\"plain text\"", "--format",
                "json"} +
            fixture.args());
  const nlohmann::json keys = parseJson(r.out)["request"]["target"]["keys"];
  ASSERT_EQ(keys.size(), 2u);
  EXPECT_EQ(keys[0]["type"], "ref");
  EXPECT_EQ(keys[0]["value"]["className"], "FIX_Rack");
  EXPECT_EQ(keys[0]["value"]["keys"][0]["value"], "R1");
  EXPECT_EQ(keys[1]["type"], "string");
  EXPECT_EQ(keys[1]["value"], "plain text");
}

TEST(TvrpaPathText, BareValuesAreNumbersAndBooleans) {
  const FixtureRegistration fixture(fixtureMachine());
  const ProgramResult r =
      tvrpa(std::vector<std::string>{"gi", "other/ns:FIX_Rack.A=42,B=-3,C=TRUE", "--format", "json"} + fixture.args());
  const nlohmann::json target = parseJson(r.out)["request"]["target"];
  EXPECT_EQ(target["namespace"], "other/ns");
  EXPECT_EQ(target["keys"][0]["type"], "uint64");
  EXPECT_EQ(target["keys"][0]["value"], 42);
  EXPECT_EQ(target["keys"][1]["type"], "sint64");
  EXPECT_EQ(target["keys"][2]["type"], "boolean");
  EXPECT_EQ(target["text"], "other/ns:FIX_Rack.A=42,B=-3,C=TRUE");
}

TEST(TvrpaPathText, AssociationPathsOfTheRealProvidersReadBackAsTheSamePath) {
  // Every registered association class: its paths, with nested references
  // that carry hosts, are read back to the same text.
  const nlohmann::json classes = parseJson(tvrpa({"classes", "--format", "json"}).out);
  std::size_t checked = 0;
  for (const nlohmann::json& c : classes) {
    const auto kinds = c["kinds"].get<std::vector<std::string>>();
    if (std::find(kinds.begin(), kinds.end(), "association") == kinds.end()) continue;
    const ProgramResult names = tvrpa({"ein", c["className"].get<std::string>(), "--tree", bladeTree()});
    for (const std::string& path : linesOf(names.out)) {
      const ProgramResult back = tvrpa({"gi", path, "--tree", bladeTree(), "--format", "json"});
      EXPECT_NE(back.exitStatus, 1) << back.err;
      EXPECT_EQ(parseJson(back.out)["request"]["target"]["text"], path);
      ++checked;
    }
  }
  EXPECT_GT(checked, 0u) << "no association instance in the example";
}

struct BadPath {
  const char* text;
  const char* message;
};

TEST(TvrpaPathText, UnreadablePathNamesTheColumnAndPointsAtIt) {
  const BadPath cases[] = {
      {"TVRHX_Chassis.Tag=\"open", "bad object path at column 19: unterminated quoted value"},
      {"TVRHX_Chassis.Tag", "bad object path at column 18: expected '=' after key Tag"},
      {"9Chassis.Tag=\"x\"", "bad object path at column 1: expected a class name"},
      {"TVRHX_Chassis.Tag=\"x\",", "bad object path at column 23: expected a key name"},
      {"TVRHX_Chassis.Tag=\"x\";", "bad object path at column 22: expected ',' between keys"},
      {"TVRHX_Chassis.Tag=1x", "bad object path at column 19: expected a quoted string, a number, TRUE or FALSE"},
  };
  for (const BadPath& c : cases) {
    const ProgramResult r = tvrpa({"gi", c.text, "--tree", bladeTree()});
    EXPECT_EQ(r.exitStatus, 1) << c.text;
    EXPECT_THAT(r.err, StartsWith(std::string("tvrpa: ") + c.message + "\n")) << c.text;
  }
}

TEST(TvrpaPathText, CaretStandsUnderTheColumn) {
  const ProgramResult r = tvrpa({"ai", "TVRHX_Chassis.Tag"});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("\n  TVRHX_Chassis.Tag\n                   ^\n"));
}

} // namespace
} // namespace tvr::test
