// TVRHX_UnitaryComputerSystemPackage as an association provider, through
// the embedded object manager: from a chassis to the computer systems the
// broker's up-calls give, and from a computer system to every chassis.
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

const char* const kClass = "TVRHX_UnitaryComputerSystemPackage";

const char* const kSystemWithUuid = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System",
             "properties": {"PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132"},
             "children": [
               {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}},
               {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}}]}]})";

ObjectPath chassisPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Chassis", {{"Tag", tag}, {"CreationClassName", "TVRHX_Chassis"}});
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

// Whether the provider itself wrote an EXITING line (the target lookup
// writes its own).
bool providerExited(const LoggerCapture& capture) {
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.UnitaryComputerSystemPackage" && line.text.rfind("EXITING", 0) == 0) return true;
  return false;
}

// A message line with its line number written N.
std::string lineMasked(std::string text) {
  const std::string label = ", Line: ";
  const std::size_t at = text.find(label);
  if (at == std::string::npos) return text;
  const std::size_t digits = at + label.size();
  return text.replace(digits, text.find(']', digits) - digits, "N");
}

// The failure reports (level 6000) of the logger, in order.
std::vector<std::string> reportTexts(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.level == 6000) out.push_back(lineMasked(line.text));
  return out;
}

class UnitaryCSPackageAssociatorsTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kSystemWithUuid); }
  ProviderHarness harness;
};

