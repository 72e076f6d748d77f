// TVRHX_DiskController through the embedded object manager.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cctype>

#include <optional>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::ResultItem;
using KVLog::Channel;

// An IDE-mode chipset controller and a RAID controller without other
// identifying information, as on the example blade.
const char* const kTwoControllers = R"({
  "systemName": "blade.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 1,
     "properties": {"PropManufacturer": "Northwind Semiconductor", "PropModel": "C620 SATA",
                    "PropType": "IDE interface", "PropOtherIdentifyingInfo": "IDE mode",
                    "PropNumControlled": 2, "PropPortType": 36, "PropFormFactor": 7}},
    {"type": "StorageControllerNode", "name": "0000:18:00.0", "status": 22,
     "properties": {"PropManufacturer": "Northwind Storage", "PropModel": "RAID 9440-8i",
                    "PropType": "RAID bus controller"}}
  ]})";

std::string oneController(const std::string& fields) {
  return R"({"systemName": "blade.example.com", "nodes": [{"type": "StorageControllerNode", "name": "C")" +
         (fields.empty() ? std::string() : ", " + fields) + "}]}";
}

class DiskControllerProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_DiskController");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

TEST_F(DiskControllerProviderTest, EnumerateInstanceNamesGivesOnePathPerControllerNode) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskController");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_DiskController");
  EXPECT_EQ(first.host, "blade.example.com");
  ASSERT_EQ(first.keys.size(), 2u);
  EXPECT_EQ(first.keys[0].name, "Tag");
  EXPECT_EQ(first.keys[0].value, Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_DiskController"));
  EXPECT_EQ(*r.items[1].path.key("Tag"), Value::chars("/0000:18:00.0"));
}

TEST_F(DiskControllerProviderTest, InstanceCarriesTenPropertiesInOrderWithTheirTypes) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& ide = r.items[0].instance;
  EXPECT_THAT(propertyNames(ide), ElementsAre("Tag", "CreationClassName", "Manufacturer", "Model", "Caption",
                                              "OtherIdentifyingInfo", "ElementName", "HealthState", "PackageType",
                                              "PrimaryStatus"));
  EXPECT_EQ(property(ide, "Tag"), Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(property(ide, "CreationClassName"), Value::chars("TVRHX_DiskController"));
  EXPECT_EQ(property(ide, "Manufacturer"), Value::chars("Northwind Semiconductor"));
  EXPECT_EQ(property(ide, "Model"), Value::chars("C620 SATA"));
  EXPECT_EQ(property(ide, "Caption"), Value::chars("IDE interface"));
  EXPECT_EQ(property(ide, "OtherIdentifyingInfo"), Value::chars("IDE mode"));
  EXPECT_EQ(property(ide, "ElementName"), Value::chars("DiskController-/0000:00:1f.2"));
  EXPECT_EQ(property(ide, "HealthState"), Value::uint16(1));
  EXPECT_EQ(property(ide, "PackageType"), Value::uint16(15));
  EXPECT_EQ(property(ide, "PrimaryStatus"), Value::uint16(7));
}

TEST_F(DiskControllerProviderTest, InstancePathEqualsTheEnumeratedPath) {
  harness.useTree(kTwoControllers);
  Response names = harness.enumerateInstanceNames("TVRHX_DiskController");
  Response instances = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(names.items.size(), 2u);
  EXPECT_EQ(names.paths(), instances.paths());
}

TEST_F(DiskControllerProviderTest, PrimaryStatusIsTheFormFactor) {
  Instance dc = onlyInstance(oneController(R"("status": 1, "properties": {"PropFormFactor": 12})"));
  EXPECT_EQ(property(dc, "PrimaryStatus"), Value::uint16(12));
  EXPECT_EQ(dc.property("FormFactor"), nullptr);
}

TEST_F(DiskControllerProviderTest, FormFactorAbove16BitsGivesItsLow16Bits) {
  Instance dc = onlyInstance(oneController(R"("properties": {"PropFormFactor": 131081})"));
  EXPECT_EQ(property(dc, "PrimaryStatus"), Value::uint16(9));
}

TEST_F(DiskControllerProviderTest, HealthStateIsTheRawNodeStatus) {
  for (unsigned status : {0u, 1u, 16u, 22u, 300u}) {
    Instance dc = onlyInstance(oneController("\"status\": " + std::to_string(status)));
    EXPECT_EQ(property(dc, "HealthState"), Value::uint16(static_cast<std::uint16_t>(status)))
        << "node status " << status;
  }
}

TEST_F(DiskControllerProviderTest, PackageTypeIsFifteenWhateverTheNodeHolds) {
  Instance dc = onlyInstance(oneController(R"("properties": {"PropPackageType": 3})"));
  EXPECT_EQ(property(dc, "PackageType"), Value::uint16(15));
}

