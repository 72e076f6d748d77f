// ai, ain, ri and rin on the fixture machine: routing to every association
// provider or to one, merging in registration order, the arguments each
// provider gets, and answers that are never completed with returnDone.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::Not;

const char* const kRackOne = "root/cimv2:FIX_Rack.Name=\"R1\",CreationClassName=\"FIX_Rack\"";
const char* const kCardOne = "root/cimv2:FIX_Card.Name=\"C1\",CreationClassName=\"FIX_Card\"";
const char* const kPort = "root/cimv2:FIX_Port.Name=\"p0\",CreationClassName=\"FIX_Port\"";

class TvrpaAssociationOperations : public ::testing::Test {
protected:
  ProgramResult run(const std::vector<std::string>& args) { return tvrpa(args + fixture_.args()); }

private:
  FixtureRegistration fixture_{fixtureMachine()};
};

TEST_F(TvrpaAssociationOperations, AssociatorNamesMergeEveryProviderInRegistrationOrder) {
  const ProgramResult r = run({"ain", kCardOne});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(linesOf(r.out), ElementsAre(kRackOne, kPort));
}

TEST_F(TvrpaAssociationOperations, AssociatorsPrintTheFarInstances) {
  const ProgramResult r = run({"ai", kRackOne});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.out, testing::StartsWith(std::string(kCardOne) + "\n    Name              = \"C1\"\n"));
}

TEST_F(TvrpaAssociationOperations, EachProviderIsAskedWithItsOwnAssociationClass) {
  const ProgramResult r = run({"ai", kCardOne, "--trace"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixHolds] Associators assocClass=\"FIX_Holds\" resultClass=NULL role=NULL "
                               "resultRole=NULL properties=NULL\n"));
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixPlugs] Associators assocClass=\"FIX_Plugs\" resultClass=NULL role=NULL "
                               "resultRole=NULL properties=NULL\n"));
}

TEST_F(TvrpaAssociationOperations, JsonListsEveryProviderAskedAndThatNoneCompleted) {
  const ProgramResult r = run({"ai", kCardOne, "--format", "json"});
  ASSERT_EQ(r.exitStatus, 0) << r.err;
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["request"]["everyAssociationProvider"], true);
  ASSERT_EQ(doc["providers"].size(), 2u);
  EXPECT_EQ(doc["providers"][0]["provider"], "FixHolds");
  EXPECT_EQ(doc["providers"][0]["className"], "FIX_Holds");
  EXPECT_EQ(doc["providers"][1]["provider"], "FixPlugs");
  // Association handlers never call returnDone; what they returned is shown.
  EXPECT_EQ(doc["done"], false);
  ASSERT_EQ(doc["items"].size(), 2u);
  EXPECT_EQ(doc["items"][0]["path"]["text"], kRackOne);
  EXPECT_EQ(doc["items"][1]["path"]["text"], kPort);
}

TEST_F(TvrpaAssociationOperations, NamedAssociationClassAsksOnlyItsProviderWithEveryArgument) {
  const ProgramResult r = run({"ai", kCardOne, "--assoc-class", "FIX_Plugs", "--result-class", "FIX_Port", "--role",
                               "Antecedent", "--result-role", "Dependent", "--properties", "Name,Slots", "--trace"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixPlugs] Associators assocClass=\"FIX_Plugs\" resultClass=\"FIX_Port\" "
                               "role=\"Antecedent\" resultRole=\"Dependent\" properties={Name,Slots}\n"));
  EXPECT_THAT(r.err, Not(HasSubstr("FixHolds")));
  EXPECT_THAT(linesOf(r.out).at(0), kPort);
}

TEST_F(TvrpaAssociationOperations, AssociatorNamesCarryNoPropertyList) {
  const ProgramResult r = run({"ain", kCardOne, "--assoc-class", "FIX_Holds", "--role", "PartComponent", "--trace"});
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixHolds] AssociatorNames assocClass=\"FIX_Holds\" resultClass=NULL "
                               "role=\"PartComponent\" resultRole=NULL\n"));
}

TEST_F(TvrpaAssociationOperations, ReferencesPrintTheAssociationInstancesWithNestedPaths) {
  const ProgramResult r = run({"ri", kCardOne});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(
      r.out,
      HasSubstr("    GroupComponent = \"root/cimv2:FIX_Rack.Name=\\\"R1\\\",CreationClassName=\\\"FIX_Rack\\\"\"\n"));
  EXPECT_THAT(
      r.out,
      HasSubstr("    Antecedent = \"root/cimv2:FIX_Card.Name=\\\"C1\\\",CreationClassName=\\\"FIX_Card\\\"\"\n"));
}