TEST_F(UnitaryCSPackageAssociatorsTest, AssociatorsFromAChassisGiveTheSystemsOfTheUpCall) {
  Response r = harness.om().associators(chassisPath("/System/Main"), over(kClass, "CIM_ComputerSystem"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(r.items[0].path, systemPath());
  EXPECT_EQ(property(r.items[0].instance, "NameFormat"), Value::chars("IP")) << "the companion's instance";
}

TEST_F(UnitaryCSPackageAssociatorsTest, ResultClassOfTheSystemOrItsBaseIsServedInAnyCase) {
  for (const char* resultClass : {"CIM_ComputerSystem", "cim_computersystem", "TVRHX_ComputerSystem"}) {
    Response r = harness.om().associators(chassisPath("/System/Main"), over(kClass, resultClass));
    EXPECT_EQ(r.items.size(), 1u) << resultClass;
  }
}

TEST_F(UnitaryCSPackageAssociatorsTest, ResultClassOfTheChassisFromAChassisAnswersNothingWithoutExitLine) {
  LoggerCapture capture;
  Response r = harness.om().associators(chassisPath("/System/Main"), over(kClass, "CIM_Chassis"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_FALSE(providerExited(capture));
}

TEST_F(UnitaryCSPackageAssociatorsTest, AssociatorsFromTheSystemGiveEveryChassis) {
  Response r = harness.om().associators(systemPath(), over(kClass, "CIM_Chassis"));
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(tags(r), ElementsAre("/System/Main", "/System/Expansion"));
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
}

TEST_F(UnitaryCSPackageAssociatorsTest, ResultClassOfTheSystemFromTheSystemAnswersNothing) {
  Response r = harness.om().associators(systemPath(), over(kClass, "CIM_ComputerSystem"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(UnitaryCSPackageAssociatorsTest, AssociatorNamesFromAChassisGiveTheSystemPaths) {
  Response r = harness.om().associatorNames(chassisPath("/System/Expansion"), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), std::vector<ObjectPath>{systemPath()});
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(UnitaryCSPackageAssociatorsTest, AssociatorNamesFromTheSystemGiveChassisPathsWithHostAndNamespace) {
  Response r = harness.om().associatorNames(systemPath(), over(kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.paths(), (std::vector<ObjectPath>{chassisPath("/System/Main"), chassisPath("/System/Expansion")}));
}

TEST_F(UnitaryCSPackageAssociatorsTest, SourceWithoutTargetAnswersAssociatorsOkButFailsReferences) {
  const ObjectPath slot = pathWithKeys("TVRHX_Slot", {{"Tag", "Slot 1"}});
  for (const Response& r : {harness.om().associators(slot, over(kClass), toThisProvider()),
                            harness.om().associatorNames(slot, over(kClass), toThisProvider())}) {
    EXPECT_EQ(r.rc, CMPI_RC_OK);
    EXPECT_EQ(r.message, std::nullopt);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(r.traces, IsEmpty());
  }
  Response refs = harness.om().references(slot, over(std::nullopt), toThisProvider());
  EXPECT_EQ(refs.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(refs.message, std::optional<std::string>("Object Path is NULL in References."));
  EXPECT_THAT(traceTexts(refs), ElementsAre("Object Path is NULL in References."));
  EXPECT_EQ(refs.traces[0].component, std::optional<std::string>("UnitaryComputerSystemPackage"));
  Response names = harness.om().referenceNames(slot, over(std::nullopt), toThisProvider());
  EXPECT_EQ(names.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(names.message, std::optional<std::string>("Object Path is NULL in ReferenceNames."));
}

TEST_F(UnitaryCSPackageAssociatorsTest, NullAssociationClassAnswersAssociatorsOk) {
  Response r = harness.om().associators(chassisPath("/System/Main"), over(std::nullopt), toThisProvider());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(UnitaryCSPackageAssociatorsTest, TargetPathTheBrokerCannotMakeStillAnswersAssociatorsOk) {
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.om().associators(chassisPath("/System/Main"), over(kClass));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(UnitaryCSPackageAssociatorsTest, ReferencesFromAChassisTieItToTheSystemWithoutPlatformGuid) {
  Response r = harness.om().references(chassisPath("/System/Main"), over(std::nullopt, kClass));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 1u);
  const Instance& association = r.items[0].instance;
  EXPECT_THAT(propertyNames(association), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(*property(association, "Dependent").ref, systemPath());
  EXPECT_EQ(*property(association, "Antecedent").ref, chassisPath("/System/Main"));
}

TEST_F(UnitaryCSPackageAssociatorsTest, ReferencesFromTheSystemGiveOneAssociationPerChassis) {
  Response r = harness.om().references(systemPath(), over(std::nullopt, "TVRHX_NoSuchClass"), toThisProvider());
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 2u);
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent"));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, systemPath());
  }
  EXPECT_EQ(*property(r.items[1].instance, "Antecedent").ref, chassisPath("/System/Expansion"));
}

TEST_F(UnitaryCSPackageAssociatorsTest, ReferenceNamesSetNoHostName) {
  for (const ObjectPath& source : {systemPath(), chassisPath("/System/Main")}) {
    Response r = harness.om().referenceNames(source, over(std::nullopt, kClass));
    EXPECT_TRUE(r.ok());
    ASSERT_FALSE(r.items.empty());
    for (const ObjectPath& path : r.paths()) {
      EXPECT_EQ(path.className, kClass);
      EXPECT_EQ(path.nameSpace, "root/cimv2");
      EXPECT_EQ(path.host, "");
      ASSERT_NE(path.key("Dependent"), nullptr);
      EXPECT_EQ(*path.key("Dependent")->ref, systemPath());
    }
  }
}

TEST_F(UnitaryCSPackageAssociatorsTest, FailedUpCallEndsEachHandlerWithTheReportAndTheBrokersStatus) {
  const std::string report = "MESSAGE [File: src/providers/UnitaryComputerSystemPackage.cpp, Line: N]: Call to "
                             "CBEnumInstances of target Class Failed.";
  const ObjectPath chassis = chassisPath("/System/Main");
  using Operation = Response (broker::ObjectManager::*)(const ObjectPath&, const AssociationArgs&,
                                                        const RequestOptions&);
  for (Operation operation : {&broker::ObjectManager::associators, &broker::ObjectManager::associatorNames,
                              &broker::ObjectManager::references, &broker::ObjectManager::referenceNames}) {
    LoggerCapture capture;
    harness.om().faults().failNext(Fault::UpCall, 1);
    Response r = (harness.om().*operation)(chassis, over(kClass), toThisProvider());
    EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(reportTexts(capture), ElementsAre(report, report));
    EXPECT_FALSE(providerExited(capture));
  }
}

TEST_F(UnitaryCSPackageAssociatorsTest, RolesChangeNothing) {
  AssociationArgs plain = over(kClass);
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "Dependent";
  EXPECT_EQ(harness.om().associators(systemPath(), roles).paths(),
            harness.om().associators(systemPath(), plain).paths());
  EXPECT_EQ(harness.om().associatorNames(chassisPath("/System/Main"), roles).paths(),
            harness.om().associatorNames(chassisPath("/System/Main"), plain).paths());
}

TEST_F(UnitaryCSPackageAssociatorsTest, AssociatorsTraceTheirTextArgumentsOnEntryAndExit) {
  LoggerCapture capture;
  AssociationArgs args = over(kClass, "CIM_ComputerSystem");
  args.role = "Antecedent";
  args.resultRole = "Dependent";
  harness.om().associators(chassisPath("/System/Main"), args);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "UnitaryComputerSystemPackage_Associators" && line.channel == KVLog::Channel::Log)
      lines.push_back(maskedLine(line.text));
  const std::string where = "UnitaryComputerSystemPackage_Associators() in src/providers/UnitaryComputerSystemPackage.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x? _RefLeftClass=TVRHX_UnitaryComputerSystemPackage "
                            "_RefRightClass=CIM_ComputerSystem role=Antecedent resultRole=Dependent properties=0";
  EXPECT_THAT(lines, ElementsAre("ENTERING: " + where, "EXITING: " + where));
}

} // namespace
} // namespace tvr::test