TEST_F(DiskControllerProviderTest, NodeWithoutPropertiesStillCarriesAllTen) {
  Instance dc = onlyInstance(oneController(""));
  EXPECT_THAT(propertyNames(dc), ElementsAre("Tag", "CreationClassName", "Manufacturer", "Model", "Caption",
                                             "OtherIdentifyingInfo", "ElementName", "HealthState", "PackageType",
                                             "PrimaryStatus"));
  EXPECT_EQ(property(dc, "Manufacturer"), Value::chars(""));
  EXPECT_EQ(property(dc, "Model"), Value::chars(""));
  EXPECT_EQ(property(dc, "Caption"), Value::chars(""));
  EXPECT_EQ(property(dc, "OtherIdentifyingInfo"), Value::chars(""));
  EXPECT_EQ(property(dc, "PrimaryStatus"), Value::uint16(0));
}

TEST_F(DiskControllerProviderTest, NodeWithoutOtherIdentifyingInfoIsADiskControllerWithThatPropertyEmpty) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(property(r.items[1].instance, "OtherIdentifyingInfo"), Value::chars(""));
  EXPECT_EQ(property(r.items[1].instance, "Model"), Value::chars("RAID 9440-8i"));
}

TEST_F(DiskControllerProviderTest, ElementNameIsAlwaysTheTagWithThePrefix) {
  harness.useTree(R"({"nodes": [
    {"type": "SystemNode", "name": "System", "children": [
      {"type": "StorageControllerNode", "name": "0000:00:1f.2"},
      {"type": "StorageControllerNode", "segment": "StorageControllerNode#7"}]},
    {"type": "StorageControllerNode", "name": "DiskController-x"}]})");
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 3u);
  for (const ResultItem& item : r.items) {
    const Value& tag = property(item.instance, "Tag");
    EXPECT_EQ(property(item.instance, "ElementName"), Value::chars("DiskController-" + tag.text));
  }
  EXPECT_EQ(property(r.items[2].instance, "ElementName"), Value::chars("DiskController-/DiskController-x"));
}

TEST_F(DiskControllerProviderTest, PropertyListNarrowsNothing) {
  harness.useTree(kTwoControllers);
  Response all = harness.enumerateInstances("TVRHX_DiskController");
  Response model = harness.enumerateInstances("TVRHX_DiskController", std::vector<std::string>{"Model"});
  Response none = harness.enumerateInstances("TVRHX_DiskController", std::vector<std::string>{});
  ASSERT_EQ(all.items.size(), 2u);
  EXPECT_EQ(propertyNames(model.items[0].instance).size(), 10u);
  EXPECT_EQ(model.instances(), all.instances());
  EXPECT_EQ(none.instances(), all.instances());
}

TEST_F(DiskControllerProviderTest, MachineWithoutStorageControllerAnswersEmptyOkAndDoneOnce) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_DiskController");
  Response instances = harness.enumerateInstances("TVRHX_DiskController");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(DiskControllerProviderTest, ThrowingCursorLeavesTheAnswerEmpty) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["StorageControllerNode"]},
                      "nodes": [{"type": "StorageControllerNode", "name": "C"}]})");
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(DiskControllerProviderTest, ClassNameOfNamesAndGetInstanceIsComparedWithoutRegardToCase) {
  harness.useTree(kTwoControllers);
  EXPECT_EQ(harness.enumerateInstanceNames("tvrhx_DISKcontroller").items.size(), 2u);
  Response one = harness.getInstance(pathWithKeys("TVRHX_DISKCONTROLLER", {{"Tag", "/0000:18:00.0"}}));
  EXPECT_EQ(one.items.size(), 1u);
}

TEST_F(DiskControllerProviderTest, EnumerateInstanceNamesOfAnIDEClassAnswersNothingAndOk) {
  harness.useTree(kTwoControllers);
  for (const char* ideClass : {"TVRHX_IDEController", "TVRHX_ChipIDECont"}) {
    Response r = harness.enumerateInstanceNames(ideClass);
    EXPECT_EQ(r.outcomes.at(0).provider, "DiskControllerProvider");
    EXPECT_EQ(r.rc, CMPI_RC_OK) << ideClass;
    EXPECT_THAT(r.items, IsEmpty()) << ideClass;
    EXPECT_EQ(r.doneCount, 1) << ideClass;
    EXPECT_THAT(r.traces, IsEmpty()) << ideClass;
  }
}

