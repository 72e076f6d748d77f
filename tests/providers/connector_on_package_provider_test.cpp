// TVRHX_ConnectorOnPackage through the embedded object manager: a connector
// whose Tag holds "Compute" sits on a main system chassis (type 17); no
// other connector has a package.
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

// Compute connectors on a main chassis and on an expansion chassis, plain
// and expansion connectors, the word in lower and upper case, and a chassis
// type that carries no connectors.
const char* const kEveryKind = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}, "children": [
      {"type": "ConnectorNode", "name": "Compute Module Midplane Connector"},
      {"type": "ConnectorNode", "name": "Front USB Port"}]},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}, "children": [
      {"type": "ConnectorNode", "name": "PXU Uplink Connector"},
      {"type": "ConnectorNode", "name": "PEN Bridge to Compute"}]},
    {"type": "ChassisNode", "name": "Rack", "properties": {"PropChassisType": 3}, "children": [
      {"type": "ConnectorNode", "name": "rack compute port"},
      {"type": "ConnectorNode", "name": "COMPUTE Console"}]}
  ]})";

// Which chassis each connector of kEveryKind sits on, in connector order.
const std::vector<std::pair<std::string, std::string>> kConnectorOnChassis = {
    {"Compute Module Midplane Connector", "/Main"},
    {"PEN Bridge to Compute", "/Main"},
};
const std::vector<std::string> kConnectorTags = {"Compute Module Midplane Connector", "Front USB Port",
                                                 "PXU Uplink Connector", "PEN Bridge to Compute",
                                                 "rack compute port", "COMPUTE Console"};
const std::vector<std::string> kChassisTags = {"/Main", "/Expansion", "/Rack"};

std::vector<std::string> connectorsOn(const std::string& chassis) {
  std::vector<std::string> connectors;
  for (const auto& [connector, on] : kConnectorOnChassis)
    if (on == chassis) connectors.push_back(connector);
  return connectors;
}

std::vector<std::string> chassisCarrying(const std::string& connector) {
  std::vector<std::string> chassis;
  for (const auto& [c, on] : kConnectorOnChassis)
    if (c == connector) chassis.push_back(on);
  return chassis;
}

std::vector<std::string> expectedPairs() {
  std::vector<std::string> pairs;
  for (const auto& [connector, on] : kConnectorOnChassis) pairs.push_back(connector + " on " + on);
  return pairs;
}

const char* const kTwoMainChassis = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main A", "properties": {"PropChassisType": 17}},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}},
    {"type": "ChassisNode", "name": "Main B", "properties": {"PropChassisType": 17}},
    {"type": "ConnectorNode", "name": "Compute Link"}
  ]})";

ObjectPath chassisPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Chassis", {{"Tag", tag}, {"CreationClassName", "TVRHX_Chassis"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath connectorPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Connector", {{"Tag", tag}, {"CreationClassName", "TVRHX_Connector"}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

AssociationArgs connectorOnPackage(std::optional<std::string> resultClass = std::nullopt) {
  return over("TVRHX_ConnectorOnPackage", std::move(resultClass));
}

RequestOptions toConnectorOnPackage() {
  RequestOptions options;
  options.routeTo = "TVRHX_ConnectorOnPackage";
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

// "<connector> on <chassis>" for every association path of a response.
std::vector<std::string> pairs(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths())
    out.push_back(tagOf(p.key("PartComponent")) + " on " + tagOf(p.key("GroupComponent")));
  return out;
}

// The ENTERING and EXITING events this provider's module logged.
std::vector<std::string> events(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.category == "Korvane.ConnectorOnPackageProvider")
      out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  return out;
}

class ConnectorOnPackageTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

// ---- The pairing rule, asked from every side ---------------------------------

TEST_F(ConnectorOnPackageTest, EnumeratedNamesTieEachComputeConnectorToTheMainChassis) {
  harness.useTree(kEveryKind);
  Response r = harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(pairs(r), expectedPairs());
}

