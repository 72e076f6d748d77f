// The association handlers of TVRHX_SASPortRealizesDisk through the
// embedded object manager: every element of the far class, whichever node
// the source is, and markProviderExit with OK where no far class is known.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using broker::AssociationArgs;
using broker::RequestOptions;
using broker::ResultItem;
using KVLog::Channel;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

const char* const kThreeControllers = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "A", "properties": {"PropOtherIdentifyingInfo": "IDE mode"}},
    {"type": "StorageControllerNode", "name": "B"},
    {"type": "StorageControllerNode", "name": "C"}
  ]})";

ObjectPath diskControllerPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_DiskController", {{"Tag", tag}, {"CreationClassName", "TVRHX_DiskController"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath sasPortPath(const std::string& deviceID) {
  ObjectPath path = pathWithKeys("TVRHX_SASPortController", {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                                             {"CreationClassName", "TVRHX_SASPortController"},
                                                             {"SystemName", "host.example.com"},
                                                             {"DeviceID", deviceID}});
  path.host = "host.example.com";
  return path;
}

AssociationArgs over(const char* assocClass, std::optional<std::string> resultClass = std::nullopt) {
  AssociationArgs args;
  if (assocClass) args.assocClass = assocClass;
  args.resultClass = std::move(resultClass);
  return args;
}

RequestOptions toSASPortRealizesDisk() {
  RequestOptions options;
  options.routeTo = "TVRHX_SASPortRealizesDisk";
  return options;
}

// The text of one key of every path of a response, in order.
std::vector<std::string> keys(const Response& r, const char* name) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) out.push_back(p.key(name) ? p.key(name)->text : "(none)");
  return out;
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
    if (line.category == "Korvane.SASPortCtrRealizesDiskCtrProvider" && line.channel == channel) out.push_back(line);
  return out;
}

class SASPortRealizesDiskAssociationTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kThreeControllers); }
  ProviderHarness harness;
};

