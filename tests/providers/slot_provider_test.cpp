// TVRHX_Slot through the embedded object manager.
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

// Two slots of a blade and one of its expansion unit.
const char* const kThreeSlots = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Blade Chassis", "children": [
      {"type": "SlotNode", "name": "Mezzanine Slot 1", "properties": {"PropSlotNumber": 1, "PropType": 73}},
      {"type": "SlotNode", "name": "Mezzanine Slot 2", "properties": {"PropSlotNumber": 2, "PropType": 73}}]},
    {"type": "ChassisNode", "name": "Expansion", "children": [
      {"type": "SlotNode", "name": "PXU Slot 1", "properties": {"PropSlotNumber": 1, "PropType": 100}}]}
  ]})";

const char* const kOneSlot =
    R"({"nodes": [{"type": "SlotNode", "name": "Slot 7", "properties": {"PropSlotNumber": 7, "PropType": 100}}]})";

std::string manySlots(int count) {
  std::string json = R"({"nodes": [)";
  for (int i = 0; i < count; ++i) {
    if (i) json += ",";
    json += R"({"type": "SlotNode", "name": "S)" + std::to_string(i) + "\"}";
  }
  return json + "]}";
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

broker::RequestOptions routedToSlot() {
  broker::RequestOptions options;
  options.routeTo = "TVRHX_Slot";
  return options;
}

class SlotProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_Slot");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

// ---- Paths ------------------------------------------------------------------

TEST_F(SlotProviderTest, EnumerateInstanceNamesGivesOnePathPerSlotNode) {
  harness.useTree(kThreeSlots);
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_Slot");
  EXPECT_EQ(first.host, "host.example.com");
  ASSERT_EQ(first.keys.size(), 2u);
  EXPECT_EQ(first.keys[0].name, "Tag");
  EXPECT_EQ(first.keys[0].value, Value::chars("Mezzanine Slot 1"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_Slot"));
  EXPECT_EQ(*r.items[1].path.key("Tag"), Value::chars("Mezzanine Slot 2"));
  EXPECT_EQ(*r.items[2].path.key("Tag"), Value::chars("PXU Slot 1"));
}

TEST_F(SlotProviderTest, InstancePathsEqualTheEnumeratedPaths) {
  harness.useTree(kThreeSlots);
  Response names = harness.enumerateInstanceNames("TVRHX_Slot");
  Response instances = harness.enumerateInstances("TVRHX_Slot");
  EXPECT_EQ(names.paths(), instances.paths());
  EXPECT_EQ(names.paths().size(), 3u);
}

// ---- Instances --------------------------------------------------------------

TEST_F(SlotProviderTest, InstanceCarriesEveryPropertyInOrderWithItsType) {
  Instance slot = onlyInstance(kOneSlot);
  EXPECT_THAT(propertyNames(slot), ElementsAre("Tag", "CreationClassName", "Number", "ConnectorLayout",
                                               "ElementName", "VendorCompatibilityStrings"));
  EXPECT_EQ(property(slot, "Tag"), Value::chars("Slot 7"));
  EXPECT_EQ(property(slot, "CreationClassName"), Value::chars("TVRHX_Slot"));
  EXPECT_EQ(property(slot, "Number"), Value::uint16(7));
  EXPECT_EQ(property(slot, "ConnectorLayout"), Value::uint16(100));
  EXPECT_EQ(property(slot, "ElementName"), Value::chars("Slot 7"));
  const Value& vendor = property(slot, "VendorCompatibilityStrings");
  EXPECT_EQ(vendor.type, CMPI_stringA);
  EXPECT_THAT(vendor.elements, ElementsAre(Value::string("TVR:Slot 7")));
}

TEST_F(SlotProviderTest, PropertyListNamingOnlyNumberStillGivesAllSixProperties) {
  harness.useTree(kOneSlot);
  Response all = harness.enumerateInstances("TVRHX_Slot");
  Response some = harness.enumerateInstances("TVRHX_Slot", std::vector<std::string>{"Number"});
  ASSERT_EQ(some.items.size(), 1u);
  EXPECT_EQ(propertyNames(some.items[0].instance).size(), 6u);
  EXPECT_EQ(some.instances(), all.instances());
}

TEST_F(SlotProviderTest, EmptyPropertyListNarrowsNothingEither) {
  harness.useTree(kOneSlot);
  Response all = harness.enumerateInstances("TVRHX_Slot");
  Response none = harness.enumerateInstances("TVRHX_Slot", std::vector<std::string>{});
  EXPECT_EQ(none.instances(), all.instances());
}

TEST_F(SlotProviderTest, SlotWithoutNameHasTheClassNameAsTagButAnEmptyKey) {
  Instance slot = onlyInstance(R"({"nodes": [{"type": "SlotNode", "segment": "Unnamed"}]})");
  EXPECT_EQ(*slot.path.key("Tag"), Value::chars(""));
  EXPECT_EQ(property(slot, "Tag"), Value::chars("TVRHX_Slot"));
  EXPECT_EQ(property(slot, "ElementName"), Value::chars(""));
  EXPECT_THAT(property(slot, "VendorCompatibilityStrings").elements, ElementsAre(Value::string("TVR:")));
}

TEST_F(SlotProviderTest, SlotWithoutNameHasAnEmptyTagInItsEnumeratedPath) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "segment": "Unnamed"}]})");
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars(""));
}

