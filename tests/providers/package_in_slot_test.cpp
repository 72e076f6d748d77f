// TVRHX_PackageInSlot through the embedded object manager: every slot
// paired with the first chassis, and the association handler frame.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;
using broker::AssociationArgs;
using broker::Fault;
using broker::RequestOptions;
using broker::ResultItem;

const char* const kTwoChassisThreeSlots = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17},
     "children": [{"type": "SlotNode", "name": "Slot 1"}, {"type": "SlotNode", "name": "Slot 2"}]},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18},
     "children": [{"type": "SlotNode", "name": "PXU Slot 3"}]}
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

// The tag key of every path of a response, in order.
std::vector<std::string> tags(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) out.push_back(p.key("Tag") ? p.key("Tag")->text : "(no tag)");
  return out;
}

// The Tag keys behind the Antecedent and Dependent of association paths.
std::vector<std::string> ends(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) {
    const Value* antecedent = p.key("Antecedent");
    const Value* dependent = p.key("Dependent");
    out.push_back((antecedent && antecedent->ref ? antecedent->ref->key("Tag")->text : "?") + " -> " +
                  (dependent && dependent->ref ? dependent->ref->key("Tag")->text : "?"));
  }
  return out;
}

RequestOptions toPackageInSlot() {
  RequestOptions options;
  options.routeTo = "TVRHX_PackageInSlot";
  return options;
}

class PackageInSlotTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(PackageInSlotTest, EveryEnumeratedAssociationTiesASlotToTheFirstChassis) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(ends(r), ElementsAre("Slot 1 -> /Main", "Slot 2 -> /Main", "PXU Slot 3 -> /Main"));
}

TEST_F(PackageInSlotTest, EnumeratedPathHasTheKeysInOrderAsReferences) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, "TVRHX_PackageInSlot");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Antecedent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, slotPath("Slot 1"));
  EXPECT_EQ(path.keys[1].name, "Dependent");
  EXPECT_EQ(*path.keys[1].value.ref, chassisPath("/Main"));
}

TEST_F(PackageInSlotTest, InstancesSetDependentThenAntecedent) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.enumerateInstances("TVRHX_PackageInSlot");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 3u);
  const Instance& first = r.items[0].instance;
  EXPECT_THAT(propertyNames(first), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(*property(first, "Dependent").ref, chassisPath("/Main"));
  EXPECT_EQ(*property(first, "Antecedent").ref, slotPath("Slot 1"));
  EXPECT_EQ(property(first, "Dependent").type, CMPI_ref);
}

TEST_F(PackageInSlotTest, InstancePathsEqualTheEnumeratedNames) {
  harness.useTree(kTwoChassisThreeSlots);
  EXPECT_EQ(harness.enumerateInstances("TVRHX_PackageInSlot").paths(),
            harness.enumerateInstanceNames("TVRHX_PackageInSlot").paths());
}

TEST_F(PackageInSlotTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kTwoChassisThreeSlots);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_PackageInSlot").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(r.items[0].path, path);
  }
}

TEST_F(PackageInSlotTest, GetInstanceIgnoresHostAndNamespaceOfTheEnds) {
  harness.useTree(kTwoChassisThreeSlots);
  ObjectPath path = harness.enumerateInstanceNames("TVRHX_PackageInSlot").paths().at(1);
  ObjectPath slot = *path.keys[0].value.ref;
  slot.host = "elsewhere";
  slot.nameSpace = "root/other";
  path.keys[0].value = Value::reference(slot);
  path.host = "";
  EXPECT_EQ(harness.getInstance(path).items.size(), 1u);
}

