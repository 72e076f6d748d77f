// The association handlers of TVRHX_DiskControllerCSPackage through the
// embedded object manager: the computer system fetched by up-calls, the
// disk controllers from the hardware, and the empty Associators answer from
// a computer system that the disk controller list gives for its class.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::AssociationArgs;
using broker::FailureShape;
using broker::Fault;
using broker::RequestOptions;
using broker::ResultItem;
using KVLog::Channel;
using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::IsEmpty;
using ::testing::StartsWith;

const char* const kSystemWithThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "SystemNode", "name": "System", "description": "Blade"},
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C"}
  ]})";

const char* const kControllersWithoutSystem = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "A"},
    {"type": "StorageControllerNode", "name": "B"}
  ]})";

ObjectPath diskControllerPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_DiskController", {{"Tag", tag}, {"CreationClassName", "TVRHX_DiskController"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath systemPath(const std::string& className = "TVRHX_ComputerSystem") {
  ObjectPath path =
      pathWithKeys(className, {{"CreationClassName", "TVRHX_ComputerSystem"}, {"Name", "host.example.com"}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

RequestOptions toDiskControllerCSPackage() {
  RequestOptions options;
  options.routeTo = "TVRHX_DiskControllerCSPackage";
  return options;
}

// The text of a reference's key, or "?" when the reference or key is absent.
std::string refKey(const Value* reference, const char* key) {
  if (!reference || !reference->ref || !reference->ref->key(key)) return "?";
  return reference->ref->key(key)->text;
}

// The lines this provider's module wrote to one channel.
std::vector<LoggedLine> ownLines(const LoggerCapture& capture, Channel channel) {
  std::vector<LoggedLine> out;
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.DiskControllerCSPackage" && line.channel == channel) out.push_back(line);
  return out;
}

class DiskControllerCSPackageAssociationTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kSystemWithThreeControllers); }
  ProviderHarness harness;
};

