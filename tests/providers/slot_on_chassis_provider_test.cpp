// TVRHX_SlotOnChassis through the embedded object manager: a slot whose Tag
// carries "PME", "PXU" or "PEN" stands on an expansion chassis (type 18),
// any other slot on a main system chassis (type 17).
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace tvr::test {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using broker::AssociationArgs;
using broker::FailureShape;
using broker::Fault;
using broker::RequestOptions;
using broker::ResultItem;
using KVLog::Channel;

// Every marker word, both chassis types that carry slots, a chassis type
// that carries none, and markers in lower case, in the middle and at the end.
const char* const kEveryKind = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}, "children": [
      {"type": "SlotNode", "name": "Slot 1"},
      {"type": "SlotNode", "name": "Riser pxu 2"}]},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}, "children": [
      {"type": "SlotNode", "name": "PXU Slot 3"},
      {"type": "SlotNode", "name": "Bay PME 4"},
      {"type": "SlotNode", "name": "Slot PEN"}]},
    {"type": "ChassisNode", "name": "Rack", "properties": {"PropChassisType": 3}}
  ]})";

// Which chassis each slot of kEveryKind stands on, in slot order.
const std::vector<std::pair<std::string, std::string>> kSlotOnChassis = {
    {"Slot 1", "/Main"},
    {"Riser pxu 2", "/Main"},
    {"PXU Slot 3", "/Expansion"},
    {"Bay PME 4", "/Expansion"},
    {"Slot PEN", "/Expansion"},
};
const std::vector<std::string> kChassisTags = {"/Main", "/Expansion", "/Rack"};

std::vector<std::string> slotsOn(const std::string& chassis) {
  std::vector<std::string> slots;
  for (const auto& [slot, on] : kSlotOnChassis)
    if (on == chassis) slots.push_back(slot);
  return slots;
}

std::vector<std::string> chassisUnder(const std::string& slot) {
  std::vector<std::string> chassis;
  for (const auto& [s, on] : kSlotOnChassis)
    if (s == slot) chassis.push_back(on);
  return chassis;
}

std::vector<std::string> expectedPairs() {
  std::vector<std::string> pairs;
  for (const auto& [slot, on] : kSlotOnChassis) pairs.push_back(slot + " on " + on);
  return pairs;
}

const char* const kPlainAndPXU = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}},
    {"type": "SlotNode", "name": "Slot 1"},
    {"type": "SlotNode", "name": "PXU Slot 2"}
  ]})";

const char* const kTwoExpansionChassis = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}},
    {"type": "ChassisNode", "name": "Expansion A", "properties": {"PropChassisType": 18}},
    {"type": "ChassisNode", "name": "Expansion B", "properties": {"PropChassisType": 18}},
    {"type": "SlotNode", "name": "PEN Slot 1"}
  ]})";

ObjectPath chassisPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Chassis", {{"Tag", tag}, {"CreationClassName", "TVRHX_Chassis"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath slotPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Slot", {{"Tag", tag}, {"CreationClassName", "TVRHX_Slot"}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

AssociationArgs slotOnChassis(std::optional<std::string> resultClass = std::nullopt) {
  return over("TVRHX_SlotOnChassis", std::move(resultClass));
}

RequestOptions toSlotOnChassis() {
  RequestOptions options;
  options.routeTo = "TVRHX_SlotOnChassis";
  return options;
}

// The Tag key of every path of a response, in order.
std::vector<std::string> tags(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) out.push_back(p.key("Tag") ? p.key("Tag")->text : "(no tag)");
  return out;
}

std::string tagOf(const Value* reference) {
  if (!reference || !reference->ref || !reference->ref->key("Tag")) return "?";
  return reference->ref->key("Tag")->text;
}

// "<slot> on <chassis>" for every association path of a response.
std::vector<std::string> pairs(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths())
    out.push_back(tagOf(p.key("PartComponent")) + " on " + tagOf(p.key("GroupComponent")));
  return out;
}

