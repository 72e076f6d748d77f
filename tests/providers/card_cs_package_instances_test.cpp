// TVRHX_CardCSPackage as an instance provider, through the embedded object
// manager: every network card paired with every computer system the object
// manager knows, the systems fetched back through the broker.
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
using KVLog::Channel;

const char* const kClass = "TVRHX_CardCSPackage";
const char* const kComponent = "AssociationProvider_CardAndComputerSystem";

// A system with a UUID, which the card packages do not carry, and three cards.
const char* const kSystemAndThreeCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System",
             "properties": {"PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132"},
             "children": [{"type": "ChassisNode", "name": "Main", "children": [
               {"type": "NetworkCardNode", "name": "eth0"},
               {"type": "NetworkCardNode", "name": "eth1"},
               {"type": "NetworkCardNode", "name": "eth2"}]}]}]})";

// Two computer systems for the stand-in, and three cards.
const char* const kTwoSystemsAndThreeCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "node-a"},
            {"type": "SystemNode", "name": "node-b"},
            {"type": "ChassisNode", "name": "Main", "children": [
              {"type": "NetworkCardNode", "name": "eth0"},
              {"type": "NetworkCardNode", "name": "eth1"},
              {"type": "NetworkCardNode", "name": "eth2"}]}]})";

ObjectPath cardPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_NetworkCard", {{"Tag", tag}, {"CreationClassName", "TVRHX_NetworkCard"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath systemPath() {
  ObjectPath path = pathWithKeys("TVRHX_ComputerSystem",
                                 {{"CreationClassName", "TVRHX_ComputerSystem"}, {"Name", "host.example.com"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath keysSorted(ObjectPath path) {
  std::sort(path.keys.begin(), path.keys.end(),
            [](const broker::Binding& a, const broker::Binding& b) { return a.name < b.name; });
  return path;
}

// "card Tag -> system Name" for each association of a response.
std::vector<std::string> ties(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) {
    const Value* antecedent = p.key("Antecedent");
    const Value* dependent = p.key("Dependent");
    out.push_back((antecedent && antecedent->ref ? antecedent->ref->key("Tag")->text : "?") + " -> " +
                  (dependent && dependent->ref ? dependent->ref->key("Name")->text : "?"));
  }
  return out;
}

std::string lineMasked(std::string text) {
  const std::string label = ", Line: ";
  const std::size_t at = text.find(label);
  if (at == std::string::npos) return text;
  const std::size_t digits = at + label.size();
  return text.replace(digits, text.find(']', digits) - digits, "N");
}

// The failure reports (level 6000) of the logger, channel and category named.
std::vector<std::string> reports(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.level == 6000)
      out.push_back(std::string(line.channel == Channel::Log ? "log " : "trace ") + line.category + " " +
                    lineMasked(line.text));
  return out;
}

const std::string kUpCallReport = "Korvane.CardComputerSystemPackage MESSAGE [File: "
                                  "src/providers/CardComputerSystemPackage.cpp, Line: N]: Call to "
                                  "CBEnumInstances of target Class Failed.";

class CardCSPackageInstancesTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(CardCSPackageInstancesTest, EnumerateInstanceNamesTiesEveryCardToTheSystem) {
  harness.useTree(kSystemAndThreeCards);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(ties(r), ElementsAre("eth0 -> host.example.com", "eth1 -> host.example.com",
                                   "eth2 -> host.example.com"));
}

TEST_F(CardCSPackageInstancesTest, EnumeratedPathHasDependentThenAntecedentAsReferences) {
  harness.useTree(kSystemAndThreeCards);
  Response r = harness.enumerateInstanceNames(kClass);
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, kClass);
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, systemPath());
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(*path.keys[1].value.ref, cardPath("eth0"));
}

TEST_F(CardCSPackageInstancesTest, EveryInstanceCarriesPlatformGuidZero) {
  harness.useTree(kSystemAndThreeCards);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 3u);
  for (const broker::ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent", "PlatformGUID"));
    EXPECT_EQ(property(item.instance, "PlatformGUID"), Value::chars("0"));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, systemPath());
  }
  EXPECT_EQ(*property(r.items[2].instance, "Antecedent").ref, cardPath("eth2"));
}

