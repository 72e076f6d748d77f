//===- NetworkCardNodeTest.cpp - Network cards from PCI class 02 ----------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

/// A machine with one Ethernet function at 0000:01:00.0 and the recorded
/// machines' PCI ID database.
void recordOneCard(RecordedMachine &machine, unsigned vendor = 0x8086,
                   unsigned device = 0x1572) {
  machine.pciFunction("0000:01:00.0", 0x020000, vendor, device, vendor, 0x0001);
  machine.writePciIds(RecordedPciIds);
}

InterfaceFiles interface(bool up, bool carrier) {
  InterfaceFiles files;
  files.up = up;
  files.carrier = carrier;
  return files;
}

class RackServerCards : public ::testing::Test {
protected:
  void SetUp() override {
    recordRackServer(Machine);
    HX::useLiveMachine(Machine.root());
  }
  RecordedMachine Machine;
};

TEST_F(RackServerCards, CardsStandBelowTheMainChassisInAddressOrder) {
  EXPECT_EQ(pathsOf(NetworkCardNode),
            (std::vector<std::string>{"/System/Chassis 1/0000:3b:00.0",
                                      "/System/Chassis 1/0000:3b:00.1",
                                      "/System/Chassis 1/0000:5e:00.0",
                                      "/System/Chassis 1/0000:5e:00.1"}));
}

TEST_F(RackServerCards, NameIsTheInterfaceTheCardCarries) {
  EXPECT_EQ(namesOf(NetworkCardNode), (std::vector<std::optional<std::string>>{
                                          "ens1f0", "ens1f1", "eno1", "eno2"}));
}

TEST_F(RackServerCards, AdapterSerialIsTheVpdSerialNumber) {
  EXPECT_EQ(nodeNamed(NetworkCardNode, "ens1f0").text(PropAdapterSerial),
            "MYX7Q20931");
}

TEST_F(RackServerCards, AdapterSerialIsTheDeviceSerialNumberWithoutVpd) {
  EXPECT_EQ(nodeNamed(NetworkCardNode, "eno1").text(PropAdapterSerial),
            "00-1b-21-ff-ff-8e-9f-b0");
}

TEST_F(RackServerCards, AdapterStatusIsOneWhenUpWithALink) {
  EXPECT_EQ(nodeNamed(NetworkCardNode, "ens1f0").number(PropAdapterStatus), 1u);
}

TEST_F(RackServerCards, AdapterStatusIsTwelveWhenUpWithoutALink) {
  EXPECT_EQ(nodeNamed(NetworkCardNode, "ens1f1").number(PropAdapterStatus),
            12u);
}

TEST_F(RackServerCards, AdapterStatusIsSixteenWhenAdministrativelyDown) {
  EXPECT_EQ(nodeNamed(NetworkCardNode, "eno2").number(PropAdapterStatus), 16u);
}

TEST_F(RackServerCards, DescriptionIsVendorAndDeviceNamesAndStatusIsOk) {
  const SeenNode card = nodeNamed(NetworkCardNode, "eno1");

  EXPECT_EQ(card.description, "Broadcom Inc. and subsidiaries BCM57416 "
                              "NetXtreme-E Dual-Media 10G RDMA Ethernet "
                              "Controller");
  EXPECT_EQ(card.status, 1u);
}

TEST_F(RackServerCards, CardCarriesItsIdsNamesAddressAndDriver) {
  const SeenNode card = nodeNamed(NetworkCardNode, "ens1f1");

  EXPECT_EQ(card.text(PropManufacturer), "Intel Corporation");
  EXPECT_EQ(card.text(PropModel), "Ethernet Controller X710 for 10GbE SFP+");
  EXPECT_EQ(card.text(PropPCIAddress), "0000:3b:00.1");
  EXPECT_EQ(card.number(PropVendorID), 0x8086u);
  EXPECT_EQ(card.number(PropDeviceID), 0x1572u);
  EXPECT_EQ(card.number(PropSubsystemVendorID), 0x8086u);
  EXPECT_EQ(card.number(PropSubsystemID), 0x0007u);
  EXPECT_EQ(card.text(PropDriver), "i40e");
  EXPECT_EQ(card.text(PropInterfaceName), "ens1f1");
  EXPECT_EQ(card.text(PropPermanentAddress), "3c:fd:fe:9e:11:a1");
}

TEST(NetworkCardNode, EveryFunctionOfClass02IsACardWhateverItsSubclass) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(NetworkCardNode),
            (std::vector<std::optional<std::string>>{"wlp2s0", "enp3s0"}));
}

TEST(NetworkCardNode, NameIsTheFirstInterfaceInNameOrder) {
  RecordedMachine machine;
  recordOneCard(machine);
  machine.netInterface("0000:01:00.0", "enp1s0d1");
  machine.netInterface("0000:01:00.0", "enp1s0");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(NetworkCardNode),
            std::vector<std::optional<std::string>>{"enp1s0"});
}

