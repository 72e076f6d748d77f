// TVRHX_Chassis through the embedded object manager.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::ResultItem;

// A blade enclosure and its expansion unit, as most tests here see them.
const char* const kTwoChassis = R"({
  "systemName": "host.example.com",
  "nodes": [
    {"type": "ChassisNode", "name": "Blade Chassis", "status": 1,
     "properties": {"PropChassisType": 17, "PropPackageType": 16, "PropManufacturer": "Northwind",
                    "PropModel": "BX-920", "PropSerialNumber": "SN-1", "PropPartNumber": "PN-1"}},
    {"type": "ChassisNode", "name": "Expansion", "status": 22,
     "properties": {"PropChassisType": 18, "PropPackageType": 9}}
  ]})";

std::string oneChassis(const std::string& fields) {
  return R"({"systemName": "host.example.com", "nodes": [{"type": "ChassisNode", "name": "C")" +
         (fields.empty() ? std::string() : ", " + fields) + "}]}";
}

class ChassisProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_Chassis");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

TEST_F(ChassisProviderTest, EnumerateInstanceNamesGivesOnePathPerChassisNode) {
  harness.useTree(kTwoChassis);
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  ASSERT_TRUE(r.ok());
  EXPECT_TRUE(r.done());
  ASSERT_EQ(r.items.size(), 2u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.className, "TVRHX_Chassis");
  EXPECT_EQ(first.host, "host.example.com");
  ASSERT_EQ(first.keys.size(), 2u);
  EXPECT_EQ(first.keys[0].name, "Tag");
  EXPECT_EQ(first.keys[0].value, Value::chars("/Blade Chassis"));
  EXPECT_EQ(first.keys[1].name, "CreationClassName");
  EXPECT_EQ(first.keys[1].value, Value::chars("TVRHX_Chassis"));
  EXPECT_EQ(*r.items[1].path.key("Tag"), Value::chars("/Expansion"));
}

TEST_F(ChassisProviderTest, PathsKeepTheRequestNamespace) {
  harness.useTree(kTwoChassis);
  Response r = harness.om().enumerateInstanceNames(ObjectPath("root/cimv2", "TVRHX_Chassis"));
  ASSERT_FALSE(r.items.empty());
  EXPECT_EQ(r.items[0].path.nameSpace, "root/cimv2");
}

TEST_F(ChassisProviderTest, InstanceCarriesEveryPropertyInOrderWithItsType) {
  Instance chassis = onlyInstance(std::string(R"({
    "systemName": "host.example.com",
    "nodes": [{"type": "ChassisNode", "name": "Blade Chassis", "status": 1,
               "properties": {"PropChassisType": 17, "PropPackageType": 16, "PropManufacturer": "Northwind",
                              "PropModel": "BX-920", "PropSerialNumber": "SN-1", "PropPartNumber": "PN-1"}}]})"));
  EXPECT_THAT(propertyNames(chassis),
              ElementsAre("Tag", "CreationClassName", "ChassisPackageType", "PackageType", "Manufacturer", "Model",
                          "SerialNumber", "PartNumber", "SKU", "ElementName", "Caption", "Description", "Status",
                          "VendorCompatibilityStrings", "Name"));
  EXPECT_EQ(property(chassis, "Tag"), Value::chars("/Blade Chassis"));
  EXPECT_EQ(property(chassis, "CreationClassName"), Value::chars("TVRHX_Chassis"));
  EXPECT_EQ(property(chassis, "ChassisPackageType"), Value::uint16(17));
  EXPECT_EQ(property(chassis, "PackageType"), Value::uint16(16));
  EXPECT_EQ(property(chassis, "Manufacturer"), Value::chars("Northwind"));
  EXPECT_EQ(property(chassis, "Model"), Value::chars("BX-920"));
  EXPECT_EQ(property(chassis, "SerialNumber"), Value::chars("SN-1"));
  EXPECT_EQ(property(chassis, "PartNumber"), Value::chars("PN-1"));
  EXPECT_EQ(property(chassis, "SKU"), Value::chars("Chassis-/Blade Chassis"));
  EXPECT_EQ(property(chassis, "ElementName"), Value::chars("/Blade Chassis"));
  EXPECT_EQ(property(chassis, "Caption"), Value::chars("Blade Chassis"));
  EXPECT_EQ(property(chassis, "Description"), Value::chars("Blade Chassis"));
  EXPECT_EQ(property(chassis, "Status"), Value::chars("OK"));
  const Value& vendor = property(chassis, "VendorCompatibilityStrings");
  EXPECT_EQ(vendor.type, CMPI_stringA);
  EXPECT_THAT(vendor.elements, ElementsAre(Value::string("TVR:/Blade Chassis")));
  EXPECT_EQ(property(chassis, "Name"), Value::chars("Chassis"));
}

