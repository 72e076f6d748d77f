// TVRHX_SASPortRealizesDisk enumerated through the embedded object manager:
// each storage node's SAS port controller tied to the disk controller of
// the same node, by DeviceID and Tag.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::Fault;
using broker::RequestOptions;
using KVLog::Channel;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Not;

const char* const kTwoControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "0000:00:1f.2",
     "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "0000:18:00.0"}
  ]})";

const char* const kThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "A"},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C"}
  ]})";

// Two sibling nodes of one name have the same path text.
const char* const kTwoNodesOfOnePath = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "Twin"},
    {"type": "StorageControllerNode", "name": "Twin"}
  ]})";

const char* const kNoController = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main"}]})";

ObjectPath diskControllerPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_DiskController", {{"Tag", tag}, {"CreationClassName", "TVRHX_DiskController"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath sasPortPath(const std::string& deviceID) {
  ObjectPath path = pathWithKeys("TVRHX_SASPortController", {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                                             {"CreationClassName", "TVRHX_SASPortController"},
                                                             {"SystemName", "host.example.com"},
                                                             {"DeviceID", deviceID}});
  path.host = "host.example.com";
  return path;
}

// The text of a reference's key, or "?" when the reference or key is absent.
std::string refKey(const Value* reference, const char* key) {
  if (!reference || !reference->ref || !reference->ref->key(key)) return "?";
  return reference->ref->key(key)->text;
}

// "DeviceID of the Dependent -> Tag of the Antecedent" for association paths.
std::vector<std::string> ties(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths())
    out.push_back(refKey(p.key("Dependent"), "DeviceID") + " -> " + refKey(p.key("Antecedent"), "Tag"));
  return out;
}

class SASPortRealizesDiskEnumerationTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(SASPortRealizesDiskEnumerationTest, EachSasPortIsTiedToTheDiskControllerOfItsNode) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_SASPortRealizesDisk");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  for (const broker::ResultItem& item : r.items) {
    const Instance& association = item.instance;
    EXPECT_EQ(refKey(association.property("Dependent"), "DeviceID"), refKey(association.property("Antecedent"), "Tag"));
  }
  EXPECT_THAT(ties(r), ElementsAre("/0000:00:1f.2 -> /0000:00:1f.2", "/0000:18:00.0 -> /0000:18:00.0"));
}

