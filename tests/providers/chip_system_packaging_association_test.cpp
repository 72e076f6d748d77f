// The association handlers of TVRHX_ChipSystemPackaging through the
// embedded object manager: the target lookup has no rule for this class,
// so every handler fails for it; named through another association that
// has a rule, the handlers go on.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::AssociationArgs;
using broker::Fault;
using broker::RequestOptions;
using broker::ResultItem;
using KVLog::Channel;
using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::IsEmpty;
using ::testing::StartsWith;

const char* const kSystemWithThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System"},
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C"}
  ]})";

ObjectPath systemPath() {
  ObjectPath path = pathWithKeys("TVRHX_ComputerSystem",
                                 {{"CreationClassName", "TVRHX_ComputerSystem"}, {"Name", "host.example.com"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath diskControllerPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_DiskController", {{"Tag", tag}, {"CreationClassName", "TVRHX_DiskController"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath chipPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_ChipIDECont", {{"Tag", tag}, {"CreationClassName", "TVRHX_ChipIDECont"}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

RequestOptions toChipSystemPackaging() {
  RequestOptions options;
  options.routeTo = "TVRHX_ChipSystemPackaging";
  return options;
}

// The lines this provider's module wrote to one channel.
std::vector<LoggedLine> ownLines(const LoggerCapture& capture, Channel channel) {
  std::vector<LoggedLine> out;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.ChipSystemPackaging" && line.channel == channel) out.push_back(line);
  return out;
}

class ChipSystemPackagingAssociationTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kSystemWithThreeControllers); }

  // A handler's failure for its own association class.
  void expectFailure(const Response& r, const char* text) {
    EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED) << text;
    EXPECT_EQ(r.message, std::optional<std::string>(text));
    EXPECT_THAT(traceTexts(r), ElementsAre(text));
    ASSERT_FALSE(r.traces.empty());
    EXPECT_EQ(r.traces[0].component, std::optional<std::string>("AssociationProvider ChipIDECont And ComputerSystem"));
    EXPECT_EQ(r.traces[0].level, 1);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 0);
  }

  ProviderHarness harness;
};

TEST_F(ChipSystemPackagingAssociationTest, AssociatorsForItsOwnClassFail) {
  LoggerCapture capture;
  expectFailure(harness.om().associators(systemPath(), over("TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in Associators.");
  EXPECT_EQ(ownLines(capture, Channel::Log).size(), 1u) << "ENTERING alone";
}

TEST_F(ChipSystemPackagingAssociationTest, AssociatorNamesForItsOwnClassFail) {
  expectFailure(harness.om().associatorNames(systemPath(), over("TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in AssociatorNames.");
  expectFailure(harness.om().associatorNames(chipPath("/A"), over("TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in AssociatorNames.");
}

TEST_F(ChipSystemPackagingAssociationTest, ReferencesForItsOwnClassFail) {
  expectFailure(harness.om().references(systemPath(), over(nullptr, "TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in References.");
  expectFailure(harness.om().references(chipPath("/A"), over(nullptr, "TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in References.");
}

TEST_F(ChipSystemPackagingAssociationTest, ReferenceNamesForItsOwnClassFail) {
  expectFailure(harness.om().referenceNames(systemPath(), over(nullptr, "TVRHX_ChipSystemPackaging")),
                "Object Path is NULL in ReferenceNames.");
}

TEST_F(ChipSystemPackagingAssociationTest, WithoutBrokerTheFailureHasNoMessage) {
  RequestOptions options = toChipSystemPackaging();
  options.nullBroker = true;
  Response r = harness.om().associators(systemPath(), over("TVRHX_ChipSystemPackaging"), options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(ChipSystemPackagingAssociationTest, AssociatorsThroughTheDiskControllerRuleGiveTheBrokersSystems) {
  Response r = harness.om().associators(diskControllerPath("/B"), over("TVRHX_DiskControllerCSPackage"),
                                        toChipSystemPackaging());
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "ChipSystemPackagingProvider");
  EXPECT_EQ(r.instances(), harness.enumerateInstances("TVRHX_ComputerSystem").instances());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
}

TEST_F(ChipSystemPackagingAssociationTest, AssociatorNamesThroughTheDiskControllerRuleGiveTheSystemsPaths) {
  Response r = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage"),
                                            toChipSystemPackaging());
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), (std::vector<ObjectPath>{systemPath()}));
}

TEST_F(ChipSystemPackagingAssociationTest, ResultClassNarrowsTheSystemsToTheirClassOrBaseClass) {
  for (const char* resultClass : {"CIM_ComputerSystem", "cim_computersystem", "TVRHX_ComputerSystem"}) {
    Response r = harness.om().associatorNames(
        diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage", resultClass), toChipSystemPackaging());
    EXPECT_EQ(r.items.size(), 1u) << resultClass;
  }
  LoggerCapture capture;
  Response other = harness.om().associatorNames(
      diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage", "CIM_Chip"), toChipSystemPackaging());
  EXPECT_EQ(other.rc, CMPI_RC_OK);
  EXPECT_THAT(other.items, IsEmpty());
  EXPECT_EQ(ownLines(capture, Channel::Log).size(), 1u) << "no exit trace";
}

TEST_F(ChipSystemPackagingAssociationTest, TargetOfAnotherClassGivesNothingWithAnExitTrace) {
  LoggerCapture capture;
  Response r = harness.om().associators(systemPath(), over("TVRHX_DiskControllerCSPackage"), toChipSystemPackaging());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_THAT(log[1].text, StartsWith("EXITING: ChipSystemPackaging_Associators() in "
                                      "src/providers/ChipSystemPackaging.cpp"));
}

TEST_F(ChipSystemPackagingAssociationTest, FailingUpCallReturnsTheBrokersStatus) {
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage"),
                                            toChipSystemPackaging());
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u) << "ENTERING and the failure, no EXITING";
  EXPECT_EQ(log[1].level, 6000);
  EXPECT_THAT(log[1].text, EndsWith("]: Call to CBEnumInstances of target Class Failed."));
}

TEST_F(ChipSystemPackagingAssociationTest, AssociatorsTraceTheirTextArguments) {
  LoggerCapture capture;
  AssociationArgs args = over("TVRHX_ChipSystemPackaging", "CIM_Chip");
  args.role = "Dependent";
  args.resultRole = "Antecedent";
  harness.om().associators(systemPath(), args);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 1u);
  EXPECT_THAT(log[0].text, ::testing::HasSubstr("ENTERING: ChipSystemPackaging_Associators() in "
                                                "src/providers/ChipSystemPackaging.cpp"));
  EXPECT_THAT(log[0].text, EndsWith(" _RefLeftClass=TVRHX_ChipSystemPackaging _RefRightClass=CIM_Chip "
                                    "role=Dependent resultRole=Antecedent properties=0"));
}

} // namespace
} // namespace tvr::test
