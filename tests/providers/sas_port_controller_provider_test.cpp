// TVRHX_SASPortController through the embedded object manager.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cctype>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::ResultItem;
using KVLog::Channel;

// The example blade's two storage controllers.
const char* const kTwoControllers = R"({
  "systemName": "blade.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System", "children": [
      {"type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 1,
       "properties": {"PropType": "IDE interface", "PropOtherIdentifyingInfo": "IDE mode"}},
      {"type": "StorageControllerNode", "name": "0000:18:00.0", "status": 1,
       "properties": {"PropType": "RAID bus controller", "PropPortType": 94}}]}
  ]})";

const char* const kOneController = R"({"systemName": "blade.example.com",
  "nodes": [{"type": "StorageControllerNode", "name": "C"}]})";

ObjectPath sasPath(const std::string& deviceID, const std::string& systemName = "blade.example.com") {
  return pathWithKeys("TVRHX_SASPortController", {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                                  {"CreationClassName", "TVRHX_SASPortController"},
                                                  {"SystemName", systemName},
                                                  {"DeviceID", deviceID}});
}

class SASPortControllerProviderTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(SASPortControllerProviderTest, EnumerateInstanceNamesGivesFourKeysInOrder) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortController");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_SASPortController");
  EXPECT_EQ(first.host, "blade.example.com");
  ASSERT_EQ(first.keys.size(), 4u);
  EXPECT_EQ(first.keys[0].name, "SystemCreationClassName");
  EXPECT_EQ(first.keys[0].value, Value::chars("TVRHX_ComputerSystem"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_SASPortController"));
  EXPECT_EQ(first.keys[2].name, "SystemName");
  EXPECT_EQ(first.keys[2].value, Value::chars("blade.example.com"));
  EXPECT_EQ(first.keys[3].name, "DeviceID");
  EXPECT_EQ(first.keys[3].value, Value::chars("/System/0000:00:1f.2"));
}

TEST_F(SASPortControllerProviderTest, InstanceHoldsExactlyItsFourKeys) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& controller = r.items[0].instance;
  EXPECT_THAT(propertyNames(controller),
              ElementsAre("SystemCreationClassName", "CreationClassName", "SystemName", "DeviceID"));
  EXPECT_EQ(property(controller, "SystemCreationClassName"), Value::chars("TVRHX_ComputerSystem"));
  EXPECT_EQ(property(controller, "CreationClassName"), Value::chars("TVRHX_SASPortController"));
  EXPECT_EQ(property(controller, "SystemName"), Value::chars("blade.example.com"));
  EXPECT_EQ(property(controller, "DeviceID"), Value::chars("/System/0000:00:1f.2"));
}

TEST_F(SASPortControllerProviderTest, InstancePathEqualsTheEnumeratedPath) {
  harness.useTree(kTwoControllers);
  Response names = harness.enumerateInstanceNames("TVRHX_SASPortController");
  Response instances = harness.enumerateInstances("TVRHX_SASPortController");
  ASSERT_EQ(names.items.size(), 2u);
  EXPECT_EQ(names.paths(), instances.paths());
}

TEST_F(SASPortControllerProviderTest, TwoControllersDifferOnlyInDeviceID) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& a = r.items[0].instance;
  const Instance& b = r.items[1].instance;
  for (const char* name : {"SystemCreationClassName", "CreationClassName", "SystemName"})
    EXPECT_EQ(property(a, name), property(b, name)) << name;
  EXPECT_NE(property(a, "DeviceID"), property(b, "DeviceID"));
  EXPECT_EQ(property(b, "DeviceID"), Value::chars("/System/0000:18:00.0"));
}

TEST_F(SASPortControllerProviderTest, EveryStorageControllerIsASASPortControllerWhateverItsKind) {
  harness.useTree(R"({"nodes": [
    {"type": "StorageControllerNode", "name": "ide", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "nvme", "properties": {"PropType": "Non-Volatile memory controller"}},
    {"type": "StorageControllerNode", "name": "bare"}]})");
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(property(r.items[2].instance, "DeviceID"), Value::chars("/bare"));
}

TEST_F(SASPortControllerProviderTest, DeviceIDIsTheTagOfTheDiskControllerOfTheSameNode) {
  harness.useTree(kTwoControllers);
  Response sas = harness.enumerateInstances("TVRHX_SASPortController");
  Response disk = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(sas.items.size(), 2u);
  ASSERT_EQ(disk.items.size(), 2u);
  for (std::size_t i = 0; i < 2; ++i)
    EXPECT_EQ(property(sas.items[i].instance, "DeviceID"), property(disk.items[i].instance, "Tag"));
  Response sasNames = harness.enumerateInstanceNames("TVRHX_SASPortController");
  Response diskNames = harness.enumerateInstanceNames("TVRHX_DiskController");
  ASSERT_EQ(sasNames.items.size(), 2u);
  ASSERT_EQ(diskNames.items.size(), 2u);
  for (std::size_t i = 0; i < 2; ++i)
    EXPECT_EQ(*sasNames.items[i].path.key("DeviceID"), *diskNames.items[i].path.key("Tag"));
}