// The ENTERING and EXITING events this provider's module logged, one
// "function in" or "function out" for each line of the log channel.
std::vector<std::string> events(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.category == "Korvane.SlotOnChassisProvider")
      out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  return out;
}

class SlotOnChassisTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

// ---- The pairing rule, asked from every side ---------------------------------

TEST_F(SlotOnChassisTest, EnumeratedNamesTieEachSlotToTheChassisOfItsKind) {
  harness.useTree(kEveryKind);
  Response r = harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(pairs(r), expectedPairs());
}

TEST_F(SlotOnChassisTest, EnumeratedInstancesTieEachSlotToTheChassisOfItsKind) {
  harness.useTree(kEveryKind);
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(pairs(r), expectedPairs());
}

TEST_F(SlotOnChassisTest, AssociatorsFromEachChassisGiveItsSlots) {
  harness.useTree(kEveryKind);
  for (const std::string& chassis : kChassisTags) {
    Response r = harness.om().associators(chassisPath(chassis), slotOnChassis());
    EXPECT_TRUE(r.ok()) << chassis;
    EXPECT_EQ(r.doneCount, 0) << chassis;
    EXPECT_EQ(tags(r), slotsOn(chassis)) << chassis;
  }
}

TEST_F(SlotOnChassisTest, AssociatorNamesFromEachChassisGiveItsSlots) {
  harness.useTree(kEveryKind);
  for (const std::string& chassis : kChassisTags) {
    Response r = harness.om().associatorNames(chassisPath(chassis), slotOnChassis());
    EXPECT_TRUE(r.ok()) << chassis;
    EXPECT_EQ(r.doneCount, 0) << chassis;
    EXPECT_EQ(tags(r), slotsOn(chassis)) << chassis;
  }
}

TEST_F(SlotOnChassisTest, AssociatorsFromEachSlotGiveItsChassis) {
  harness.useTree(kEveryKind);
  for (const auto& [slot, on] : kSlotOnChassis) {
    Response r = harness.om().associators(slotPath(slot), slotOnChassis());
    EXPECT_TRUE(r.ok()) << slot;
    EXPECT_EQ(r.doneCount, 0) << slot;
    EXPECT_EQ(tags(r), chassisUnder(slot)) << slot;
  }
}

TEST_F(SlotOnChassisTest, AssociatorNamesFromEachSlotGiveItsChassis) {
  harness.useTree(kEveryKind);
  for (const auto& [slot, on] : kSlotOnChassis) {
    Response r = harness.om().associatorNames(slotPath(slot), slotOnChassis());
    EXPECT_TRUE(r.ok()) << slot;
    EXPECT_EQ(tags(r), chassisUnder(slot)) << slot;
  }
}

TEST_F(SlotOnChassisTest, PlainSlotAndPXUSlotStandOnMainAndExpansionChassis) {
  harness.useTree(kPlainAndPXU);
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_THAT(pairs(r), ElementsAre("Slot 1 on /Main", "PXU Slot 2 on /Expansion"));
  EXPECT_THAT(tags(harness.om().associators(slotPath("Slot 1"), slotOnChassis())), ElementsAre("/Main"));
  EXPECT_THAT(tags(harness.om().associators(slotPath("PXU Slot 2"), slotOnChassis())), ElementsAre("/Expansion"));
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Main"), slotOnChassis())), ElementsAre("Slot 1"));
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Expansion"), slotOnChassis())), ElementsAre("PXU Slot 2"));
}

TEST_F(SlotOnChassisTest, EnumerationTiesASlotToTheFirstChassisOfItsKindOnly) {
  harness.useTree(kTwoExpansionChassis);
  EXPECT_THAT(pairs(harness.enumerateInstances("TVRHX_SlotOnChassis")), ElementsAre("PEN Slot 1 on /Expansion A"));
  EXPECT_THAT(pairs(harness.enumerateInstanceNames("TVRHX_SlotOnChassis")),
              ElementsAre("PEN Slot 1 on /Expansion A"));
}

