// TVRHX_NetworkCard through the embedded object manager.
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

// Two cards of a blade and one of its expansion unit, up, without link and
// stopped.
const char* const kThreeCards = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Blade Chassis", "children": [
      {"type": "NetworkCardNode", "name": "eth0", "status": 1, "description": "10GbE Mezzanine Adapter",
       "properties": {"PropAdapterSerial": "3c:fd:fe:a0:11:20", "PropAdapterStatus": 1}},
      {"type": "NetworkCardNode", "name": "eth1", "status": 1, "description": "10GbE Mezzanine Adapter",
       "properties": {"PropAdapterSerial": "3c:fd:fe:a0:11:21", "PropAdapterStatus": 12}}]},
    {"type": "ChassisNode", "name": "Expansion", "children": [
      {"type": "NetworkCardNode", "name": "eth2", "status": 1, "description": "25GbE Adapter",
       "properties": {"PropAdapterSerial": "b4:96:91:7c:02:10", "PropAdapterStatus": 16}}]}
  ]})";

const char* const kOneCard = R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0",
  "description": "10GbE Adapter", "properties": {"PropAdapterSerial": "3c:fd:fe:a0:11:20", "PropAdapterStatus": 1}}]})";

std::string cardWithStatus(const std::string& adapterStatus) {
  return R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "properties": {"PropAdapterStatus": )" +
         adapterStatus + "}}]}";
}

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

broker::RequestOptions routedToNetworkCard() {
  broker::RequestOptions options;
  options.routeTo = "TVRHX_NetworkCard";
  return options;
}

Value operationalStatus(std::vector<std::uint16_t> values) {
  std::vector<Value> elements;
  for (std::uint16_t value : values) elements.push_back(Value::uint16(value));
  return Value::array(CMPI_uint16, std::move(elements));
}

class NetworkCardProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_NetworkCard");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

// ---- Paths ------------------------------------------------------------------

