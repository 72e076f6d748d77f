// TVRHX_Connector through the embedded object manager.
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

// The connectors of a blade and of its expansion unit.
const char* const kThreeConnectors = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Blade Chassis", "children": [
      {"type": "ConnectorNode", "name": "Compute Module Midplane Connector"},
      {"type": "ConnectorNode", "name": "Front USB Port"}]},
    {"type": "ChassisNode", "name": "Expansion", "children": [
      {"type": "ConnectorNode", "name": "PXU Uplink Connector"}]}
  ]})";

const char* const kTwoConnectors =
    R"({"nodes": [{"type": "ConnectorNode", "name": "A"}, {"type": "ConnectorNode", "name": "B"}]})";

// The logger events of a request, one "function in" or "function out" for
// each line of the log channel.
std::vector<std::string> events(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log)
      out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  return out;
}

// A logger line with its addresses and line number blotted out, so that it
// can be compared whole: "0x7ffd5a3c" becomes "0x#", "[Line: 87]" "[Line: #]".
std::string shapeOf(const std::string& text) {
  std::string shape;
  for (std::size_t i = 0; i < text.size();) {
    if (text.compare(i, 2, "0x") == 0) {
      shape += "0x#";
      for (i += 2; i < text.size() && std::isxdigit(static_cast<unsigned char>(text[i])); ++i) {
      }
    } else if (text.compare(i, 7, "[Line: ") == 0) {
      shape += "[Line: #]";
      i = text.find(']', i);
      i = i == std::string::npos ? text.size() : i + 1;
    } else {
      shape += text[i++];
    }
  }
  return shape;
}

broker::RequestOptions routedToConnector() {
  broker::RequestOptions options;
  options.routeTo = "TVRHX_Connector";
  return options;
}

class ConnectorProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_Connector");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

// ---- Paths ------------------------------------------------------------------

