// The association handlers of TVRHX_ICRealizesChip through the embedded
// object manager: the target lookup knows no far class for this
// association, so every handler closes with markProviderExit and OK.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::AssociationArgs;
using broker::Operation;
using broker::RequestOptions;
using KVLog::Channel;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;

const char* const kThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "children": [{"type": "SlotNode", "name": "Slot 1"}]},
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}}
  ]})";

ObjectPath chipPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_ChipIDECont", {{"Tag", tag}, {"CreationClassName", "TVRHX_ChipIDECont"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath controllerPath(const std::string& deviceID) {
  ObjectPath path = pathWithKeys("TVRHX_IDEController", {{"DeviceID", deviceID},
                                                         {"CreationClassName", "TVRHX_IDEController"},
                                                         {"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                                         {"SystemName", "host.example.com"}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

RequestOptions toICRealizesChip() {
  RequestOptions options;
  options.routeTo = "TVRHX_ICRealizesChip";
  return options;
}

// The four association operations from one source with the same arguments.
std::vector<Response> allFour(ProviderHarness& harness, const ObjectPath& source, const AssociationArgs& args) {
  const RequestOptions options = toICRealizesChip();
  return {harness.om().associators(source, args, options), harness.om().associatorNames(source, args, options),
          harness.om().references(source, args, options), harness.om().referenceNames(source, args, options)};
}

// The lines this provider's module wrote to one channel.
std::vector<LoggedLine> ownLines(const LoggerCapture& capture, Channel channel) {
  std::vector<LoggedLine> out;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.IDEDiskCntrlRealizesIDEChipProvider" && line.channel == channel) out.push_back(line);
  return out;
}

const char* handlerOf(Operation op) {
  switch (op) {
  case Operation::Associators:
    return "IDEDiskRealizesIDEChipCtlr_Associators";
  case Operation::AssociatorNames:
    return "IDEDiskRealizesIDEChipCtlr_AssociatorNames";
  case Operation::References:
    return "IDEDiskRealizesIDEChipCtlr_References";
  default:
    return "IDEDiskRealizesIDEChipCtlr_ReferenceNames";
  }
}

class ICRealizesChipAssociationTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kThreeControllers); }
  ProviderHarness harness;
};

TEST_F(ICRealizesChipAssociationTest, EveryHandlerFromAChipAnswersNothingAndOk) {
  for (const Response& r : allFour(harness, chipPath("/A"), over("TVRHX_ICRealizesChip"))) {
    EXPECT_EQ(r.rc, CMPI_RC_OK) << broker::operationName(r.operation);
    EXPECT_EQ(r.message, std::nullopt);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(r.traces, IsEmpty()) << "no failure text goes to the broker";
    EXPECT_EQ(r.doneCount, 0);
  }
}

TEST_F(ICRealizesChipAssociationTest, EveryHandlerFromAControllerAnswersNothingAndOk) {
  for (const Response& r : allFour(harness, controllerPath("/C"), over("TVRHX_ICRealizesChip"))) {
    EXPECT_EQ(r.rc, CMPI_RC_OK) << broker::operationName(r.operation);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 0);
  }
}