TEST_F(PackageInSlotTest, GetInstanceWithADependentThatIsNoChassisFindsNothing) {
  harness.useTree(kTwoChassisThreeSlots);
  ObjectPath path("root/cimv2", "TVRHX_PackageInSlot");
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(slotPath("Slot 1"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(chassisPath("/Nowhere"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(PackageInSlotTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.getInstance(ObjectPath("root/cimv2", "TVRHX_PackageInSlot"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("PackageInSlotProvider"));
}

TEST_F(PackageInSlotTest, ChassisWithoutSlotsAnswersNothingAndCompletes) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  Response instances = harness.enumerateInstances("TVRHX_PackageInSlot");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(PackageInSlotTest, MachineWithoutChassisEndsInTheRangeCheckException) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "Slot 1"}]})");
  const Response names = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  const Response instances = harness.enumerateInstances("TVRHX_PackageInSlot");
  const Response one = harness.getInstance(pathWithKeys("TVRHX_PackageInSlot", {{"Antecedent", "x"}}));
  for (const Response* r : {&names, &instances, &one}) {
    ASSERT_TRUE(r->exception.has_value());
    EXPECT_EQ(r->exception->type, "std::out_of_range");
    EXPECT_THAT(r->exception->what, StartsWith("vector::_M_range_check"));
    EXPECT_EQ(r->doneCount, 0);
  }
}

TEST_F(PackageInSlotTest, AssociatorsFromASlotWithoutChassisIsEmptyAndOk) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "Slot 1"}]})");
  Response r = harness.om().associators(slotPath("Slot 1"), over("TVRHX_PackageInSlot"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(PackageInSlotTest, AssociatorsFromAnySlotGiveEveryChassis) {
  harness.useTree(kTwoChassisThreeSlots);
  for (const char* slot : {"Slot 1", "PXU Slot 3"}) {
    Response r = harness.om().associators(slotPath(slot), over("TVRHX_PackageInSlot"));
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
    EXPECT_THAT(tags(r), ElementsAre("/Main", "/Expansion"));
    ASSERT_FALSE(r.items.empty());
    EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  }
}

TEST_F(PackageInSlotTest, AssociatorsFromAChassisGiveEverySlot) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.om().associators(chassisPath("/Expansion"), over("TVRHX_PackageInSlot"));
  EXPECT_THAT(tags(r), ElementsAre("Slot 1", "Slot 2", "PXU Slot 3"));
}

TEST_F(PackageInSlotTest, AssociatorNamesGiveThePaths) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.om().associatorNames(slotPath("Slot 2"), over("TVRHX_PackageInSlot"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_EQ(r.paths(), (std::vector<ObjectPath>{chassisPath("/Main"), chassisPath("/Expansion")}));
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(PackageInSlotTest, ResultClassOfTheFarClassOrItsBaseClassIsServedInAnyCase) {
  harness.useTree(kTwoChassisThreeSlots);
  for (const char* resultClass : {"CIM_Chassis", "cim_chassis", "TVRHX_Chassis", "tvrhx_CHASSIS"}) {
    Response r = harness.om().associators(slotPath("Slot 1"), over("TVRHX_PackageInSlot", resultClass));
    EXPECT_EQ(r.items.size(), 2u) << resultClass;
  }
}

TEST_F(PackageInSlotTest, ResultClassOfAnotherClassAnswersNothing) {
  harness.useTree(kTwoChassisThreeSlots);
  for (const char* resultClass : {"CIM_Slot", "CIM_PhysicalPackage", "CIM_PhysicalElement", "TVRHX_Nothing"}) {
    Response r = harness.om().associators(slotPath("Slot 1"), over("TVRHX_PackageInSlot", resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_THAT(r.items, IsEmpty()) << resultClass;
    EXPECT_EQ(r.doneCount, 0) << resultClass;
  }
}

TEST_F(PackageInSlotTest, RolesChangeNothing) {
  harness.useTree(kTwoChassisThreeSlots);
  AssociationArgs plain = over("TVRHX_PackageInSlot");
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "Antecedent";
  EXPECT_EQ(harness.om().associators(slotPath("Slot 1"), roles).paths(),
            harness.om().associators(slotPath("Slot 1"), plain).paths());
  EXPECT_EQ(harness.om().associatorNames(chassisPath("/Main"), roles).paths(),
            harness.om().associatorNames(chassisPath("/Main"), plain).paths());
  EXPECT_EQ(harness.om().references(slotPath("Slot 1"), roles).paths(),
            harness.om().references(slotPath("Slot 1"), plain).paths());
  EXPECT_EQ(harness.om().referenceNames(chassisPath("/Main"), roles).paths(),
            harness.om().referenceNames(chassisPath("/Main"), plain).paths());
}

TEST_F(PackageInSlotTest, UnknownAssociationClassFailsWithItsMessage) {
  harness.useTree(kTwoChassisThreeSlots);
  for (const char* assocClass : {"TVRHX_NoSuchAssociation", "TVRHX_ConnectedTo"}) {
    Response r =
        harness.om().associators(slotPath("Slot 1"), over(assocClass), toPackageInSlot());
    EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
    EXPECT_EQ(r.message, std::optional<std::string>("Object Path is NULL in Associations."));
    EXPECT_THAT(traceTexts(r), ElementsAre("Object Path is NULL in Associations."));
    EXPECT_EQ(r.doneCount, 0);
  }
}

TEST_F(PackageInSlotTest, NullAssociationClassFindsNoTarget) {
  harness.useTree(kTwoChassisThreeSlots);
  Response names = harness.om().associatorNames(slotPath("Slot 1"), over(nullptr), toPackageInSlot());
  EXPECT_EQ(names.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(names.message, std::optional<std::string>("Object Path is NULL in Associations."));
}

TEST_F(PackageInSlotTest, SourceOfAnotherClassFailsInEachHandler) {
  harness.useTree(kTwoChassisThreeSlots);
  const ObjectPath card = pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth0"}});
  EXPECT_EQ(harness.om().associators(card, over("TVRHX_PackageInSlot")).message,
            std::optional<std::string>("Object Path is NULL in Associations."));
  EXPECT_EQ(harness.om().associatorNames(card, over("TVRHX_PackageInSlot")).message,
            std::optional<std::string>("Object Path is NULL in Associations."));
  Response refs = harness.om().references(card, over(nullptr, "TVRHX_PackageInSlot"));
  EXPECT_EQ(refs.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(refs.message, std::optional<std::string>("Object Path is NULL in References."));
  Response names = harness.om().referenceNames(card, over(nullptr, "TVRHX_PackageInSlot"));
  EXPECT_EQ(names.message, std::optional<std::string>("Object Path is NULL in ReferenceNames."));
  EXPECT_EQ(names.doneCount, 0);
}

TEST_F(PackageInSlotTest, ReferencesFromAChassisGiveOneAssociationPerSlot) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.om().references(chassisPath("/Expansion"), over(nullptr, "TVRHX_NoSuchClass"),
                                       toPackageInSlot());
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 3u);
  const Instance& first = r.items[0].instance;
  EXPECT_THAT(propertyNames(first), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(*property(first, "Dependent").ref, chassisPath("/Expansion"));
  EXPECT_EQ(property(first, "Antecedent").ref->key("Tag")->text, "Slot 1");
}

TEST_F(PackageInSlotTest, ReferencesFromASlotPutTheSlotAtTheAntecedent) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.om().references(slotPath("Slot 2"), over(nullptr, "TVRHX_PackageInSlot"));
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(property(r.items[1].instance, "Dependent").ref->key("Tag")->text, "/Expansion");
  EXPECT_EQ(*property(r.items[1].instance, "Antecedent").ref, slotPath("Slot 2"));
}

TEST_F(PackageInSlotTest, ReferenceNamesGiveAssociationPathsWithBothEnds) {
  harness.useTree(kTwoChassisThreeSlots);
  Response r = harness.om().referenceNames(chassisPath("/Main"), over(nullptr, "TVRHX_PackageInSlot"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(ends(r), ElementsAre("Slot 1 -> /Main", "Slot 2 -> /Main", "PXU Slot 3 -> /Main"));
  ASSERT_FALSE(r.items.empty());
  EXPECT_EQ(r.items[0].path.host, "host.example.com");
  EXPECT_EQ(r.items[0].path.nameSpace, "root/cimv2");
}

TEST_F(PackageInSlotTest, FailedAssociationPathFailsEnumerateInstanceNames) {
  harness.useTree(kTwoChassisThreeSlots);
  // Two chassis paths and three slot paths are made first.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, broker::FailureShape::Null, 5);
  Response r = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for PackageInSlot"));
  EXPECT_THAT(traceTexts(r), ::testing::Contains("Create CMPIObjectPath failed for PackageInSlot."));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(PackageInSlotTest, FailedBuilderGivesAnEmptySuccessfulAnswer) {
  harness.useTree(kTwoChassisThreeSlots);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, broker::FailureShape::Null, 5);
  Response r = harness.enumerateInstances("TVRHX_PackageInSlot");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ::testing::Contains("Create CMPIObjectPath failed for PackageInSlot."));
}

TEST_F(PackageInSlotTest, EntryPointsMakeTwoMisThatShareTheBroker) {
  harness.useTree(kTwoChassisThreeSlots);
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("PackageInSlotProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("PackageInSlotProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_NE(static_cast<void*>(instance), static_cast<void*>(association));
  EXPECT_STREQ(instance->ft->miName, "instancePackageInSlotProvider");
  EXPECT_STREQ(association->ft->miName, "associationPackageInSlotProvider");
  EXPECT_EQ(association->ft->ftVersion, 200);
  EXPECT_EQ(association->ft->miVersion, 200);

  using AssociationEntry = CMPIAssociationMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  auto entry = reinterpret_cast<AssociationEntry>(
      harness.om().providerSymbol("PackageInSlotProvider", "PackageInSlotProvider_Create_AssociationMI", &error));
  ASSERT_NE(entry, nullptr) << error;
  ProviderHarness other;
  entry(other.om().broker(), nullptr, nullptr);
  Response viaInstanceMi = harness.enumerateInstanceNames("TVRHX_PackageInSlot");
  ASSERT_FALSE(viaInstanceMi.traces.empty());
  EXPECT_EQ(viaInstanceMi.traces[0].broker, other.om().broker()) << "both MIs use the one broker variable";
  entry(harness.om().broker(), nullptr, nullptr);
}

TEST_F(PackageInSlotTest, AssociationHandlersTraceTheirTextArguments) {
  harness.useTree(kTwoChassisThreeSlots);
  LoggerCapture capture;
  AssociationArgs args = over("TVRHX_PackageInSlot", "CIM_Chassis");
  args.role = "Antecedent";
  harness.om().associatorNames(slotPath("Slot 1"), args);
  const std::vector<std::string> log = capture.texts(KVLog::Channel::Log);
  ASSERT_FALSE(log.empty());
  EXPECT_THAT(log[0], ::testing::HasSubstr(
                          "ENTERING: PackageInSlot_AssociatorNames() in src/providers/PackageInSlotProvider.cpp"));
  EXPECT_THAT(log[0], ::testing::HasSubstr(" _RefLeftClass=TVRHX_PackageInSlot _RefRightClass=CIM_Chassis "
                                           "role=Antecedent resultRole="));
  EXPECT_THAT(log.back(), StartsWith("EXITING: PackageInSlot_AssociatorNames()"));
}

TEST_F(PackageInSlotTest, NullRoleCutsTheParameterListThere) {
  harness.useTree(kTwoChassisThreeSlots);
  LoggerCapture capture;
  harness.om().associators(slotPath("Slot 1"), over("TVRHX_PackageInSlot"));
  const std::vector<std::string> log = capture.texts(KVLog::Channel::Log);
  ASSERT_FALSE(log.empty());
  const std::string tail = " _RefLeftClass=TVRHX_PackageInSlot _RefRightClass=";
  EXPECT_EQ(log[0].substr(log[0].size() - tail.size()), tail);
}

} // namespace
} // namespace tvr::test
