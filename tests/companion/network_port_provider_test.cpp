// TVRHX_NetworkPort from the companion providers, through the embedded
// object manager: the port each network card realises, named by its card.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;
using broker::Fault;

const char* const kTwoCards = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main", "children": [
    {"type": "NetworkCardNode", "name": "eth0", "description": "10GbE Adapter",
     "properties": {"PropAdapterStatus": 1, "PropInterfaceName": "ens1f0",
                    "PropPermanentAddress": "3c:fd:fe:a0:11:20", "PropSpeed": 1000000000,
                    "PropMaxSpeed": 4000000000, "PropLinkTechnology": 2}},
    {"type": "NetworkCardNode", "name": "eth1"}]}]})";

std::string cardWith(const std::string& properties) {
  return R"({"systemName": "host.example.com", "nodes": [{"type": "NetworkCardNode", "name": "eth0",
             "properties": {)" +
         properties + "}}]}";
}

ObjectPath portPath(const std::string& deviceID, const std::string& systemName = "host.example.com") {
  return pathWithKeys("TVRHX_NetworkPort", {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
                                            {"SystemName", systemName},
                                            {"CreationClassName", "TVRHX_NetworkPort"},
                                            {"DeviceID", deviceID}});
}

class NetworkPortProviderTest : public ::testing::Test {
protected:
  Instance onlyPort(const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances("TVRHX_NetworkPort");
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }

  ProviderHarness harness;
};

TEST_F(NetworkPortProviderTest, EnumerateInstanceNamesGivesOnePortPerCardWithItsKeysInOrder) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkPort");
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  const ObjectPath& first = r.items[0].path;
  EXPECT_EQ(first.nameSpace, "root/cimv2");
  EXPECT_EQ(first.host, "host.example.com");
  EXPECT_EQ(first.className, "TVRHX_NetworkPort");
  ASSERT_EQ(first.keys.size(), 4u);
  EXPECT_EQ(first.keys[0], (broker::Binding{"SystemCreationClassName", Value::chars("TVRHX_ComputerSystem")}));
  EXPECT_EQ(first.keys[1], (broker::Binding{"SystemName", Value::chars("host.example.com")}));
  EXPECT_EQ(first.keys[2], (broker::Binding{"CreationClassName", Value::chars("TVRHX_NetworkPort")}));
  EXPECT_EQ(first.keys[3], (broker::Binding{"DeviceID", Value::chars("eth0")}));
  EXPECT_EQ(*r.items[1].path.key("DeviceID"), Value::chars("eth1"));
}

TEST_F(NetworkPortProviderTest, EachPortsDeviceIdIsItsCardsTag) {
  harness.useTree(kTwoCards);
  std::vector<std::string> deviceIDs;
  for (const ObjectPath& port : harness.enumerateInstanceNames("TVRHX_NetworkPort").paths())
    deviceIDs.push_back(port.key("DeviceID")->text);
  std::vector<std::string> tags;
  for (const ObjectPath& card : harness.enumerateInstanceNames("TVRHX_NetworkCard").paths())
    tags.push_back(card.key("Tag")->text);
  EXPECT_EQ(deviceIDs, tags);
}

TEST_F(NetworkPortProviderTest, InstanceCarriesWhatTheCardNodeTellsOfItsPort) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstances("TVRHX_NetworkPort");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& port = r.items[0].instance;
  EXPECT_THAT(propertyNames(port),
              ElementsAre("SystemCreationClassName", "SystemName", "CreationClassName", "DeviceID", "ElementName",
                          "Description", "PermanentAddress", "Speed", "MaxSpeed", "LinkTechnology", "EnabledState"));
  EXPECT_EQ(property(port, "ElementName"), Value::chars("ens1f0"));
  EXPECT_EQ(property(port, "Description"), Value::chars("10GbE Adapter"));
  EXPECT_EQ(property(port, "PermanentAddress"), Value::chars("3CFDFEA01120"));
  EXPECT_EQ(property(port, "Speed"), Value::uint64(1000000000));
  EXPECT_EQ(property(port, "MaxSpeed"), Value::uint64(4000000000));
  EXPECT_EQ(property(port, "LinkTechnology"), Value::uint16(2));
  EXPECT_EQ(property(port, "EnabledState"), Value::uint16(2));
}

TEST_F(NetworkPortProviderTest, CardThatTellsNothingGivesThePortItsNameAndAnUnknownState) {
  harness.useTree(kTwoCards);
  Response r = harness.enumerateInstances("TVRHX_NetworkPort");
  ASSERT_EQ(r.items.size(), 2u);
  const Instance& port = r.items[1].instance;
  EXPECT_THAT(propertyNames(port), ElementsAre("SystemCreationClassName", "SystemName", "CreationClassName",
                                               "DeviceID", "ElementName", "EnabledState"));
  EXPECT_EQ(property(port, "ElementName"), Value::chars("eth1"));
  EXPECT_EQ(property(port, "EnabledState"), Value::uint16(0));
}

