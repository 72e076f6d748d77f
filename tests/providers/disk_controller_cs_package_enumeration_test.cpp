// TVRHX_DiskControllerCSPackage enumerated through the embedded object
// manager: every storage controller with every computer system the object
// manager knows, fetched back by up-calls.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::FailureShape;
using broker::Fault;
using broker::RequestOptions;
using KVLog::Channel;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;

// One computer system (the companion's: the machine of the system node)
// and three controllers, one of them without other identifying information.
const char* const kSystemWithThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System", "children": [
      {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
      {"type": "StorageControllerNode", "name": "B"},
      {"type": "StorageControllerNode", "name": "C", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}}]}
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

const char* const kSystemWithoutController = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System"}]})";

// Two sibling nodes of one name have the same path text.
const char* const kSystemWithTwoNodesOfOnePath = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System"},
    {"type": "StorageControllerNode", "name": "Twin"},
    {"type": "StorageControllerNode", "name": "Twin"}
  ]})";

ObjectPath diskControllerPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_DiskController", {{"Tag", tag}, {"CreationClassName", "TVRHX_DiskController"}});
  path.host = "host.example.com";
  return path;
}

// The text of a reference's key, or "?" when the reference or key is absent.
std::string refKey(const Value* reference, const char* key) {
  if (!reference || !reference->ref || !reference->ref->key(key)) return "?";
  return reference->ref->key(key)->text;
}

// "Name of the system (Dependent) : Tag of the controller (Antecedent)".
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
    if (line.category == "Korvane.DiskControllerCSPackage" && line.channel == channel) out.push_back(line);
  return out;
}

class DiskControllerCSPackageEnumerationTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(DiskControllerCSPackageEnumerationTest, EveryControllerIsPackagedByTheComputerSystem) {
  harness.useTree(kSystemWithThreeControllers);
  const std::vector<std::string> expected = {"host.example.com : /System/A", "host.example.com : /System/B",
                                             "host.example.com : /System/C"};
  Response names = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  Response instances = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(pairs(names), expected);
  EXPECT_EQ(pairs(instances), expected);
  for (const Response* r : {&names, &instances}) {
    EXPECT_TRUE(r->ok());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(DiskControllerCSPackageEnumerationTest, TwoComputerSystemsAndThreeControllersGiveSixAssociations) {
  ProviderHarness twoSystems{StandIn::ComputerSystems};
  twoSystems.useTree(kTwoSystemsThreeControllers);
  const std::vector<std::string> expected = {"Sys1 : /A", "Sys1 : /B", "Sys1 : /C",
                                             "Sys2 : /A", "Sys2 : /B", "Sys2 : /C"};
  EXPECT_EQ(pairs(twoSystems.enumerateInstanceNames("TVRHX_DiskControllerCSPackage")), expected);
  EXPECT_EQ(pairs(twoSystems.enumerateInstances("TVRHX_DiskControllerCSPackage")), expected);
}

TEST_F(DiskControllerCSPackageEnumerationTest, NodesOfOnePathTextAreEachPackaged) {
  harness.useTree(kSystemWithTwoNodesOfOnePath);
  EXPECT_THAT(pairs(harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage")),
              ElementsAre("host.example.com : /Twin", "host.example.com : /Twin"));
}

TEST_F(DiskControllerCSPackageEnumerationTest, NoStorageControllerAnswersNothingAndCompletes) {
  harness.useTree(kSystemWithoutController);
  Response names = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  Response instances = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(DiskControllerCSPackageEnumerationTest, NoComputerSystemAnswersNothingAndCompletes) {
  harness.useTree(kControllersWithoutSystem);
  Response names = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  Response instances = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(DiskControllerCSPackageEnumerationTest, InstancesCarryDependentAntecedentAndPlatformGuidZero) {
  harness.useTree(kSystemWithThreeControllers);
  Response r = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  ASSERT_EQ(r.items.size(), 3u);
  for (const broker::ResultItem& item : r.items) {
    const Instance& association = item.instance;
    EXPECT_THAT(propertyNames(association), ElementsAre("Dependent", "Antecedent", "PlatformGUID"));
    EXPECT_EQ(property(association, "Dependent").type, CMPI_ref);
    EXPECT_EQ(property(association, "Antecedent").type, CMPI_ref);
    EXPECT_EQ(property(association, "PlatformGUID"), Value::chars("0"));
    EXPECT_EQ(association.path.className, "TVRHX_DiskControllerCSPackage");
    EXPECT_EQ(association.path.host, "host.example.com");
  }
  const Instance& first = r.items[0].instance;
  EXPECT_EQ(*property(first, "Antecedent").ref, diskControllerPath("/System/A"));
  EXPECT_EQ(property(first, "Dependent").ref->className, "TVRHX_ComputerSystem");
}

TEST_F(DiskControllerCSPackageEnumerationTest, EnumeratedPathAddsDependentThenAntecedent) {
  harness.useTree(kSystemWithThreeControllers);
  const std::vector<ObjectPath> systems = harness.enumerateInstanceNames("TVRHX_ComputerSystem").paths();
  ASSERT_EQ(systems.size(), 1u);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& path = r.items[1].path;
  EXPECT_EQ(path.className, "TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, systems[0]);
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, diskControllerPath("/System/B"));
}

TEST_F(DiskControllerCSPackageEnumerationTest, EnumerateInstanceNamesTracesEnteringAndExiting) {
  harness.useTree(kSystemWithThreeControllers);
  LoggerCapture capture;
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.doneCount, 1);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_EQ(maskedLine(log[0].text), "ENTERING: DiskControllerCSPackage_EnumInstanceNames() in "
                                     "src/providers/DiskControllerCSPackage.cpp [Line: N],Parameters List:  "
                                     "mi=0x? ctx=0x? rslt=0x? ref=0x?");
  EXPECT_THAT(log[1].text, StartsWith("EXITING: DiskControllerCSPackage_EnumInstanceNames()"));
}

TEST_F(DiskControllerCSPackageEnumerationTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kSystemWithThreeControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, *path.key("Antecedent")->ref);
    EXPECT_EQ(property(r.items[0].instance, "PlatformGUID"), Value::chars("0"));
  }
}

TEST_F(DiskControllerCSPackageEnumerationTest, GetInstanceOfAControllerThatIsNotThereFindsNothing) {
  harness.useTree(kSystemWithThreeControllers);
  ObjectPath path = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage").paths().at(0);
  path.keys[1].value = Value::reference(diskControllerPath("/System/Z"));
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(DiskControllerCSPackageEnumerationTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kSystemWithThreeControllers);
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("AssociationProvider DiskController And ComputerSystem"));
}

TEST_F(DiskControllerCSPackageEnumerationTest, FailingUpCallFailsEnumerateInstanceNamesAsTheBrokerSaid) {
  harness.useTree(kSystemWithThreeControllers);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u) << "ENTERING and the failure, no EXITING";
  EXPECT_EQ(log[1].level, 6000);
  EXPECT_THAT(log[1].text, StartsWith("MESSAGE [File: src/providers/DiskControllerCSPackage.cpp, Line: "));
  EXPECT_THAT(log[1].text, EndsWith("]: Call to CBEnumInstances of target Class Failed."));
  EXPECT_EQ(ownLines(capture, Channel::Trace).size(), 2u);
}