TEST_F(SlotProviderTest, SlotWithoutNumberOrLayoutPublishesZeros) {
  Instance slot = onlyInstance(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  EXPECT_EQ(property(slot, "Number"), Value::uint16(0));
  EXPECT_EQ(property(slot, "ConnectorLayout"), Value::uint16(0));
}

TEST_F(SlotProviderTest, SlotWithALayoutButNoNumberPublishesBoth) {
  Instance slot = onlyInstance(R"({"nodes": [{"type": "SlotNode", "name": "S", "properties": {"PropType": 73}}]})");
  EXPECT_EQ(property(slot, "Number"), Value::uint16(0));
  EXPECT_EQ(property(slot, "ConnectorLayout"), Value::uint16(73));
}

TEST_F(SlotProviderTest, NumberAndLayoutKeepTheLow16Bits) {
  Instance slot = onlyInstance(
      R"({"nodes": [{"type": "SlotNode", "name": "S", "properties": {"PropSlotNumber": 65537, "PropType": 65636}}]})");
  EXPECT_EQ(property(slot, "Number"), Value::uint16(1));
  EXPECT_EQ(property(slot, "ConnectorLayout"), Value::uint16(100));
}

// ---- Empty machines and other classes ---------------------------------------

TEST_F(SlotProviderTest, MachineWithoutSlotsAnswersNothingDoneOnceAndOk) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_Slot");
  Response instances = harness.enumerateInstances("TVRHX_Slot");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
  EXPECT_THAT(traceTexts(names), ElementsAre("*** Returning COPs of Slot ***"));
  EXPECT_THAT(traceTexts(instances), IsEmpty());
}

TEST_F(SlotProviderTest, ThrowingCursorLeavesTheAnswerEmpty) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["SlotNode"]}, "nodes": [{"type": "SlotNode", "name": "S"}]})");
  Response r = harness.enumerateInstances("TVRHX_Slot");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SlotProviderTest, ClassNameDifferingInCaseOnlyIsServed) {
  harness.useTree(kThreeSlots);
  for (const char* name : {"tvrhx_slot", "TVRHX_SLOT", "tVrHx_SlOt"}) {
    Response names = harness.om().enumerateInstanceNames(classPath(name), routedToSlot());
    Response instances = harness.om().enumerateInstances(classPath(name), std::nullopt, routedToSlot());
    Response one =
        harness.om().getInstance(pathWithKeys(name, {{"Tag", "PXU Slot 1"}}), std::nullopt, routedToSlot());
    EXPECT_EQ(names.items.size(), 3u) << name;
    EXPECT_EQ(instances.items.size(), 3u) << name;
    EXPECT_EQ(one.items.size(), 1u) << name;
  }
}