TEST_F(SASPortControllerProviderTest, PropertyListNarrowsNothing) {
  harness.useTree(kTwoControllers);
  Response all = harness.enumerateInstances("TVRHX_SASPortController");
  Response deviceID = harness.enumerateInstances("TVRHX_SASPortController", std::vector<std::string>{"DeviceID"});
  ASSERT_EQ(all.items.size(), 2u);
  EXPECT_EQ(propertyNames(deviceID.items[0].instance).size(), 4u);
  EXPECT_EQ(deviceID.instances(), all.instances());
}

TEST_F(SASPortControllerProviderTest, MachineWithoutStorageControllerAnswersEmptyOkAndDoneOnce) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_SASPortController");
  Response instances = harness.enumerateInstances("TVRHX_SASPortController");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(SASPortControllerProviderTest, ClassNameIsComparedWithoutRegardToCase) {
  harness.useTree(kTwoControllers);
  EXPECT_EQ(harness.enumerateInstanceNames("tvrhx_sasportcontroller").items.size(), 2u);
  EXPECT_EQ(harness.enumerateInstances("TVRHX_SASPORTCONTROLLER").items.size(), 2u);
}

TEST_F(SASPortControllerProviderTest, AnotherClassIsAnsweredWithNothingAndOk) {
  harness.useTree(kTwoControllers);
  broker::RequestOptions options;
  options.routeTo = "TVRHX_SASPortController";
  Response names = harness.om().enumerateInstanceNames(classPath("CIM_SASPortController"), options);
  Response instances = harness.om().enumerateInstances(classPath("TVRHX_DiskController"), std::nullopt, options);
  Response one = harness.om().getInstance(pathWithKeys("CIM_Controller", {{"DeviceID", "/System/0000:00:1f.2"}}),
                                          std::nullopt, options);
  for (const Response* r : {&names, &instances, &one}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(r->traces, IsEmpty());
  }
}

TEST_F(SASPortControllerProviderTest, GetInstanceFindsTheControllerByDeviceID) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(sasPath("/System/0000:18:00.0"));
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "DeviceID"), Value::chars("/System/0000:18:00.0"));
}

TEST_F(SASPortControllerProviderTest, GetInstanceReadsOnlyTheDeviceID) {
  harness.useTree(kTwoControllers);
  Response otherHost = harness.getInstance(sasPath("/System/0000:18:00.0", "elsewhere.example.com"));
  ASSERT_EQ(otherHost.items.size(), 1u);
  EXPECT_EQ(property(otherHost.items[0].instance, "SystemName"), Value::chars("blade.example.com"));
  Response onlyDeviceID =
      harness.getInstance(pathWithKeys("TVRHX_SASPortController", {{"DeviceID", "/System/0000:00:1f.2"}}));
  EXPECT_EQ(onlyDeviceID.items.size(), 1u);
}

TEST_F(SASPortControllerProviderTest, GetInstanceOfEveryEnumeratedPathFindsItsInstance) {
  harness.useTree(kTwoControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_SASPortController").paths()) {
    Response one = harness.getInstance(path);
    ASSERT_EQ(one.items.size(), 1u);
    EXPECT_EQ(one.items[0].path, path);
  }
}

TEST_F(SASPortControllerProviderTest, GetInstanceOfNoNodeAnswersOkWithNothingAndNoDone) {
  harness.useTree(kTwoControllers);
  for (const char* deviceID : {"/System/0000:99:00.0", "/system/0000:18:00.0", "/System/0000:18:00.0 "}) {
    Response r = harness.getInstance(sasPath(deviceID));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << deviceID;
    EXPECT_THAT(r.items, IsEmpty()) << deviceID;
    EXPECT_EQ(r.doneCount, 0) << deviceID;
  }
}

TEST_F(SASPortControllerProviderTest, GetInstanceWithoutDeviceIDFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(pathWithKeys("TVRHX_SASPortController", {{"SystemName", "blade.example.com"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(SASPortControllerProviderTest, EachInstanceSendsTwoBrokerTraces) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of SASPortController ***",
                                         "*** Returning an instance of SASPortController ***",
                                         "*** Returning an instance of SASPortController ***",
                                         "*** Returning an instance of SASPortController ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("PhysicalAssetProvider"));
  }
}

TEST_F(SASPortControllerProviderTest, PathListSendsOneBrokerTrace) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortController");
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("*** Returning COPs of SASPortController ***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("PhysicalAssetProvider"));
}

TEST_F(SASPortControllerProviderTest, PathListRetriesTheSameNodeWhilePathsCannotBeMade) {
  harness.useTree(kTwoControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 3);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(*r.items[0].path.key("DeviceID"), Value::chars("/System/0000:00:1f.2"));
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 5u);
}

TEST_F(SASPortControllerProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kTwoControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(r.items[0].path.keys.size(), 4u);
}

TEST_F(SASPortControllerProviderTest, FailedPathGivesANullInstanceWithoutItsOwnTrace) {
  harness.useTree(kOneController);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of SASPortController ***"));
}

TEST_F(SASPortControllerProviderTest, FailedInstanceIsReturnedNullAfterItsTrace) {
  harness.useTree(kOneController);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_SASPortController");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of SASPortController ***",
                                         "*** Returning an instance of SASPortController ***"));
}

