// --format text, mof and json of the CIM operations, on the fixture's racks
// (whose values need escaping) and on the example blade system.
#include "TvrpaRun.h"

#include "tvr/broker/Mof.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;

const char* const kRackOne = "root/cimv2:FIX_Rack.Name=\"R1\",CreationClassName=\"FIX_Rack\"";

class TvrpaOutputFormats : public ::testing::Test {
protected:
  ProgramResult run(const std::vector<std::string>& args) { return tvrpa(args + fixture_.args()); }

private:
  FixtureRegistration fixture_{fixtureMachine()};
};

TEST_F(TvrpaOutputFormats, TextShowsEachPropertyOnOneLineWithEscapes) {
  const ProgramResult r = run({"gi", kRackOne});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, std::string(kRackOne) + "\n"
                                           "    Name              = \"R1\"\n"
                                           "    CreationClassName = \"FIX_Rack\"\n"
                                           "    Description       = \"Says \\\"hi\\\" \\\\ bye\\nline two\"\n"
                                           "    Slots             = 4\n"
                                           "    Enabled           = TRUE\n"
                                           "    Aliases           = {\"first\", \"second\"}\n");
}

TEST_F(TvrpaOutputFormats, TextSeparatesInstancesByABlankLine) {
  const ProgramResult r = run({"ei", "FIX_Card"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, HasSubstr("Aliases           = {\"first\", \"second\"}\n\nroot/cimv2:FIX_Card.Name=\"C2\""));
}

TEST_F(TvrpaOutputFormats, MofWritesInstanceDeclarationsAfterTheirPath) {
  const ProgramResult r = run({"gi", kRackOne, "--format", "mof"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "// " + std::string(kRackOne) +
                       "\n"
                       "instance of FIX_Rack\n"
                       "{\n"
                       "    Name = \"R1\";\n"
                       "    CreationClassName = \"FIX_Rack\";\n"
                       "    Description = \"Says \\\"hi\\\" \\\\ bye\\nline two\";\n"
                       "    Slots = 4;\n"
                       "    Enabled = TRUE;\n"
                       "    Aliases = {\"first\", \"second\"};\n"
                       "};\n");
}

TEST_F(TvrpaOutputFormats, MofWritesReferencesAsQuotedPaths) {
  const ProgramResult r = run({"ei", "FIX_Holds", "--format", "mof"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(
      r.out,
      HasSubstr("    GroupComponent = \"root/cimv2:FIX_Rack.Name=\\\"R1\\\",CreationClassName=\\\"FIX_Rack\\\"\";\n"));
}

TEST_F(TvrpaOutputFormats, MofOutputReadsBackAsMof) {
  const ProgramResult r = run({"ei", "FIX_Rack", "--format", "mof"});
  broker::MofError error;
  const auto schema = broker::MofSchema::parse(r.out, "ei-output", &error);
  ASSERT_TRUE(schema) << error.str() << "\n" << r.out;
  ASSERT_EQ(schema->instances().size(), 2u);
  EXPECT_EQ(schema->instances()[1].className, "FIX_Rack");
  ASSERT_EQ(schema->instances()[1].values.size(), 6u);
  EXPECT_EQ(schema->instances()[1].values[0].first, "Name");
}

TEST_F(TvrpaOutputFormats, MofPrintsPathsOfNameOperationsAsText) {
  const ProgramResult r = run({"ein", "FIX_Rack", "--format", "mof"});
  EXPECT_THAT(r.out, HasSubstr(std::string(kRackOne) + "\n"));
}

TEST_F(TvrpaOutputFormats, JsonGivesTheRequestItemsStatusDoneAndProviders) {
  const ProgramResult r = run({"gi", kRackOne, "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["operation"], "GetInstance");
  EXPECT_EQ(doc["request"]["target"]["text"], kRackOne);
  EXPECT_EQ(doc["status"], nlohmann::json({{"code", 0}, {"name", "CMPI_RC_OK"}, {"message", nullptr}}));
  EXPECT_EQ(doc["done"], true);
  EXPECT_TRUE(doc["exception"].is_null());
  ASSERT_EQ(doc["providers"].size(), 1u);
  EXPECT_EQ(doc["providers"][0]["provider"], "FixRack");
  EXPECT_EQ(doc["providers"][0]["className"], "FIX_Rack");
  ASSERT_EQ(doc["items"].size(), 1u);
  const nlohmann::json& item = doc["items"][0];
  EXPECT_EQ(item["kind"], "instance");
  EXPECT_EQ(item["path"]["className"], "FIX_Rack");
  EXPECT_EQ(item["properties"][2]["value"], "Says \"hi\" \\ bye\nline two");
  EXPECT_EQ(item["properties"][3],
            nlohmann::json({{"name", "Slots"}, {"type", "uint16"}, {"cmpiType", "CMPI_uint16"}, {"value", 4}}));
  EXPECT_EQ(item["properties"][4]["value"], true);
  EXPECT_EQ(item["properties"][5]["type"], "string[]");
  EXPECT_EQ(item["properties"][5]["value"], nlohmann::json({"first", "second"}));
}

TEST_F(TvrpaOutputFormats, JsonOfAnEmptyAnswerHasNoItems) {
  const ProgramResult r = run({"gi", "FIX_Rack.Name=\"nothing\"", "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["items"], nlohmann::json::array());
  EXPECT_EQ(doc["done"], true);
}

TEST_F(TvrpaOutputFormats, JsonNamesPathsWithTypedKeys) {
  const ProgramResult r = run({"ein", "FIX_Rack", "--format", "json"});
  const nlohmann::json doc = parseJson(r.out);
  ASSERT_EQ(doc["items"].size(), 2u);
  EXPECT_EQ(doc["items"][0]["kind"], "path");
  EXPECT_EQ(
      doc["items"][1]["path"]["keys"][0],
      nlohmann::json({{"name", "Name"}, {"type", "string"}, {"cmpiType", "CMPI_chars"}, {"value", "Rack \"B\" \\ 2"}}));
}

TEST(TvrpaOutputFormatsOnTheBladeSystem, JsonCarriesEachPropertysCimType) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  ASSERT_EQ(doc["items"].size(), 2u);
  const nlohmann::json& first = doc["items"][0];
  EXPECT_EQ(first["path"]["host"], "blade-07.lab.example.com");
  EXPECT_EQ(first["properties"][0]["name"], "Tag");
  EXPECT_EQ(first["properties"][0]["cmpiType"], "CMPI_chars");
  EXPECT_EQ(first["properties"][2]["name"], "ChassisPackageType");
  EXPECT_EQ(first["properties"][2]["type"], "uint16");
  EXPECT_EQ(first["properties"][2]["value"], 17);
}

TEST(TvrpaOutputFormatsOnTheBladeSystem, MofOfEveryChassisReadsBack) {
  const ProgramResult r = tvrpa({"ei", "TVRHX_Chassis", "--tree", bladeTree(), "--format", "mof"});
  broker::MofError error;
  const auto schema = broker::MofSchema::parse(r.out, "ei-output", &error);
  ASSERT_TRUE(schema) << error.str();
  EXPECT_EQ(schema->instances().size(), 2u);
}

} // namespace
} // namespace tvr::test
