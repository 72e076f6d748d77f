// TVRHX_ChipSystemPackaging enumerated through the embedded object manager:
// the chip path of every storage controller node with every computer
// system the object manager knows, fetched back by up-calls.
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
using ::testing::EndsWith;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

// One computer system (the companion's) and three controllers; B has no
// other identifying information and so no chip instance.
const char* const kSystemWithThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System"},
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}}
  ]})";

// Two computer systems for the stand-in provider, three controllers.
const char* const kTwoSystemsThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "Sys1"},
    {"type": "SystemNode", "name": "Sys2"},
    {"type": "StorageControllerNode", "name": "A"},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C"}
  ]})";

const char* const kControllersWithoutSystem = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "A"},
    {"type": "StorageControllerNode", "name": "B"}
  ]})";

// Two sibling nodes of one name have the same path text.
const char* const kSystemWithTwoNodesOfOnePath = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System"},
    {"type": "StorageControllerNode", "name": "Twin"},
    {"type": "StorageControllerNode", "name": "Twin"}
  ]})";

const char* const kSystemWithoutController = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System"}]})";

ObjectPath chipPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_ChipIDECont", {{"Tag", tag}, {"CreationClassName", "TVRHX_ChipIDECont"}});
  path.host = "host.example.com";
  return path;
}

// The text of a reference's key, or "?" when the reference or key is absent.
std::string refKey(const Value* reference, const char* key) {
  if (!reference || !reference->ref || !reference->ref->key(key)) return "?";
  return reference->ref->key(key)->text;
}

// "Name of the system (Dependent) : Tag of the chip (Antecedent)".
std::vector<std::string> pairs(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths())
    out.push_back(refKey(p.key("Dependent"), "Name") + " : " + refKey(p.key("Antecedent"), "Tag"));
  return out;
}

// The lines this provider's module wrote to one channel.
std::vector<LoggedLine> ownLines(const LoggerCapture& capture, Channel channel) {
  std::vector<LoggedLine> out;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.ChipSystemPackaging" && line.channel == channel) out.push_back(line);
  return out;
}

class ChipSystemPackagingEnumerationTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(ChipSystemPackagingEnumerationTest, EveryChipPathIsPackagedByTheComputerSystem) {
  harness.useTree(kSystemWithThreeControllers);
  const std::vector<std::string> expected = {"host.example.com : /A", "host.example.com : /B", "host.example.com : /C"};
  Response names = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  Response instances = harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(pairs(names), expected);
  EXPECT_EQ(pairs(instances), expected);
  for (const Response* r : {&names, &instances}) {
    EXPECT_TRUE(r->ok());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ChipSystemPackagingEnumerationTest, NodeWithoutOtherIdentifyingInfoTakesPartThoughItHasNoChip) {
  harness.useTree(kSystemWithThreeControllers);
  EXPECT_THAT(pairs(harness.enumerateInstances("TVRHX_ChipSystemPackaging")), Contains("host.example.com : /B"));
  std::vector<std::string> chips;
  for (const ObjectPath& p : harness.enumerateInstances("TVRHX_ChipIDECont").paths())
    chips.push_back(p.key("Tag")->text);
  EXPECT_THAT(chips, ElementsAre("/A", "/C"));
}

TEST_F(ChipSystemPackagingEnumerationTest, TwoComputerSystemsAndThreeNodesGiveSixAssociationsWithoutPlatformGuid) {
  ProviderHarness twoSystems{StandIn::ComputerSystems};
  twoSystems.useTree(kTwoSystemsThreeControllers);
  Response r = twoSystems.enumerateInstances("TVRHX_ChipSystemPackaging");
  EXPECT_THAT(pairs(r), ElementsAre("Sys1 : /A", "Sys1 : /B", "Sys1 : /C", "Sys2 : /A", "Sys2 : /B", "Sys2 : /C"));
  for (const broker::ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent"));
    EXPECT_EQ(item.instance.property("PlatformGUID"), nullptr);
  }
  EXPECT_EQ(pairs(twoSystems.enumerateInstanceNames("TVRHX_ChipSystemPackaging")), pairs(r));
}

TEST_F(ChipSystemPackagingEnumerationTest, NodesOfOnePathTextAreEachPackaged) {
  harness.useTree(kSystemWithTwoNodesOfOnePath);
  EXPECT_THAT(pairs(harness.enumerateInstances("TVRHX_ChipSystemPackaging")),
              ElementsAre("host.example.com : /Twin", "host.example.com : /Twin"));
}

TEST_F(ChipSystemPackagingEnumerationTest, NoComputerSystemAnswersNothingAndCompletes) {
  harness.useTree(kControllersWithoutSystem);
  Response names = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  Response instances = harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ChipSystemPackagingEnumerationTest, NoStorageControllerAnswersNothingAndCompletes) {
  harness.useTree(kSystemWithoutController);
  Response names = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  Response instances = harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ChipSystemPackagingEnumerationTest, EnumeratedPathAddsDependentThenAntecedent) {
  harness.useTree(kSystemWithThreeControllers);
  const std::vector<ObjectPath> systems = harness.enumerateInstanceNames("TVRHX_ComputerSystem").paths();
  ASSERT_EQ(systems.size(), 1u);
  Response r = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& path = r.items[2].path;
  EXPECT_EQ(path.className, "TVRHX_ChipSystemPackaging");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, systems[0]);
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, chipPath("/C"));
}

