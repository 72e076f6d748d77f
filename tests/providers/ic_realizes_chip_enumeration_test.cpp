// TVRHX_ICRealizesChip enumerated through the embedded object manager: each
// IDE chip paired with every IDE controller of the same path text.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::FailureShape;
using broker::Fault;
using KVLog::Channel;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

// Three controllers; the middle one has no other identifying information,
// so it has no IDE instances, only IDE paths.
const char* const kThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C", "properties": {"PropOtherIdentifyingInfo": ""}}
  ]})";

// Two sibling nodes of one name have the same path text.
const char* const kTwoNodesOfOnePath = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "Twin"},
    {"type": "StorageControllerNode", "name": "Twin"},
    {"type": "StorageControllerNode", "name": "Single"}
  ]})";

const char* const kNoController = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main"}]})";

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

// The text of a reference's key, or "?" when the reference or key is absent.
std::string refKey(const Value* reference, const char* key) {
  if (!reference || !reference->ref || !reference->ref->key(key)) return "?";
  return reference->ref->key(key)->text;
}

// "Tag of the chip (Antecedent) -> DeviceID of the controller (Dependent)".
std::vector<std::string> pairs(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths())
    out.push_back(refKey(p.key("Antecedent"), "Tag") + " -> " + refKey(p.key("Dependent"), "DeviceID"));
  return out;
}

class ICRealizesChipEnumerationTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(ICRealizesChipEnumerationTest, ThreeNodesPairEachChipWithTheControllerOfItsNode) {
  harness.useTree(kThreeControllers);
  const std::vector<std::string> expected = {"/A -> /A", "/B -> /B", "/C -> /C"};
  Response instances = harness.enumerateInstances("TVRHX_ICRealizesChip");
  Response names = harness.enumerateInstanceNames("TVRHX_ICRealizesChip");
  EXPECT_EQ(pairs(instances), expected);
  EXPECT_EQ(pairs(names), expected);
  for (const Response* r : {&instances, &names}) {
    EXPECT_TRUE(r->ok());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ICRealizesChipEnumerationTest, NodeWithoutOtherIdentifyingInfoIsPairedThoughItHasNoIdeInstances) {
  harness.useTree(kThreeControllers);
  EXPECT_THAT(pairs(harness.enumerateInstanceNames("TVRHX_ICRealizesChip")), Contains("/B -> /B"));
  std::vector<std::string> chips;
  for (const ObjectPath& p : harness.enumerateInstances("TVRHX_ChipIDECont").paths())
    chips.push_back(p.key("Tag")->text);
  EXPECT_THAT(chips, ElementsAre("/A", "/C"));
  std::vector<std::string> controllers;
  for (const ObjectPath& p : harness.enumerateInstances("TVRHX_IDEController").paths())
    controllers.push_back(p.key("DeviceID")->text);
  EXPECT_THAT(controllers, ElementsAre("/A", "/C"));
}

TEST_F(ICRealizesChipEnumerationTest, NodesOfOnePathTextPairEachChipWithEachOfTheirControllers) {
  harness.useTree(kTwoNodesOfOnePath);
  EXPECT_THAT(
      pairs(harness.enumerateInstances("TVRHX_ICRealizesChip")),
      ElementsAre("/Twin -> /Twin", "/Twin -> /Twin", "/Twin -> /Twin", "/Twin -> /Twin", "/Single -> /Single"));
}

TEST_F(ICRealizesChipEnumerationTest, NoStorageControllerAnswersNothingAndCompletes) {
  harness.useTree(kNoController);
  Response names = harness.enumerateInstanceNames("TVRHX_ICRealizesChip");
  Response instances = harness.enumerateInstances("TVRHX_ICRealizesChip");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ICRealizesChipEnumerationTest, InstancesSetAntecedentThenDependentAsReferences) {
  harness.useTree(kThreeControllers);
  Response r = harness.enumerateInstances("TVRHX_ICRealizesChip");
  ASSERT_EQ(r.items.size(), 3u);
  const Instance& first = r.items[0].instance;
  EXPECT_THAT(propertyNames(first), ElementsAre("Antecedent", "Dependent"));
  EXPECT_EQ(property(first, "Antecedent").type, CMPI_ref);
  EXPECT_EQ(*property(first, "Antecedent").ref, chipPath("/A"));
  EXPECT_EQ(*property(first, "Dependent").ref, controllerPath("/A"));
  EXPECT_EQ(first.path.className, "TVRHX_ICRealizesChip");
  EXPECT_EQ(first.path.host, "host.example.com");
  EXPECT_EQ(first.path.nameSpace, "root/cimv2");
}

TEST_F(ICRealizesChipEnumerationTest, EnumeratedPathAddsDependentThenAntecedent) {
  harness.useTree(kThreeControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_ICRealizesChip");
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, "TVRHX_ICRealizesChip");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, controllerPath("/A"));
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, chipPath("/A"));
}

TEST_F(ICRealizesChipEnumerationTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kThreeControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_ICRealizesChip").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, *path.key("Antecedent")->ref);
  }
}

TEST_F(ICRealizesChipEnumerationTest, GetInstanceOfEndsFromTwoNodesFindsNothing) {
  harness.useTree(kThreeControllers);
  ObjectPath path("root/cimv2", "TVRHX_ICRealizesChip");
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(chipPath("/A"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(controllerPath("/B"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ICRealizesChipEnumerationTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kThreeControllers);
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_ICRealizesChip"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component,
            std::optional<std::string>("IDE Disk Controller Realizes IDE Chip Controller Provider"));
}

TEST_F(ICRealizesChipEnumerationTest, FailedAssociationPathFailsEnumerateInstanceNames) {
  harness.useTree(kThreeControllers);
  LoggerCapture capture;
  // Three chip paths and three controller paths are made first; the second
  // association path fails.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 7);
  Response r = harness.enumerateInstanceNames("TVRHX_ICRealizesChip");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for icChipRealizesClass"));
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for icChipRealizesClass.");
  EXPECT_EQ(r.traces.back().component,
            std::optional<std::string>("IDE Disk Controller Realizes IDE Chip Controller Provider"));
  EXPECT_THAT(pairs(r), ElementsAre("/A -> /A"));
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(capture.texts(Channel::Log),
              Not(Contains(StartsWith("EXITING: IDEDiskRealizesIDEChipCtlr_EnumInstanceNames()"))));
}

TEST_F(ICRealizesChipEnumerationTest, FailedBuilderStillHandsOutWhatItMadeBeforeWithOk) {
  harness.useTree(kThreeControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Hollow, 7);
  Response r = harness.enumerateInstances("TVRHX_ICRealizesChip");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(pairs(r), ElementsAre("/A -> /A"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for icChipRealizesClass."));
}

TEST_F(ICRealizesChipEnumerationTest, FailedBuilderLeavesGetInstanceOkAndComplete) {
  harness.useTree(kThreeControllers);
  const ObjectPath second = harness.enumerateInstanceNames("TVRHX_ICRealizesChip").paths().at(1);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 7);
  Response r = harness.getInstance(second);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ICRealizesChipEnumerationTest, BuilderTracesEnteringAndExitingWithItsParameterList) {
  harness.useTree(kThreeControllers);
  LoggerCapture capture;
  harness.enumerateInstances("TVRHX_ICRealizesChip");
  std::vector<std::string> own;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.IDEDiskCntrlRealizesIDEChipProvider" && line.channel == Channel::Trace)
      own.push_back(maskedLine(line.text));
  const std::string file = " in src/providers/IDEDiskCntrlRealizesIDEChipProvider.cpp [Line: N],Parameters List:  ";
  EXPECT_THAT(own, ElementsAre("ENTERING: IDEDiskRealizesIDEChipCtlr_EnumInstances()" + file +
                                   "mi=0x? ctx=0x? rslt=0x? ref=0x? properties=0",
                               "ENTERING: IDEDiskRealizesIDEChipCtlrCMPIInstances()" + file +
                                   "ref=0x? properties=0 ctx=0x? instances=0x?",
                               "EXITING: IDEDiskRealizesIDEChipCtlrCMPIInstances()" + file +
                                   "ref=0x? properties=0 ctx=0x? instances=0x?",
                               "EXITING: IDEDiskRealizesIDEChipCtlr_EnumInstances()" + file +
                                   "mi=0x? ctx=0x? rslt=0x? ref=0x? properties=0"));
}

TEST_F(ICRealizesChipEnumerationTest, EntryPointsMakeTwoMisUnderTheProviderName) {
  harness.useTree(kThreeControllers);
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("IDEDiskRealizesIDEChipCtlrProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("IDEDiskRealizesIDEChipCtlrProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceIDEDiskRealizesIDEChipCtlrProvider");
  EXPECT_STREQ(association->ft->miName, "associationIDEDiskRealizesIDEChipCtlrProvider");
}

} // namespace
} // namespace tvr::test
