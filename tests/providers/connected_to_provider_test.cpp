// TVRHX_ConnectedTo through the embedded object manager: the one cable from
// the first connector whose Tag holds "Compute" to the first whose Tag holds
// "PXU" or "PME".
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
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

// Two compute connectors, every expansion marker, and a plain connector
// first: the cable runs from the first compute connector to the first
// connector with PXU or PME, passing the PEN one over.
const char* const kCable = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}, "children": [
      {"type": "ConnectorNode", "name": "Front USB Port"},
      {"type": "ConnectorNode", "name": "Compute Module Midplane Connector"},
      {"type": "ConnectorNode", "name": "Compute Spare Connector"}]},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}, "children": [
      {"type": "ConnectorNode", "name": "PEN Console"},
      {"type": "ConnectorNode", "name": "PME Bridge"},
      {"type": "ConnectorNode", "name": "PXU Uplink Connector"}]}
  ]})";

const std::vector<std::string> kCableConnectors = {"Front USB Port",       "Compute Module Midplane Connector",
                                                   "Compute Spare Connector", "PEN Console",
                                                   "PME Bridge",           "PXU Uplink Connector"};

std::string connectors(const std::vector<std::string>& names) {
  std::string nodes;
  for (const std::string& name : names)
    nodes += (nodes.empty() ? "" : ", ") + std::string(R"({"type": "ConnectorNode", "name": ")") + name + "\"}";
  return R"({"systemName": "host.example.com", "nodes": [)" + nodes + "]}";
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

AssociationArgs connectedTo(std::optional<std::string> resultClass = std::nullopt) {
  return over("TVRHX_ConnectedTo", std::move(resultClass));
}

RequestOptions toConnectedTo() {
  RequestOptions options;
  options.routeTo = "TVRHX_ConnectedTo";
  return options;
}

std::string tagOf(const Value* reference) {
  if (!reference || !reference->ref || !reference->ref->key("Tag")) return "?";
  return reference->ref->key("Tag")->text;
}

// "<antecedent> -> <dependent>" for every association path of a response.
std::vector<std::string> cables(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) out.push_back(tagOf(p.key("Antecedent")) + " -> " + tagOf(p.key("Dependent")));
  return out;
}

// The ENTERING and EXITING events this provider's module logged.
std::vector<std::string> events(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.category == "Korvane.ConnectedToProvider")
      out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  return out;
}

const char* const kNoInstancesTrace = "***Can't get Instances, Exiting EnumerateInstanceNames***";

class ConnectedToTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

// ---- The one cable ------------------------------------------------------------

TEST_F(ConnectedToTest, CableRunsFromTheFirstComputeConnectorToTheFirstPXUOrPMEConnector) {
  harness.useTree(kCable);
  Response names = harness.enumerateInstanceNames("TVRHX_ConnectedTo");
  Response instances = harness.enumerateInstances("TVRHX_ConnectedTo");
  for (const Response* r : {&names, &instances}) {
    EXPECT_TRUE(r->ok());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(cables(*r), ElementsAre("Compute Module Midplane Connector -> PME Bridge"));
  }
}

TEST_F(ConnectedToTest, InstanceSetsAntecedentThenDependentAsReferences) {
  harness.useTree(kCable);
  Response r = harness.enumerateInstances("TVRHX_ConnectedTo");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  const Instance& cable = r.items[0].instance;
  EXPECT_THAT(propertyNames(cable), ElementsAre("Antecedent", "Dependent"));
  EXPECT_EQ(property(cable, "Antecedent").type, CMPI_ref);
  EXPECT_EQ(property(cable, "Dependent").type, CMPI_ref);
  EXPECT_EQ(*property(cable, "Antecedent").ref, connectorPath("Compute Module Midplane Connector"));
  EXPECT_EQ(*property(cable, "Dependent").ref, connectorPath("PME Bridge"));
}

TEST_F(ConnectedToTest, AssociationPathHasAntecedentThenDependent) {
  harness.useTree(kCable);
  Response r = harness.enumerateInstanceNames("TVRHX_ConnectedTo");
  ASSERT_EQ(r.items.size(), 1u);
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(path.className, "TVRHX_ConnectedTo");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Antecedent");
  EXPECT_EQ(path.keys[1].name, "Dependent");
  EXPECT_EQ(path.keys[1].value.type, CMPI_ref);
  EXPECT_EQ(harness.enumerateInstances("TVRHX_ConnectedTo").paths(), r.paths());
}