TEST_F(SlotProviderTest, AnotherClassGetsDoneOkAndNothing) {
  harness.useTree(kThreeSlots);
  Response names = harness.om().enumerateInstanceNames(classPath("CIM_Slot"), routedToSlot());
  Response instances = harness.om().enumerateInstances(classPath("CIM_Slot"), std::nullopt, routedToSlot());
  Response one =
      harness.om().getInstance(pathWithKeys("CIM_Slot", {{"Tag", "PXU Slot 1"}}), std::nullopt, routedToSlot());
  for (const Response* r : {&names, &instances, &one}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_EQ(r->message, std::nullopt);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(r->traces, IsEmpty());
  }
}

// ---- The 16-bit answer count ------------------------------------------------

TEST_F(SlotProviderTest, AnswerOf65536SlotsCountsAsZeroAndReturnsNothing) {
  harness.useTree(manySlots(65536));
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SlotProviderTest, AnswerOf65537SlotsReturnsOne) {
  harness.useTree(manySlots(65537));
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("S0"));
  EXPECT_EQ(r.doneCount, 1);
}

// ---- GetInstance ------------------------------------------------------------

TEST_F(SlotProviderTest, GetInstanceFindsTheSlotByTag) {
  harness.useTree(kThreeSlots);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "Mezzanine Slot 2"}}));
  ASSERT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("Mezzanine Slot 2"));
  EXPECT_EQ(property(r.items[0].instance, "Number"), Value::uint16(2));
}

TEST_F(SlotProviderTest, GetInstanceOfEveryEnumeratedPathFindsItsInstance) {
  harness.useTree(kThreeSlots);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_Slot").paths()) {
    Response one = harness.getInstance(path);
    ASSERT_EQ(one.items.size(), 1u);
    EXPECT_EQ(one.items[0].path, path);
  }
}

TEST_F(SlotProviderTest, GetInstanceIgnoresCreationClassName) {
  harness.useTree(kThreeSlots);
  Response r = harness.getInstance(
      pathWithKeys("TVRHX_Slot", {{"Tag", "PXU Slot 1"}, {"CreationClassName", "Something_Else"}}));
  EXPECT_EQ(r.items.size(), 1u);
}

TEST_F(SlotProviderTest, GetInstanceOfTheFirstOfTwoSlotsWithOneName) {
  harness.useTree(R"({"nodes": [
    {"type": "SlotNode", "name": "Twin", "properties": {"PropSlotNumber": 1}},
    {"type": "SlotNode", "name": "Twin", "properties": {"PropSlotNumber": 2}}]})");
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "Twin"}}));
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Number"), Value::uint16(1));
}

TEST_F(SlotProviderTest, GetInstanceWithTagDifferingInCaseFindsNothing) {
  harness.useTree(kThreeSlots);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "pxu slot 1"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(SlotProviderTest, GetInstanceWithoutTagKeyFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kThreeSlots);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"CreationClassName", "TVRHX_Slot"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

// ---- Broker traces ----------------------------------------------------------

TEST_F(SlotProviderTest, EachInstanceSendsTwoBrokerTraces) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "A"}, {"type": "SlotNode", "name": "B"}]})");
  Response r = harness.enumerateInstances("TVRHX_Slot");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("SlotProvider"));
    EXPECT_EQ(t.string, std::nullopt);
  }
}

TEST_F(SlotProviderTest, PathListSendsOneBrokerTraceAfterTheWalk) {
  harness.useTree(kThreeSlots);
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("*** Returning COPs of Slot ***"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("SlotProvider"));
  EXPECT_EQ(r.traces[0].level, 1);
}

TEST_F(SlotProviderTest, GetInstanceSendsTheTraceOfTheInstanceOnly) {
  harness.useTree(kThreeSlots);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "PXU Slot 1"}}));
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Slot ***"));
}

// ---- Failures of the object manager -----------------------------------------

TEST_F(SlotProviderTest, PathListRetriesTheSameSlotWhilePathsCannotBeMade) {
  harness.useTree(kThreeSlots);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 4);
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("Mezzanine Slot 1"));
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 7u);
}

