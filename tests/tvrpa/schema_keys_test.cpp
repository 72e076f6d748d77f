// --schema and the project's schema: an instance a provider returns with no
// keys in its path is shown with the keys its class declares, as an object
// manager that knows the class shows it.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;

const char* const kLooseSchema = R"(
class FIX_Loose
{
      [Key]
   string Name;
      [Key]
   string CreationClassName;
   string Description;
};
)";

class TvrpaSchemaKeys : public ::testing::Test {
protected:
  ProgramResult run(const std::vector<std::string>& args) { return tvrpa(args + fixture_.args()); }

private:
  FixtureRegistration fixture_{{{"FIX_Loose", "FixLoose", "instance"}}};
};

TEST_F(TvrpaSchemaKeys, InstanceOfAClassTheSchemaDoesNotKnowKeepsItsBarePath) {
  const ProgramResult r = run({"ei", "FIX_Loose"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(linesOf(r.out).at(0), "root/cimv2:FIX_Loose");
}

TEST_F(TvrpaSchemaKeys, SchemaGivesAKeylessInstanceTheKeysOfItsClass) {
  const TextFile schema(kLooseSchema, ".mof");
  const ProgramResult r = run({"ei", "FIX_Loose", "--schema", schema.path()});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(linesOf(r.out).at(0), "root/cimv2:FIX_Loose.Name=\"L1\",CreationClassName=\"FIX_Loose\"");
}

TEST_F(TvrpaSchemaKeys, InventoryUsesTheSchemaToo) {
  const TextFile schema(kLooseSchema, ".mof");
  const ProgramResult r = run({"inventory", "--schema", schema.path(), "--format", "json"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(parseJson(r.out)["elements"][0]["path"],
            "root/cimv2:FIX_Loose.Name=\"L1\",CreationClassName=\"FIX_Loose\"");
}

TEST_F(TvrpaSchemaKeys, UnreadableSchemaIsAUsageError) {
  const ProgramResult r = run({"ei", "FIX_Loose", "--schema", "/nonexistent/x.mof"});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr("tvrpa: cannot read the schema: "));
  EXPECT_THAT(r.err, HasSubstr("/nonexistent/x.mof"));
}

TEST_F(TvrpaSchemaKeys, BrokenSchemaIsAUsageErrorNamingTheLine) {
  const TextFile schema("class FIX_Loose\n{\n   string Name\n};\n", ".mof");
  const ProgramResult r = run({"ei", "FIX_Loose", "--schema", schema.path()});
  EXPECT_EQ(r.exitStatus, 1);
  EXPECT_THAT(r.err, HasSubstr(schema.path() + ":"));
}

} // namespace
} // namespace tvr::test