TEST_F(NetworkCardProviderTest, EnumerateInstanceNamesGivesOnePathPerCardNode) {
  harness.useTree(kThreeCards);
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_NetworkCard");
  EXPECT_EQ(first.host, "host.example.com");
  ASSERT_EQ(first.keys.size(), 2u);
  EXPECT_EQ(first.keys[0].name, "Tag");
  EXPECT_EQ(first.keys[0].value, Value::chars("eth0"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_NetworkCard"));
  EXPECT_EQ(*r.items[1].path.key("Tag"), Value::chars("eth1"));
  EXPECT_EQ(*r.items[2].path.key("Tag"), Value::chars("eth2"));
}

TEST_F(NetworkCardProviderTest, InstancePathsEqualTheEnumeratedPaths) {
  harness.useTree(kThreeCards);
  Response names = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  Response instances = harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_EQ(names.paths(), instances.paths());
  EXPECT_EQ(names.paths().size(), 3u);
}

// ---- Instances --------------------------------------------------------------

TEST_F(NetworkCardProviderTest, InstanceCarriesEveryPropertyInOrderWithItsType) {
  Instance card = onlyInstance(kOneCard);
  EXPECT_THAT(propertyNames(card), ElementsAre("Tag", "CreationClassName", "Name", "ElementName", "SerialNumber",
                                               "Status", "PackageType", "Description", "OperationalStatus"));
  EXPECT_EQ(property(card, "Tag"), Value::chars("eth0"));
  EXPECT_EQ(property(card, "CreationClassName"), Value::chars("TVRHX_NetworkCard"));
  EXPECT_EQ(property(card, "Name"), Value::chars("eth0"));
  EXPECT_EQ(property(card, "ElementName"), Value::chars("eth0"));
  EXPECT_EQ(property(card, "SerialNumber"), Value::chars("3c:fd:fe:a0:11:20"));
  EXPECT_EQ(property(card, "Status"), Value::chars("OK"));
  EXPECT_EQ(property(card, "PackageType"), Value::uint16(9));
  EXPECT_EQ(property(card, "Description"), Value::chars("10GbE Adapter"));
  const Value& operational = property(card, "OperationalStatus");
  EXPECT_EQ(operational.type, CMPI_uint16A);
  EXPECT_EQ(operational, operationalStatus({2}));
}

TEST_F(NetworkCardProviderTest, PropertyListHoldingOnlyStatusStillGivesAllNineProperties) {
  harness.useTree(kThreeCards);
  Response all = harness.enumerateInstances("TVRHX_NetworkCard");
  Response some = harness.enumerateInstances("TVRHX_NetworkCard", std::vector<std::string>{"Status"});
  ASSERT_EQ(some.items.size(), 3u);
  EXPECT_EQ(propertyNames(some.items[0].instance).size(), 9u);
  EXPECT_EQ(some.instances(), all.instances());
}

TEST_F(NetworkCardProviderTest, StatusAndOperationalStatusFollowTheAdapterStatus) {
  struct Case {
    const char* adapterStatus;
    const char* status;
    std::uint16_t operational;
  };
  for (const Case& c : {Case{"0", "Stopped", 13}, Case{"1", "OK", 2}, Case{"12", "Stopped", 13},
                        Case{"16", "Stopped", 10}, Case{"3", "Stopped", 13}}) {
    Instance card = onlyInstance(cardWithStatus(c.adapterStatus));
    EXPECT_EQ(property(card, "Status"), Value::chars(c.status)) << "adapter status " << c.adapterStatus;
    EXPECT_EQ(property(card, "OperationalStatus"), operationalStatus({c.operational}))
        << "adapter status " << c.adapterStatus;
  }
}

TEST_F(NetworkCardProviderTest, CardWithoutAdapterStatusHasAnEmptyStatusAndNoOperationalStatus) {
  Instance card = onlyInstance(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "status": 1}]})");
  EXPECT_EQ(property(card, "Status"), Value::chars(""));
  EXPECT_EQ(card.property("OperationalStatus"), nullptr);
  EXPECT_THAT(propertyNames(card), ElementsAre("Tag", "CreationClassName", "Name", "ElementName", "SerialNumber",
                                               "Status", "PackageType", "Description"));
}

TEST_F(NetworkCardProviderTest, PackageTypeIsNineOnEveryCardWhateverTheNodeHolds) {
  harness.useTree(R"({"nodes": [
    {"type": "NetworkCardNode", "name": "a", "properties": {"PropPackageType": 5}},
    {"type": "NetworkCardNode", "name": "b", "properties": {"PropPackageType": 9}},
    {"type": "NetworkCardNode", "name": "c"}]})");
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  ASSERT_EQ(r.items.size(), 3u);
  for (const Instance& card : r.instances()) EXPECT_EQ(property(card, "PackageType"), Value::uint16(9));
}

TEST_F(NetworkCardProviderTest, CardWithoutNameHasTheClassNameAsTagButAnEmptyKey) {
  Instance card = onlyInstance(
      R"({"nodes": [{"type": "NetworkCardNode", "segment": "Unnamed", "properties": {"PropAdapterStatus": 1}}]})");
  EXPECT_EQ(*card.path.key("Tag"), Value::chars(""));
  EXPECT_EQ(property(card, "Tag"), Value::chars("TVRHX_NetworkCard"));
  EXPECT_EQ(property(card, "Name"), Value::chars(""));
  EXPECT_EQ(property(card, "ElementName"), Value::chars(""));
}

TEST_F(NetworkCardProviderTest, CardWithoutAdapterSerialHasAnEmptySerialNumber) {
  Instance card = onlyInstance(
      R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "properties": {"PropSerialNumber": "SN-1"}}]})");
  EXPECT_EQ(property(card, "SerialNumber"), Value::chars(""));
}

