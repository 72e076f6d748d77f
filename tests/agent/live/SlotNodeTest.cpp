//===- SlotNodeTest.cpp - Slot nodes from SMBIOS type 9 or sysfs ----------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

SystemSlot slotOfType(unsigned type, unsigned dataBusWidth) {
  SystemSlot slot;
  slot.designation = "Slot";
  slot.slotType = type;
  slot.dataBusWidth = dataBusWidth;
  return slot;
}

/// The ConnectorLayout of a machine with the one slot \p slot.
std::optional<unsigned> layoutOf(const SystemSlot &slot) {
  RecordedMachine machine;
  machine.writeSmbios(SmbiosTable().add(slot).add(endOfTable()));
  HX::useLiveMachine(machine.root());
  return nodesOf(SlotNode).at(0).number(PropType);
}

TEST(SlotNode, NameIsTheDesignationAndNumberTheSlotId) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode slot = nodeNamed(SlotNode, "PCIe Slot 2");

  EXPECT_EQ(slot.number(PropSlotNumber), 2u);
}

TEST(SlotNode, SlotsStandBelowTheMainChassisInTableOrder) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(pathsOf(SlotNode),
            (std::vector<std::string>{"/System/Chassis 1/PCIe Slot 1",
                                      "/System/Chassis 1/PCIe Slot 2",
                                      "/System/Chassis 1/PCIe Slot 3",
                                      "/System/Chassis 1/OCP NIC 3.0 Slot"}));
}

TEST(SlotNode, ConnectorLayoutOfAPcieSlotTypeWithWidthIsThatWidth) {
  EXPECT_EQ(layoutOf(slotOfType(0xA6, 0x08)), 19u); // x1
  EXPECT_EQ(layoutOf(slotOfType(0xAD, 0x09)), 20u); // Gen 2 x2
  EXPECT_EQ(layoutOf(slotOfType(0xB4, 0x0A)), 21u); // Gen 3 x4
  EXPECT_EQ(layoutOf(slotOfType(0xBC, 0x0B)), 22u); // Gen 4 x8
  EXPECT_EQ(layoutOf(slotOfType(0xC3, 0x0D)), 23u); // Gen 5 x16
}

TEST(SlotNode, ConnectorLayoutOfAPcieSlotTypeWithoutWidthFollowsTheBusWidth) {
  EXPECT_EQ(layoutOf(slotOfType(0xB1, 0x0B)), 22u); // Gen 3, x8 bus
  EXPECT_EQ(layoutOf(slotOfType(0xA5, 0x0E)), 24u); // PCIe, x32 bus
  EXPECT_EQ(layoutOf(slotOfType(0x17, 0x0A)), 21u); // M.2 key M, x4 bus
  EXPECT_EQ(layoutOf(slotOfType(0x26, 0x0D)), 23u); // OCP NIC 3.0, x16 bus
}

TEST(SlotNode, ConnectorLayoutOfAPcieSlotWithoutAnyWidthIsPlainPcie) {
  EXPECT_EQ(layoutOf(slotOfType(0xB8, 0x02)), 18u); // Gen 4, bus "Unknown"
  EXPECT_EQ(layoutOf(slotOfType(0xA5, 0x0C)), 18u); // x12: no CIM value
}

TEST(SlotNode, ConnectorLayoutOfPciAndPcixSlots) {
  EXPECT_EQ(layoutOf(slotOfType(0x06, 0x05)), 16u); // PCI
  EXPECT_EQ(layoutOf(slotOfType(0x0E, 0x05)), 16u); // PCI 66 MHz
  EXPECT_EQ(layoutOf(slotOfType(0x12, 0x06)), 17u); // PCI-X
}

TEST(SlotNode, ConnectorLayoutOfOtherBusesIsSlot) {
  EXPECT_EQ(layoutOf(slotOfType(0x03, 0x04)), 7u); // ISA
  EXPECT_EQ(layoutOf(slotOfType(0x0F, 0x05)), 7u); // AGP
  EXPECT_EQ(layoutOf(slotOfType(0x19, 0x05)), 7u); // MXM type II
}

TEST(SlotNode, ConnectorLayoutOfOtherUnknownAndUndefinedTypes) {
  EXPECT_EQ(layoutOf(slotOfType(0x01, 0x01)), 1u); // Other
  EXPECT_EQ(layoutOf(slotOfType(0x02, 0x02)), 0u); // Unknown
  EXPECT_EQ(layoutOf(slotOfType(0x7E, 0x02)), 0u); // not defined
}