TEST_F(ChassisProviderTest, InstancePathEqualsTheEnumeratedPath) {
  harness.useTree(kTwoChassis);
  Response names = harness.enumerateInstanceNames("TVRHX_Chassis");
  Response instances = harness.enumerateInstances("TVRHX_Chassis");
  EXPECT_EQ(names.paths(), instances.paths());
}

TEST_F(ChassisProviderTest, MissingStringPropertiesAreEmptyTexts) {
  Instance chassis = onlyInstance(oneChassis(""));
  EXPECT_EQ(property(chassis, "Manufacturer"), Value::chars(""));
  EXPECT_EQ(property(chassis, "Model"), Value::chars(""));
  EXPECT_EQ(property(chassis, "SerialNumber"), Value::chars(""));
  EXPECT_EQ(property(chassis, "PartNumber"), Value::chars(""));
}

TEST_F(ChassisProviderTest, NodeWithoutNameHasEmptyCaptionAndDescription) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "segment": "Enclosure"}]})");
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Caption"), Value::chars(""));
  EXPECT_EQ(property(r.items[0].instance, "Description"), Value::chars(""));
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("/Enclosure"));
}

TEST_F(ChassisProviderTest, PropertyListNarrowsNothing) {
  harness.useTree(kTwoChassis);
  Response all = harness.enumerateInstances("TVRHX_Chassis");
  Response some = harness.enumerateInstances("TVRHX_Chassis", std::vector<std::string>{"Name", "NoSuchProperty"});
  Response none = harness.enumerateInstances("TVRHX_Chassis", std::vector<std::string>{});
  ASSERT_EQ(all.items.size(), 2u);
  EXPECT_EQ(some.instances(), all.instances());
  EXPECT_EQ(none.instances(), all.instances());
}

TEST_F(ChassisProviderTest, ChassisTypeOneAddsTypeDescriptionFromCaption) {
  Instance chassis = onlyInstance(oneChassis(R"("properties": {"PropChassisType": 1})"));
  EXPECT_EQ(property(chassis, "ChassisTypeDescription"), Value::chars("C"));
  EXPECT_THAT(propertyNames(chassis),
              ElementsAre("Tag", "CreationClassName", "ChassisPackageType", "PackageType", "Manufacturer", "Model",
                          "SerialNumber", "PartNumber", "SKU", "ElementName", "Caption", "ChassisTypeDescription",
                          "Description", "Status", "VendorCompatibilityStrings", "Name"));
}

TEST_F(ChassisProviderTest, OtherChassisTypesHaveNoTypeDescription) {
  for (const char* type : {"0", "2", "17", "65536"}) {
    Instance chassis = onlyInstance(oneChassis(std::string(R"("properties": {"PropChassisType": )") + type + "}"));
    EXPECT_EQ(chassis.property("ChassisTypeDescription"), nullptr) << "chassis type " << type;
  }
}

TEST_F(ChassisProviderTest, TypeDescriptionFollowsThePublishedSixteenBitType) {
  Instance chassis = onlyInstance(oneChassis(R"("properties": {"PropChassisType": 65537})"));
  EXPECT_EQ(property(chassis, "ChassisPackageType"), Value::uint16(1));
  EXPECT_EQ(property(chassis, "ChassisTypeDescription"), Value::chars("C"));
}