TEST_F(NetworkCardProviderTest, CardWithoutDescriptionHasAnEmptyDescription) {
  Instance card = onlyInstance(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  EXPECT_EQ(property(card, "Description"), Value::chars(""));
}

TEST_F(NetworkCardProviderTest, NoPlaceholderPropertyIsPublished) {
  Instance card = onlyInstance(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "status": 1,
    "properties": {"PropAdapterStatus": 1, "PropManufacturer": "Northwind", "PropModel": "NW-X710"}}]})");
  for (const char* name : {"Caption", "Manufacturer", "Model", "HealthState", "PoweredOn", "SKU", "Version"})
    EXPECT_EQ(card.property(name), nullptr) << name;
}

// ---- Empty machines and other classes ---------------------------------------

TEST_F(NetworkCardProviderTest, MachineWithoutCardsAnswersNothingDoneOnceAndOk) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  Response instances = harness.enumerateInstances("TVRHX_NetworkCard");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
  EXPECT_THAT(traceTexts(names), ElementsAre("*** Returning an COPs of NetCard ***"));
  EXPECT_THAT(traceTexts(instances), IsEmpty());
}

TEST_F(NetworkCardProviderTest, ThrowingCursorLeavesTheAnswerEmpty) {
  harness.useTree(
      R"({"faults": {"throwOnSelect": ["NetworkCardNode"]}, "nodes": [{"type": "NetworkCardNode", "name": "e"}]})");
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(NetworkCardProviderTest, ClassNameDifferingInCaseOnlyIsServed) {
  harness.useTree(kThreeCards);
  for (const char* name : {"tvrhx_networkcard", "TVRHX_NETWORKCARD", "Tvrhx_NetworkCARD"}) {
    Response names = harness.om().enumerateInstanceNames(classPath(name), routedToNetworkCard());
    Response instances = harness.om().enumerateInstances(classPath(name), std::nullopt, routedToNetworkCard());
    Response one =
        harness.om().getInstance(pathWithKeys(name, {{"Tag", "eth1"}}), std::nullopt, routedToNetworkCard());
    EXPECT_EQ(names.items.size(), 3u) << name;
    EXPECT_EQ(instances.items.size(), 3u) << name;
    EXPECT_EQ(one.items.size(), 1u) << name;
  }
}

TEST_F(NetworkCardProviderTest, AnotherClassGetsDoneOkAndNothing) {
  harness.useTree(kThreeCards);
  Response names = harness.om().enumerateInstanceNames(classPath("CIM_Card"), routedToNetworkCard());
  Response instances = harness.om().enumerateInstances(classPath("CIM_Card"), std::nullopt, routedToNetworkCard());
  Response one =
      harness.om().getInstance(pathWithKeys("CIM_Card", {{"Tag", "eth1"}}), std::nullopt, routedToNetworkCard());
  for (const Response* r : {&names, &instances, &one}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_EQ(r->message, std::nullopt);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(r->traces, IsEmpty());
  }
}

// ---- GetInstance ------------------------------------------------------------

TEST_F(NetworkCardProviderTest, GetInstanceFindsTheCardByTag) {
  harness.useTree(kThreeCards);
  Response r = harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth2"}}));
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("eth2"));
  EXPECT_EQ(property(r.items[0].instance, "OperationalStatus"), operationalStatus({10}));
}

TEST_F(NetworkCardProviderTest, GetInstanceOfEveryEnumeratedPathFindsItsInstance) {
  harness.useTree(kThreeCards);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_NetworkCard").paths()) {
    Response one = harness.getInstance(path);
    ASSERT_EQ(one.items.size(), 1u);
    EXPECT_EQ(one.items[0].path, path);
  }
}

TEST_F(NetworkCardProviderTest, GetInstanceIgnoresCreationClassName) {
  harness.useTree(kThreeCards);
  Response r =
      harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth0"}, {"CreationClassName", "Other"}}));
  EXPECT_EQ(r.items.size(), 1u);
}

