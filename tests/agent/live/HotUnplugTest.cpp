//===- HotUnplugTest.cpp - Devices that vanish between listing and reading ===//
//
// A listed entry whose files are gone is exactly what the reader meets when a
// device is removed between the listing and the reading; a dangling link or a
// missing attribute in a recorded tree stands for it.
//
//===----------------------------------------------------------------------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

class HotUnplug : public ::testing::Test {
protected:
  void SetUp() override { recordRackServer(Machine); }

  /// Selects \p type a few times, as providers do, and returns the last
  /// reading's nodes.
  std::vector<SeenNode> selectedRepeatedly(NodeType type) {
    HX::useLiveMachine(Machine.root());
    for (int i = 0; i < 3; ++i)
      nodesOf(type);
    return nodesOf(type);
  }

  RecordedMachine Machine;
  LoggedProblems Problems;
};

TEST_F(HotUnplug, FunctionGoneBeforeItsClassIsReadIsLeftOutAndLoggedOnce) {
  Machine.makeLink("/sys/bus/pci/devices/0000:3b:00.2",
                   "../../../devices/pci0000:3b/0000:3b:00.2");

  const std::vector<SeenNode> cards = selectedRepeatedly(NetworkCardNode);

  EXPECT_EQ(cards.size(), 4u);
  EXPECT_EQ(Problems.texts(),
            std::vector<std::string>{
                Machine.path("/sys/bus/pci/devices/0000:3b:00.2/class") +
                ": cannot read: No such file or directory"});
  EXPECT_EQ(Problems.levels(), std::vector<int>{6000});
}

TEST_F(HotUnplug, CardWhoseIdsVanishIsBuiltFromWhatWasRead) {
  Machine.remove(Machine.devicePath("0000:3b:00.1") + "/vendor");
  Machine.remove(Machine.devicePath("0000:3b:00.1") + "/device");

  const std::vector<SeenNode> cards = selectedRepeatedly(NetworkCardNode);

  ASSERT_EQ(cards.size(), 4u);
  EXPECT_EQ(cards[1].name(), "ens1f1");
  EXPECT_FALSE(cards[1].has(PropManufacturer));
  EXPECT_FALSE(cards[1].has(PropVendorID));
  EXPECT_EQ(cards[1].number(PropSubsystemVendorID), 0x8086u);
  EXPECT_EQ(cards[1].description, "");
  EXPECT_EQ(Problems.mentioning("0000:3b:00.1/vendor: cannot read"), 1);
  EXPECT_EQ(Problems.mentioning("0000:3b:00.1/device: cannot read"), 1);
}

TEST_F(HotUnplug, InterfaceGoneBeforeItIsReadLeavesTheCardNamedByAddress) {
  Machine.remove(Machine.devicePath("0000:5e:00.0") + "/net/eno1");

  const std::vector<SeenNode> cards = selectedRepeatedly(NetworkCardNode);

  ASSERT_EQ(cards.size(), 4u);
  EXPECT_EQ(cards[2].name(), "0000:5e:00.0");
  EXPECT_FALSE(cards[2].has(PropAdapterStatus));
  EXPECT_EQ(cards[2].text(PropAdapterSerial), "00-1b-21-ff-ff-8e-9f-b0");
  EXPECT_EQ(Problems.texts(), std::vector<std::string>{
                                  Machine.path("/sys/class/net/eno1/flags") +
                                  ": cannot read: No such file or directory"});
}

TEST_F(HotUnplug, ControllerGoneBeforeItsClassIsReadIsLeftOut) {
  Machine.remove(Machine.devicePath("0000:18:00.0"));

  const std::vector<SeenNode> controllers =
      selectedRepeatedly(StorageControllerNode);

  EXPECT_EQ(namesOf(StorageControllerNode),
            (std::vector<std::optional<std::string>>{"0000:00:1f.2",
                                                     "0000:d8:00.0"}));
  EXPECT_EQ(Problems.mentioning("0000:18:00.0/class: cannot read"), 1);
}

TEST_F(HotUnplug, DiskWhoseEntryIsNoLinkIsNotCounted) {
  Machine.remove("/sys/block/sda");
  Machine.writeFile("/sys/block/sda", "");

  selectedRepeatedly(StorageControllerNode);

  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:18:00.0")
                .number(PropNumControlled),
            3u);
  EXPECT_TRUE(Problems.texts().empty());
}

TEST_F(HotUnplug, KernelSlotGoneWhileReadKeepsItsNameAndIsLogged) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  machine.makeDirectory("/sys/bus/pci/slots/7");
  HX::useLiveMachine(machine.root());

  for (int i = 0; i < 3; ++i)
    nodesOf(SlotNode);

  EXPECT_EQ(namesOf(SlotNode),
            std::vector<std::optional<std::string>>{"Slot 7"});
  EXPECT_EQ(Problems.texts(), std::vector<std::string>{
                                  machine.path("/sys/bus/pci/slots/7/address") +
                                  ": cannot read: No such file or directory"});
}

TEST_F(HotUnplug, ReplugIntoTheSameAddressIsReadAnew) {
  HX::useLiveMachine(Machine.root());
  ASSERT_EQ(nodeNamed(NetworkCardNode, "eno1").text(PropModel),
            "BCM57416 NetXtreme-E Dual-Media 10G RDMA Ethernet Controller");

  // Another card goes in: new ids behind a new entry for the same address.
  Machine.pciFunction("0000:5e:00.0", 0x020000, 0x8086, 0x1572, 0x8086, 0x0007);

  EXPECT_EQ(nodeNamed(NetworkCardNode, "eno1").text(PropModel),
            "Ethernet Controller X710 for 10GbE SFP+");
}

} // namespace