TEST_F(ConnectorOnPackageTest, EnumeratedInstancesTieEachComputeConnectorToTheMainChassis) {
  harness.useTree(kEveryKind);
  Response r = harness.enumerateInstances("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_EQ(pairs(r), expectedPairs());
}

TEST_F(ConnectorOnPackageTest, AssociatorsFromEachChassisGiveItsConnectors) {
  harness.useTree(kEveryKind);
  for (const std::string& chassis : kChassisTags) {
    Response r = harness.om().associators(chassisPath(chassis), connectorOnPackage());
    EXPECT_TRUE(r.ok()) << chassis;
    EXPECT_EQ(r.doneCount, 0) << chassis;
    EXPECT_EQ(tags(r), connectorsOn(chassis)) << chassis;
  }
}

TEST_F(ConnectorOnPackageTest, AssociatorNamesFromEachChassisGiveItsConnectors) {
  harness.useTree(kEveryKind);
  for (const std::string& chassis : kChassisTags) {
    Response r = harness.om().associatorNames(chassisPath(chassis), connectorOnPackage());
    EXPECT_TRUE(r.ok()) << chassis;
    EXPECT_EQ(r.doneCount, 0) << chassis;
    EXPECT_EQ(tags(r), connectorsOn(chassis)) << chassis;
  }
}

TEST_F(ConnectorOnPackageTest, AssociatorsFromEachConnectorGiveItsChassis) {
  harness.useTree(kEveryKind);
  for (const std::string& connector : kConnectorTags) {
    Response r = harness.om().associators(connectorPath(connector), connectorOnPackage());
    EXPECT_TRUE(r.ok()) << connector;
    EXPECT_EQ(r.doneCount, 0) << connector;
    EXPECT_EQ(tags(r), chassisCarrying(connector)) << connector;
  }
}

TEST_F(ConnectorOnPackageTest, AssociatorNamesFromEachConnectorGiveItsChassis) {
  harness.useTree(kEveryKind);
  for (const std::string& connector : kConnectorTags) {
    Response r = harness.om().associatorNames(connectorPath(connector), connectorOnPackage());
    EXPECT_TRUE(r.ok()) << connector;
    EXPECT_EQ(tags(r), chassisCarrying(connector)) << connector;
  }
}

TEST_F(ConnectorOnPackageTest, ConnectorWithoutTheWordHasNoPackage) {
  harness.useTree(kEveryKind);
  for (const char* connector : {"Front USB Port", "PXU Uplink Connector"}) {
    LoggerCapture capture;
    Response r = harness.om().associators(connectorPath(connector), connectorOnPackage());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << connector;
    EXPECT_THAT(r.items, IsEmpty()) << connector;
    EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in", "ConnectorOnPackage_Associators out"))
        << connector;
  }
}

TEST_F(ConnectorOnPackageTest, OnlyTheWordInItsOwnCaseCounts) {
  harness.useTree(kEveryKind);
  for (const char* connector : {"rack compute port", "COMPUTE Console"}) {
    EXPECT_THAT(harness.om().associators(connectorPath(connector), connectorOnPackage()).items, IsEmpty())
        << connector;
    EXPECT_THAT(tags(harness.om().associators(chassisPath("/Main"), connectorOnPackage())), Not(Contains(connector)));
  }
}

TEST_F(ConnectorOnPackageTest, EnumerationTiesAComputeConnectorToTheFirstMainChassisOnly) {
  harness.useTree(kTwoMainChassis);
  EXPECT_THAT(pairs(harness.enumerateInstances("TVRHX_ConnectorOnPackage")), ElementsAre("Compute Link on /Main A"));
  EXPECT_THAT(pairs(harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage")),
              ElementsAre("Compute Link on /Main A"));
}

TEST_F(ConnectorOnPackageTest, AssociatorsTieAComputeConnectorToEveryMainChassis) {
  harness.useTree(kTwoMainChassis);
  EXPECT_THAT(tags(harness.om().associators(connectorPath("Compute Link"), connectorOnPackage())),
              ElementsAre("/Main A", "/Main B"));
  for (const char* chassis : {"/Main A", "/Main B"})
    EXPECT_THAT(tags(harness.om().associatorNames(chassisPath(chassis), connectorOnPackage())),
                ElementsAre("Compute Link"))
        << chassis;
}

TEST_F(ConnectorOnPackageTest, ExpansionChassisAsSourceAnswersNothing) {
  harness.useTree(kTwoMainChassis);
  LoggerCapture capture;
  Response r = harness.om().associators(chassisPath("/Expansion"), connectorOnPackage());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in", "ConnectorOnPackage_Associators out"));
}

TEST_F(ConnectorOnPackageTest, MachineWithoutMainChassisHasNoAssociations) {
  harness.useTree(R"({"systemName": "host.example.com", "nodes": [
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}},
    {"type": "ConnectorNode", "name": "Compute Link"}]})");
  Response r = harness.enumerateInstances("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Not(Contains(HasSubstr("NULL"))));
  EXPECT_THAT(harness.om().associators(connectorPath("Compute Link"), connectorOnPackage()).items, IsEmpty());
}

