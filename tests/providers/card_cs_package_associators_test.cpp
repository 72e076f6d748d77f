// TVRHX_CardCSPackage as an association provider, through the embedded
// object manager: from a card to the computer systems the broker's up-calls
// give, and from a computer system to every card.
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

const char* const kClass = "TVRHX_CardCSPackage";

const char* const kSystemAndTwoCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System", "children": [
    {"type": "ChassisNode", "name": "Main", "children": [
      {"type": "NetworkCardNode", "name": "eth0", "properties": {"PropAdapterStatus": 1}},
      {"type": "NetworkCardNode", "name": "eth1", "properties": {"PropAdapterStatus": 16}}]}]}]})";

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

std::vector<std::string> tags(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) out.push_back(p.key("Tag") ? p.key("Tag")->text : "(no tag)");
  return out;
}

bool providerExited(const LoggerCapture& capture) {
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.CardComputerSystemPackage" && line.text.rfind("EXITING", 0) == 0) return true;
  return false;
}

std::string lineMasked(std::string text) {
  const std::string label = ", Line: ";
  const std::size_t at = text.find(label);
  if (at == std::string::npos) return text;
  const std::size_t digits = at + label.size();
  return text.replace(digits, text.find(']', digits) - digits, "N");
}

std::vector<std::string> reportTexts(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.level == 6000) out.push_back(lineMasked(line.text));
  return out;
}

class CardCSPackageAssociatorsTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kSystemAndTwoCards); }
  ProviderHarness harness;
};

