// TVRHX_ComputerSystem from the companion providers, through the embedded
// object manager: this machine as one computer system, named as every path
// of the physical-asset providers names it.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;
using broker::Fault;
using broker::RequestOptions;

const char* const kSystemWithUuid = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System", "description": "Two-socket blade server",
             "properties": {"PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132"}}]})";

const char* const kSystemWithoutUuid = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System"}]})";

ObjectPath systemPath(const std::string& creationClass, const std::string& name) {
  return pathWithKeys("TVRHX_ComputerSystem", {{"CreationClassName", creationClass}, {"Name", name}});
}

class ComputerSystemProviderTest : public ::testing::Test {
protected:
  Instance onlyInstance(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_ComputerSystem");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

TEST_F(ComputerSystemProviderTest, EnumerateInstanceNamesGivesOneSystemNamedAsTheProvidersPaths) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.enumerateInstanceNames("TVRHX_ComputerSystem");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  EXPECT_EQ(path.className, "TVRHX_ComputerSystem");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "CreationClassName");
  EXPECT_EQ(path.keys[0].value, Value::chars("TVRHX_ComputerSystem"));
  EXPECT_EQ(path.keys[1].name, "Name");
  EXPECT_EQ(path.keys[1].value, Value::chars("host.example.com"));
}

TEST_F(ComputerSystemProviderTest, InstanceCarriesWhatIdentifiesTheSystem) {
  const Instance system = onlyInstance(kSystemWithUuid);
  EXPECT_THAT(propertyNames(system),
              ElementsAre("CreationClassName", "Name", "ElementName", "NameFormat", "Description", "Dedicated",
                          "EnabledState", "OtherIdentifyingInfo", "IdentifyingDescriptions"));
  EXPECT_EQ(property(system, "ElementName"), Value::chars("host.example.com"));
  EXPECT_EQ(property(system, "NameFormat"), Value::chars("IP"));
  EXPECT_EQ(property(system, "Description"), Value::chars("Two-socket blade server"));
  EXPECT_EQ(property(system, "Dedicated"), Value::array(CMPI_uint16, {Value::uint16(0)}));
  EXPECT_EQ(property(system, "EnabledState"), Value::uint16(2));
}

TEST_F(ComputerSystemProviderTest, UuidIsTheSystemsGuid) {
  const Instance system = onlyInstance(kSystemWithUuid);
  EXPECT_EQ(property(system, "OtherIdentifyingInfo"),
            Value::array(CMPI_string, {Value::string("4c4c4544-0042-3510-8051-b7c04f4e3132")}));
  EXPECT_EQ(property(system, "IdentifyingDescriptions"), Value::array(CMPI_string, {Value::string("CIM:GUID")}));
}

TEST_F(ComputerSystemProviderTest, SystemWithoutUuidOrDescriptionLeavesThemOut) {
  const Instance system = onlyInstance(kSystemWithoutUuid);
  EXPECT_THAT(propertyNames(system),
              ElementsAre("CreationClassName", "Name", "ElementName", "NameFormat", "Dedicated", "EnabledState"));
}

TEST_F(ComputerSystemProviderTest, HardwareWithoutSystemNodeHasNoComputerSystem) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Main"}]})");
  for (const Response& r :
       {harness.enumerateInstanceNames("TVRHX_ComputerSystem"), harness.enumerateInstances("TVRHX_ComputerSystem")}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(ComputerSystemProviderTest, GetInstanceFindsTheSystemWhateverTheCaseOfItsKeys) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.getInstance(systemPath("tvrhx_computersystem", "HOST.example.com"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "Name"), Value::chars("host.example.com"));
}

TEST_F(ComputerSystemProviderTest, GetInstanceOfAnotherSystemIsNotFound) {
  harness.useTree(kSystemWithUuid);
  for (const ObjectPath& path : {systemPath("TVRHX_ComputerSystem", "other.example.com"),
                                 systemPath("CIM_ComputerSystem", "host.example.com"),
                                 pathWithKeys("TVRHX_ComputerSystem", {{"Name", "host.example.com"}})}) {
    Response r = harness.getInstance(path);
    EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
    EXPECT_THAT(r.items, IsEmpty());
  }
}

TEST_F(ComputerSystemProviderTest, PropertyListNarrowsTheInstanceToItAndTheKeys) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.enumerateInstances("TVRHX_ComputerSystem", std::vector<std::string>{"ElementName"});
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_THAT(propertyNames(r.items[0].instance), ElementsAre("CreationClassName", "Name", "ElementName"));
}

TEST_F(ComputerSystemProviderTest, UnreadableHardwareFailsTheRequestAndIsLogged) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["SystemNode"]},
                      "nodes": [{"type": "SystemNode", "name": "System"}]})");
  LoggerCapture capture;
  Response r = harness.enumerateInstances("TVRHX_ComputerSystem");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  ASSERT_TRUE(r.message.has_value());
  EXPECT_THAT(*r.message, StartsWith("cannot read the hardware: "));
  EXPECT_FALSE(r.exception.has_value());
  EXPECT_EQ(r.doneCount, 0);
  bool logged = false;
  for (const LoggedLine& line : capture.lines())
    logged = logged || (line.category == "TVR.CompanionProviders" && line.level == 6000 &&
                        line.text.rfind("CompanionComputerSystemProvider: cannot read the hardware: ", 0) == 0);
  EXPECT_TRUE(logged);
}

TEST_F(ComputerSystemProviderTest, BrokerThatCannotMakeAPathFailsTheRequest) {
  harness.useTree(kSystemWithUuid);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames("TVRHX_ComputerSystem");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("cannot build the computer system"));
  EXPECT_THAT(r.items, IsEmpty());
}

TEST_F(ComputerSystemProviderTest, WithoutBrokerTheRequestFailsWithoutMessage) {
  harness.useTree(kSystemWithUuid);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstances("TVRHX_ComputerSystem", std::nullopt, options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
}

} // namespace
} // namespace tvr::test