TEST_F(ChipSystemPackagingEnumerationTest, GetInstanceOfAnEnumeratedPathReturnsTheMatchingInstance) {
  harness.useTree(kSystemWithThreeControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, *path.key("Antecedent")->ref);
    EXPECT_EQ(*property(r.items[0].instance, "Dependent").ref, *path.key("Dependent")->ref);
  }
}

TEST_F(ChipSystemPackagingEnumerationTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kSystemWithThreeControllers);
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_ChipSystemPackaging"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("AssociationProvider ChipIDECont And ComputerSystem"));
}

TEST_F(ChipSystemPackagingEnumerationTest, FailingUpCallFailsEnumerateInstanceNamesAsTheBrokerSaid) {
  harness.useTree(kSystemWithThreeControllers);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u) << "ENTERING and the failure, no EXITING";
  EXPECT_EQ(log[1].level, 6000);
  EXPECT_THAT(log[1].text, StartsWith("MESSAGE [File: src/providers/ChipSystemPackaging.cpp, Line: "));
  EXPECT_THAT(log[1].text, EndsWith("]: Call to CBEnumInstances of target Class Failed."));
}

TEST_F(ChipSystemPackagingEnumerationTest, FailingUpCallGivesEnumerateInstancesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemWithThreeControllers);
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ChipSystemPackagingEnumerationTest, FailedComputerSystemPathFailsEnumerateInstanceNames) {
  harness.useTree(kSystemWithThreeControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed."));
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for ComputerSystemClass."));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("AssociationProvider ChipIDECont And ComputerSystem"));
  EXPECT_EQ(r.doneCount, 0);
}

// The association path of the last pair is the last path the request
// makes: a clean run counts them.
TEST_F(ChipSystemPackagingEnumerationTest, FailedAssociationPathFailsWithTheFullStopInBothTexts) {
  harness.useTree(kSystemWithThreeControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  const auto madeByOneRun = harness.om().faults().calls(Fault::NewObjectPath) - before;
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null,
                                 static_cast<std::uint32_t>(madeByOneRun - 1));
  Response r = harness.enumerateInstanceNames("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for ChipSystemPackaging."));
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for ChipSystemPackaging.");
  EXPECT_THAT(pairs(r), ElementsAre("host.example.com : /A", "host.example.com : /B"));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(ChipSystemPackagingEnumerationTest, FailedAssociationPathGivesEnumerateInstancesAnEmptyAnswer) {
  harness.useTree(kSystemWithThreeControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  const auto madeByOneRun = harness.om().faults().calls(Fault::NewObjectPath) - before;
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null,
                                 static_cast<std::uint32_t>(madeByOneRun - 1));
  Response r = harness.enumerateInstances("TVRHX_ChipSystemPackaging");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for ChipSystemPackaging.");
  EXPECT_THAT(capture.texts(Channel::Log), Not(Contains(StartsWith("EXITING: ChipSystemPackagingCMPIInstances()"))));
}

TEST_F(ChipSystemPackagingEnumerationTest, EntryPointsMakeTwoMisUnderTheProviderName) {
  harness.useTree(kSystemWithThreeControllers);
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("ChipSystemPackagingProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("ChipSystemPackagingProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceChipSystemPackagingProvider");
  EXPECT_STREQ(association->ft->miName, "associationChipSystemPackagingProvider");
}

} // namespace
} // namespace tvr::test