TEST_F(NetworkCardProviderTest, GetInstanceWithTagDifferingInCaseFindsNothing) {
  harness.useTree(kThreeCards);
  Response r = harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "ETH0"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(NetworkCardProviderTest, GetInstanceWithoutTagKeyFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kThreeCards);
  Response r =
      harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"CreationClassName", "TVRHX_NetworkCard"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

// ---- Broker traces ----------------------------------------------------------

TEST_F(NetworkCardProviderTest, EachCardSendsATraceThatSaysChassisThenOneThatSaysNetworkCard) {
  harness.useTree(kThreeCards);
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of NetworkCard ***",
                                         "*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of NetworkCard ***",
                                         "*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of NetworkCard ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("PhysicalAssetProvider"));
    EXPECT_EQ(t.string, std::nullopt);
  }
}

TEST_F(NetworkCardProviderTest, PathListSendsOneBrokerTraceAfterTheWalk) {
  harness.useTree(kThreeCards);
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("*** Returning an COPs of NetCard ***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("PhysicalAssetProvider"));
  EXPECT_EQ(r.traces[0].level, 1);
}

TEST_F(NetworkCardProviderTest, GetInstanceSendsTheTraceOfTheInstanceOnly) {
  harness.useTree(kThreeCards);
  Response r = harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth1"}}));
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***"));
}

// ---- Failures of the object manager -----------------------------------------

TEST_F(NetworkCardProviderTest, PathListRetriesTheSameCardWhilePathsCannotBeMade) {
  harness.useTree(kThreeCards);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 3);
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("eth0"));
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 6u);
}