TEST_F(ConnectedToTest, ConnectorWithComputeAndPXUIsTiedToItself) {
  harness.useTree(connectors({"Compute PXU Bridge", "PME Port", "Compute Link"}));
  EXPECT_THAT(cables(harness.enumerateInstances("TVRHX_ConnectedTo")),
              ElementsAre("Compute PXU Bridge -> Compute PXU Bridge"));
}

TEST_F(ConnectedToTest, PENIsNoExpansionMarkerForTheCable) {
  harness.useTree(connectors({"Compute Link", "PEN Console", "pxu lower case", "Pme mixed case"}));
  Response r = harness.enumerateInstances("TVRHX_ConnectedTo");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains(kNoInstancesTrace));
  EXPECT_EQ(r.traces.back().text, std::optional<std::string>(kNoInstancesTrace));
  EXPECT_EQ(r.traces.back().component, std::optional<std::string>("ConnectedToProvider"));
  EXPECT_EQ(r.traces.back().level, 1);
}

TEST_F(ConnectedToTest, ComputeInAnotherCaseIsNoComputeConnector) {
  harness.useTree(connectors({"COMPUTE Link", "compute link", "PXU Uplink"}));
  Response r = harness.enumerateInstanceNames("TVRHX_ConnectedTo");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.traces.back().text, std::optional<std::string>(kNoInstancesTrace));
}

TEST_F(ConnectedToTest, MachineWithoutBothKindsOfConnectorTracesOnceAndAnswersNothing) {
  for (const std::vector<std::string>& names :
       {std::vector<std::string>{"PXU Uplink"}, std::vector<std::string>{"Compute Link"}, std::vector<std::string>{}}) {
    harness.useTree(connectors(names));
    Response r = harness.enumerateInstances("TVRHX_ConnectedTo");
    EXPECT_EQ(r.rc, CMPI_RC_OK);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
    int failures = 0;
    for (const std::string& text : traceTexts(r)) failures += text == kNoInstancesTrace;
    EXPECT_EQ(failures, 1) << names.size();
  }
}

TEST_F(ConnectedToTest, ConnectorWhoseInstanceCannotBeMadeIsPassedOver) {
  harness.useTree(kCable);
  // The expansion walk makes one connector instance after another; the fifth,
  // PME Bridge, cannot be made.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 4);
  Response r = harness.enumerateInstances("TVRHX_ConnectedTo");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(cables(r), ElementsAre("Compute Module Midplane Connector -> PXU Uplink Connector"));
  EXPECT_THAT(traceTexts(r), Not(Contains(HasSubstr("NULL"))));
}

TEST_F(ConnectedToTest, CableWhosePathCannotBeMadeIsLeftOutWithoutReport) {
  harness.useTree(kCable);
  // Both walks make six connector instances before the cable's path.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 12);
  LoggerCapture capture;
  Response r = harness.enumerateInstances("TVRHX_ConnectedTo");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Not(Contains(kNoInstancesTrace)));
  EXPECT_THAT(events(capture), Contains("ConnectedToCMPIInstances out"));
}

// ---- Associators and AssociatorNames -----------------------------------------

TEST_F(ConnectedToTest, AssociatorsFromEveryConnectorThatExistsAnswerNothing) {
  harness.useTree(kCable);
  for (const std::string& connector : kCableConnectors) {
    LoggerCapture capture;
    Response r = harness.om().associators(connectorPath(connector), connectedTo());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << connector;
    EXPECT_EQ(r.message, std::nullopt) << connector;
    EXPECT_THAT(r.items, IsEmpty()) << connector;
    EXPECT_EQ(r.doneCount, 0) << connector;
    // Finding the source ends the lookup and the handler before their exit lines.
    EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_Associators in", "getConnectorforConnector in"))
        << connector;
  }
}

TEST_F(ConnectedToTest, AssociatorNamesFromEveryConnectorThatExistsAnswerNothing) {
  harness.useTree(kCable);
  for (const std::string& connector : kCableConnectors) {
    LoggerCapture capture;
    Response r = harness.om().associatorNames(connectorPath(connector), connectedTo());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << connector;
    EXPECT_THAT(r.items, IsEmpty()) << connector;
    EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_AssociatorNames in", "getConnectorforConnector in"))
        << connector;
  }
}