TEST_F(SlotProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kThreeSlots);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_Slot");
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("Mezzanine Slot 1"));
}

TEST_F(SlotProviderTest, FailedPathGivesANullInstanceInTheAnswerWithoutItsOwnTrace) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "A"}, {"type": "SlotNode", "name": "B"}]})");
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_Slot");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::Instance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***"));
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SlotProviderTest, FailedInstanceIsReturnedNullAfterItsTrace) {
  harness.useTree(kOneSlot);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_Slot");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Slot ***",
                                         "*** Returning an instance of Slot ***"));
}

TEST_F(SlotProviderTest, HollowInstanceIsReturnedAsItCame) {
  harness.useTree(kOneSlot);
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
  Response r = harness.enumerateInstances("TVRHX_Slot");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(traceTexts(r).size(), 2u);
}

TEST_F(SlotProviderTest, FailedVendorArrayLeavesThatPropertyOut) {
  Instance slot = [&] {
    harness.useTree(kOneSlot);
    harness.om().faults().failNext(Fault::NewArray, 1);
    Response r = harness.enumerateInstances("TVRHX_Slot");
    EXPECT_TRUE(r.ok());
    return r.items.at(0).instance;
  }();
  EXPECT_THAT(propertyNames(slot), ElementsAre("Tag", "CreationClassName", "Number", "ConnectorLayout",
                                               "ElementName"));
}

TEST_F(SlotProviderTest, GetInstanceWhosePathCannotBeMadeReturnsANullInstance) {
  harness.useTree(kThreeSlots);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "PXU Slot 1"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(SlotProviderTest, NullBrokerMakesNullInstancesAndNoTraces) {
  harness.useTree(kThreeSlots);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstances("TVRHX_Slot", std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 3u);
  for (const ResultItem& item : r.items) EXPECT_EQ(item.kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

// ---- The function table -----------------------------------------------------

TEST_F(SlotProviderTest, FunctionTableIsNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("SlotProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceSlotProvider");
  EXPECT_EQ(harness.om().providerSymbol("SlotProvider", "SlotProvider_Create_AssociationMI", &error), nullptr);
}

TEST_F(SlotProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("SlotProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  for (CMPIStatus s : {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
                       mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_Slot", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

// ---- Logger lines -----------------------------------------------------------

class SlotLoggingTest : public SlotProviderTest {
protected:
  void SetUp() override {
    harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "A"}, {"type": "SlotNode", "name": "B"}]})");
  }
  LoggerCapture capture;
};

TEST_F(SlotLoggingTest, EveryEventGoesToTheLogThenToTheTraceWithTheSameText) {
  harness.enumerateInstances("TVRHX_Slot");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_FALSE(lines.empty());
  ASSERT_EQ(lines.size() % 2, 0u);
  for (std::size_t i = 0; i < lines.size(); i += 2) {
    EXPECT_EQ(lines[i].channel, Channel::Log);
    EXPECT_EQ(lines[i + 1].channel, Channel::Trace);
    EXPECT_EQ(lines[i].text, lines[i + 1].text);
    EXPECT_EQ(lines[i].function, lines[i + 1].function);
    EXPECT_EQ(lines[i].level, 3000);
    EXPECT_EQ(lines[i + 1].level, 3000);
  }
}

TEST_F(SlotLoggingTest, HandlersLogUnderTheProviderAndFactoriesUnderTheFactory) {
  harness.enumerateInstanceNames("TVRHX_Slot");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 6u);
  EXPECT_EQ(lines[0].function, "Slot_EnumInstanceNames");
  EXPECT_EQ(lines[0].file, "src/providers/SlotProvider.cpp");
  EXPECT_EQ(lines[0].category, "Korvane.SlotProvider");
  EXPECT_EQ(lines[2].function, "getAllSlotCOP");
  EXPECT_EQ(lines[2].file, "src/factory/SlotFactory.cpp");
  EXPECT_EQ(lines[2].category, "Korvane.PhysicalAssetObjFactory");
  EXPECT_EQ(lines[4].function, "Slot_EnumInstanceNames");
}