TEST_F(ChassisProviderTest, ChassisPackageTypeKeepsTheLow16Bits) {
  Instance chassis = onlyInstance(oneChassis(R"("properties": {"PropChassisType": 65553})"));
  EXPECT_EQ(property(chassis, "ChassisPackageType"), Value::uint16(17));
}

TEST_F(ChassisProviderTest, ExpansionChassisIsBladeExpansionBesideABlade) {
  harness.useTree(kTwoChassis);
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(property(r.items[1].instance, "PackageType"), Value::uint16(17));
}

TEST_F(ChassisProviderTest, ExpansionChassisIsChassisFrameWithoutABlade) {
  harness.useTree(R"({"nodes": [
    {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17, "PropPackageType": 3}},
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18, "PropPackageType": 9}}]})");
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(property(r.items[1].instance, "PackageType"), Value::uint16(3));
}

TEST_F(ChassisProviderTest, BladeFoundAfterTheExpansionChassisCountsToo) {
  harness.useTree(R"({"nodes": [
    {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}},
    {"type": "ChassisNode", "name": "Blade", "properties": {"PropChassisType": 17, "PropPackageType": 16}}]})");
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(property(r.items[0].instance, "PackageType"), Value::uint16(17));
}

TEST_F(ChassisProviderTest, PackageTypeIsReadFromTheNodeForOtherChassisTypes) {
  Instance chassis = onlyInstance(oneChassis(R"("properties": {"PropChassisType": 3, "PropPackageType": 9})"));
  EXPECT_EQ(property(chassis, "PackageType"), Value::uint16(9));
}

TEST_F(ChassisProviderTest, PackageTypeIsZeroWhenTheNodeHasNone) {
  Instance chassis = onlyInstance(oneChassis(R"("properties": {"PropChassisType": 3})"));
  EXPECT_EQ(property(chassis, "PackageType"), Value::uint16(0));
}

TEST_F(ChassisProviderTest, StatusTextFollowsTheNodeStatus) {
  const std::vector<std::pair<int, const char*>> cases = {
      {0, "Unknown"}, {1, "OK"}, {2, "Unknown"}, {19, "Unknown"}, {20, "Pred Fail"}, {21, "Degraded"},
      {22, "Degraded"}, {26, "Degraded"}, {27, "Unknown"}};
  for (const auto& [status, text] : cases) {
    Instance chassis = onlyInstance(oneChassis("\"status\": " + std::to_string(status)));
    EXPECT_EQ(property(chassis, "Status"), Value::chars(text)) << "node status " << status;
  }
}

TEST_F(ChassisProviderTest, MachineWithoutChassisAnswersEmptyAndOk) {
  harness.useTree(R"({"nodes": [{"type": "SlotNode", "name": "Slot 1"}]})");
  Response names = harness.enumerateInstanceNames("TVRHX_Chassis");
  Response instances = harness.enumerateInstances("TVRHX_Chassis");
  for (const Response* r : {&names, &instances}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
  }
}

TEST_F(ChassisProviderTest, ThrowingCursorLeavesTheViewEmpty) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["ChassisNode"]},
                      "nodes": [{"type": "ChassisNode", "name": "Main"}]})");
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_TRUE(r.done());
}

TEST_F(ChassisProviderTest, RefusedTreeFileLeavesTheViewEmpty) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "nmae": "typo"}]})");
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(ChassisProviderTest, GetInstanceFindsTheChassisByTag) {
  harness.useTree(kTwoChassis);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Expansion"}}));
  ASSERT_TRUE(r.ok());
  EXPECT_TRUE(r.done());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Tag"), Value::chars("/Expansion"));
  EXPECT_EQ(property(r.items[0].instance, "Status"), Value::chars("Degraded"));
}

TEST_F(ChassisProviderTest, GetInstanceIgnoresCreationClassName) {
  harness.useTree(kTwoChassis);
  Response r = harness.getInstance(
      pathWithKeys("TVRHX_Chassis", {{"Tag", "/Expansion"}, {"CreationClassName", "Something_Else"}}));
  EXPECT_EQ(r.items.size(), 1u);
}