TEST_F(SASPortControllerProviderTest, GetInstanceWithANullBrokerReturnsANullInstance) {
  harness.useTree(kTwoControllers);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.getInstance(sasPath("/System/0000:18:00.0"), std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(SASPortControllerProviderTest, FunctionTableNamesTheProvider) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("SASPortControllerProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceSASPortControllerProvider");
  EXPECT_EQ(harness.om().providerSymbol("SASPortControllerProvider",
                                        "SASPortControllerProvider_Create_AssociationMI", &error),
            nullptr);
}

TEST_F(SASPortControllerProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("SASPortControllerProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_SASPortController", "WQL").rc,
            CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "x", "WQL").msg, nullptr);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

// The logger lines of one request, as "<function> in" and "<function> out".
class SASPortControllerLoggingTest : public SASPortControllerProviderTest {
protected:
  void SetUp() override { harness.useTree(kTwoControllers); }

  std::vector<std::string> events() const {
    std::vector<std::string> out;
    for (const LoggedLine& line : capture.lines())
      if (line.channel == Channel::Log)
        out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
    return out;
  }

  LoggerCapture capture;
};

TEST_F(SASPortControllerLoggingTest, EnumerateInstancesTracesTheListAndEachInstance) {
  harness.enumerateInstances("TVRHX_SASPortController");
  EXPECT_THAT(events(), ElementsAre("SASPortController_EnumInstances in", "getAllSASPortControllerInstances in",
                                    "makeSASPortControllerInstance in", "makeSASPortControllerInstance out",
                                    "makeSASPortControllerInstance in", "makeSASPortControllerInstance out",
                                    "getAllSASPortControllerInstances out", "SASPortController_EnumInstances out"));
  for (const LoggedLine& line : capture.lines()) {
    const bool handler = line.function.rfind("SASPortController_", 0) == 0;
    EXPECT_EQ(line.category,
              handler ? "Korvane.SASPortControllerProvider" : "Korvane.PhysicalAssetObjFactory");
  }
}

TEST_F(SASPortControllerLoggingTest, PathListWritesEnteringOnly) {
  harness.enumerateInstanceNames("TVRHX_SASPortController");
  EXPECT_THAT(events(), ElementsAre("SASPortController_EnumInstanceNames in", "getAllSASPortControllerCOP in",
                                    "SASPortController_EnumInstanceNames out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_EQ(maskedLine(texts[1]),
            "ENTERING: getAllSASPortControllerCOP() in src/factory/SASPortControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ctx=0x? ref=0x? objpaths=0x? rc=0x?");
}

TEST_F(SASPortControllerLoggingTest, MakeInstanceListsBrokerRefViewPropertiesAndStatus) {
  harness.enumerateInstances("TVRHX_SASPortController");
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_GE(texts.size(), 3u);
  EXPECT_EQ(maskedLine(texts[2]),
            "ENTERING: makeSASPortControllerInstance() in src/factory/SASPortControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ref=0x? dc=0x? properties=0 rc=0x?");
}

TEST_F(SASPortControllerLoggingTest, FailedPathLeavesOnlyEnteringOfTheMakeFunction) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  harness.enumerateInstances("TVRHX_SASPortController");
  EXPECT_THAT(events(), ElementsAre("SASPortController_EnumInstances in", "getAllSASPortControllerInstances in",
                                    "makeSASPortControllerInstance in", "makeSASPortControllerInstance in",
                                    "makeSASPortControllerInstance out", "getAllSASPortControllerInstances out",
                                    "SASPortController_EnumInstances out"));
}

TEST_F(SASPortControllerLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(sasPath("/System/0000:18:00.0"));
  EXPECT_THAT(events(), ElementsAre("SASPortController_GetInstance in", "getOneSASPortControllerInstance in",
                                    "makeSASPortControllerInstance in", "makeSASPortControllerInstance out",
                                    "SASPortController_GetInstance out"));
}

TEST_F(SASPortControllerLoggingTest, LookupThatFindsNothingSaysInstancesInItsExitLine) {
  harness.getInstance(sasPath("/nowhere"));
  EXPECT_THAT(events(), ElementsAre("SASPortController_GetInstance in", "getOneSASPortControllerInstance in",
                                    "getOneSASPortControllerInstance out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_NE(texts[1].find(" context=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[1].find(" properties=0 instance=0 rc=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[2].find(" properties=0 instances=0 rc=0x"), std::string::npos) << texts[2];
}

} // namespace
} // namespace tvr::test