TEST(NetworkCardNode, CardWithoutInterfaceIsNamedByItsPciAddress) {
  RecordedMachine machine;
  recordOneCard(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode card = nodesOf(NetworkCardNode).at(0);

  EXPECT_EQ(card.name(), "0000:01:00.0");
  EXPECT_FALSE(card.has(PropAdapterStatus));
  EXPECT_FALSE(card.has(PropInterfaceName));
}

TEST(NetworkCardNode, InterfaceBelowAVirtioDeviceBelongsToItsFunction) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> cards = nodesOf(NetworkCardNode);

  ASSERT_EQ(cards.size(), 1u);
  EXPECT_EQ(cards[0].name(), "eth0");
  EXPECT_EQ(cards[0].path, "/System/Chassis 1/0000:00:03.0");
}

TEST(NetworkCardNode, AnyInterfaceUpWithALinkMakesTheCardUpWithALink) {
  RecordedMachine machine;
  recordOneCard(machine);
  machine.netInterface("0000:01:00.0", "a0", interface(false, false));
  machine.netInterface("0000:01:00.0", "a1", interface(true, false));
  machine.netInterface("0000:01:00.0", "a2", interface(true, true));
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).number(PropAdapterStatus), 1u);
}

TEST(NetworkCardNode, AdapterSerialFallsBackToThePermanentAddress) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode card = nodeNamed(NetworkCardNode, "enp3s0");

  EXPECT_EQ(card.text(PropAdapterSerial), "98:28:a6:00:11:22");
  EXPECT_EQ(card.text(PropPermanentAddress), "98:28:a6:00:11:22");
}

TEST(NetworkCardNode, AddressSetByTheAdministratorIsNoSerial) {
  RecordedMachine machine;
  recordOneCard(machine);
  InterfaceFiles files;
  files.address = "02:00:00:00:00:01";
  files.addressAssignType = 3;
  machine.netInterface("0000:01:00.0", "bond-slave", files);
  HX::useLiveMachine(machine.root());

  const SeenNode card = nodesOf(NetworkCardNode).at(0);

  EXPECT_FALSE(card.has(PropAdapterSerial));
  EXPECT_FALSE(card.has(PropPermanentAddress));
}

TEST(NetworkCardNode, VpdSerialPlaceholderGivesWayToTheAddress) {
  RecordedMachine machine;
  recordOneCard(machine);
  machine.writeVpd("0000:01:00.0", std::string("\x90\x10\x00", 3) + "SN\x0d" +
                                       "Not Specified" +
                                       std::string("\x78", 1));
  machine.netInterface("0000:01:00.0", "eth0");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).text(PropAdapterSerial),
            "52:54:00:12:34:56");
}

TEST(NetworkCardNode, IdsMissingFromTheDatabaseAreNamedByNumber) {
  RecordedMachine machine;
  recordOneCard(machine, 0x1d0f, 0xec20);
  HX::useLiveMachine(machine.root());

  const SeenNode card = nodesOf(NetworkCardNode).at(0);

  EXPECT_EQ(card.description, "Vendor 1d0f Device ec20");
  EXPECT_EQ(card.text(PropManufacturer), "Vendor 1d0f");
  EXPECT_EQ(card.text(PropModel), "Device ec20");
}

TEST(NetworkCardNode, DeviceMissingFromTheDatabaseOfAKnownVendor) {
  RecordedMachine machine;
  recordOneCard(machine, 0x8086, 0xfffe);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).description,
            "Intel Corporation Device fffe");
}

TEST(NetworkCardNode, VirtualFunctionsAreNoCards) {
  RecordedMachine machine;
  recordOneCard(machine);
  machine.pciFunction("0000:01:02.0", 0x020000, 0x8086, 0x154c, 0x8086, 0x0000);
  machine.makeVirtualFunction("0000:01:02.0", "0000:01:00.0");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(pathsOf(NetworkCardNode),
            std::vector<std::string>{"/System/Chassis 1/0000:01:00.0"});
}

TEST(NetworkCardNode, FunctionsOfOtherClassesAreNoCards) {
  RecordedMachine machine;
  machine.pciFunction("0000:00:14.0", 0x0c0330, 0x8086, 0xa36d, 0x8086, 0x0000);
  machine.pciFunction("0000:00:1f.2", 0x010601, 0x8086, 0xa182, 0x8086, 0x0000);
  // A USB network adapter sits below the USB controller, not below a card.
  machine.netInterface(
      "0000:00:14.0", "enx001122334455",
      {true, true, "00:11:22:33:44:55", 0, "usb1/1-1/1-1:1.0"});
  HX::useLiveMachine(machine.root());

  EXPECT_TRUE(nodesOf(NetworkCardNode).empty());
}

} // namespace