TEST_F(ICRealizesChipAssociationTest, EveryHandlerClosesWithMarkProviderExit) {
  const ObjectPath source = chipPath("/A");
  const AssociationArgs args = over("TVRHX_ICRealizesChip");
  const RequestOptions options = toICRealizesChip();
  for (Operation op :
       {Operation::Associators, Operation::AssociatorNames, Operation::References, Operation::ReferenceNames}) {
    LoggerCapture capture;
    if (op == Operation::Associators) harness.om().associators(source, args, options);
    if (op == Operation::AssociatorNames) harness.om().associatorNames(source, args, options);
    if (op == Operation::References) harness.om().references(source, args, options);
    if (op == Operation::ReferenceNames) harness.om().referenceNames(source, args, options);
    const std::string handler = handlerOf(op);
    for (Channel channel : {Channel::Log, Channel::Trace}) {
      const std::vector<LoggedLine> lines = ownLines(capture, channel);
      ASSERT_EQ(lines.size(), 3u) << handler;
      EXPECT_THAT(lines[0].text, StartsWith("ENTERING: " + handler + "()"));
      EXPECT_EQ(lines[0].level, 3000);
      EXPECT_EQ(maskedLine(lines[1].text),
                "EXITING: " + handler + "() in src/providers/IDEDiskCntrlRealizesIDEChipProvider.cpp [Line: N]");
      EXPECT_EQ(lines[2].text, std::string(78, '='));
      for (int i : {1, 2}) {
        EXPECT_EQ(lines[i].level, 4000);
        EXPECT_EQ(lines[i].function, "markProviderExit");
        EXPECT_EQ(lines[i].file, "include/Trace.h");
      }
    }
  }
}

TEST_F(ICRealizesChipAssociationTest, AssociatorsWithARuleOfAnotherAssociationGiveNothingWithAnExitTrace) {
  const ObjectPath chassis = pathWithKeys("TVRHX_Chassis", {{"Tag", "/Main"}, {"CreationClassName", "TVRHX_Chassis"}});
  LoggerCapture capture;
  Response r = harness.om().associators(chassis, over("TVRHX_PackageInSlot"), toICRealizesChip());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(traceTexts(r), ElementsAre("Target Class is Slot"));
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_THAT(log[1].text, StartsWith("EXITING: IDEDiskRealizesIDEChipCtlr_Associators() in "
                                      "src/providers/IDEDiskCntrlRealizesIDEChipProvider.cpp"));
  EXPECT_EQ(log[1].level, 3000);
}

TEST_F(ICRealizesChipAssociationTest, AssociatorNamesWithARuleOfAnotherAssociationGiveNothing) {
  const ObjectPath slot = pathWithKeys("TVRHX_Slot", {{"Tag", "Slot 1"}, {"CreationClassName", "TVRHX_Slot"}});
  Response r = harness.om().associatorNames(slot, over("TVRHX_SlotOnChassis"), toICRealizesChip());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(ICRealizesChipAssociationTest, ResultClassChangesNothingOnAnyHandler) {
  for (const char* resultClass : {"TVRHX_ChipIDECont", "TVRHX_IDEController", "CIM_Nothing", ""}) {
    for (const Response& r : allFour(harness, chipPath("/C"), over("TVRHX_ICRealizesChip", resultClass))) {
      EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass << " " << broker::operationName(r.operation);
      EXPECT_THAT(r.items, IsEmpty());
      EXPECT_EQ(r.doneCount, 0);
    }
  }
}

TEST_F(ICRealizesChipAssociationTest, RoutedByTheirOwnClassReferencesReachTheProvider) {
  LoggerCapture capture;
  Response r = harness.om().referenceNames(controllerPath("/A"), over(nullptr, "TVRHX_ICRealizesChip"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  ASSERT_EQ(r.outcomes.size(), 1u);
  EXPECT_EQ(r.outcomes[0].provider, "IDEDiskRealizesIDEChipCtlrProvider");
  EXPECT_EQ(ownLines(capture, Channel::Log).size(), 3u);
}

TEST_F(ICRealizesChipAssociationTest, ReferencesTraceANullResultClassIntoTheLookup) {
  LoggerCapture capture;
  harness.om().references(chipPath("/A"), over(nullptr, "TVRHX_ICRealizesChip"), toICRealizesChip());
  std::vector<std::string> lookup;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.PhysicalAssetObjFactory" && line.channel == Channel::Log) lookup.push_back(line.text);
  ASSERT_FALSE(lookup.empty());
  EXPECT_THAT(lookup[0], ::testing::EndsWith(" _RefLeftClass=TVRHX_ICRealizesChip _RefRightClass="));
}

} // namespace
} // namespace tvr::test
