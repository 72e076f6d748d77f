// TVRHX_NPRealizesNC as an association provider, through the embedded
// object manager: Associators and AssociatorNames pair ports and cards by
// DeviceID and Tag; References and ReferenceNames tie a source to every
// element of the far class.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::AssociationArgs;
using broker::Fault;
using broker::RequestOptions;
using broker::ResultItem;
using KVLog::Channel;

const char* const kClass = "TVRHX_NPRealizesNC";
const char* const kCategory = "Korvane.NetPortRealizesNetCard";

// Two cards; the companion gives each its own port.
const char* const kTwoCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main", "children": [
    {"type": "NetworkCardNode", "name": "eth0", "properties": {"PropInterfaceName": "ens1f0"}},
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

AssociationArgs over(std::optional<std::string> assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  args.assocClass = std::move(assocClass);
  args.resultClass = std::move(resultClass);
  return args;
}

RequestOptions toThisProvider() {
  RequestOptions options;
  options.routeTo = kClass;
  return options;
}

// The Tag or DeviceID of each path of a response.
std::vector<std::string> names(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) {
    const Value* name = p.key(p.className == "TVRHX_NetworkCard" ? "Tag" : "DeviceID");
    out.push_back(name ? name->text : "?");
  }
  return out;
}

std::string lineMasked(std::string text) {
  for (const std::string label : {", Line: ", "[Line: "}) {
    const std::size_t at = text.find(label);
    if (at == std::string::npos) continue;
    const std::size_t digits = at + label.size();
    text.replace(digits, text.find(']', digits) - digits, "N");
  }
  return text;
}

// The provider's own logger lines at a level, log channel only.
std::vector<std::string> linesAt(const LoggerCapture& capture, int level) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.category == kCategory && line.level == level)
      out.push_back(lineMasked(line.text));
  return out;
}

bool providerExited(const LoggerCapture& capture) {
  for (const std::string& text : linesAt(capture, 3000))
    if (text.rfind("EXITING", 0) == 0) return true;
  return false;
}

std::string message(const std::string& text) {
  return "MESSAGE [File: src/providers/NetPortRealizesNetCard.cpp, Line: N]: " + text;
}

class NPRealizesNCAssociatorsTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kTwoCards); }
  ProviderHarness harness;
};

class NPRealizesNCStandInPortsTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kPortsP1P2CardsP1P3); }
  ProviderHarness harness{StandIn::NetworkPorts};
};

TEST_F(NPRealizesNCAssociatorsTest, AssociatorsFromAPortGiveTheCardWhoseTagIsItsDeviceId) {
  Response r = harness.om().associators(portPath("eth1"), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(r.items[0].path, cardPath("eth1"));
}

TEST_F(NPRealizesNCAssociatorsTest, AssociatorsFromACardGiveItsPort) {
  Response r = harness.om().associators(cardPath("eth0"), over(kClass));
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].path, portPath("eth0"));
  EXPECT_EQ(property(r.items[0].instance, "ElementName"), Value::chars("ens1f0")) << "the companion's instance";
}

TEST_F(NPRealizesNCAssociatorsTest, AssociatorNamesFromAPortGiveTheCardPathWithHostAndNamespace) {
  Response r = harness.om().associatorNames(portPath("eth0"), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), std::vector<ObjectPath>{cardPath("eth0")});
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(NPRealizesNCAssociatorsTest, AssociatorNamesFromACardGiveItsPortPath) {
  Response r = harness.om().associatorNames(cardPath("eth1"), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), std::vector<ObjectPath>{portPath("eth1")});
}

TEST_F(NPRealizesNCAssociatorsTest, DeviceIdThatDiffersFromTheTagOnlyInCaseFindsNoCard) {
  for (const Response& r : {harness.om().associators(portPath("ETH0"), over(kClass)),
                            harness.om().associatorNames(portPath("ETH0"), over(kClass))}) {
    EXPECT_EQ(r.rc, CMPI_RC_OK);
    EXPECT_THAT(r.items, IsEmpty());
  }
}