// ---- Associators and AssociatorNames -----------------------------------------

TEST_F(ConnectorOnPackageTest, AssociatorsGiveInstancesAndAssociatorNamesGivePaths) {
  harness.useTree(kTwoMainChassis);
  Response instances = harness.om().associators(chassisPath("/Main B"), connectorOnPackage());
  ASSERT_EQ(instances.items.size(), 1u);
  EXPECT_EQ(instances.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(property(instances.items[0].instance, "ConnectorLayout").type, CMPI_uint16);
  Response names = harness.om().associatorNames(connectorPath("Compute Link"), connectorOnPackage());
  ASSERT_EQ(names.items.size(), 2u);
  EXPECT_EQ(names.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(names.items[0].path, chassisPath("/Main A"));
}

TEST_F(ConnectorOnPackageTest, AnyResultClassAnswersNothing) {
  harness.useTree(kTwoMainChassis);
  for (const char* resultClass : {"CIM_PhysicalConnector", "TVRHX_Connector", "cim_physicalconnector"}) {
    Response r = harness.om().associators(chassisPath("/Main A"), connectorOnPackage(resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_THAT(r.items, IsEmpty()) << resultClass;
    EXPECT_EQ(r.doneCount, 0) << resultClass;
  }
  for (const char* resultClass : {"CIM_Chassis", "TVRHX_Chassis"})
    EXPECT_THAT(harness.om().associatorNames(connectorPath("Compute Link"), connectorOnPackage(resultClass)).items,
                IsEmpty())
        << resultClass;
  EXPECT_THAT(tags(harness.om().associators(chassisPath("/Main A"), connectorOnPackage())),
              ElementsAre("Compute Link"));
}

TEST_F(ConnectorOnPackageTest, ResultClassEndsTheHandlerBeforeItsExitLine) {
  harness.useTree(kTwoMainChassis);
  LoggerCapture capture;
  harness.om().associators(connectorPath("Compute Link"), connectorOnPackage("CIM_Chassis"));
  EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in"));
}

TEST_F(ConnectorOnPackageTest, ConnectorThatDoesNotExistEndsAssociatorsWithoutExitLine) {
  harness.useTree(kTwoMainChassis);
  for (const char* connector : {"Compute Ghost", "compute link"}) {
    LoggerCapture capture;
    Response r = harness.om().associatorNames(connectorPath(connector), connectorOnPackage());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << connector;
    EXPECT_THAT(r.items, IsEmpty()) << connector;
    EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_AssociatorNames in")) << connector;
  }
}

TEST_F(ConnectorOnPackageTest, ChassisThatDoesNotExistEndsAssociatorsWithoutExitLine) {
  harness.useTree(kTwoMainChassis);
  LoggerCapture capture;
  Response r = harness.om().associators(chassisPath("/Nowhere"), connectorOnPackage());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in"));
}

TEST_F(ConnectorOnPackageTest, AssociationClassWithoutRuleAnswersNothingWithoutFailure) {
  harness.useTree(kTwoMainChassis);
  for (const char* assocClass : {"TVRHX_NoSuchAssociation", "TVRHX_SlotOnChassis"}) {
    LoggerCapture capture;
    Response r = harness.om().associators(connectorPath("Compute Link"), over(assocClass), toConnectorOnPackage());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << assocClass;
    EXPECT_EQ(r.message, std::nullopt) << assocClass;
    EXPECT_THAT(r.items, IsEmpty()) << assocClass;
    EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in", "ConnectorOnPackage_Associators out"))
        << assocClass;
  }
  Response names = harness.om().associatorNames(chassisPath("/Main A"), over(nullptr), toConnectorOnPackage());
  EXPECT_EQ(names.rc, CMPI_RC_OK);
  EXPECT_THAT(names.items, IsEmpty());
}

TEST_F(ConnectorOnPackageTest, WithoutBrokerAssociatorsAnswerNothing) {
  harness.useTree(kTwoMainChassis);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.om().associators(connectorPath("Compute Link"), connectorOnPackage(), options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(ConnectorOnPackageTest, ChassisInstanceThatCannotBeMadeEndsAssociatorsWithNothing) {
  harness.useTree(kTwoMainChassis);
  LoggerCapture capture;
  // The target path and the source connector come first, then the chassis.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 2);
  Response r = harness.om().associators(connectorPath("Compute Link"), connectorOnPackage());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  // The texts speak of the connector although the chassis failed.
  EXPECT_EQ(r.traces.back().text, std::optional<std::string>("CMPIInstace is NULL for Connector"));
  EXPECT_EQ(r.traces.back().component, std::optional<std::string>("ConnectorOnPackageProvider"));
  EXPECT_EQ(r.traces.back().level, 1);
  EXPECT_THAT(events(capture), ElementsAre("ConnectorOnPackage_Associators in"));
}

TEST_F(ConnectorOnPackageTest, ConnectorInstanceThatCannotBeMadeIsLeftOutOfTheChassisAnswer) {
  harness.useTree(kEveryKind);
  // The target path and the source chassis come first, then the connectors.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 2);
  Response r = harness.om().associators(chassisPath("/Main"), connectorOnPackage());
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(tags(r), ElementsAre("PEN Bridge to Compute"));
  EXPECT_THAT(traceTexts(r), Not(Contains("CMPIInstace is NULL for Connector")));
}

TEST_F(ConnectorOnPackageTest, TargetLookupAnnouncesTheFarClass) {
  harness.useTree(kTwoMainChassis);
  EXPECT_EQ(traceTexts(harness.om().associatorNames(chassisPath("/Main A"), connectorOnPackage())).front(),
            "Target Class is ConnectorClass");
  EXPECT_EQ(traceTexts(harness.om().associatorNames(connectorPath("Compute Link"), connectorOnPackage())).front(),
            "Target Class is ChassisClass");
}

TEST_F(ConnectorOnPackageTest, RolesChangeNothing) {
  harness.useTree(kTwoMainChassis);
  AssociationArgs plain = connectorOnPackage();
  AssociationArgs roles = plain;
  roles.role = "PartComponent";
  roles.resultRole = "NoSuchRole";
  EXPECT_EQ(harness.om().associators(connectorPath("Compute Link"), roles).paths(),
            harness.om().associators(connectorPath("Compute Link"), plain).paths());
}

TEST_F(ConnectorOnPackageTest, ReferencesAndReferenceNamesAreRefused) {
  harness.useTree(kEveryKind);
  for (const ObjectPath& source : {chassisPath("/Main"), connectorPath("Compute Module Midplane Connector")}) {
    Response refs = harness.om().references(source, over(nullptr, "TVRHX_ConnectorOnPackage"));
    Response names = harness.om().referenceNames(source, over(nullptr, "TVRHX_ConnectorOnPackage"));
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

TEST_F(ConnectorOnPackageTest, AssociationPathHasGroupThenPartComponentAsReferences) {
  harness.useTree(kTwoMainChassis);
  Response r = harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage");
  ASSERT_EQ(r.items.size(), 1u);
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, "TVRHX_ConnectorOnPackage");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "GroupComponent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, chassisPath("/Main A"));
  EXPECT_EQ(path.keys[1].name, "PartComponent");
  EXPECT_EQ(*path.keys[1].value.ref, connectorPath("Compute Link"));
}

TEST_F(ConnectorOnPackageTest, InstanceSetsPartComponentThenGroupComponent) {
  harness.useTree(kTwoMainChassis);
  Response r = harness.enumerateInstances("TVRHX_ConnectorOnPackage");
  ASSERT_EQ(r.items.size(), 1u);
  const Instance& association = r.items[0].instance;
  EXPECT_THAT(propertyNames(association), ElementsAre("PartComponent", "GroupComponent"));
  EXPECT_EQ(property(association, "GroupComponent").type, CMPI_ref);
  EXPECT_EQ(*property(association, "PartComponent").ref, connectorPath("Compute Link"));
  EXPECT_EQ(*property(association, "GroupComponent").ref, chassisPath("/Main A"));
}

TEST_F(ConnectorOnPackageTest, InstancePathsEqualTheEnumeratedNames) {
  harness.useTree(kEveryKind);
  EXPECT_EQ(harness.enumerateInstances("TVRHX_ConnectorOnPackage").paths(),
            harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage").paths());
}

TEST_F(ConnectorOnPackageTest, MachineWithoutConnectorsHasNoAssociations) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}}]})");
  LoggerCapture capture;
  Response r = harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(events(capture),
              ElementsAre("ConnectorOnPackage_EnumInstanceNames in", "ConnectorOnPackageCMPIInstances in",
                          "ConnectorOnPackageCMPIInstances out", "ConnectorOnPackage_EnumInstanceNames out"));
}

TEST_F(ConnectorOnPackageTest, AssociationWhosePathCannotBeMadeIsANullInstanceAndNoName) {
  harness.useTree(kEveryKind);
  // Three chassis instances and six connector paths are made before the
  // first association path.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 9);
  Response instances = harness.enumerateInstances("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(instances.ok());
  ASSERT_EQ(instances.items.size(), 2u);
  EXPECT_EQ(instances.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(pairs(instances), ElementsAre("PEN Bridge to Compute on /Main"));

  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 9);
  Response names = harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage");
  EXPECT_TRUE(names.ok());
  EXPECT_THAT(pairs(names), ElementsAre("PEN Bridge to Compute on /Main"));
}

TEST_F(ConnectorOnPackageTest, EnumInstancesReadsEachAssociationPathIntoItsStatus) {
  harness.useTree(kEveryKind);
  // Three chassis instances and the first association are made before the
  // last association, which comes out hollow: reading its path fails.
  harness.om().faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow, 4);
  Response r = harness.enumerateInstances("TVRHX_ConnectorOnPackage");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::NullInstance);
}

TEST_F(ConnectorOnPackageTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kEveryKind);
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_ConnectorOnPackage").paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u);
    EXPECT_EQ(r.items[0].path, path);
  }
}