TEST_F(ConnectedToTest, ConnectorThatDoesNotExistHasAnEmptyTagAndNoFarEnd) {
  harness.useTree(kCable);
  for (const char* connector : {"Compute Ghost", "PXU Ghost", "compute module midplane connector"}) {
    LoggerCapture capture;
    Response r = harness.om().associators(connectorPath(connector), connectedTo());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << connector;
    EXPECT_THAT(r.items, IsEmpty()) << connector;
    EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_Associators in", "getConnectorforConnector in",
                                             "getConnectorforConnector out", "ConnectedTo_Associators out"))
        << connector;
  }
}

TEST_F(ConnectedToTest, AnyResultClassAnswersNothingBeforeTheLookup) {
  harness.useTree(kCable);
  for (const char* resultClass : {"TVRHX_Connector", "CIM_PhysicalConnector", "cim_physicalconnector"}) {
    LoggerCapture capture;
    Response r = harness.om().associatorNames(connectorPath("Compute Ghost"), connectedTo(resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_THAT(r.items, IsEmpty()) << resultClass;
    EXPECT_EQ(r.doneCount, 0) << resultClass;
    EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_AssociatorNames in")) << resultClass;
  }
}

TEST_F(ConnectedToTest, TargetLookupAnnouncesTheChassisThoughTheFarClassIsTheConnector) {
  harness.useTree(kCable);
  Response r = harness.om().associatorNames(connectorPath("Compute Ghost"), connectedTo());
  EXPECT_THAT(traceTexts(r), ElementsAre("Target Class is ChassisClass"));
}

TEST_F(ConnectedToTest, AssociationClassWithoutRuleAnswersNothingWithoutFailure) {
  harness.useTree(kCable);
  for (const char* assocClass : {"TVRHX_NoSuchAssociation", "TVRHX_ConnectorOnPackage", "tvrhx_connectedto"}) {
    LoggerCapture capture;
    Response r = harness.om().associators(connectorPath("PME Bridge"), over(assocClass), toConnectedTo());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << assocClass;
    EXPECT_EQ(r.message, std::nullopt) << assocClass;
    EXPECT_THAT(r.items, IsEmpty()) << assocClass;
    EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_Associators in", "ConnectedTo_Associators out"))
        << assocClass;
  }
  const ObjectPath chassis = pathWithKeys("TVRHX_Chassis", {{"Tag", "/Main"}});
  Response fromChassis = harness.om().associatorNames(chassis, connectedTo());
  EXPECT_EQ(fromChassis.rc, CMPI_RC_OK);
  EXPECT_THAT(fromChassis.items, IsEmpty());
  EXPECT_EQ(harness.om().associatorNames(connectorPath("PME Bridge"), over(nullptr), toConnectedTo()).rc,
            CMPI_RC_OK);
}

TEST_F(ConnectedToTest, WithoutBrokerAssociatorsAnswerNothing) {
  harness.useTree(kCable);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.om().associators(connectorPath("Compute Ghost"), connectedTo(), options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
}

TEST_F(ConnectedToTest, ReferencesAndReferenceNamesAreRefused) {
  harness.useTree(kCable);
  for (const ObjectPath& source : {connectorPath("Compute Module Midplane Connector"), connectorPath("PME Bridge")}) {
    Response refs = harness.om().references(source, over(nullptr, "TVRHX_ConnectedTo"));
    Response names = harness.om().referenceNames(source, over(nullptr, "TVRHX_ConnectedTo"));
    for (const Response* r : {&refs, &names}) {
      EXPECT_EQ(r->rc, CMPI_RC_ERR_NOT_SUPPORTED);
      EXPECT_EQ(r->message, std::nullopt);
      EXPECT_THAT(r->items, IsEmpty());
      EXPECT_THAT(r->traces, IsEmpty());
      EXPECT_EQ(r->doneCount, 0);
    }
  }
}

// ---- GetInstance ----------------------------------------------------------------

TEST_F(ConnectedToTest, GetInstanceWithTheCableKeysFindsTheCable) {
  harness.useTree(kCable);
  const ObjectPath path = harness.enumerateInstanceNames("TVRHX_ConnectedTo").paths().at(0);
  Response r = harness.getInstance(path);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].path, path);
  EXPECT_THAT(cables(r), ElementsAre("Compute Module Midplane Connector -> PME Bridge"));
}

TEST_F(ConnectedToTest, GetInstanceWithOtherKeysFindsNothing) {
  harness.useTree(kCable);
  auto cable = [](const std::string& antecedent, const std::string& dependent) {
    ObjectPath path("root/cimv2", "TVRHX_ConnectedTo");
    path.keys.push_back(broker::Binding{"Antecedent", Value::reference(connectorPath(antecedent))});
    path.keys.push_back(broker::Binding{"Dependent", Value::reference(connectorPath(dependent))});
    return path;
  };
  for (const ObjectPath& path : {cable("PME Bridge", "Compute Module Midplane Connector"),
                                 cable("Compute Module Midplane Connector", "PXU Uplink Connector"),
                                 pathWithKeys("TVRHX_ConnectedTo", {{"Antecedent", "x"}})}) {
    Response r = harness.getInstance(path);
    EXPECT_EQ(r.rc, CMPI_RC_OK);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(ConnectedToTest, GetInstanceWithoutKeysAnswersNothingWithoutFailure) {
  harness.useTree(kCable);
  LoggerCapture capture;
  Response r = harness.getInstance(classPath("TVRHX_ConnectedTo"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(events(capture), ElementsAre("ConnectedTo_GetInstance in", "ConnectedTo_GetInstance out"));
}

TEST_F(ConnectedToTest, GetInstanceOnAMachineWithoutTheCableCompletes) {
  harness.useTree(connectors({"Compute Link"}));
  Response r = harness.getInstance(pathWithKeys("TVRHX_ConnectedTo", {{"Antecedent", "x"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

// ---- Entry points and logger lines --------------------------------------------

TEST_F(ConnectedToTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("ConnectedToProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("ConnectedToProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_STREQ(instance->ft->miName, "instanceConnectedToProvider");
  EXPECT_STREQ(association->ft->miName, "associationConnectedToProvider");
  EXPECT_EQ(instance->ft->miVersion, 200);
}

TEST_F(ConnectedToTest, WriteOperationsAndQueriesAreRefusedAndCleanupAnswersOk) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ConnectedToProvider", &error);
  CMPIAssociationMI* assoc = harness.om().associationMI("ConnectedToProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  ASSERT_NE(assoc, nullptr) << error;
  for (CMPIStatus s : {mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr),
                       mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr),
                       mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_ConnectedTo", "WQL")}) {
    EXPECT_EQ(s.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(s.msg, nullptr);
  }
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(assoc->ft->cleanup(assoc, nullptr, 0).rc, CMPI_RC_OK);
}

TEST_F(ConnectedToTest, EnumerationLogsBothLookupsInsideTheBuilder) {
  harness.useTree(kCable);
  LoggerCapture capture;
  harness.enumerateInstances("TVRHX_ConnectedTo");
  EXPECT_THAT(events(capture),
              ElementsAre("ConnectedTo_EnumInstances in", "ConnectedToCMPIInstances in", "getConnectorforPME in",
                          "getConnectorforPME out", "getConnectorforChassis in", "getConnectorforChassis out",
                          "ConnectedToCMPIInstances out", "ConnectedTo_EnumInstances out"));
}

TEST_F(ConnectedToTest, FailedLookupEndsTheBuilderBeforeItsExitLine) {
  harness.useTree(connectors({"Compute Link"}));
  LoggerCapture capture;
  harness.enumerateInstanceNames("TVRHX_ConnectedTo");
  EXPECT_THAT(events(capture),
              ElementsAre("ConnectedTo_EnumInstanceNames in", "ConnectedToCMPIInstances in", "getConnectorforPME in",
                          "getConnectorforPME out", "ConnectedTo_EnumInstanceNames out"));
}

TEST_F(ConnectedToTest, LookupLinesListTheirArguments) {
  harness.useTree(kCable);
  LoggerCapture capture;
  harness.enumerateInstances("TVRHX_ConnectedTo");
  std::vector<std::string> lookup;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.function == "getConnectorforChassis")
      lookup.push_back(maskedLine(line.text));
  ASSERT_EQ(lookup.size(), 2u);
  EXPECT_EQ(lookup[0], "ENTERING: getConnectorforChassis() in src/providers/ConnectedToProvider.cpp [Line: N],"
                       "Parameters List:  ref=0x? ctx=0x? instance=0");
  EXPECT_EQ(lookup[1], "EXITING: getConnectorforChassis() in src/providers/ConnectedToProvider.cpp [Line: N],"
                       "Parameters List:  ref=0x? ctx=0x? instance=0x?");
}

} // namespace
} // namespace tvr::test