TEST_F(NPRealizesNCAssociatorsTest, PortWithoutMatchingCardHasNoAssociator) {
  Response r = harness.om().associators(portPath("P2"), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(NPRealizesNCAssociatorsTest, PortPathWithoutDeviceIdIsLoggedAndAnswersNothing) {
  const ObjectPath port = pathWithKeys("TVRHX_NetworkPort", {{"CreationClassName", "TVRHX_NetworkPort"}});
  using Operation = Response (broker::ObjectManager::*)(const ObjectPath&, const AssociationArgs&,
                                                        const RequestOptions&);
  for (Operation operation : {&broker::ObjectManager::associators, &broker::ObjectManager::associatorNames}) {
    LoggerCapture capture;
    Response r = (harness.om().*operation)(port, over(kClass), {});
    EXPECT_EQ(r.rc, CMPI_RC_OK);
    EXPECT_EQ(r.message, std::nullopt);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(linesAt(capture, 6000), ElementsAre(message("Did not get DeviceID in the object path")));
    EXPECT_FALSE(providerExited(capture));
  }
}

TEST_F(NPRealizesNCAssociatorsTest, CardPathWithoutTagIsLoggedInTheWordsOfEachHandler) {
  const ObjectPath card = pathWithKeys("TVRHX_NetworkCard", {{"CreationClassName", "TVRHX_NetworkCard"}});
  LoggerCapture associatorsCapture;
  Response associators = harness.om().associators(card, over(kClass));
  EXPECT_THAT(linesAt(associatorsCapture, 6000), ElementsAre(message("Did not get Tag in the object path")));
  EXPECT_FALSE(providerExited(associatorsCapture));
  LoggerCapture namesCapture;
  Response names = harness.om().associatorNames(card, over(kClass));
  EXPECT_THAT(linesAt(namesCapture, 6000), ElementsAre(message("Did not get Tag key in the object path")));
  for (const Response* r : {&associators, &names}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
  }
}

TEST_F(NPRealizesNCAssociatorsTest, AnyResultClassChangesNothing) {
  const std::vector<ObjectPath> plain = harness.om().associators(portPath("eth0"), over(kClass)).paths();
  ASSERT_EQ(plain.size(), 1u);
  for (const char* resultClass : {"CIM_Card", "TVRHX_NetworkPort", "CIM_Slot", "TVRHX_NoSuchClass"}) {
    EXPECT_EQ(harness.om().associators(portPath("eth0"), over(kClass, resultClass)).paths(), plain) << resultClass;
    EXPECT_EQ(harness.om().associatorNames(cardPath("eth0"), over(kClass, resultClass)).paths(),
              std::vector<ObjectPath>{portPath("eth0")})
        << resultClass;
  }
}

TEST_F(NPRealizesNCAssociatorsTest, SourceNeitherPortNorCardAnswersOkAndClosesWithTheProviderExit) {
  const ObjectPath chassis = pathWithKeys("TVRHX_Chassis", {{"Tag", "/Main"}});
  using Operation = Response (broker::ObjectManager::*)(const ObjectPath&, const AssociationArgs&,
                                                        const RequestOptions&);
  const std::vector<std::pair<Operation, std::string>> handlers = {
      {&broker::ObjectManager::associators, "NetPortRealizesNetCard_Associators"},
      {&broker::ObjectManager::associatorNames, "NetPortRealizesNetCard_AssociatorNames"},
      {&broker::ObjectManager::references, "NetPortRealizesNetCard_References"},
      {&broker::ObjectManager::referenceNames, "NetPortRealizesNetCard_ReferenceNames"}};
  for (const auto& [operation, handler] : handlers) {
    LoggerCapture capture;
    Response r = (harness.om().*operation)(chassis, over(kClass), toThisProvider());
    EXPECT_EQ(r.rc, CMPI_RC_OK) << handler;
    EXPECT_EQ(r.message, std::nullopt) << handler;
    EXPECT_THAT(r.items, IsEmpty()) << handler;
    EXPECT_FALSE(providerExited(capture)) << handler;
    const std::string exiting = "EXITING: " + handler + "() in src/providers/NetPortRealizesNetCard.cpp [Line: N]";
    EXPECT_THAT(linesAt(capture, 4000), ElementsAre(exiting, std::string(78, '='))) << handler;
  }
}

TEST_F(NPRealizesNCAssociatorsTest, TargetPathTheBrokerCannotMakeStillAnswersOk) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.om().associators(portPath("eth0"), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(NPRealizesNCAssociatorsTest, ReferencesFromACardTieItToEveryPort) {
  Response r = harness.om().references(cardPath("eth0"), over(std::nullopt, kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 2u);
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent"));
    EXPECT_EQ(*property(item.instance, "Antecedent").ref, cardPath("eth0"));
  }
  EXPECT_EQ(*property(r.items[1].instance, "Dependent").ref, portPath("eth1"));
}

TEST_F(NPRealizesNCAssociatorsTest, ReferenceNamesSetNoHostName) {
  for (const ObjectPath& source : {portPath("eth0"), cardPath("eth1")}) {
    Response r = harness.om().referenceNames(source, over(std::nullopt, kClass));
    EXPECT_TRUE(r.ok());
    ASSERT_EQ(r.items.size(), 2u);
    for (const ObjectPath& path : r.paths()) {
      EXPECT_EQ(path.className, kClass);
      EXPECT_EQ(path.nameSpace, "root/cimv2");
      EXPECT_EQ(path.host, "");
      ASSERT_NE(path.key("Dependent"), nullptr);
      EXPECT_EQ(path.key("Dependent")->ref->className, "TVRHX_NetworkPort");
    }
  }
}

TEST_F(NPRealizesNCAssociatorsTest, FailedUpCallEndsTheCardSideWithTheReportAndTheBrokersStatus) {
  using Operation = Response (broker::ObjectManager::*)(const ObjectPath&, const AssociationArgs&,
                                                        const RequestOptions&);
  for (Operation operation : {&broker::ObjectManager::associators, &broker::ObjectManager::associatorNames,
                              &broker::ObjectManager::references, &broker::ObjectManager::referenceNames}) {
    LoggerCapture capture;
    harness.om().faults().failNext(Fault::UpCall, 1);
    Response r = (harness.om().*operation)(cardPath("eth0"), over(kClass), toThisProvider());
    EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(linesAt(capture, 6000), ElementsAre(message("Call to CBEnumInstances of target Class Failed.")));
    EXPECT_FALSE(providerExited(capture));
  }
}

TEST_F(NPRealizesNCStandInPortsTest, ReferencesFromPortP2TieItToEachCard) {
  Response r = harness.om().references(portPath("P2"), over(std::nullopt, kClass));
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 2u);
  for (const ResultItem& item : r.items) EXPECT_EQ(*property(item.instance, "Dependent").ref, portPath("P2"));
  EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, cardPath("P1"));
  EXPECT_EQ(*property(r.items[1].instance, "Antecedent").ref, cardPath("P3"));
}

TEST_F(NPRealizesNCStandInPortsTest, AssociatorsFromPortP2FindNoCard) {
  Response r = harness.om().associators(portPath("P2"), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(NPRealizesNCStandInPortsTest, CardP1IsRealisedByPortP1Only) {
  EXPECT_THAT(names(harness.om().associators(cardPath("P1"), over(kClass))), ElementsAre("P1"));
  EXPECT_THAT(names(harness.om().associatorNames(cardPath("P1"), over(kClass))), ElementsAre("P1"));
}

TEST(NPRealizesNCSeveralMatchesTest, EachMatchIsAnswered) {
  ProviderHarness harness({StandIn::NetworkPorts});
  harness.useTree(R"({"systemName": "host.example.com", "nodes": [
    {"type": "NetworkPortNode", "name": "A"}, {"type": "NetworkPortNode", "name": "A"},
    {"type": "NetworkCardNode", "name": "A"}, {"type": "NetworkCardNode", "name": "A"},
    {"type": "NetworkCardNode", "name": "a"}]})");
  EXPECT_THAT(names(harness.om().associators(portPath("A"), over(kClass))), ElementsAre("A", "A"));
  EXPECT_THAT(names(harness.om().associatorNames(portPath("A"), over(kClass))), ElementsAre("A", "A"));
  EXPECT_THAT(names(harness.om().associators(cardPath("A"), over(kClass))), ElementsAre("A", "A"));
  EXPECT_THAT(names(harness.om().associatorNames(cardPath("A"), over(kClass))), ElementsAre("A", "A"));
}

TEST_F(NPRealizesNCAssociatorsTest, AssociatorsTraceTheirTextArgumentsOnEntryAndExit) {
  LoggerCapture capture;
  AssociationArgs args = over(kClass, "CIM_Card");
  args.role = "Antecedent";
  args.resultRole = "Dependent";
  harness.om().associators(portPath("eth0"), args);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "NetPortRealizesNetCard_Associators" && line.channel == KVLog::Channel::Log)
      lines.push_back(maskedLine(line.text));
  const std::string where = "NetPortRealizesNetCard_Associators() in src/providers/NetPortRealizesNetCard.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_NPRealizesNC "
                            "_RefRightClass=CIM_Card role=Antecedent resultRole=Dependent properties=0";
  EXPECT_THAT(lines, ElementsAre("ENTERING: " + where, "EXITING: " + where));
}

} // namespace
} // namespace tvr::test