TEST_F(SlotOnChassisTest, AssociatorsTieASlotToEveryChassisOfItsKind) {
  harness.useTree(kTwoExpansionChassis);
  EXPECT_THAT(tags(harness.om().associators(slotPath("PEN Slot 1"), slotOnChassis())),
              ElementsAre("/Expansion A", "/Expansion B"));
  for (const char* chassis : {"/Expansion A", "/Expansion B"})
    EXPECT_THAT(tags(harness.om().associatorNames(chassisPath(chassis), slotOnChassis())),
                ElementsAre("PEN Slot 1"))
        << chassis;
}

TEST_F(SlotOnChassisTest, MarkerInLowerCaseIsAPlainTag) {
  harness.useTree(kEveryKind);
  EXPECT_THAT(tags(harness.om().associators(slotPath("Riser pxu 2"), slotOnChassis())), ElementsAre("/Main"));
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Expansion"), slotOnChassis())),
              Not(Contains("Riser pxu 2")));
}

TEST_F(SlotOnChassisTest, MarkerInTheMiddleOrAtTheEndOfTheTagCounts) {
  harness.useTree(kEveryKind);
  EXPECT_THAT(tags(harness.om().associators(slotPath("Bay PME 4"), slotOnChassis())), ElementsAre("/Expansion"));
  EXPECT_THAT(tags(harness.om().associators(slotPath("Slot PEN"), slotOnChassis())), ElementsAre("/Expansion"));
}

TEST_F(SlotOnChassisTest, ChassisOfAnotherTypeCarriesNoSlots) {
  harness.useTree(R"({"systemName": "host.example.com", "nodes": [
    {"type": "ChassisNode", "name": "Tower", "properties": {"PropChassisType": 7}},
    {"type": "SlotNode", "name": "Slot 1"}, {"type": "SlotNode", "name": "PXU Slot 2"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  Response instances = harness.enumerateInstances("TVRHX_SlotOnChassis");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
  for (const char* slot : {"Slot 1", "PXU Slot 2"}) {
    Response r = harness.om().associators(slotPath(slot), slotOnChassis());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << slot;
    EXPECT_THAT(r.items, IsEmpty()) << slot;
  }
  EXPECT_THAT(harness.om().associators(chassisPath("/Tower"), slotOnChassis()).items, IsEmpty());
}

TEST_F(SlotOnChassisTest, ChassisWithoutATypeCarriesNoSlots) {
  harness.useTree(R"({"systemName": "host.example.com", "nodes": [
    {"type": "ChassisNode", "name": "Untyped"}, {"type": "SlotNode", "name": "Slot 1"}]})");
  EXPECT_THAT(harness.enumerateInstances("TVRHX_SlotOnChassis").items, IsEmpty());
  EXPECT_THAT(harness.om().associators(chassisPath("/Untyped"), slotOnChassis()).items, IsEmpty());
  EXPECT_THAT(harness.om().associators(slotPath("Slot 1"), slotOnChassis()).items, IsEmpty());
}

TEST_F(SlotOnChassisTest, SlotWithNoChassisOfItsKindIsLeftOutSilently) {
  harness.useTree(R"({"systemName": "host.example.com", "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}},
    {"type": "SlotNode", "name": "PXU Slot 1"}, {"type": "SlotNode", "name": "Slot 2"}]})");
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(pairs(r), ElementsAre("Slot 2 on /Main"));
  EXPECT_THAT(traceTexts(r), Not(Contains(HasSubstr("NULL"))));
  EXPECT_THAT(harness.om().associators(slotPath("PXU Slot 1"), slotOnChassis()).items, IsEmpty());
}

// ---- Associators and AssociatorNames -----------------------------------------