TEST_F(DiskControllerCSPackageAssociationTest, AssociatorsFromADiskControllerGiveTheBrokersComputerSystems) {
  Response r = harness.om().associators(diskControllerPath("/B"), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_EQ(r.instances(), harness.enumerateInstances("TVRHX_ComputerSystem").instances());
  EXPECT_EQ(r.items[0].path, systemPath());
}

TEST_F(DiskControllerCSPackageAssociationTest, AssociatorNamesFromADiskControllerGiveTheSystemsPaths) {
  Response r = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_EQ(r.paths(), harness.enumerateInstanceNames("TVRHX_ComputerSystem").paths());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

// The controllers are listed against the source path, and a computer
// system is no class the disk controller list presents.
TEST_F(DiskControllerCSPackageAssociationTest, AssociatorsFromAComputerSystemGiveNoController) {
  LoggerCapture capture;
  Response r = harness.om().associators(systemPath(), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_THAT(log[1].text, StartsWith("EXITING: DiskControllerCSPackage_Associators()"));
}

TEST_F(DiskControllerCSPackageAssociationTest, AssociatorNamesFromAComputerSystemGiveEveryControllerPath) {
  Response r = harness.om().associatorNames(systemPath(), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_EQ(r.paths(),
            (std::vector<ObjectPath>{diskControllerPath("/A"), diskControllerPath("/B"), diskControllerPath("/C")}));
}

TEST_F(DiskControllerCSPackageAssociationTest, ResultClassCimCardIsServedInAnyCase) {
  for (const char* resultClass : {"CIM_Card", "cim_card", "CIM_CARD", "TVRHX_DiskController", "tvrhx_diskcontroller"}) {
    Response r = harness.om().associatorNames(systemPath(), over("TVRHX_DiskControllerCSPackage", resultClass));
    EXPECT_EQ(r.items.size(), 3u) << resultClass;
  }
}

TEST_F(DiskControllerCSPackageAssociationTest, ResultClassOfAnotherControllerClassAnswersNothing) {
  for (const char* resultClass : {"CIM_PhysicalPackage", "CIM_Controller", "CIM_ComputerSystem"}) {
    LoggerCapture capture;
    Response r = harness.om().associatorNames(systemPath(), over("TVRHX_DiskControllerCSPackage", resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_THAT(r.items, IsEmpty()) << resultClass;
    EXPECT_EQ(r.doneCount, 0) << resultClass;
    EXPECT_EQ(ownLines(capture, Channel::Log).size(), 1u) << "no exit trace for " << resultClass;
  }
}

TEST_F(DiskControllerCSPackageAssociationTest, ResultClassOfTheSystemOrItsBaseClassIsServed) {
  for (const char* resultClass : {"CIM_ComputerSystem", "cim_computersystem", "TVRHX_ComputerSystem"}) {
    Response r = harness.om().associators(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage", resultClass));
    EXPECT_EQ(r.items.size(), 1u) << resultClass;
  }
  Response other =
      harness.om().associators(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage", "CIM_System"));
  EXPECT_EQ(other.rc, CMPI_RC_OK);
  EXPECT_THAT(other.items, IsEmpty());
}

TEST_F(DiskControllerCSPackageAssociationTest, UnknownSourceIsEmptyInAssociatorsButAFailureInReferences) {
  const ObjectPath card = pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth0"}});
  Response associators = harness.om().associators(card, over("TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(associators.rc, CMPI_RC_OK);
  EXPECT_EQ(associators.message, std::nullopt);
  EXPECT_THAT(associators.items, IsEmpty());
  EXPECT_THAT(associators.traces, IsEmpty());
  Response names = harness.om().associatorNames(card, over("TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(names.rc, CMPI_RC_OK);
  Response references = harness.om().references(card, over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(references.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(references.message, std::optional<std::string>("Object Path is NULL in References."));
  EXPECT_THAT(traceTexts(references), ElementsAre("Object Path is NULL in References."));
  EXPECT_EQ(references.traces[0].component,
            std::optional<std::string>("AssociationProvider DiskController And ComputerSystem"));
  Response referenceNames = harness.om().referenceNames(card, over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(referenceNames.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(referenceNames.message, std::optional<std::string>("Object Path is NULL in ReferenceNames."));
  EXPECT_EQ(referenceNames.doneCount, 0);
}

TEST_F(DiskControllerCSPackageAssociationTest, SystemClassInAnotherCaseIsAnUnknownSource) {
  const ObjectPath lowerCase = systemPath("tvrhx_computersystem");
  Response names =
      harness.om().associatorNames(lowerCase, over("TVRHX_DiskControllerCSPackage"), toDiskControllerCSPackage());
  EXPECT_EQ(names.rc, CMPI_RC_OK);
  EXPECT_THAT(names.items, IsEmpty());
  Response references =
      harness.om().references(lowerCase, over(nullptr, "TVRHX_DiskControllerCSPackage"), toDiskControllerCSPackage());
  EXPECT_EQ(references.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(references.message, std::optional<std::string>("Object Path is NULL in References."));
}

TEST_F(DiskControllerCSPackageAssociationTest, NoComputerSystemLeavesAssociatorsFromAControllerEmpty) {
  harness.useTree(kControllersWithoutSystem);
  Response r = harness.om().associators(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(DiskControllerCSPackageAssociationTest, FailingUpCallInAssociatorsReturnsTheBrokersStatus) {
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1, FailureShape::Hollow);
  Response r = harness.om().associators(diskControllerPath("/A"), over("TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u) << "ENTERING and the failure, no EXITING";
  EXPECT_EQ(log[1].level, 6000);
  EXPECT_THAT(log[1].text, EndsWith("]: Call to CBEnumInstances of target Class Failed."));
}

TEST_F(DiskControllerCSPackageAssociationTest, FailingUpCallInReferenceNamesReturnsTheBrokersStatus) {
  harness.om().faults().failNext(Fault::UpCall, 1);
  LoggerCapture capture;
  Response r = harness.om().referenceNames(diskControllerPath("/A"), over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(r.items, IsEmpty());
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_EQ(log[1].level, 6000);
}

TEST_F(DiskControllerCSPackageAssociationTest, ReferencesFromAControllerTieItToTheSystemWithoutPlatformGuid) {
  Response r = harness.om().references(diskControllerPath("/C"), over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 1u);
  const Instance& association = r.items[0].instance;
  EXPECT_THAT(propertyNames(association), ElementsAre("Dependent", "Antecedent"));
  EXPECT_EQ(*property(association, "Dependent").ref, systemPath());
  EXPECT_EQ(*property(association, "Antecedent").ref, diskControllerPath("/C"));
  EXPECT_EQ(association.property("PlatformGUID"), nullptr);
  EXPECT_EQ(association.path.className, "TVRHX_DiskControllerCSPackage");
}

TEST_F(DiskControllerCSPackageAssociationTest, ReferencesFromASystemTieItToEveryController) {
  Response r = harness.om().references(systemPath(), over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 3u);
  std::vector<std::string> controllers;
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent"));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, systemPath());
    EXPECT_EQ(item.instance.property("PlatformGUID"), nullptr);
    controllers.push_back(refKey(item.instance.property("Antecedent"), "Tag"));
  }
  EXPECT_THAT(controllers, ElementsAre("/A", "/B", "/C"));
  EXPECT_EQ(*property(r.items[0].instance, "Antecedent").ref, diskControllerPath("/A"));
}

TEST_F(DiskControllerCSPackageAssociationTest, ReferenceNamesGiveAssociationPathsInTheSourcesNamespace) {
  Response r = harness.om().referenceNames(systemPath(), over(nullptr, "TVRHX_DiskControllerCSPackage"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& path = r.items[1].path;
  EXPECT_EQ(r.items[1].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(path.className, "TVRHX_DiskControllerCSPackage");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(*path.key("Antecedent")->ref, diskControllerPath("/B"));
  EXPECT_EQ(*path.key("Dependent")->ref, systemPath());
}

TEST_F(DiskControllerCSPackageAssociationTest, RolesChangeNothing) {
  AssociationArgs plain = over("TVRHX_DiskControllerCSPackage");
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "Antecedent";
  EXPECT_EQ(harness.om().associatorNames(systemPath(), roles).paths(),
            harness.om().associatorNames(systemPath(), plain).paths());
  EXPECT_EQ(harness.om().referenceNames(diskControllerPath("/A"), roles, toDiskControllerCSPackage()).paths(),
            harness.om().referenceNames(diskControllerPath("/A"), plain, toDiskControllerCSPackage()).paths());
}

TEST_F(DiskControllerCSPackageAssociationTest, AssociatorsTraceTheirTextArguments) {
  LoggerCapture capture;
  AssociationArgs args = over("TVRHX_DiskControllerCSPackage", "CIM_Card");
  args.role = "Dependent";
  args.resultRole = "Antecedent";
  harness.om().associatorNames(systemPath(), args);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_THAT(log[0].text, ::testing::HasSubstr("ENTERING: DiskControllerCSPackage_AssociatorNames() in "
                                                "src/providers/DiskControllerCSPackage.cpp"));
  EXPECT_THAT(log[0].text, EndsWith(" _RefLeftClass=TVRHX_DiskControllerCSPackage _RefRightClass=CIM_Card "
                                    "role=Dependent resultRole=Antecedent"));
  EXPECT_THAT(log[1].text, StartsWith("EXITING: DiskControllerCSPackage_AssociatorNames()"));
}

} // namespace
} // namespace tvr::test