TEST_F(DiskControllerProviderTest, GetInstanceOfAnIDEClassAnswersNothingAndOk) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(pathWithKeys("TVRHX_ChipIDECont", {{"Tag", "/0000:00:1f.2"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(DiskControllerProviderTest, GetInstanceFindsTheControllerByTag) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/0000:18:00.0"}}));
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Model"), Value::chars("RAID 9440-8i"));
  EXPECT_EQ(property(r.items[0].instance, "HealthState"), Value::uint16(22));
}

TEST_F(DiskControllerProviderTest, GetInstanceIgnoresCreationClassName) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(
      pathWithKeys("TVRHX_DiskController", {{"Tag", "/0000:18:00.0"}, {"CreationClassName", "Other_Class"}}));
  EXPECT_EQ(r.items.size(), 1u);
}

TEST_F(DiskControllerProviderTest, GetInstanceOfEveryEnumeratedPathFindsItsInstance) {
  harness.useTree(kTwoControllers);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_DiskController").paths()) {
    Response one = harness.getInstance(path);
    ASSERT_EQ(one.items.size(), 1u);
    EXPECT_EQ(one.items[0].path, path);
  }
}

TEST_F(DiskControllerProviderTest, GetInstanceWithTagDifferingInCaseFindsNothing) {
  harness.useTree(R"({"nodes": [{"type": "StorageControllerNode", "name": "Sata"}]})");
  Response r = harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/SATA"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(DiskControllerProviderTest, GetInstanceWithoutTagKeyFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kTwoControllers);
  Response r =
      harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"CreationClassName", "TVRHX_DiskController"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(DiskControllerProviderTest, EachInstanceSendsTwoBrokerTraces) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of DiskController ***",
                                         "*** Returning an instance of DiskController ***",
                                         "*** Returning an instance of DiskController ***",
                                         "*** Returning an instance of DiskController ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("PhysicalAssetProvider"));
  }
}

TEST_F(DiskControllerProviderTest, PathListSendsOneBrokerTrace) {
  harness.useTree(kTwoControllers);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskController");
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("*** Returning COPs of DiskController ***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("PhysicalAssetProvider"));
  EXPECT_EQ(r.traces[0].level, 1);
}

TEST_F(DiskControllerProviderTest, GetInstanceSendsTheInstanceTraceOnce) {
  harness.useTree(kTwoControllers);
  Response r = harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/0000:00:1f.2"}}));
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of DiskController ***"));
}

TEST_F(DiskControllerProviderTest, PathListRetriesTheSameNodeWhilePathsCannotBeMade) {
  harness.useTree(kTwoControllers);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 3);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 5u);
}

TEST_F(DiskControllerProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kTwoControllers);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("/0000:00:1f.2"));
}

TEST_F(DiskControllerProviderTest, FailedPathGivesANullInstanceWithoutItsOwnTrace) {
  harness.useTree(oneController(""));
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of DiskController ***"));
}

TEST_F(DiskControllerProviderTest, FailedInstanceIsReturnedNullAfterItsTrace) {
  harness.useTree(oneController(""));
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of DiskController ***",
                                         "*** Returning an instance of DiskController ***"));
}

TEST_F(DiskControllerProviderTest, HollowInstanceIsReturnedWithoutProperties) {
  harness.useTree(oneController(""));
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(traceTexts(r).size(), 2u);
}

TEST_F(DiskControllerProviderTest, GetInstanceWithANullBrokerReturnsANullInstance) {
  harness.useTree(kTwoControllers);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/0000:18:00.0"}}),
                                   std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(DiskControllerProviderTest, FunctionTableNamesTheProvider) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("DiskControllerProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceDiskControllerProvider");
  EXPECT_EQ(harness.om().providerSymbol("DiskControllerProvider", "DiskControllerProvider_Create_AssociationMI",
                                        &error),
            nullptr);
}

TEST_F(DiskControllerProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("DiskControllerProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_DiskController", "WQL").rc,
            CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr).msg, nullptr);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

// The logger lines of one request, as "<function> in" and "<function> out".
class DiskControllerLoggingTest : public DiskControllerProviderTest {
protected:
  void SetUp() override { harness.useTree(kTwoControllers); }

  std::vector<std::string> events() const {
    std::vector<std::string> out;
    for (const LoggedLine& line : capture.lines())
      if (line.channel == Channel::Log)
        out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
    return out;
  }

  std::optional<LoggedLine> firstLine(const std::string& function) const {
    for (const LoggedLine& line : capture.lines())
      if (line.function == function) return line;
    return std::nullopt;
  }

  LoggerCapture capture;
};