TEST_F(NetworkCardProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kThreeCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkCard");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(NetworkCardProviderTest, FailedPathGivesANullInstanceWithoutTheChassisTrace) {
  harness.useTree(kOneCard);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of NetworkCard ***"));
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(NetworkCardProviderTest, FailedInstanceIsReturnedNullAfterBothTraces) {
  harness.useTree(kOneCard);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of NetworkCard ***"));
}

TEST_F(NetworkCardProviderTest, FailedArrayLeavesOperationalStatusOutAndTellsTheStatus) {
  harness.useTree(kOneCard);
  harness.om().faults().failNext(Fault::NewArray, 1);
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  // The array is made with the request's status, which so ends as the
  // object manager left it.
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  ASSERT_EQ(r.items.size(), 1u);
  const Instance& card = r.items[0].instance;
  EXPECT_EQ(card.property("OperationalStatus"), nullptr);
  EXPECT_THAT(propertyNames(card), ElementsAre("Tag", "CreationClassName", "Name", "ElementName", "SerialNumber",
                                               "Status", "PackageType", "Description"));
  EXPECT_EQ(property(card, "Status"), Value::chars("OK"));
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(NetworkCardProviderTest, HollowArrayLeavesOperationalStatusOutToo) {
  harness.useTree(kOneCard);
  harness.om().faults().failNext(Fault::NewArray, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_NetworkCard");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].instance.property("OperationalStatus"), nullptr);
  EXPECT_EQ(property(r.items[0].instance, "Description"), Value::chars("10GbE Adapter"));
}

TEST_F(NetworkCardProviderTest, NullBrokerMakesNullInstancesAndNoTraces) {
  harness.useTree(kThreeCards);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstances("TVRHX_NetworkCard", std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 3u);
  for (const ResultItem& item : r.items) EXPECT_EQ(item.kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(r.traces, IsEmpty());
}

// ---- The function table -----------------------------------------------------

TEST_F(NetworkCardProviderTest, FunctionTableIsNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("NetworkCardProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceNetworkCardProvider");
  EXPECT_EQ(harness.om().providerSymbol("NetworkCardProvider", "NetworkCardProvider_Create_AssociationMI", &error),
            nullptr);
}

TEST_F(NetworkCardProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("NetworkCardProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  for (CMPIStatus s :
       {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
        mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
        mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
        mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_NetworkCard", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

// ---- Logger lines -----------------------------------------------------------

class NetworkCardLoggingTest : public NetworkCardProviderTest {
protected:
  void SetUp() override {
    harness.useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"},
                                  {"type": "NetworkCardNode", "name": "eth1"}]})");
  }
  LoggerCapture capture;
};

TEST_F(NetworkCardLoggingTest, EveryEventGoesToTheLogThenToTheTraceWithTheSameText) {
  harness.enumerateInstances("TVRHX_NetworkCard");
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

TEST_F(NetworkCardLoggingTest, HandlersLogUnderTheProviderAndFactoriesUnderTheFactory) {
  harness.enumerateInstanceNames("TVRHX_NetworkCard");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 6u);
  EXPECT_EQ(lines[0].function, "NetworkCard_EnumInstanceNames");
  EXPECT_EQ(lines[0].file, "src/providers/NetworkCardProvider.cpp");
  EXPECT_EQ(lines[0].category, "Korvane.NetworkCardProvider");
  EXPECT_EQ(lines[2].function, "getAllNetworkCardCOP");
  EXPECT_EQ(lines[2].file, "src/factory/NetworkCardFactory.cpp");
  EXPECT_EQ(lines[2].category, "Korvane.PhysicalAssetObjFactory");
  EXPECT_EQ(lines[4].function, "NetworkCard_EnumInstanceNames");
}

TEST_F(NetworkCardLoggingTest, InstanceListTracesEachInstanceBuilt) {
  harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_THAT(events(capture),
              ElementsAre("NetworkCard_EnumInstances in", "getAllNetworkCardInstances in",
                          "makeNetworkCardInstance in", "makeNetworkCardInstance out", "makeNetworkCardInstance in",
                          "makeNetworkCardInstance out", "getAllNetworkCardInstances out",
                          "NetworkCard_EnumInstances out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 8u);
  const std::string list =
      "ENTERING: getAllNetworkCardInstances() in src/factory/NetworkCardFactory.cpp [Line: #],Parameters List: "
      " broker=0x# context=0x# ref=0x# properties=0 instances=0x# rc=0x#";
  const std::string make =
      "EXITING: makeNetworkCardInstance() in src/factory/NetworkCardFactory.cpp [Line: #],Parameters List: "
      " broker=0x# ref=0x# nc=0x# properties=0 rc=0x#";
  EXPECT_EQ(shapeOf(texts[1]), list);
  EXPECT_EQ(shapeOf(texts[3]), make);
}

TEST_F(NetworkCardLoggingTest, PathListWritesEnteringOnly) {
  harness.enumerateInstanceNames("TVRHX_NetworkCard");
  EXPECT_THAT(events(capture), ElementsAre("NetworkCard_EnumInstanceNames in", "getAllNetworkCardCOP in",
                                           "NetworkCard_EnumInstanceNames out"));
}

TEST_F(NetworkCardLoggingTest, InstanceWhosePathCannotBeMadeLeavesOnlyItsEnteringLine) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  harness.enumerateInstances("TVRHX_NetworkCard");
  EXPECT_THAT(events(capture),
              ElementsAre("NetworkCard_EnumInstances in", "getAllNetworkCardInstances in",
                          "makeNetworkCardInstance in", "makeNetworkCardInstance in", "makeNetworkCardInstance out",
                          "getAllNetworkCardInstances out", "NetworkCard_EnumInstances out"));
}

TEST_F(NetworkCardLoggingTest, GetInstanceThatFindsNothingSaysInstancesInTheLookupsExitLine) {
  harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth9"}}));
  EXPECT_THAT(events(capture), ElementsAre("NetworkCard_GetInstance in", "getOneNetworkCardInstance in",
                                           "getOneNetworkCardInstance out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_NE(texts[1].find(" properties=0 instance=0 rc=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[2].find(" properties=0 instances=0 rc=0x"), std::string::npos) << texts[2];
}

TEST_F(NetworkCardLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth1"}}));
  EXPECT_THAT(events(capture),
              ElementsAre("NetworkCard_GetInstance in", "getOneNetworkCardInstance in", "makeNetworkCardInstance in",
                          "makeNetworkCardInstance out", "NetworkCard_GetInstance out"));
}

} // namespace
} // namespace tvr::test
