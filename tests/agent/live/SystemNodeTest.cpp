//===- SystemNodeTest.cpp - The system node from SMBIOS type 1 ------------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

SystemInformation systemWithUuid(std::array<std::uint8_t, 16> uuid) {
  SystemInformation system;
  system.manufacturer = "Korvane";
  system.productName = "Tarvos R2";
  system.uuid = uuid;
  return system;
}

TEST(SystemNode, IsTheRootOfTheTree) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(pathsOf(SystemNode), std::vector<std::string>{"/System"});
}

TEST(SystemNode, UuidIsInTextFormWithLittleEndianFieldsFromSmbios26On) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(SystemNode).at(0).text(PropUUID),
            "4c4c4544-004b-5810-804a-b4c04f4b3231");
}

TEST(SystemNode, UuidFieldsAreBigEndianBeforeSmbios26) {
  RecordedMachine machine;
  const SmbiosTable table =
      SmbiosTable().add(systemWithUuid(rackServerUuid())).add(endOfTable());
  machine.writeSmbios(entryPoint2(2, 5,
                                  static_cast<unsigned>(table.bytes().size()),
                                  table.count()),
                      table.bytes());
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(SystemNode).at(0).text(PropUUID),
            "44454c4c-4b00-1058-804a-b4c04f4b3231");
}

TEST(SystemNode, UuidOfAllZeroBytesIsAbsent) {
  RecordedMachine machine;
  machine.writeSmbios(SmbiosTable().add(systemWithUuid({})).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodesOf(SystemNode).at(0).has(PropUUID));
}

TEST(SystemNode, UuidOfAllOnesIsAbsent) {
  RecordedMachine machine;
  std::array<std::uint8_t, 16> ones;
  ones.fill(0xFF);
  machine.writeSmbios(
      SmbiosTable().add(systemWithUuid(ones)).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodesOf(SystemNode).at(0).has(PropUUID));
}

TEST(SystemNode, NameAndPropertiesComeFromTheSystemStructure) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode system = nodesOf(SystemNode).at(0);

  EXPECT_EQ(system.name(), "Tarvos R2");
  EXPECT_EQ(system.text(PropManufacturer), "Korvane");
  EXPECT_EQ(system.text(PropModel), "Tarvos R2");
  EXPECT_EQ(system.text(PropVersion), "1.0");
  EXPECT_EQ(system.text(PropSerialNumber), "KRV7Q2481");
  EXPECT_EQ(system.text(PropSKU), "TR2-2U-8SFF");
}

TEST(SystemNode, OnlyTheFirstSystemStructureCounts) {
  RecordedMachine machine;
  SystemInformation second = systemWithUuid({});
  second.productName = "Second";
  machine.writeSmbios(SmbiosTable()
                          .add(systemWithUuid(rackServerUuid()))
                          .add(second)
                          .add(endOfTable()));
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> systems = nodesOf(SystemNode);

  ASSERT_EQ(systems.size(), 1u);
  EXPECT_EQ(systems[0].name(), "Tarvos R2");
}

TEST(SystemNode, MachineWithoutSmbiosHasASystemNodeWithoutUuid) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> systems = nodesOf(SystemNode);

  ASSERT_EQ(systems.size(), 1u);
  EXPECT_FALSE(systems[0].has(PropUUID));
  EXPECT_FALSE(systems[0].name().has_value());
}

TEST(SystemNode, UuidComesFromDmiAttributesWithoutTheTable) {
  RecordedMachine machine;
  machine.writeDmiAttribute("product_uuid",
                            "4C4C4544-004B-5810-804A-B4C04F4B3231");
  machine.writeDmiAttribute("product_name", "Tarvos R2");
  HX::useLiveMachine(machine.root());

  const SeenNode system = nodesOf(SystemNode).at(0);

  EXPECT_EQ(system.text(PropUUID), "4c4c4544-004b-5810-804a-b4c04f4b3231");
  EXPECT_EQ(system.name(), "Tarvos R2");
}

TEST(SystemNode, MalformedDmiUuidIsAbsent) {
  RecordedMachine machine;
  machine.writeDmiAttribute("product_uuid", "not-a-uuid");
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodesOf(SystemNode).at(0).has(PropUUID));
}

} // namespace