TEST_F(DiskControllerLoggingTest, EnumerateInstancesTracesTheListAndEachInstance) {
  harness.enumerateInstances("TVRHX_DiskController");
  EXPECT_THAT(events(), ElementsAre("DiskController_EnumInstances in", "getAllDiskControllerInstances in",
                                    "makeDiskControllerInstance in", "makeDiskControllerInstance out",
                                    "makeDiskControllerInstance in", "makeDiskControllerInstance out",
                                    "getAllDiskControllerInstances out", "DiskController_EnumInstances out"));
}

TEST_F(DiskControllerLoggingTest, PathListWritesEnteringOnly) {
  harness.enumerateInstanceNames("TVRHX_DiskController");
  EXPECT_THAT(events(), ElementsAre("DiskController_EnumInstanceNames in", "getAllDiskControllerCOP in",
                                    "DiskController_EnumInstanceNames out"));
}

TEST_F(DiskControllerLoggingTest, HandlerLinesGoToTheProviderCategoryAndFactoryLinesToTheFactoryCategory) {
  harness.enumerateInstanceNames("TVRHX_DiskController");
  const std::optional<LoggedLine> handler = firstLine("DiskController_EnumInstanceNames");
  const std::optional<LoggedLine> list = firstLine("getAllDiskControllerCOP");
  ASSERT_TRUE(handler && list);
  EXPECT_EQ(handler->category, "Korvane.DiskControllerProvider");
  EXPECT_EQ(handler->file, "src/providers/DiskControllerProvider.cpp");
  EXPECT_EQ(handler->level, 3000);
  EXPECT_EQ(list->category, "Korvane.PhysicalAssetObjFactory");
  EXPECT_EQ(maskedLine(list->text),
            "ENTERING: getAllDiskControllerCOP() in src/factory/DiskControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ctx=0x? ref=0x? objpaths=0x? rc=0x?");
}

TEST_F(DiskControllerLoggingTest, EachEventGoesToTheLogThenToTheTraceWithTheSameText) {
  harness.enumerateInstances("TVRHX_DiskController");
  const std::vector<LoggedLine> all = capture.lines();
  ASSERT_EQ(all.size(), 16u);
  for (std::size_t i = 0; i < all.size(); i += 2) {
    EXPECT_EQ(all[i].channel, Channel::Log);
    EXPECT_EQ(all[i + 1].channel, Channel::Trace);
    EXPECT_EQ(all[i].text, all[i + 1].text);
  }
}

TEST_F(DiskControllerLoggingTest, MakeInstanceListsBrokerRefViewPropertiesAndStatus) {
  harness.enumerateInstances("TVRHX_DiskController");
  const std::optional<LoggedLine> make = firstLine("makeDiskControllerInstance");
  ASSERT_TRUE(make);
  EXPECT_EQ(maskedLine(make->text),
            "ENTERING: makeDiskControllerInstance() in src/factory/DiskControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ref=0x? dc=0x? properties=0 rc=0x?");
  const std::optional<LoggedLine> list = firstLine("getAllDiskControllerInstances");
  ASSERT_TRUE(list);
  EXPECT_EQ(maskedLine(list->text),
            "ENTERING: getAllDiskControllerInstances() in src/factory/DiskControllerFactory.cpp [Line: N],Parameters List:  broker=0x? context=0x? ref=0x? properties=0 instances=0x? rc=0x?");
}

TEST_F(DiskControllerLoggingTest, FailedPathLeavesTheMakeFunctionsEnteringAndExiting) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  harness.enumerateInstances("TVRHX_DiskController");
  EXPECT_THAT(events(), ElementsAre("DiskController_EnumInstances in", "getAllDiskControllerInstances in",
                                    "makeDiskControllerInstance in", "makeDiskControllerInstance out",
                                    "makeDiskControllerInstance in", "makeDiskControllerInstance out",
                                    "getAllDiskControllerInstances out", "DiskController_EnumInstances out"));
}

TEST_F(DiskControllerLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/0000:18:00.0"}}));
  EXPECT_THAT(events(), ElementsAre("DiskController_GetInstance in", "getOneDiskControllerInstance in",
                                    "makeDiskControllerInstance in", "makeDiskControllerInstance out",
                                    "DiskController_GetInstance out"));
}

TEST_F(DiskControllerLoggingTest, LookupThatFindsNothingSaysInstancesInItsExitLine) {
  harness.getInstance(pathWithKeys("TVRHX_DiskController", {{"Tag", "/nowhere"}}));
  EXPECT_THAT(events(), ElementsAre("DiskController_GetInstance in", "getOneDiskControllerInstance in",
                                    "getOneDiskControllerInstance out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_NE(texts[1].find(" properties=0 instance=0 rc=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[2].find(" properties=0 instances=0 rc=0x"), std::string::npos) << texts[2];
}

} // namespace
} // namespace tvr::test