TEST_F(SlotOnChassisTest, AssociatorsGiveInstancesAndAssociatorNamesGivePaths) {
  harness.useTree(kPlainAndPXU);
  Response instances = harness.om().associators(chassisPath("/Main"), slotOnChassis());
  ASSERT_EQ(instances.items.size(), 1u);
  EXPECT_EQ(instances.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(property(instances.items[0].instance, "Number").type, CMPI_uint16);
  Response names = harness.om().associatorNames(slotPath("Slot 1"), slotOnChassis());
  ASSERT_EQ(names.items.size(), 1u);
  EXPECT_EQ(names.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(names.items[0].path, chassisPath("/Main"));
  EXPECT_EQ(names.items[0].path.nameSpace, "root/cimv2");
}

TEST_F(SlotOnChassisTest, AnyResultClassAnswersNothing) {
  harness.useTree(kPlainAndPXU);
  for (const char* resultClass : {"CIM_Slot", "TVRHX_Slot", "tvrhx_slot", "CIM_Chassis"}) {
    Response r = harness.om().associators(chassisPath("/Main"), slotOnChassis(resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_THAT(r.items, IsEmpty()) << resultClass;
    EXPECT_EQ(r.doneCount, 0) << resultClass;
  }
  for (const char* resultClass : {"CIM_Chassis", "TVRHX_Chassis", "CIM_Slot"}) {
    EXPECT_THAT(harness.om().associatorNames(slotPath("Slot 1"), slotOnChassis(resultClass)).items, IsEmpty())
        << resultClass;
  }
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Main"), slotOnChassis())), ElementsAre("Slot 1"));
}

TEST_F(SlotOnChassisTest, ResultClassEndsTheHandlerBeforeItsExitLine) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  harness.om().associatorNames(chassisPath("/Main"), slotOnChassis("TVRHX_Slot"));
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_AssociatorNames in"));
}

TEST_F(SlotOnChassisTest, RolesChangeNothing) {
  harness.useTree(kEveryKind);
  AssociationArgs plain = slotOnChassis();
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "GroupComponent";
  EXPECT_EQ(harness.om().associators(chassisPath("/Expansion"), roles).paths(),
            harness.om().associators(chassisPath("/Expansion"), plain).paths());
  EXPECT_EQ(harness.om().associatorNames(slotPath("Slot 1"), roles).paths(),
            harness.om().associatorNames(slotPath("Slot 1"), plain).paths());
}

TEST_F(SlotOnChassisTest, AssociatorsFromAChassisThatDoesNotExistEndWithoutExitLine) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  Response r = harness.om().associators(chassisPath("/Nowhere"), slotOnChassis());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_Associators in"));
}

TEST_F(SlotOnChassisTest, ChassisTagDiffersOnlyInCaseFromARealOneIsNotFound) {
  harness.useTree(kPlainAndPXU);
  EXPECT_THAT(harness.om().associators(chassisPath("/main"), slotOnChassis()).items, IsEmpty());
}

TEST_F(SlotOnChassisTest, SlotThatDoesNotExistFindsTheChassisItsTagNames) {
  harness.useTree(kPlainAndPXU);
  EXPECT_THAT(tags(harness.om().associators(slotPath("Ghost PXU"), slotOnChassis())), ElementsAre("/Expansion"));
  EXPECT_THAT(tags(harness.om().associators(slotPath("Ghost"), slotOnChassis())), ElementsAre("/Main"));
}

TEST_F(SlotOnChassisTest, SlotPathWithoutTagIsAPlainSlot) {
  harness.useTree(kPlainAndPXU);
  const ObjectPath untagged = pathWithKeys("TVRHX_Slot", {{"CreationClassName", "TVRHX_Slot"}});
  EXPECT_THAT(tags(harness.om().associators(untagged, slotOnChassis())), ElementsAre("/Main"));
}

TEST_F(SlotOnChassisTest, AssociationClassWithoutRuleAnswersNothingWithoutFailure) {
  harness.useTree(kPlainAndPXU);
  for (const char* assocClass : {"TVRHX_NoSuchAssociation", "TVRHX_ConnectedTo", "tvrhx_slotonchassis"}) {
    LoggerCapture capture;
    Response r = harness.om().associators(slotPath("Slot 1"), over(assocClass), toSlotOnChassis());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << assocClass;
    EXPECT_EQ(r.message, std::nullopt) << assocClass;
    EXPECT_THAT(r.items, IsEmpty()) << assocClass;
    EXPECT_THAT(traceTexts(r), IsEmpty()) << assocClass;
    EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_Associators in", "SlotOnChassis_Associators out"))
        << assocClass;
  }
}

TEST_F(SlotOnChassisTest, NullAssociationClassAnswersNothingWithoutFailure) {
  harness.useTree(kPlainAndPXU);
  Response r = harness.om().associatorNames(chassisPath("/Main"), over(nullptr), toSlotOnChassis());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(SlotOnChassisTest, SourceOfAnotherClassAnswersNothingWithoutFailure) {
  harness.useTree(kPlainAndPXU);
  const ObjectPath card = pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth0"}});
  Response r = harness.om().associators(card, slotOnChassis());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(SlotOnChassisTest, WithoutBrokerAssociatorsAnswerNothing) {
  harness.useTree(kPlainAndPXU);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.om().associators(chassisPath("/Main"), slotOnChassis(), options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Main"), slotOnChassis())), ElementsAre("Slot 1"));
}

TEST_F(SlotOnChassisTest, SlotInstanceThatCannotBeMadeEndsAssociatorsWithNothing) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  // The target path and the source chassis come first, then Slot 1; the
  // instance of PXU Slot 2 cannot be made.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 3);
  Response r = harness.om().associators(chassisPath("/Main"), slotOnChassis());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty()) << "Slot 1, found before the failure, is not returned either";
  EXPECT_THAT(traceTexts(r), Contains("CMPIInstace is NULL for Slot"));
  EXPECT_EQ(r.traces.back().text, std::optional<std::string>("CMPIInstace is NULL for Slot"));
  EXPECT_EQ(r.traces.back().component, std::optional<std::string>("SlotOnChassisProvider"));
  EXPECT_EQ(r.traces.back().level, 1);
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_Associators in"));
}

TEST_F(SlotOnChassisTest, ChassisInstanceThatCannotBeMadeEndsAssociatorsWithNothing) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  // The target path comes first, then the first chassis.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 1);
  Response r = harness.om().associatorNames(slotPath("PXU Slot 2"), slotOnChassis());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.traces.back().text, std::optional<std::string>("CMPIInstace is NULL for Chassis"));
  EXPECT_EQ(r.traces.back().component, std::optional<std::string>("SlotOnChassisProvider"));
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_AssociatorNames in"));
}

TEST_F(SlotOnChassisTest, TargetLookupAnnouncesTheFarClass) {
  harness.useTree(kPlainAndPXU);
  EXPECT_EQ(traceTexts(harness.om().associatorNames(chassisPath("/Main"), slotOnChassis())).front(),
            "Target Class is Slot");
  EXPECT_EQ(traceTexts(harness.om().associatorNames(slotPath("Slot 1"), slotOnChassis())).front(),
            "Target Class is ChassisClass");
}

TEST_F(SlotOnChassisTest, ReferencesAndReferenceNamesAreRefused) {
  harness.useTree(kEveryKind);
  for (const ObjectPath& source : {chassisPath("/Main"), slotPath("Slot 1"), classPath("TVRHX_SlotOnChassis")}) {
    Response refs = harness.om().references(source, over(nullptr, "TVRHX_SlotOnChassis"));
    Response names = harness.om().referenceNames(source, over(nullptr, "TVRHX_SlotOnChassis"));
    for (const Response* r : {&refs, &names}) {
      EXPECT_EQ(r->rc, CMPI_RC_ERR_NOT_SUPPORTED);
      EXPECT_EQ(r->message, std::nullopt);
      EXPECT_THAT(r->items, IsEmpty());
      EXPECT_THAT(r->traces, IsEmpty());
      EXPECT_EQ(r->doneCount, 0);
    }
  }
}

// ---- EnumInstanceNames, EnumInstances and GetInstance -------------------------

TEST_F(SlotOnChassisTest, AssociationPathHasGroupThenPartComponentAsReferences) {
  harness.useTree(kPlainAndPXU);
  Response r = harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  ASSERT_EQ(r.items.size(), 2u);
  const ObjectPath& path = r.items[1].path;
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(path.className, "TVRHX_SlotOnChassis");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "GroupComponent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, chassisPath("/Expansion"));
  EXPECT_EQ(path.keys[1].name, "PartComponent");
  EXPECT_EQ(*path.keys[1].value.ref, slotPath("PXU Slot 2"));
}

TEST_F(SlotOnChassisTest, InstanceSetsPartComponentThenGroupComponent) {
  harness.useTree(kPlainAndPXU);
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& first = r.items[0].instance;
  EXPECT_THAT(propertyNames(first), ElementsAre("PartComponent", "GroupComponent"));
  EXPECT_EQ(property(first, "PartComponent").type, CMPI_ref);
  EXPECT_EQ(*property(first, "PartComponent").ref, slotPath("Slot 1"));
  EXPECT_EQ(*property(first, "GroupComponent").ref, chassisPath("/Main"));
}

TEST_F(SlotOnChassisTest, InstancePathsEqualTheEnumeratedNames) {
  harness.useTree(kEveryKind);
  EXPECT_EQ(harness.enumerateInstances("TVRHX_SlotOnChassis").paths(),
            harness.enumerateInstanceNames("TVRHX_SlotOnChassis").paths());
}

TEST_F(SlotOnChassisTest, MachineWithoutChassisHasNoAssociations) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "Slot 1"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  Response instances = harness.enumerateInstances("TVRHX_SlotOnChassis");
  for (const Response* r : {&names, &instances}) {
    EXPECT_TRUE(r->ok());
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
  EXPECT_THAT(harness.om().associators(slotPath("Slot 1"), slotOnChassis()).items, IsEmpty());
}

TEST_F(SlotOnChassisTest, MachineWithoutSlotsHasNoAssociations) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}}]})");
  LoggerCapture capture;
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_EnumInstances in", "SlotOnChassisCMPIInstances in",
                                           "SlotOnChassisCMPIInstances out", "SlotOnChassis_EnumInstances out"));
  EXPECT_THAT(harness.om().associators(chassisPath("/Main"), slotOnChassis()).items, IsEmpty());
}