TEST_F(NetworkPortProviderTest, PermanentAddressIsWrittenAsTwelveUpperCaseDigits) {
  for (const char* address : {"3c:fd:fe:a0:11:20", "3C-FD-FE-A0-11-20", "3cfdfea01120"}) {
    const Instance port = onlyPort(cardWith(std::string(R"("PropPermanentAddress": ")") + address + "\""));
    EXPECT_EQ(property(port, "PermanentAddress"), Value::chars("3CFDFEA01120")) << address;
  }
}

TEST_F(NetworkPortProviderTest, AddressThatIsNoMacIsLeftOut) {
  for (const char* address : {"", "3c:fd:fe:a0:11", "3c:fd-fe:a0:11:20", "3c:fd:fe:a0:11:2g", "00-1b-21-ff-ff-8e-9f-b0"}) {
    const Instance port = onlyPort(cardWith(std::string(R"("PropPermanentAddress": ")") + address + "\""));
    EXPECT_EQ(port.property("PermanentAddress"), nullptr) << address;
  }
}

TEST_F(NetworkPortProviderTest, EnabledStateFollowsTheAdapterStatus) {
  const std::vector<std::pair<int, int>> statusToState = {{1, 2}, {12, 2}, {16, 3}, {0, 0}, {7, 0}};
  for (const auto& [adapterStatus, enabledState] : statusToState) {
    const Instance port = onlyPort(cardWith(R"("PropAdapterStatus": )" + std::to_string(adapterStatus)));
    EXPECT_EQ(property(port, "EnabledState"), Value::uint16(static_cast<std::uint16_t>(enabledState)))
        << "adapter status " << adapterStatus;
  }
}

TEST_F(NetworkPortProviderTest, EnabledStateOfTheNodeWinsOverTheAdapterStatus) {
  const Instance port = onlyPort(cardWith(R"("PropAdapterStatus": 1, "PropEnabledState": 6)"));
  EXPECT_EQ(property(port, "EnabledState"), Value::uint16(6));
}

TEST_F(NetworkPortProviderTest, CardWithoutNameRealisesNoPort) {
  harness.useTree(R"({"nodes": [{"type": "NetworkCardNode"}, {"type": "NetworkCardNode", "name": "eth1"}]})");
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkPort");
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(*r.items[0].path.key("DeviceID"), Value::chars("eth1"));
}

TEST_F(NetworkPortProviderTest, MachineWithoutCardsHasNoPorts) {
  harness.useTree(R"({"nodes": [{"type": "SystemNode", "name": "System"}]})");
  for (const Response& r :
       {harness.enumerateInstanceNames("TVRHX_NetworkPort"), harness.enumerateInstances("TVRHX_NetworkPort")}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
  }
}

TEST_F(NetworkPortProviderTest, GetInstanceFindsThePortByItsKeys) {
  harness.useTree(kTwoCards);
  Response r = harness.getInstance(portPath("eth1", "HOST.EXAMPLE.COM"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(property(r.items[0].instance, "DeviceID"), Value::chars("eth1"));
}

TEST_F(NetworkPortProviderTest, GetInstanceComparesTheDeviceIdExactly) {
  harness.useTree(kTwoCards);
  for (const ObjectPath& path : {portPath("ETH1"), portPath("eth9"), portPath("eth1", "other.example.com")}) {
    Response r = harness.getInstance(path);
    EXPECT_EQ(r.rc, CMPI_RC_ERR_NOT_FOUND);
    EXPECT_THAT(r.items, IsEmpty());
  }
}

TEST_F(NetworkPortProviderTest, UnreadableHardwareFailsTheRequest) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["NetworkCardNode"]},
                      "nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  Response r = harness.enumerateInstanceNames("TVRHX_NetworkPort");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  ASSERT_TRUE(r.message.has_value());
  EXPECT_THAT(*r.message, StartsWith("cannot read the hardware: "));
  EXPECT_FALSE(r.exception.has_value());
}

TEST_F(NetworkPortProviderTest, BrokerThatCannotMakeAnInstanceFailsTheRequest) {
  harness.useTree(kTwoCards);
  harness.om().faults().failNext(Fault::NewInstance, 1);
  Response r = harness.enumerateInstances("TVRHX_NetworkPort");
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("cannot build a network port"));
  EXPECT_THAT(r.items, IsEmpty());
}

} // namespace
} // namespace tvr::test