TEST_F(ConnectorProviderTest, EnumerateInstanceNamesGivesOnePathPerConnectorNode) {
  harness.useTree(kThreeConnectors);
  Response r = harness.enumerateInstanceNames("TVRHX_Connector");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_Connector");
  EXPECT_EQ(first.host, "host.example.com");
  ASSERT_EQ(first.keys.size(), 2u);
  EXPECT_EQ(first.keys[0].name, "Tag");
  EXPECT_EQ(first.keys[0].value, Value::chars("Compute Module Midplane Connector"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_Connector"));
  EXPECT_EQ(*r.items[2].path.key("Tag"), Value::chars("PXU Uplink Connector"));
}

TEST_F(ConnectorProviderTest, InstancePathsEqualTheEnumeratedPaths) {
  harness.useTree(kThreeConnectors);
  Response names = harness.enumerateInstanceNames("TVRHX_Connector");
  Response instances = harness.enumerateInstances("TVRHX_Connector");
  EXPECT_EQ(names.paths(), instances.paths());
  EXPECT_EQ(names.paths().size(), 3u);
}

// ---- Instances --------------------------------------------------------------

TEST_F(ConnectorProviderTest, InstanceCarriesEveryPropertyInOrderWithItsType) {
  Instance connector = onlyInstance(R"({"nodes": [{"type": "ConnectorNode", "name": "Front USB Port"}]})");
  EXPECT_THAT(propertyNames(connector),
              ElementsAre("Tag", "CreationClassName", "ConnectorLayout", "ElementName", "ConnectorDescription"));
  EXPECT_EQ(property(connector, "Tag"), Value::chars("Front USB Port"));
  EXPECT_EQ(property(connector, "CreationClassName"), Value::chars("TVRHX_Connector"));
  EXPECT_EQ(property(connector, "ConnectorLayout"), Value::uint16(1));
  EXPECT_EQ(property(connector, "ElementName"), Value::chars("Front USB Port"));
  EXPECT_EQ(property(connector, "ConnectorDescription"), Value::chars("Front USB Port"));
}

TEST_F(ConnectorProviderTest, ConnectorLayoutIsOneWhateverTheNodeSays) {
  harness.useTree(R"({"nodes": [
    {"type": "ConnectorNode", "name": "A", "properties": {"PropType": 73}},
    {"type": "ConnectorNode", "name": "B", "properties": {"PropType": 0}},
    {"type": "ConnectorNode", "name": "C"}]})");
  Response r = harness.enumerateInstances("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 3u);
  for (const Instance& connector : r.instances())
    EXPECT_EQ(property(connector, "ConnectorLayout"), Value::uint16(1)) << connector.path.keys[0].value.text;
}

TEST_F(ConnectorProviderTest, ElementNameAndDescriptionEqualTheTagOnEveryInstance) {
  harness.useTree(kThreeConnectors);
  Response r = harness.enumerateInstances("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 3u);
  for (const Instance& connector : r.instances()) {
    EXPECT_EQ(property(connector, "ElementName"), property(connector, "ConnectorDescription"));
    EXPECT_EQ(property(connector, "ElementName"), property(connector, "Tag"));
  }
}

TEST_F(ConnectorProviderTest, ConnectorWithoutNameHasTheClassNameAsTagAndEmptyTexts) {
  Instance connector = onlyInstance(R"({"nodes": [{"type": "ConnectorNode", "segment": "Unnamed"}]})");
  EXPECT_EQ(*connector.path.key("Tag"), Value::chars(""));
  EXPECT_EQ(property(connector, "Tag"), Value::chars("TVRHX_Connector"));
  EXPECT_EQ(property(connector, "ElementName"), Value::chars(""));
  EXPECT_EQ(property(connector, "ConnectorDescription"), Value::chars(""));
}

TEST_F(ConnectorProviderTest, PropertyListNamingOnlyElementNameStillGivesAllFiveProperties) {
  harness.useTree(kThreeConnectors);
  Response all = harness.enumerateInstances("TVRHX_Connector");
  Response some = harness.enumerateInstances("TVRHX_Connector", std::vector<std::string>{"ElementName"});
  ASSERT_EQ(some.items.size(), 3u);
  EXPECT_EQ(propertyNames(some.items[0].instance).size(), 5u);
  EXPECT_EQ(some.instances(), all.instances());
}

// ---- Empty machines and other classes ---------------------------------------

TEST_F(ConnectorProviderTest, MachineWithoutConnectorsAnswersNothingDoneOnceAndOk) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_Connector");
  Response instances = harness.enumerateInstances("TVRHX_Connector");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
  EXPECT_THAT(traceTexts(names), ElementsAre("*** Returning COPs of Connector ***"));
}

TEST_F(ConnectorProviderTest, ThrowingCursorLeavesTheAnswerEmpty) {
  harness.useTree(
      R"({"faults": {"throwOnSelect": ["ConnectorNode"]}, "nodes": [{"type": "ConnectorNode", "name": "P"}]})");
  Response r = harness.enumerateInstances("TVRHX_Connector");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ConnectorProviderTest, ClassNameDifferingInCaseOnlyIsServed) {
  harness.useTree(kThreeConnectors);
  for (const char* name : {"tvrhx_connector", "TVRHX_CONNECTOR"}) {
    Response names = harness.om().enumerateInstanceNames(classPath(name), routedToConnector());
    Response instances = harness.om().enumerateInstances(classPath(name), std::nullopt, routedToConnector());
    Response one = harness.om().getInstance(pathWithKeys(name, {{"Tag", "Front USB Port"}}), std::nullopt,
                                            routedToConnector());
    EXPECT_EQ(names.items.size(), 3u) << name;
    EXPECT_EQ(instances.items.size(), 3u) << name;
    EXPECT_EQ(one.items.size(), 1u) << name;
  }
}

TEST_F(ConnectorProviderTest, AnotherClassGetsDoneOkAndNothing) {
  harness.useTree(kThreeConnectors);
  Response names = harness.om().enumerateInstanceNames(classPath("CIM_Connector"), routedToConnector());
  Response instances =
      harness.om().enumerateInstances(classPath("CIM_Connector"), std::nullopt, routedToConnector());
  Response one = harness.om().getInstance(pathWithKeys("CIM_Connector", {{"Tag", "Front USB Port"}}), std::nullopt,
                                          routedToConnector());
  for (const Response* r : {&names, &instances, &one}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(r->traces, IsEmpty());
  }
}

// ---- GetInstance ------------------------------------------------------------

TEST_F(ConnectorProviderTest, GetInstanceFindsTheConnectorByTag) {
  harness.useTree(kThreeConnectors);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Connector", {{"Tag", "PXU Uplink Connector"}}));
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("PXU Uplink Connector"));
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Connector ***"));
}