TEST_F(SlotOnChassisTest, AssociationWhosePathCannotBeMadeIsANullInstanceAndNoName) {
  harness.useTree(kPlainAndPXU);
  // Two chassis instances and two slot paths are made before the first
  // association path.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 4);
  Response instances = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_TRUE(instances.ok());
  EXPECT_EQ(instances.doneCount, 1);
  ASSERT_EQ(instances.items.size(), 2u);
  EXPECT_EQ(instances.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(pairs(instances), ElementsAre("PXU Slot 2 on /Expansion"));

  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 4);
  Response names = harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  EXPECT_TRUE(names.ok());
  EXPECT_EQ(names.doneCount, 1);
  EXPECT_THAT(pairs(names), ElementsAre("PXU Slot 2 on /Expansion"));
}

TEST_F(SlotOnChassisTest, HollowAssociationIsReturnedAsItIsWithStatusOk) {
  harness.useTree(kPlainAndPXU);
  // Two chassis instances come before the first association.
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow, 2);
  Response r = harness.enumerateInstances("TVRHX_SlotOnChassis");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::Instance);
}

TEST_F(SlotOnChassisTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kEveryKind);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_SlotOnChassis").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u);
    EXPECT_EQ(r.items[0].path, path);
  }
}

TEST_F(SlotOnChassisTest, GetInstanceOfAPairTheRuleDoesNotTieFindsNothing) {
  harness.useTree(kPlainAndPXU);
  ObjectPath path("root/cimv2", "TVRHX_SlotOnChassis");
  path.keys.push_back(broker::Binding{"GroupComponent", Value::reference(chassisPath("/Expansion"))});
  path.keys.push_back(broker::Binding{"PartComponent", Value::reference(slotPath("Slot 1"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(SlotOnChassisTest, GetInstanceWithoutKeysAnswersNothingWithoutFailure) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  Response r = harness.getInstance(classPath("TVRHX_SlotOnChassis"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(events(capture), ElementsAre("SlotOnChassis_GetInstance in", "SlotOnChassis_GetInstance out"));
}

// ---- Entry points and logger lines --------------------------------------------

TEST_F(SlotOnChassisTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("SlotOnChassisProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("SlotOnChassisProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_NE(static_cast<void*>(instance), static_cast<void*>(association));
  EXPECT_STREQ(instance->ft->miName, "instanceSlotOnChassisProvider");
  EXPECT_STREQ(association->ft->miName, "associationSlotOnChassisProvider");
  EXPECT_EQ(instance->ft->ftVersion, 200);
  EXPECT_EQ(association->ft->miVersion, 200);
}

TEST_F(SlotOnChassisTest, WriteOperationsAndQueriesAreRefusedAndCleanupAnswersOk) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("SlotOnChassisProvider", &error);
  CMPIAssociationMI* assoc = harness.om().associationMI("SlotOnChassisProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  ASSERT_NE(assoc, nullptr) << error;
  for (CMPIStatus s : {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
                       mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_SlotOnChassis", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
  EXPECT_EQ(assoc->ft->cleanup(assoc, nullptr, 0).rc, CMPI_RC_OK);
}

TEST_F(SlotOnChassisTest, AssociatorsLogTheirTextArgumentsUnderTheProvider) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  AssociationArgs args = slotOnChassis();
  args.role = "GroupComponent";
  args.resultRole = "PartComponent";
  harness.om().associators(chassisPath("/Main"), args);
  std::vector<LoggedLine> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.SlotOnChassisProvider") lines.push_back(line);
  ASSERT_EQ(lines.size(), 4u);
  EXPECT_EQ(lines[0].channel, Channel::Log);
  EXPECT_EQ(lines[1].channel, Channel::Trace);
  EXPECT_EQ(lines[0].level, 3000);
  EXPECT_EQ(lines[0].file, "src/providers/SlotOnChassisProvider.cpp");
  // A null result class cuts the parameter list where it stands.
  EXPECT_EQ(maskedLine(lines[0].text),
            "ENTERING: SlotOnChassis_Associators() in src/providers/SlotOnChassisProvider.cpp [Line: N],"
            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_SlotOnChassis _RefRightClass=");
  EXPECT_EQ(maskedLine(lines[2].text),
            "EXITING: SlotOnChassis_Associators() in src/providers/SlotOnChassisProvider.cpp [Line: N],"
            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_SlotOnChassis _RefRightClass=");
}

TEST_F(SlotOnChassisTest, AssociatorNamesLogEveryArgumentWhenAllAreGiven) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  AssociationArgs args = slotOnChassis("CIM_Slot");
  args.role = "GroupComponent";
  args.resultRole = "PartComponent";
  harness.om().associatorNames(chassisPath("/Main"), args);
  const std::vector<std::string> log = capture.texts(Channel::Log);
  ASSERT_FALSE(log.empty());
  EXPECT_EQ(maskedLine(log[0]),
            "ENTERING: SlotOnChassis_AssociatorNames() in src/providers/SlotOnChassisProvider.cpp [Line: N],"
            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_SlotOnChassis "
            "_RefRightClass=CIM_Slot role=GroupComponent resultRole=PartComponent");
}

TEST_F(SlotOnChassisTest, EnumerationLogsHandlerAndBuilder) {
  harness.useTree(kPlainAndPXU);
  LoggerCapture capture;
  harness.enumerateInstanceNames("TVRHX_SlotOnChassis");
  EXPECT_THAT(events(capture),
              ElementsAre("SlotOnChassis_EnumInstanceNames in", "SlotOnChassisCMPIInstances in",
                          "SlotOnChassisCMPIInstances out", "SlotOnChassis_EnumInstanceNames out"));
  std::vector<std::string> builder;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.function == "SlotOnChassisCMPIInstances")
      builder.push_back(maskedLine(line.text));
  ASSERT_EQ(builder.size(), 2u);
  EXPECT_EQ(builder[0], "ENTERING: SlotOnChassisCMPIInstances() in src/providers/SlotOnChassisProvider.cpp "
                        "[Line: N],Parameters List:  ref=0x? properties=0 ctx=0x? instances=0x?");
}

} // namespace
} // namespace tvr::test
