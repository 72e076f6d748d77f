// TVRHX_NPRealizesNC as an instance provider, through the embedded object
// manager: each network port the object manager knows paired with each card
// whose Tag is the port's DeviceID, byte for byte.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

namespace tvr::test {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::RequestOptions;

const char* const kClass = "TVRHX_NPRealizesNC";
const char* const kComponent = "AssociationProvider NetworkPort And NetworkCard";

// Two cards; the companion gives each its own port.
const char* const kTwoCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main", "children": [
    {"type": "NetworkCardNode", "name": "eth0"},
    {"type": "NetworkCardNode", "name": "eth1"}]}]})";

// For the port stand-in: ports P1 and P2, cards P1 and P3.
const char* const kPortsP1P2CardsP1P3 = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "NetworkPortNode", "name": "P1"}, {"type": "NetworkPortNode", "name": "P2"},
            {"type": "NetworkCardNode", "name": "P1"}, {"type": "NetworkCardNode", "name": "P3"}]})";

ObjectPath cardPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_NetworkCard", {{"Tag", tag}, {"CreationClassName", "TVRHX_NetworkCard"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath portPath(const std::string& deviceID) {
  ObjectPath path = pathWithKeys("TVRHX_NetworkPort", {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                                       {"SystemName", "host.example.com"},
                                                       {"CreationClassName", "TVRHX_NetworkPort"},
                                                       {"DeviceID", deviceID}});
  path.host = "host.example.com";
  return path;
}

ObjectPath keysSorted(ObjectPath path) {
  std::sort(path.keys.begin(), path.keys.end(),
            [](const broker::Binding& a, const broker::Binding& b) { return a.name < b.name; });
  return path;
}

// "card Tag -> port DeviceID" for each association of a response.
std::vector<std::string> ties(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) {
    const Value* antecedent = p.key("Antecedent");
    const Value* dependent = p.key("Dependent");
    out.push_back((antecedent && antecedent->ref ? antecedent->ref->key("Tag")->text : "?") + " -> " +
                  (dependent && dependent->ref ? dependent->ref->key("DeviceID")->text : "?"));
  }
  return out;
}

class NPRealizesNCInstancesTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(NPRealizesNCInstancesTest, EnumerateInstanceNamesPairsEachPortWithItsCard) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(ties(r), ElementsAre("eth0 -> eth0", "eth1 -> eth1"));
}

TEST_F(NPRealizesNCInstancesTest, EnumeratedPathHasDependentThenAntecedentAsReferences) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstanceNames(kClass);
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, kClass);
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, portPath("eth0"));
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, cardPath("eth0"));
}

TEST_F(NPRealizesNCInstancesTest, InstancesSetDependentThenAntecedent) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(ties(r), ElementsAre("eth0 -> eth0", "eth1 -> eth1"));
  ASSERT_FALSE(r.items.empty());
  EXPECT_THAT(propertyNames(r.items[0].instance), ElementsAre("Dependent", "Antecedent"));
}

TEST_F(NPRealizesNCInstancesTest, CardNamesThatDifferOnlyInCaseEachRealiseTheirOwnPort) {
  harness.useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"},
                                {"type": "NetworkCardNode", "name": "ETH0"}]})");
  EXPECT_THAT(ties(harness.enumerateInstanceNames(kClass)), ElementsAre("eth0 -> eth0", "ETH0 -> ETH0"));
}

TEST(NPRealizesNCWithStandInPortsTest, PortsP1P2AndCardsP1P3GiveOneAssociation) {
  ProviderHarness harness({StandIn::NetworkPorts});
  harness.useTree(kPortsP1P2CardsP1P3);
  EXPECT_THAT(ties(harness.enumerateInstanceNames(kClass)), ElementsAre("P1 -> P1"));
  EXPECT_THAT(ties(harness.enumerateInstances(kClass)), ElementsAre("P1 -> P1"));
}

TEST(NPRealizesNCWithStandInPortsTest, DeviceIdThatDiffersFromTheTagOnlyInCaseGivesNoAssociation) {
  ProviderHarness harness({StandIn::NetworkPorts});
  harness.useTree(R"({"nodes": [{"type": "NetworkPortNode", "name": "ETH0"},
                                {"type": "NetworkCardNode", "name": "eth0"}]})");
  Response r = harness.enumerateInstances(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
}