TEST_F(ConnectorProviderTest, GetInstanceIgnoresCreationClassName) {
  harness.useTree(kThreeConnectors);
  Response r = harness.getInstance(
      pathWithKeys("TVRHX_Connector", {{"Tag", "Front USB Port"}, {"CreationClassName", "Other"}}));
  EXPECT_EQ(r.items.size(), 1u);
}

TEST_F(ConnectorProviderTest, GetInstanceWithTagDifferingInCaseFindsNothing) {
  harness.useTree(kThreeConnectors);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Connector", {{"Tag", "front usb port"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(ConnectorProviderTest, GetInstanceWithoutTagKeyFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kThreeConnectors);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Connector", {{"CreationClassName", "TVRHX_Connector"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(ConnectorProviderTest, GetInstanceWhoseInstanceCannotBeMadeReturnsItNull) {
  harness.useTree(kThreeConnectors);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Connector", {{"Tag", "Front USB Port"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.doneCount, 1);
}

// ---- Broker traces ----------------------------------------------------------

TEST_F(ConnectorProviderTest, EachInstanceSendsTwoBrokerTraces) {
  harness.useTree(kTwoConnectors);
  Response r = harness.enumerateInstances("TVRHX_Connector");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Connector ***",
                                         "*** Returning an instance of Connector ***",
                                         "*** Returning an instance of Connector ***",
                                         "*** Returning an instance of Connector ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("ConnectorProvider"));
    EXPECT_EQ(t.string, std::nullopt);
  }
}

TEST_F(ConnectorProviderTest, PathListSendsOneBrokerTraceAfterTheWalk) {
  harness.useTree(kThreeConnectors);
  Response r = harness.enumerateInstanceNames("TVRHX_Connector");
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("*** Returning COPs of Connector ***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("ConnectorProvider"));
  EXPECT_EQ(r.traces[0].level, 1);
}

// ---- Failures of the object manager -----------------------------------------

TEST_F(ConnectorProviderTest, PathListRetriesTheSameConnectorWhilePathsCannotBeMade) {
  harness.useTree(kThreeConnectors);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 2);
  Response r = harness.enumerateInstanceNames("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("Compute Module Midplane Connector"));
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 5u);
}

TEST_F(ConnectorProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kThreeConnectors);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(ConnectorProviderTest, ConnectorWhoseInstanceCannotBeMadeIsLeftOutButStillTraced) {
  harness.useTree(kTwoConnectors);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_Connector");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("B"));
  EXPECT_EQ(traceTexts(r).size(), 4u);
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ConnectorProviderTest, HollowInstanceIsLeftOutToo) {
  harness.useTree(kTwoConnectors);
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("B"));
}

TEST_F(ConnectorProviderTest, ConnectorWhosePathCannotBeMadeIsLeftOutWithOnlyTheListsTrace) {
  harness.useTree(kTwoConnectors);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_Connector");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("B"));
  EXPECT_EQ(traceTexts(r).size(), 3u);
}

TEST_F(ConnectorProviderTest, NullBrokerAnswersNoInstancesAtAll) {
  harness.useTree(kThreeConnectors);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstances("TVRHX_Connector", std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

// ---- The function table -----------------------------------------------------

TEST_F(ConnectorProviderTest, FunctionTableIsNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ConnectorProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceConnectorProvider");
  EXPECT_EQ(harness.om().providerSymbol("ConnectorProvider", "ConnectorProvider_Create_AssociationMI", &error),
            nullptr);
}

TEST_F(ConnectorProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ConnectorProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  for (CMPIStatus s : {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
                       mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_Connector", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

// ---- Logger lines -----------------------------------------------------------

class ConnectorLoggingTest : public ConnectorProviderTest {
protected:
  void SetUp() override { harness.useTree(kTwoConnectors); }
  LoggerCapture capture;
};

TEST_F(ConnectorLoggingTest, EveryEventGoesToTheLogThenToTheTraceWithTheSameText) {
  harness.enumerateInstances("TVRHX_Connector");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_FALSE(lines.empty());
  ASSERT_EQ(lines.size() % 2, 0u);
  for (std::size_t i = 0; i < lines.size(); i += 2) {
    EXPECT_EQ(lines[i].channel, Channel::Log);
    EXPECT_EQ(lines[i + 1].channel, Channel::Trace);
    EXPECT_EQ(lines[i].text, lines[i + 1].text);
    EXPECT_EQ(lines[i].level, 3000);
  }
}

TEST_F(ConnectorLoggingTest, HandlersLogUnderTheProviderAndFactoriesUnderTheFactory) {
  harness.enumerateInstanceNames("TVRHX_Connector");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 6u);
  EXPECT_EQ(lines[0].function, "Connector_EnumInstanceNames");
  EXPECT_EQ(lines[0].file, "src/providers/ConnectorProvider.cpp");
  EXPECT_EQ(lines[0].category, "Korvane.ConnectorProvider");
  EXPECT_EQ(lines[2].function, "getAllConnectorCOP");
  EXPECT_EQ(lines[2].file, "src/factory/ConnectorFactory.cpp");
  EXPECT_EQ(lines[2].category, "Korvane.PhysicalAssetObjFactory");
  EXPECT_EQ(lines[4].function, "Connector_EnumInstanceNames");
}

TEST_F(ConnectorLoggingTest, InstanceListTracesEachInstanceBuilt) {
  harness.enumerateInstances("TVRHX_Connector");
  EXPECT_THAT(events(capture),
              ElementsAre("Connector_EnumInstances in", "getAllConnectorInstances in", "makeConnectorInstance in",
                          "makeConnectorInstance out", "makeConnectorInstance in", "makeConnectorInstance out",
                          "getAllConnectorInstances out", "Connector_EnumInstances out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  const std::string make =
      "ENTERING: makeConnectorInstance() in src/factory/ConnectorFactory.cpp [Line: #],Parameters List: "
      " broker=0x# ref=0x# connector=0x# properties=0 rc=0x#";
  ASSERT_EQ(texts.size(), 8u);
  EXPECT_EQ(shapeOf(texts[2]), make);
}

TEST_F(ConnectorLoggingTest, InstanceWhosePathCannotBeMadeLeavesOnlyItsEnteringLine) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  harness.enumerateInstances("TVRHX_Connector");
  EXPECT_THAT(events(capture),
              ElementsAre("Connector_EnumInstances in", "getAllConnectorInstances in", "makeConnectorInstance in",
                          "makeConnectorInstance in", "makeConnectorInstance out", "getAllConnectorInstances out",
                          "Connector_EnumInstances out"));
}

TEST_F(ConnectorLoggingTest, GetInstanceThatFindsNothingSaysInstancesInTheLookupsExitLine) {
  harness.getInstance(pathWithKeys("TVRHX_Connector", {{"Tag", "Elsewhere"}}));
  EXPECT_THAT(events(capture),
              ElementsAre("Connector_GetInstance in", "getOneConnectorInstance in", "getOneConnectorInstance out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_NE(texts[1].find(" properties=0 instance=0 rc=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[2].find(" properties=0 instances=0 rc=0x"), std::string::npos) << texts[2];
}

TEST_F(ConnectorLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(pathWithKeys("TVRHX_Connector", {{"Tag", "B"}}));
  EXPECT_THAT(events(capture),
              ElementsAre("Connector_GetInstance in", "getOneConnectorInstance in", "makeConnectorInstance in",
                          "makeConnectorInstance out", "Connector_GetInstance out"));
}

} // namespace
} // namespace tvr::test