TEST_F(TvrpaAssociationOperations, ReferencesAskEachProviderWithItsOwnClassAsResultClass) {
  const ProgramResult r = run({"ri", kCardOne, "--role", "PartComponent", "--properties", "", "--trace"});
  EXPECT_THAT(
      r.err,
      HasSubstr("[broker 1 FixHolds] References resultClass=\"FIX_Holds\" role=\"PartComponent\" properties={}\n"));
  EXPECT_THAT(
      r.err,
      HasSubstr("[broker 1 FixPlugs] References resultClass=\"FIX_Plugs\" role=\"PartComponent\" properties={}\n"));
}

TEST_F(TvrpaAssociationOperations, AssocClassOfReferencesIsTheirResultClass) {
  const ProgramResult r = run({"rin", kCardOne, "--assoc-class", "FIX_Holds", "--trace"});
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixHolds] ReferenceNames resultClass=\"FIX_Holds\" role=NULL\n"));
  EXPECT_THAT(r.err, Not(HasSubstr("FixPlugs")));
  EXPECT_EQ(linesOf(r.out).size(), 1u);
}

TEST_F(TvrpaAssociationOperations, ReferencesNamingAClassOfNoAssociationPassItToEveryProvider) {
  const ProgramResult r = run({"rin", kCardOne, "--result-class", "FIX_Rack", "--trace"});
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixHolds] ReferenceNames resultClass=\"FIX_Rack\" role=NULL\n"));
  EXPECT_THAT(r.err, HasSubstr("[broker 1 FixPlugs] ReferenceNames resultClass=\"FIX_Rack\" role=NULL\n"));
}

TEST_F(TvrpaAssociationOperations, PrintedAssociatorPathsReadBack) {
  const ProgramResult names = run({"ain", kCardOne});
  for (const std::string& path : linesOf(names.out)) {
    const ProgramResult back = run({"ain", path});
    EXPECT_EQ(back.exitStatus, 0) << back.err;
    EXPECT_THAT(linesOf(back.out), testing::Contains(kCardOne)) << path;
  }
}

TEST_F(TvrpaAssociationOperations, UnknownAssociationClassIsRefusedByTheObjectManager) {
  const ProgramResult r = run({"ai", kCardOne, "--assoc-class", "FIX_Nothing"});
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_THAT(
      r.err,
      HasSubstr("tvrpa: CMPI_RC_ERR_INVALID_CLASS: no association provider is registered for class FIX_Nothing"));
}

TEST(TvrpaWithoutAssociationProviders, AssociatorsAnswerEmptyAndSucceed) {
  const FixtureRegistration elementsOnly({{"FIX_Rack", "FixRack", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ai", kRackOne} + elementsOnly.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(r.out, "");
  EXPECT_THAT(r.err,
              HasSubstr("no association provider is registered in namespace root/cimv2, so the answer is empty"));
}

TEST(TvrpaWithoutAssociationProviders, EveryAssociationOperationAnswersCleanlyInJson) {
  const FixtureRegistration elementsOnly({{"FIX_Rack", "FixRack", "instance"}});
  for (const char* op : {"ai", "ain", "ri", "rin"}) {
    const ProgramResult r = tvrpa(std::vector<std::string>{op, kRackOne, "--format", "json"} + elementsOnly.args());
    EXPECT_EQ(r.exitStatus, 0) << op << r.err;
    const nlohmann::json doc = parseJson(r.out);
    EXPECT_EQ(doc["items"], nlohmann::json::array()) << op;
    EXPECT_EQ(doc["providers"], nlohmann::json::array()) << op;
    EXPECT_EQ(doc["status"]["name"], "CMPI_RC_OK") << op;
  }
}

TEST(TvrpaWithoutAssociationProviders, UnservedNamespaceIsStillRefused) {
  const FixtureRegistration elementsOnly({{"FIX_Rack", "FixRack", "instance"}});
  const ProgramResult r =
      tvrpa(std::vector<std::string>{"ai", "root/other:FIX_Rack.Name=\"R1\""} + elementsOnly.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_THAT(r.err, HasSubstr("CMPI_RC_ERR_INVALID_NAMESPACE"));
}

} // namespace
} // namespace tvr::test
