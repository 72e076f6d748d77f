// Exit statuses and the messages that go with them: 2 for a provider's
// error status (by its CMPI name, with its message), 3 for an exception that
// escaped a provider; an answer merged from several association providers
// fails only when all of them failed.
#include "TvrpaRun.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::HasSubstr;
using ::testing::StartsWith;

const char* const kCardOne = "root/cimv2:FIX_Card.Name=\"C1\",CreationClassName=\"FIX_Card\"";

TEST(TvrpaExitStatus, ClassNobodyServesIsAnErrorWithTheStatusName) {
  const ProgramResult r = tvrpa({"ei", "CIM_Nothing", "--tree", bladeTree()});
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_EQ(r.err, "tvrpa: CMPI_RC_ERR_INVALID_CLASS: no provider is registered for class CIM_Nothing\n");
}

TEST(TvrpaExitStatus, ProviderErrorShowsItsStatusNameAndMessage) {
  const FixtureRegistration broken({{"FIX_Broken", "FixFailing", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ei", "FIX_Broken"} + broken.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_EQ(r.err, "tvrpa: FixFailing (FIX_Broken) answered CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here\n");
  EXPECT_EQ(r.out, "");
}

TEST(TvrpaExitStatus, ProviderErrorIsInTheJsonStatus) {
  const FixtureRegistration broken({{"FIX_Broken", "FixFailing", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ein", "FIX_Broken", "--format", "json"} + broken.args());
  EXPECT_EQ(r.exitStatus, 2);
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["status"]["code"], 6);
  EXPECT_EQ(doc["status"]["name"], "CMPI_RC_ERR_NOT_FOUND");
  EXPECT_EQ(doc["status"]["message"], "the fixture has nothing here");
  EXPECT_EQ(doc["done"], false);
}

TEST(TvrpaExitStatus, EscapedExceptionIsReportedAsSuchAfterWhatCameBeforeIt) {
  const FixtureRegistration throwing({{"FIX_Throws", "FixThrowing", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ei", "FIX_Throws"} + throwing.args());
  EXPECT_EQ(r.exitStatus, 3);
  EXPECT_EQ(r.err, "tvrpa: an exception escaped the provider FixThrowing (FIX_Throws): std::runtime_error: "
                   "fixture provider gave up\n");
  EXPECT_THAT(r.out, StartsWith("root/cimv2:FIX_Rack.Name=\"R1\""));
}

TEST(TvrpaExitStatus, EscapedExceptionIsInTheJson) {
  const FixtureRegistration throwing({{"FIX_Throws", "FixThrowing", "instance"}});
  const ProgramResult r =
      tvrpa(std::vector<std::string>{"gi", "FIX_Throws.Name=\"x\"", "--format", "json"} + throwing.args());
  EXPECT_EQ(r.exitStatus, 3);
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["exception"], nlohmann::json({{"type", "std::runtime_error"}, {"what", "fixture provider gave up"}}));
  EXPECT_EQ(doc["providers"][0]["exception"]["type"], "std::runtime_error");
  EXPECT_EQ(doc["items"].size(), 1u);
}

TEST(TvrpaExitStatus, OneFailingProviderAmongSeveralLeavesTheMergedAnswerOk) {
  // As an object manager merges them: a provider that serves other classes
  // than the source's often refuses, and the others' answers stand.
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.push_back({"FIX_Broken", "FixFailing", "instance association"});
  const FixtureRegistration registration(classes);
  const ProgramResult r = tvrpa(std::vector<std::string>{"ain", kCardOne} + registration.args());
  EXPECT_EQ(r.exitStatus, 0) << r.err;
  EXPECT_EQ(linesOf(r.out).size(), 2u);
  EXPECT_EQ(r.err, "");
}

TEST(TvrpaExitStatus, MergedJsonStillShowsEachProvidersStatus) {
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.push_back({"FIX_Broken", "FixFailing", "instance association"});
  const FixtureRegistration registration(classes);
  const ProgramResult r = tvrpa(std::vector<std::string>{"ain", kCardOne, "--format", "json"} + registration.args());
  const nlohmann::json doc = parseJson(r.out);
  EXPECT_EQ(doc["status"]["name"], "CMPI_RC_OK");
  ASSERT_EQ(doc["providers"].size(), 3u);
  EXPECT_EQ(doc["providers"][2]["provider"], "FixFailing");
  EXPECT_EQ(doc["providers"][2]["status"]["name"], "CMPI_RC_ERR_NOT_FOUND");
}

TEST(TvrpaExitStatus, EveryProviderFailingFailsTheMergedAnswerAndNamesEach) {
  const FixtureRegistration registration(
      {{"FIX_Broken", "FixFailing", "instance association"}, {"FIX_Refused", "FixFailing", "instance association"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"rin", kCardOne} + registration.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_EQ(r.err, "tvrpa: FixFailing (FIX_Broken) answered CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here\n"
                   "tvrpa: FixFailing (FIX_Refused) answered CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here\n");
}

TEST(TvrpaExitStatus, NamedAssociationProviderFailingFailsTheRun) {
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.push_back({"FIX_Broken", "FixFailing", "instance association"});
  const FixtureRegistration registration(classes);
  const ProgramResult r =
      tvrpa(std::vector<std::string>{"ai", kCardOne, "--assoc-class", "FIX_Broken"} + registration.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_EQ(r.err, "tvrpa: FixFailing (FIX_Broken) answered CMPI_RC_ERR_NOT_FOUND: the fixture has nothing here\n");
}

TEST(TvrpaExitStatus, ExceptionOutranksAnErrorStatus) {
  std::vector<FixtureClass> classes = fixtureMachine();
  classes.push_back({"FIX_Broken", "FixFailing", "instance association"});
  classes.push_back({"FIX_Throws", "FixThrowing", "instance association"});
  const FixtureRegistration registration(classes);
  const ProgramResult r = tvrpa(std::vector<std::string>{"ain", kCardOne} + registration.args());
  EXPECT_EQ(r.exitStatus, 3);
  EXPECT_THAT(r.err, HasSubstr("FixFailing (FIX_Broken) answered CMPI_RC_ERR_NOT_FOUND"));
  EXPECT_THAT(r.err, HasSubstr("an exception escaped the provider FixThrowing (FIX_Throws)"));
}

TEST(TvrpaExitStatus, MissingEntryPointIsAProviderFailure) {
  const FixtureRegistration wrong({{"FIX_Rack", "NoSuchProvider", "instance"}});
  const ProgramResult r = tvrpa(std::vector<std::string>{"ei", "FIX_Rack"} + wrong.args());
  EXPECT_EQ(r.exitStatus, 2);
  EXPECT_THAT(r.err, StartsWith("tvrpa: NoSuchProvider (FIX_Rack) answered CMPI_RC_ERR_FAILED: "));
  EXPECT_THAT(r.err, HasSubstr("NoSuchProvider_Create_InstanceMI"));
}

} // namespace
} // namespace tvr::test