TEST_F(ConnectorOnPackageTest, GetInstanceOfAPairTheRuleDoesNotTieFindsNothing) {
  harness.useTree(kTwoMainChassis);
  ObjectPath path("root/cimv2", "TVRHX_ConnectorOnPackage");
  path.keys.push_back(broker::Binding{"GroupComponent", Value::reference(chassisPath("/Main B"))});
  path.keys.push_back(broker::Binding{"PartComponent", Value::reference(connectorPath("Compute Link"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ConnectorOnPackageTest, GetInstanceWithoutKeysAnswersNothingWithoutFailure) {
  harness.useTree(kTwoMainChassis);
  Response r = harness.getInstance(classPath("TVRHX_ConnectorOnPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

// ---- Entry points and logger lines --------------------------------------------

TEST_F(ConnectorOnPackageTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("ConnectorOnPackageProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("ConnectorOnPackageProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceConnectorOnPackageProvider");
  EXPECT_STREQ(association->ft->miName, "associationConnectorOnPackageProvider");
  EXPECT_EQ(association->ft->ftVersion, 200);
}

TEST_F(ConnectorOnPackageTest, WriteOperationsAndQueriesAreRefusedAndCleanupAnswersOk) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ConnectorOnPackageProvider", &error);
  CMPIAssociationMI* assoc = harness.om().associationMI("ConnectorOnPackageProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  ASSERT_NE(assoc, nullptr) << error;
  for (CMPIStatus s : {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
                       mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_Connector", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(assoc->ft->cleanup(assoc, nullptr, 1).rc, CMPI_RC_OK);
}

TEST_F(ConnectorOnPackageTest, HandlersLogUnderTheProvider) {
  harness.useTree(kTwoMainChassis);
  LoggerCapture capture;
  harness.om().associatorNames(connectorPath("Compute Link"), connectorOnPackage());
  std::vector<LoggedLine> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.ConnectorOnPackageProvider") lines.push_back(line);
  ASSERT_EQ(lines.size(), 4u);
  EXPECT_EQ(lines[0].channel, Channel::Log);
  EXPECT_EQ(lines[1].channel, Channel::Trace);
  EXPECT_EQ(lines[1].text, lines[0].text);
  EXPECT_EQ(maskedLine(lines[2].text),
            "EXITING: ConnectorOnPackage_AssociatorNames() in src/providers/ConnectorOnPackageProvider.cpp "
            "[Line: N],Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_ConnectorOnPackage "
            "_RefRightClass=");
}

} // namespace
} // namespace tvr::test