TEST_F(ChassisProviderTest, GetInstanceOfEveryEnumeratedPathFindsItsInstance) {
  harness.useTree(kTwoChassis);
  Response all = harness.enumerateInstances("TVRHX_Chassis");
  for (const ObjectPath& path : harness.enumerateInstanceNames("TVRHX_Chassis").paths()) {
    Response one = harness.getInstance(path);
    ASSERT_EQ(one.items.size(), 1u) << path.className;
    EXPECT_EQ(one.items[0].path, path);
  }
}

TEST_F(ChassisProviderTest, GetInstanceWithTagDifferingInCaseFindsNothing) {
  harness.useTree(kTwoChassis);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/EXPANSION"}}));
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_FALSE(r.done());
}

TEST_F(ChassisProviderTest, GetInstanceWithoutTagKeyFindsNothingAndSaysTheKeyIsMissing) {
  harness.useTree(kTwoChassis);
  Response r = harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"CreationClassName", "TVRHX_Chassis"}}));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_FALSE(r.done());
}

TEST_F(ChassisProviderTest, EachInstanceSendsTwoBrokerTraces) {
  harness.useTree(kTwoChassis);
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of Chassis ***"));
  for (const broker::TraceLine& t : r.traces) {
    EXPECT_EQ(t.level, 1);
    EXPECT_EQ(t.component, std::optional<std::string>("PhysicalAssetProvider"));
  }
}

TEST_F(ChassisProviderTest, PathListSendsOneBrokerTrace) {
  harness.useTree(kTwoChassis);
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an COPs of Chassis ***"));
}

TEST_F(ChassisProviderTest, PathListRetriesTheSameNodeWhilePathsCannotBeMade) {
  harness.useTree(kTwoChassis);
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 3);
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  EXPECT_EQ(r.items.size(), 2u);
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 5u);
}

TEST_F(ChassisProviderTest, HollowPathsAreRetriedToo) {
  harness.useTree(kTwoChassis);
  harness.om().faults().failNext(Fault::NewObjectPath, 2, FailureShape::Hollow);
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 2u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("/Blade Chassis"));
}

TEST_F(ChassisProviderTest, FailedPathGivesANullInstanceWithoutItsOwnTrace) {
  harness.useTree(oneChassis(""));
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  EXPECT_TRUE(r.ok());
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***"));
}

TEST_F(ChassisProviderTest, FailedInstanceIsReturnedNullAfterItsTrace) {
  harness.useTree(oneChassis(""));
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning an instance of Chassis ***",
                                         "*** Returning an instance of Chassis ***"));
}

TEST_F(ChassisProviderTest, FailedVendorArrayLeavesThatPropertyOut) {
  harness.useTree(oneChassis(""));
  harness.om().faults().failNext(Fault::NewArray, 1);
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].instance.property("VendorCompatibilityStrings"), nullptr);
  EXPECT_EQ(property(r.items[0].instance, "Name"), Value::chars("Chassis"));
}

TEST_F(ChassisProviderTest, GetInstanceWithANullBrokerReturnsANullInstance) {
  harness.useTree(kTwoChassis);
  broker::RequestOptions options;
  options.nullBroker = true;
  Response r = harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Expansion"}}), std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(r.items[0].kind, ResultItem::Kind::NullInstance);
  EXPECT_TRUE(r.done());
  EXPECT_THAT(r.traces, IsEmpty());
  // The real broker is back for the next request.
  EXPECT_EQ(harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Expansion"}})).items[0].kind,
            ResultItem::Kind::Instance);
}

TEST_F(ChassisProviderTest, WriteOperationsAndQueriesAreRefused) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ChassisProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->modifyInstance(mi, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->deleteInstance(mi, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->execQuery(mi, nullptr, nullptr, nullptr, "SELECT * FROM TVRHX_Chassis", "WQL").rc,
            CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mi->ft->createInstance(mi, nullptr, nullptr, nullptr, nullptr).msg, nullptr);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(mi->ft->cleanup(mi, nullptr, 1).rc, CMPI_RC_OK);
}

} // namespace
} // namespace tvr::test