TEST_F(SASPortRealizesDiskEnumerationTest, InstancesSetDependentThenAntecedentAsReferences) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_SASPortRealizesDisk");
  ASSERT_FALSE(r.items.empty());
  const Instance& first = r.items[0].instance;
  EXPECT_THAT(propertyNames(first), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(property(first, "Dependent").type, CMPI_ref);
  EXPECT_EQ(property(first, "Antecedent").type, CMPI_ref);
  EXPECT_EQ(*property(first, "Dependent").ref, sasPortPath("/0000:00:1f.2"));
  EXPECT_EQ(*property(first, "Antecedent").ref, diskControllerPath("/0000:00:1f.2"));
  EXPECT_EQ(first.path.className, "TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(first.path.host, "host.example.com");
}

TEST_F(SASPortRealizesDiskEnumerationTest, ThreeNodesGiveThreeTiesInBothEnumerations) {
  harness.useTree(kThreeControllers);
  const std::vector<std::string> expected = {"/A -> /A", "/B -> /B", "/C -> /C"};
  EXPECT_EQ(ties(harness.enumerateInstances("TVRHX_SASPortRealizesDisk")), expected);
  EXPECT_EQ(ties(harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk")), expected);
}

TEST_F(SASPortRealizesDiskEnumerationTest, NodesOfOnePathTextTieEachPortToEachOfTheirControllers) {
  harness.useTree(kTwoNodesOfOnePath);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(ties(r), ElementsAre("/Twin -> /Twin", "/Twin -> /Twin", "/Twin -> /Twin", "/Twin -> /Twin"));
}

TEST_F(SASPortRealizesDiskEnumerationTest, NodeWithoutOtherIdentifyingInfoIsTiedLikeAnyOther) {
  harness.useTree(kTwoControllers);
  EXPECT_THAT(ties(harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk")),
              Contains("/0000:18:00.0 -> /0000:18:00.0"));
}

TEST_F(SASPortRealizesDiskEnumerationTest, NoStorageControllerAnswersNothingAndCompletes) {
  harness.useTree(kNoController);
  Response names = harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  Response instances = harness.enumerateInstances("TVRHX_SASPortRealizesDisk");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_EQ(r->message, std::nullopt);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(SASPortRealizesDiskEnumerationTest, EnumeratedPathAddsDependentThenAntecedent) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, "TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, sasPortPath("/0000:00:1f.2"));
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, diskControllerPath("/0000:00:1f.2"));
}

TEST_F(SASPortRealizesDiskEnumerationTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kThreeControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(*property(r.items[0].instance, "Dependent").ref, *path.key("Dependent")->ref);
    EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, *path.key("Antecedent")->ref);
  }
}

TEST_F(SASPortRealizesDiskEnumerationTest, GetInstanceOfEndsFromTwoNodesFindsNothing) {
  harness.useTree(kThreeControllers);
  ObjectPath path("root/cimv2", "TVRHX_SASPortRealizesDisk");
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(diskControllerPath("/A"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(sasPortPath("/B"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SASPortRealizesDiskEnumerationTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_SASPortRealizesDisk"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component,
            std::optional<std::string>("SASPortController Realizes DiskDriveControllerProvider"));
  EXPECT_EQ(r.traces[0].level, 1);
}

TEST_F(SASPortRealizesDiskEnumerationTest, GetInstanceWithoutKeysAndBrokerFailsWithoutMessage) {
  harness.useTree(kNoController);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_SASPortRealizesDisk"), std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SASPortRealizesDiskEnumerationTest, FailedAssociationPathFailsEnumerateInstanceNames) {
  harness.useTree(kTwoControllers);
  LoggerCapture capture;
  // Two disk controller paths and two SAS port paths are made first.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, broker::FailureShape::Null, 4);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for SASPortRealizesDisk"));
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for SASPortRealizesDisk.");
  EXPECT_EQ(r.traces.back().component,
            std::optional<std::string>("SASPortController Realizes DiskDriveControllerProvider"));
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(capture.texts(Channel::Log),
              Not(Contains(::testing::StartsWith("EXITING: SASPortRealizesDisk_EnumInstanceNames()"))));
}

TEST_F(SASPortRealizesDiskEnumerationTest, FailedAssociationPathAfterTheFirstTieKeepsWhatWasReturned) {
  harness.useTree(kTwoControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, broker::FailureShape::Hollow, 5);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(ties(r), ElementsAre("/0000:00:1f.2 -> /0000:00:1f.2"));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(SASPortRealizesDiskEnumerationTest, FailedBuilderGivesAnEmptySuccessfulAnswer) {
  harness.useTree(kTwoControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, broker::FailureShape::Null, 5);
  Response r = harness.enumerateInstances("TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for SASPortRealizesDisk."));
}

TEST_F(SASPortRealizesDiskEnumerationTest, EnumerateInstanceNamesTracesEnteringAndExiting) {
  harness.useTree(kTwoControllers);
  LoggerCapture capture;
  harness.enumerateInstanceNames("TVRHX_SASPortRealizesDisk");
  std::vector<std::string> own;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.SASPortCtrRealizesDiskCtrProvider" && line.channel == Channel::Log)
      own.push_back(maskedLine(line.text));
  EXPECT_THAT(own, ElementsAre("ENTERING: SASPortRealizesDisk_EnumInstanceNames() in "
                               "src/providers/SASPortCtrRealizesDiskCtrProvider.cpp [Line: N],Parameters List:  "
                               "mi=0x? ctx=0x? rslt=0x? ref=0x?",
                               "EXITING: SASPortRealizesDisk_EnumInstanceNames() in "
                               "src/providers/SASPortCtrRealizesDiskCtrProvider.cpp [Line: N],Parameters List:  "
                               "mi=0x? ctx=0x? rslt=0x? ref=0x?"));
}

TEST_F(SASPortRealizesDiskEnumerationTest, EntryPointsMakeTwoMisUnderTheProviderName) {
  harness.useTree(kTwoControllers);
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("SASPortRealizesDiskProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("SASPortRealizesDiskProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceSASPortRealizesDiskProvider");
  EXPECT_STREQ(association->ft->miName, "associationSASPortRealizesDiskProvider");
  EXPECT_EQ(instance->ft->ftVersion, 200);
  EXPECT_EQ(association->ft->miVersion, 200);
}

} // namespace
} // namespace tvr::test