// The companion knows one system; the stand-in one for each system node.
TEST(CardCSPackageWithTwoSystemsTest, ThreeCardsMakeSixAssociationsSystemsOutside) {
  ProviderHarness harness({StandIn::ComputerSystems});
  harness.useTree(kTwoSystemsAndThreeCards);
  const std::vector<std::string> expected = {"eth0 -> node-a", "eth1 -> node-a", "eth2 -> node-a",
                                             "eth0 -> node-b", "eth1 -> node-b", "eth2 -> node-b"};
  EXPECT_EQ(ties(harness.enumerateInstanceNames(kClass)), expected);
  EXPECT_EQ(ties(harness.enumerateInstances(kClass)), expected);
}

TEST_F(CardCSPackageInstancesTest, MachineWithoutCardsAnswersNothingAndCompletes) {
  harness.useTree(R"({"nodes": [{"type": "SystemNode", "name": "System"}]})");
  for (const Response& r : {harness.enumerateInstanceNames(kClass), harness.enumerateInstances(kClass)}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(CardCSPackageInstancesTest, WithoutComputerSystemBothEnumerationsAnswerNothingAndComplete) {
  harness.useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  for (const Response& r : {harness.enumerateInstanceNames(kClass), harness.enumerateInstances(kClass)}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(CardCSPackageInstancesTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kSystemAndThreeCards);
  for (const ObjectPath& path : harness.enumerateInstanceNames(kClass).paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(keysSorted(r.items[0].path), keysSorted(path));
  }
}

TEST_F(CardCSPackageInstancesTest, GetInstanceOfACardThatIsNotThereFindsNothing) {
  harness.useTree(kSystemAndThreeCards);
  ObjectPath path("root/cimv2", kClass);
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(cardPath("eth9"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(systemPath())});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(CardCSPackageInstancesTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kSystemAndThreeCards);
  Response r = harness.getInstance(ObjectPath("root/cimv2", kClass));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), ElementsAre("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>(kComponent));
}

TEST_F(CardCSPackageInstancesTest, FailedUpCallFailsEnumerateInstanceNamesWithTheReport) {
  harness.useTree(kSystemAndThreeCards);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(reports(capture), ElementsAre("log " + kUpCallReport, "trace " + kUpCallReport));
}

TEST_F(CardCSPackageInstancesTest, FailedUpCallGivesEnumerateInstancesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemAndThreeCards);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(reports(capture), ElementsAre("log " + kUpCallReport, "trace " + kUpCallReport));
}

TEST_F(CardCSPackageInstancesTest, FailedSystemClassPathFailsEnumerateInstanceNames) {
  harness.useTree(kSystemAndThreeCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed."));
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for ComputerSystemClass."));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>(kComponent));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(CardCSPackageInstancesTest, FailedAssociationPathFailsEnumerateInstanceNamesWithAFullStop) {
  harness.useTree(kSystemAndThreeCards);
  // The system class path, the companion's system path and three card paths
  // are made first.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 5);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for CardComputerSystemPackage."));
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for CardComputerSystemPackage."));
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(CardCSPackageInstancesTest, FailedBuilderGivesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemAndThreeCards);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 5);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for CardComputerSystemPackage."));
}

TEST_F(CardCSPackageInstancesTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("CardComputerSystemPackageProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("CardComputerSystemPackageProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_NE(static_cast<void*>(instance), static_cast<void*>(association));
  EXPECT_STREQ(instance->ft->miName, "instanceCardComputerSystemPackageProvider");
  EXPECT_STREQ(association->ft->miName, "associationCardComputerSystemPackageProvider");
}

TEST_F(CardCSPackageInstancesTest, EnumerateInstanceNamesTracesEntryAndExitOnBothChannels) {
  harness.useTree(kSystemAndThreeCards);
  LoggerCapture capture;
  harness.enumerateInstanceNames(kClass);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "CardComputerSystemPackage_EnumInstanceNames")
      lines.push_back(std::string(line.channel == KVLog::Channel::Log ? "log " : "trace ") + maskedLine(line.text));
  const std::string where = "CardComputerSystemPackage_EnumInstanceNames() in src/providers/CardComputerSystemPackage.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x?";
  EXPECT_THAT(lines, ElementsAre("log ENTERING: " + where, "trace ENTERING: " + where, "log EXITING: " + where,
                                 "trace EXITING: " + where));
}

} // namespace
} // namespace tvr::test