TEST(SlotNode, SlotCarriesTheSmbiosCodesAndAddress) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode slot = nodeNamed(SlotNode, "PCIe Slot 1");

  EXPECT_EQ(slot.number(PropSlotType), 0xB6u);
  EXPECT_EQ(slot.number(PropSlotUsage), 0x04u);
  EXPECT_EQ(slot.number(PropMaxLinkWidth), 16u);
  EXPECT_EQ(slot.text(PropPCIAddress), "0000:3b:00.0");
}

TEST(SlotNode, SlotWithoutBusAddressHasNoPciAddress) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodeNamed(SlotNode, "PCIe Slot 2").has(PropPCIAddress));
}

TEST(SlotNode, SlotsWithTheSameDesignationGetDistinctNamesAndPaths) {
  RecordedMachine machine;
  SystemSlot slot;
  slot.designation = "PCIe Slot";
  machine.writeSmbios(
      SmbiosTable().add(slot).add(slot).add(slot).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(SlotNode),
            (std::vector<std::optional<std::string>>{
                "PCIe Slot", "PCIe Slot (2)", "PCIe Slot (3)"}));
  EXPECT_EQ(pathsOf(SlotNode),
            (std::vector<std::string>{"/System/Chassis 1/PCIe Slot",
                                      "/System/Chassis 1/PCIe Slot (2)",
                                      "/System/Chassis 1/PCIe Slot (3)"}));
}

TEST(SlotNode, RenamedDuplicateDoesNotTakeTheNameOfALaterSlot) {
  RecordedMachine machine;
  SystemSlot plain, numbered;
  plain.designation = "Riser";
  numbered.designation = "Riser (2)";
  machine.writeSmbios(
      SmbiosTable().add(plain).add(plain).add(numbered).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(SlotNode), (std::vector<std::optional<std::string>>{
                                   "Riser", "Riser (3)", "Riser (2)"}));
}

TEST(SlotNode, SlotWithoutDesignationHasNoNameButAPathOfItsOwn) {
  RecordedMachine machine;
  SystemSlot unnamed;
  unnamed.designation = "To Be Filled By O.E.M.";
  machine.writeSmbios(
      SmbiosTable().add(unnamed).add(unnamed).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> slots = nodesOf(SlotNode);

  ASSERT_EQ(slots.size(), 2u);
  EXPECT_FALSE(slots[0].name().has_value());
  EXPECT_EQ(slots[0].path, "/System/Chassis 1/SlotNode#0");
  EXPECT_EQ(slots[1].path, "/System/Chassis 1/SlotNode#1");
}

TEST(SlotNode, KernelSlotsStandInWhenTheTableListsNone) {
  RecordedMachine machine;
  machine.writeSmbios(
      SmbiosTable().add(ChassisInformation()).add(endOfTable()));
  machine.pciSlot("10", "0000:af:00", "16.0 GT/s PCIe");
  machine.pciSlot("2", "0000:3b:00", "8.0 GT/s PCIe");
  machine.pciSlot("1-1", "0000:5e:00", "Unknown");
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> slots = nodesOf(SlotNode);

  ASSERT_EQ(slots.size(), 3u);
  EXPECT_EQ(slots[0].path, "/System/Chassis 1/Slot 2");
  EXPECT_EQ(slots[0].number(PropSlotNumber), 2u);
  EXPECT_EQ(slots[0].number(PropType), 18u);
  EXPECT_EQ(slots[0].text(PropPCIAddress), "0000:3b:00");
  EXPECT_EQ(slots[1].name(), "Slot 10");
  EXPECT_EQ(slots[2].name(), "Slot 1-1");
  EXPECT_FALSE(slots[2].has(PropSlotNumber));
  EXPECT_EQ(slots[2].number(PropType), 0u);
}

TEST(SlotNode, KernelSlotsStandInOnAMachineWithoutSmbios) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  machine.pciSlot("3", "0000:00:03", "");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(pathsOf(SlotNode),
            std::vector<std::string>{"/System/Chassis 1/Slot 3"});
}

TEST(SlotNode, KernelSlotsAreLeftAloneWhenTheTableListsSlots) {
  RecordedMachine machine;
  recordRackServer(machine); // the kernel knows slot "1" as well
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(SlotNode).size(), 4u);
}

TEST(SlotNode, MachineWithoutAnySlotHasNoSlotNodes) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  HX::Instrumentation cursor;
  cursor.selectNode(SlotNode);

  EXPECT_FALSE(cursor);
}

} // namespace