TEST_F(CardCSPackageAssociatorsTest, AssociatorsFromACardGiveTheSystemsOfTheUpCall) {
  Response r = harness.om().associators(cardPath("eth1"), over(kClass, "CIM_ComputerSystem"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(r.items[0].path, systemPath());
}

TEST_F(CardCSPackageAssociatorsTest, AssociatorsFromTheSystemGiveEveryCard) {
  Response r = harness.om().associators(systemPath(), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(tags(r), ElementsAre("eth0", "eth1"));
  EXPECT_EQ(property(r.items[1].instance, "Status"), Value::chars("Stopped")) << "the card's own instance";
}

TEST_F(CardCSPackageAssociatorsTest, ResultClassOfTheCardOrItsBaseIsServedInAnyCase) {
  for (const char* resultClass : {"CIM_Card", "cim_CARD", "TVRHX_NetworkCard", "tvrhx_networkcard"}) {
    Response r = harness.om().associators(systemPath(), over(kClass, resultClass));
    EXPECT_EQ(r.items.size(), 2u) << resultClass;
  }
}

TEST_F(CardCSPackageAssociatorsTest, ResultClassAboveTheCardsBaseAnswersNothingWithoutExitLine) {
  LoggerCapture capture;
  Response r = harness.om().associators(systemPath(), over(kClass, "CIM_PhysicalPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_FALSE(providerExited(capture));
}

TEST_F(CardCSPackageAssociatorsTest, AssociatorNamesFromTheSystemGiveCardPathsWithHostAndNamespace) {
  Response r = harness.om().associatorNames(systemPath(), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), (std::vector<ObjectPath>{cardPath("eth0"), cardPath("eth1")}));
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(CardCSPackageAssociatorsTest, AssociatorNamesFromACardGiveTheSystemPaths) {
  Response r = harness.om().associatorNames(cardPath("eth0"), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), std::vector<ObjectPath>{systemPath()});
}

TEST_F(CardCSPackageAssociatorsTest, WithoutComputerSystemAssociatorsFromACardAnswerNothing) {
  harness.useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  Response r = harness.om().associators(cardPath("eth0"), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(CardCSPackageAssociatorsTest, SourceWithoutTargetAnswersAssociatorsOkButFailsReferences) {
  const ObjectPath chassis = pathWithKeys("TVRHX_Chassis", {{"Tag", "/System/Main"}});
  Response r = harness.om().associators(chassis, over(kClass), toThisProvider());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  Response refs = harness.om().references(chassis, over(std::nullopt), toThisProvider());
  EXPECT_EQ(refs.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(refs.message, std::optional<std::string>("Object Path is NULL in References."));
  EXPECT_THAT(traceTexts(refs), ElementsAre("Object Path is NULL in References."));
  EXPECT_EQ(refs.traces[0].component, std::optional<std::string>("AssociationProvider_CardAndComputerSystem"));
  Response names = harness.om().referenceNames(chassis, over(std::nullopt), toThisProvider());
  EXPECT_EQ(names.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(names.message, std::optional<std::string>("Object Path is NULL in ReferenceNames."));
}

TEST_F(CardCSPackageAssociatorsTest, TargetPathTheBrokerCannotMakeLeavesItsStatus) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.om().associators(systemPath(), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(CardCSPackageAssociatorsTest, ReferencesFromTheSystemGiveOneAssociationPerCardWithoutPlatformGuid) {
  Response r = harness.om().references(systemPath(), over(std::nullopt, kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 2u);
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent"));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, systemPath());
  }
  EXPECT_EQ(*property(r.items[1].instance, "Antecedent").ref, cardPath("eth1"));
}

TEST_F(CardCSPackageAssociatorsTest, ReferencesFromACardTieItToTheSystem) {
  Response r = harness.om().references(cardPath("eth0"), over(std::nullopt, "TVRHX_NoSuchClass"),
                                       toThisProvider());
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  const Instance& association = r.items[0].instance;
  EXPECT_THAT(propertyNames(association), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(*property(association, "Dependent").ref, systemPath());
  EXPECT_EQ(*property(association, "Antecedent").ref, cardPath("eth0"));
}

TEST_F(CardCSPackageAssociatorsTest, ReferenceNamesSetNoHostName) {
  for (const ObjectPath& source : {systemPath(), cardPath("eth1")}) {
    Response r = harness.om().referenceNames(source, over(std::nullopt, kClass));
    EXPECT_TRUE(r.ok());
    ASSERT_FALSE(r.items.empty());
    for (const ObjectPath& path : r.paths()) {
      EXPECT_EQ(path.className, kClass);
      EXPECT_EQ(path.nameSpace, "root/cimv2");
      EXPECT_EQ(path.host, "");
      ASSERT_NE(path.key("Antecedent"), nullptr);
      EXPECT_EQ(path.key("Antecedent")->ref->className, "TVRHX_NetworkCard");
    }
  }
}

TEST_F(CardCSPackageAssociatorsTest, FailedUpCallEndsEachHandlerWithTheReportAndTheBrokersStatus) {
  const std::string report = "MESSAGE [File: src/providers/CardComputerSystemPackage.cpp, Line: N]: Call to "
                             "CBEnumInstances of target Class Failed.";
  using Operation = Response (broker::ObjectManager::*)(const ObjectPath&, const AssociationArgs&,
                                                        const RequestOptions&);
  for (Operation operation : {&broker::ObjectManager::associators, &broker::ObjectManager::associatorNames,
                              &broker::ObjectManager::references, &broker::ObjectManager::referenceNames}) {
    LoggerCapture capture;
    harness.om().faults().failNext(Fault::UpCall, 1);
    Response r = (harness.om().*operation)(cardPath("eth0"), over(kClass), toThisProvider());
    EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(reportTexts(capture), ElementsAre(report, report));
    EXPECT_FALSE(providerExited(capture));
  }
}

TEST_F(CardCSPackageAssociatorsTest, RolesChangeNothing) {
  AssociationArgs plain = over(kClass);
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "Antecedent";
  EXPECT_EQ(harness.om().associators(systemPath(), roles).paths(),
            harness.om().associators(systemPath(), plain).paths());
  EXPECT_EQ(harness.om().associatorNames(cardPath("eth0"), roles).paths(),
            harness.om().associatorNames(cardPath("eth0"), plain).paths());
}

TEST_F(CardCSPackageAssociatorsTest, AssociatorsTraceTheirTextArgumentsOnEntryAndExit) {
  LoggerCapture capture;
  AssociationArgs args = over(kClass, "CIM_Card");
  args.role = "Antecedent";
  args.resultRole = "Dependent";
  harness.om().associators(systemPath(), args);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "CardComputerSystemPackage_Associators" && line.channel == KVLog::Channel::Log)
      lines.push_back(maskedLine(line.text));
  const std::string where = "CardComputerSystemPackage_Associators() in src/providers/CardComputerSystemPackage.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_CardCSPackage "
                            "_RefRightClass=CIM_Card role=Antecedent resultRole=Dependent properties=0";
  EXPECT_THAT(lines, ElementsAre("ENTERING: " + where, "EXITING: " + where));
}

} // namespace
} // namespace tvr::test