TEST_F(DiskControllerCSPackageEnumerationTest, FailingUpCallGivesEnumerateInstancesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemWithThreeControllers);
  harness.om().faults().failNext(Fault::UpCall, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(DiskControllerCSPackageEnumerationTest, FailedComputerSystemPathFailsEnumerateInstanceNames) {
  harness.useTree(kSystemWithThreeControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed."));
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for ComputerSystemClass."));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("AssociationProvider DiskController And ComputerSystem"));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(DiskControllerCSPackageEnumerationTest, WithoutBrokerTheFailureHasNoMessage) {
  harness.useTree(kSystemWithThreeControllers);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage", options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

// The association path of the last pair is the last path the request
// makes: a clean run counts them.
TEST_F(DiskControllerCSPackageEnumerationTest, FailedAssociationPathFailsWithTheFullStopInBothTexts) {
  harness.useTree(kSystemWithThreeControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  const auto madeByOneRun = harness.om().faults().calls(Fault::NewObjectPath) - before;
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null,
                                 static_cast<std::uint32_t>(madeByOneRun - 1));
  Response r = harness.enumerateInstanceNames("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for DiskControllerCSPackage."));
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for DiskControllerCSPackage.");
  EXPECT_THAT(pairs(r), ElementsAre("host.example.com : /System/A", "host.example.com : /System/B"));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(DiskControllerCSPackageEnumerationTest, FailedAssociationPathGivesEnumerateInstancesAnEmptyAnswer) {
  harness.useTree(kSystemWithThreeControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  const auto madeByOneRun = harness.om().faults().calls(Fault::NewObjectPath) - before;
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Hollow,
                                 static_cast<std::uint32_t>(madeByOneRun - 1));
  Response r = harness.enumerateInstances("TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(traceTexts(r).back(), "Create CMPIObjectPath failed for DiskControllerCSPackage.");
  EXPECT_THAT(capture.texts(Channel::Log),
              Not(Contains(StartsWith("EXITING: DiskControllerCSPackageCMPIInstances()"))));
}

TEST_F(DiskControllerCSPackageEnumerationTest, EntryPointsMakeTwoMisUnderTheProviderName) {
  harness.useTree(kSystemWithThreeControllers);
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("DiskControllerCSPackageProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("DiskControllerCSPackageProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceDiskControllerCSPackageProvider");
  EXPECT_STREQ(association->ft->miName, "associationDiskControllerCSPackageProvider");
}

} // namespace
} // namespace tvr::test