TEST(NPRealizesNCWithStandInPortsTest, EveryMatchCountsPortsOutsideCardsInside) {
  ProviderHarness harness({StandIn::NetworkPorts});
  // Port A matches two cards; two ports named B match one card.
  harness.useTree(R"({"nodes": [
    {"type": "NetworkPortNode", "name": "A"}, {"type": "NetworkPortNode", "name": "B"},
    {"type": "ChassisNode", "name": "Main", "children": [
      {"type": "NetworkPortNode", "name": "B"},
      {"type": "NetworkCardNode", "name": "A"},
      {"type": "NetworkCardNode", "name": "B"},
      {"type": "NetworkCardNode", "name": "A"}]}]})");
  EXPECT_THAT(ties(harness.enumerateInstanceNames(kClass)), ElementsAre("A -> A", "A -> A", "B -> B", "B -> B"));
  EXPECT_THAT(ties(harness.enumerateInstances(kClass)), ElementsAre("A -> A", "A -> A", "B -> B", "B -> B"));
}

TEST(NPRealizesNCWithStandInPortsTest, WithoutPortsBothEnumerationsAnswerNothingAndComplete) {
  ProviderHarness harness({StandIn::NetworkPorts});
  harness.useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  for (const Response& r : {harness.enumerateInstanceNames(kClass), harness.enumerateInstances(kClass)}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(NPRealizesNCInstancesTest, FailedUpCallAnswersEnumerateInstanceNamesOkWithItsText) {
  harness.useTree(kTwoCards);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::optional<std::string>("CBEnumInstanceNames Failed for the TVRHX_NetworkPort"));
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(r.traces, IsEmpty());
  for (const LoggedLine& line : capture.lines()) EXPECT_NE(line.level, 6000) << line.text;
}

TEST_F(NPRealizesNCInstancesTest, FailedUpCallGivesEnumerateInstancesAnEmptySuccessfulAnswerWithoutReport) {
  harness.useTree(kTwoCards);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(r.traces, IsEmpty());
  for (const LoggedLine& line : capture.lines()) EXPECT_NE(line.level, 6000) << line.text;
}

TEST_F(NPRealizesNCInstancesTest, FailedPortClassPathFailsEnumerateInstanceNames) {
  harness.useTree(kTwoCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed."));
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for NetworkPortClass."));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>(kComponent));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(NPRealizesNCInstancesTest, FailedPortClassPathInTheBuilderIsTracedAsTheSystemsClass) {
  harness.useTree(kTwoCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for ComputerSystemClass."));
}

TEST_F(NPRealizesNCInstancesTest, FailedAssociationPathFailsEnumerateInstanceNamesWithAFullStop) {
  harness.useTree(kTwoCards);
  // The port class path, the companion's two port paths and the two card
  // paths of the first port are made first.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 5);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for NetPortRealizesNetCard."));
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for NetPortRealizesNetCard."));
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(NPRealizesNCInstancesTest, FailedBuilderGivesAnEmptySuccessfulAnswer) {
  harness.useTree(kTwoCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 5);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for NetPortRealizesNetCard."));
}

TEST_F(NPRealizesNCInstancesTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kTwoCards);
  for (const ObjectPath& path : harness.enumerateInstanceNames(kClass).paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(keysSorted(r.items[0].path), keysSorted(path));
  }
}

TEST_F(NPRealizesNCInstancesTest, GetInstanceOfAPairTheRuleDoesNotTieFindsNothing) {
  harness.useTree(kTwoCards);
  ObjectPath path("root/cimv2", kClass);
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(cardPath("eth1"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(portPath("eth0"))});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(NPRealizesNCInstancesTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kTwoCards);
  Response r = harness.getInstance(ObjectPath("root/cimv2", kClass));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>(kComponent));
}

TEST_F(NPRealizesNCInstancesTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("NetPortRealizesNetCardProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("NetPortRealizesNetCardProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_NE(static_cast<void*>(instance), static_cast<void*>(association));
  EXPECT_STREQ(instance->ft->miName, "instanceNetPortRealizesNetCardProvider");
  EXPECT_STREQ(association->ft->miName, "associationNetPortRealizesNetCardProvider");
}

TEST_F(NPRealizesNCInstancesTest, EnumerateInstanceNamesTracesEntryAndExitOnBothChannels) {
  harness.useTree(kTwoCards);
  LoggerCapture capture;
  harness.enumerateInstanceNames(kClass);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "NetPortRealizesNetCard_EnumInstanceNames")
      lines.push_back(std::string(line.channel == KVLog::Channel::Log ? "log " : "trace ") + maskedLine(line.text));
  const std::string where = "NetPortRealizesNetCard_EnumInstanceNames() in src/providers/NetPortRealizesNetCard.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x?";
  EXPECT_THAT(lines, ElementsAre("log ENTERING: " + where, "trace ENTERING: " + where, "log EXITING: " + where,
                                 "trace EXITING: " + where));
}

} // namespace
} // namespace tvr::test