TEST_F(SASPortRealizesDiskAssociationTest, AssociatorsFromADiskControllerGiveEverySasPort) {
  Response r = harness.om().associators(diskControllerPath("/B"), over("TVRHX_SASPortRealizesDisk"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0) << "association handlers never complete the answer";
  EXPECT_THAT(keys(r, "DeviceID"), ElementsAre("/A", "/B", "/C"));
  ASSERT_EQ(r.items.size(), 3u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::Instance);
  EXPECT_THAT(propertyNames(r.items[0].instance),
              ElementsAre("SystemCreationClassName", "CreationClassName", "SystemName", "DeviceID"));
}

TEST_F(SASPortRealizesDiskAssociationTest, AssociatorNamesFromASasPortGiveEveryDiskControllerPath) {
  Response r = harness.om().associatorNames(sasPortPath("/C"), over("TVRHX_SASPortRealizesDisk"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_EQ(r.paths(),
            (std::vector<ObjectPath>{diskControllerPath("/A"), diskControllerPath("/B"), diskControllerPath("/C")}));
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
}

TEST_F(SASPortRealizesDiskAssociationTest, AssociatorNamesFromADiskControllerGiveEverySasPortPath) {
  Response r = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_SASPortRealizesDisk"));
  EXPECT_EQ(r.paths(), (std::vector<ObjectPath>{sasPortPath("/A"), sasPortPath("/B"), sasPortPath("/C")}));
}

// The disk controllers are listed against the source path, and a SAS port
// path is no class the disk controller list presents.
TEST_F(SASPortRealizesDiskAssociationTest, AssociatorsFromASasPortFindNoDiskControllerInstance) {
  Response r = harness.om().associators(sasPortPath("/A"), over("TVRHX_SASPortRealizesDisk"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(SASPortRealizesDiskAssociationTest, ResultClassChangesNothingAfterTheLookup) {
  const Response plain = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_SASPortRealizesDisk"));
  for (const char* resultClass : {"CIM_Nothing", "TVRHX_DiskController", "CIM_Realizes", ""}) {
    Response r = harness.om().associatorNames(diskControllerPath("/A"), over("TVRHX_SASPortRealizesDisk", resultClass));
    EXPECT_EQ(r.rc, CMPI_RC_OK) << resultClass;
    EXPECT_EQ(r.paths(), plain.paths()) << resultClass;
    Response instances =
        harness.om().associators(diskControllerPath("/A"), over("TVRHX_SASPortRealizesDisk", resultClass));
    EXPECT_EQ(instances.items.size(), 3u) << resultClass;
  }
}

TEST_F(SASPortRealizesDiskAssociationTest, RolesChangeNothing) {
  AssociationArgs plain = over("TVRHX_SASPortRealizesDisk");
  AssociationArgs roles = plain;
  roles.role = "NoSuchRole";
  roles.resultRole = "Antecedent";
  EXPECT_EQ(harness.om().associatorNames(diskControllerPath("/A"), roles).paths(),
            harness.om().associatorNames(diskControllerPath("/A"), plain).paths());
  EXPECT_EQ(harness.om().referenceNames(sasPortPath("/B"), roles, toSASPortRealizesDisk()).paths(),
            harness.om().referenceNames(sasPortPath("/B"), plain, toSASPortRealizesDisk()).paths());
}

TEST_F(SASPortRealizesDiskAssociationTest, SourceOfAnUnpairedClassAnswersOkAndMarksTheExit) {
  const ObjectPath chassis = pathWithKeys("TVRHX_Chassis", {{"Tag", "/Main"}});
  LoggerCapture capture;
  Response r = harness.om().associators(chassis, over("TVRHX_SASPortRealizesDisk"));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 3u);
  EXPECT_THAT(maskedLine(log[0].text), ::testing::StartsWith("ENTERING: SASPortRealizesDisk_Associators()"));
  EXPECT_EQ(maskedLine(log[1].text),
            "EXITING: SASPortRealizesDisk_Associators() in src/providers/SASPortCtrRealizesDiskCtrProvider.cpp "
            "[Line: N]");
  EXPECT_EQ(log[1].level, 4000);
  EXPECT_EQ(log[1].function, "markProviderExit");
  EXPECT_EQ(log[2].text, std::string(78, '='));
  EXPECT_EQ(ownLines(capture, Channel::Trace).size(), 3u);
}

TEST_F(SASPortRealizesDiskAssociationTest, EveryHandlerWithoutAFarClassAnswersOk) {
  const ObjectPath card = pathWithKeys("TVRHX_NetworkCard", {{"Tag", "eth0"}});
  const AssociationArgs args = over("TVRHX_SASPortRealizesDisk", "TVRHX_SASPortRealizesDisk");
  const RequestOptions options = toSASPortRealizesDisk();
  for (const Response& r :
       {harness.om().associators(card, args, options), harness.om().associatorNames(card, args, options),
        harness.om().references(card, args, options), harness.om().referenceNames(card, args, options)}) {
    EXPECT_EQ(r.rc, CMPI_RC_OK) << broker::operationName(r.operation);
    EXPECT_EQ(r.message, std::nullopt);
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_THAT(r.traces, IsEmpty());
    EXPECT_EQ(r.doneCount, 0);
  }
}

TEST_F(SASPortRealizesDiskAssociationTest, NullAssociationClassFindsNoFarClassAndAnswersOk) {
  Response r = harness.om().associatorNames(diskControllerPath("/A"), over(nullptr), toSASPortRealizesDisk());
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(SASPortRealizesDiskAssociationTest, ReferencesFromADiskControllerTieItToEverySasPort) {
  Response r = harness.om().references(diskControllerPath("/B"), over(nullptr, "TVRHX_SASPortRealizesDisk"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 3u);
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Antecedent", "Dependent"));
    EXPECT_EQ(*property(item.instance, "Antecedent").ref, diskControllerPath("/B"));
  }
  EXPECT_EQ(refKey(r.items[0].instance.property("Dependent"), "DeviceID"), "/A");
  EXPECT_EQ(refKey(r.items[2].instance.property("Dependent"), "DeviceID"), "/C");
  EXPECT_EQ(r.items[0].instance.path.className, "TVRHX_SASPortRealizesDisk");
}

TEST_F(SASPortRealizesDiskAssociationTest, ReferencesFromASasPortTieItToEveryDiskController) {
  Response r = harness.om().references(sasPortPath("/A"), over(nullptr, "TVRHX_SASPortRealizesDisk"));
  ASSERT_EQ(r.items.size(), 3u);
  for (const ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Antecedent", "Dependent"));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, sasPortPath("/A"));
  }
  EXPECT_EQ(refKey(r.items[1].instance.property("Antecedent"), "Tag"), "/B");
}

TEST_F(SASPortRealizesDiskAssociationTest, ReferenceNamesGiveAssociationPathsWithHostAndNamespace) {
  Response r = harness.om().referenceNames(sasPortPath("/C"), over(nullptr, "TVRHX_SASPortRealizesDisk"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 0);
  ASSERT_EQ(r.items.size(), 3u);
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::ObjectPath);
  EXPECT_EQ(path.className, "TVRHX_SASPortRealizesDisk");
  EXPECT_EQ(path.host, "host.example.com");
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(refKey(path.key("Antecedent"), "Tag"), "/A");
  EXPECT_EQ(*path.key("Dependent")->ref, sasPortPath("/C"));
}

TEST_F(SASPortRealizesDiskAssociationTest, AssociationHandlersTraceTheirArgumentsAndExit) {
  LoggerCapture capture;
  AssociationArgs args = over("TVRHX_SASPortRealizesDisk", "CIM_Anything");
  args.role = "Antecedent";
  args.resultRole = "Dependent";
  harness.om().associatorNames(diskControllerPath("/A"), args);
  const std::vector<LoggedLine> log = ownLines(capture, Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_THAT(log[0].text, ::testing::HasSubstr("ENTERING: SASPortRealizesDisk_AssociatorNames() in "
                                                "src/providers/SASPortCtrRealizesDiskCtrProvider.cpp"));
  EXPECT_THAT(log[0].text, ::testing::EndsWith(" _RefLeftClass=TVRHX_SASPortRealizesDisk "
                                               "_RefRightClass=CIM_Anything role=Antecedent resultRole=Dependent"));
  EXPECT_THAT(log[1].text, ::testing::StartsWith("EXITING: SASPortRealizesDisk_AssociatorNames()"));
  EXPECT_EQ(log[1].level, 3000);
}

} // namespace
} // namespace tvr::test