TEST_F(SlotLoggingTest, PathListWritesEnteringOnly) {
  harness.enumerateInstanceNames("TVRHX_Slot");
  EXPECT_THAT(events(capture),
              ElementsAre("Slot_EnumInstanceNames in", "getAllSlotCOP in", "Slot_EnumInstanceNames out"));
  const std::string entering =
      "ENTERING: getAllSlotCOP() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# ctx=0x# ref=0x# objpaths=0x# rc=0x#";
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_EQ(shapeOf(texts[1]), entering);
}

TEST_F(SlotLoggingTest, InstanceListTracesEachInstanceBuilt) {
  harness.enumerateInstances("TVRHX_Slot");
  EXPECT_THAT(events(capture),
              ElementsAre("Slot_EnumInstances in", "getAllSlotInstances in", "makeSlotInstance in",
                          "makeSlotInstance out", "makeSlotInstance in", "makeSlotInstance out",
                          "getAllSlotInstances out", "Slot_EnumInstances out"));
}

TEST_F(SlotLoggingTest, FactoryParameterListsNameTheirArguments) {
  harness.enumerateInstances("TVRHX_Slot", std::vector<std::string>{"Number"});
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 8u);
  const std::string handler =
      "ENTERING: Slot_EnumInstances() in src/providers/SlotProvider.cpp [Line: #],Parameters List: "
      " mi=0x# ctx=0x# result=0x# ref=0x# properties=0x#";
  const std::string list =
      "ENTERING: getAllSlotInstances() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# context=0x# ref=0x# properties=0x# instances=0x# rc=0x#";
  const std::string make =
      "ENTERING: makeSlotInstance() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# ref=0x# slot=0x# properties=0x# rc=0x#";
  const std::string makeExit =
      "EXITING: makeSlotInstance() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# ref=0x# slot=0x# properties=0x# rc=0x#";
  EXPECT_EQ(shapeOf(texts[0]), handler);
  EXPECT_EQ(shapeOf(texts[1]), list);
  EXPECT_EQ(shapeOf(texts[2]), make);
  EXPECT_EQ(shapeOf(texts[3]), makeExit);
}

TEST_F(SlotLoggingTest, InstanceWhosePathCannotBeMadeLeavesOnlyItsEnteringLine) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  harness.enumerateInstances("TVRHX_Slot");
  EXPECT_THAT(events(capture),
              ElementsAre("Slot_EnumInstances in", "getAllSlotInstances in", "makeSlotInstance in",
                          "makeSlotInstance in", "makeSlotInstance out", "getAllSlotInstances out",
                          "Slot_EnumInstances out"));
}

TEST_F(SlotLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "B"}}));
  EXPECT_THAT(events(capture), ElementsAre("Slot_GetInstance in", "getOneSlotInstance in", "makeSlotInstance in",
                                           "makeSlotInstance out", "Slot_GetInstance out"));
}

TEST_F(SlotLoggingTest, GetInstanceThatFindsNothingSaysInstancesInTheLookupsExitLine) {
  harness.getInstance(pathWithKeys("TVRHX_Slot", {{"Tag", "Elsewhere"}}));
  EXPECT_THAT(events(capture),
              ElementsAre("Slot_GetInstance in", "getOneSlotInstance in", "getOneSlotInstance out"));
  const std::vector<std::string> texts = capture.texts(Channel::Log);
  ASSERT_EQ(texts.size(), 3u);
  const std::string entering =
      "ENTERING: getOneSlotInstance() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# context=0x# ref=0x# properties=0 instance=0 rc=0x#";
  const std::string exiting =
      "EXITING: getOneSlotInstance() in src/factory/SlotFactory.cpp [Line: #],Parameters List: "
      " broker=0x# context=0x# ref=0x# properties=0 instances=0 rc=0x#";
  EXPECT_EQ(shapeOf(texts[1]), entering);
  EXPECT_EQ(shapeOf(texts[2]), exiting);
}

} // namespace
} // namespace tvr::test
