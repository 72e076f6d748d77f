//===- ChassisNodeTest.cpp - Chassis nodes from SMBIOS type 3 -------------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

ChassisInformation chassisOfType(unsigned type) {
  ChassisInformation chassis;
  chassis.type = type;
  return chassis;
}

/// A machine whose table holds just \p chassis.
void recordChassis(RecordedMachine &machine,
                   std::initializer_list<ChassisInformation> chassis) {
  SmbiosTable table;
  for (const ChassisInformation &each : chassis)
    table.add(each);
  machine.writeSmbios(table.add(endOfTable()));
}

TEST(ChassisNode, EveryChassisStructureIsANodeInTableOrder) {
  RecordedMachine machine;
  recordBlade(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(
      pathsOf(ChassisNode),
      (std::vector<std::string>{"/System/Chassis 1", "/System/Chassis 2"}));
}

TEST(ChassisNode, ChassisTypeIsTheSmbiosTypeWithTheLockBitMasked) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(0x80 | 0x17)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 0x17u);
}

TEST(ChassisNode, PackageTypeOfAMainServerChassisIsBlade) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(17)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropPackageType), 16u);
}

TEST(ChassisNode, PackageTypeOfAnExpansionChassisIsBladeExpansion) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(18)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropPackageType), 17u);
}

TEST(ChassisNode, PackageTypeOfABladeIsBlade) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(28)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropPackageType), 16u);
}

TEST(ChassisNode, PackageTypeOfOtherEnclosuresIsChassisFrame) {
  for (unsigned type : {1u, 2u, 3u, 7u, 10u, 23u, 29u, 36u, 99u}) {
    RecordedMachine machine;
    recordChassis(machine, {chassisOfType(type)});
    HX::useLiveMachine(machine.root());

    EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropPackageType), 3u)
        << "chassis type " << type;
  }
}

TEST(ChassisNode, NameIsTheChassisTypeName) {
  RecordedMachine machine;
  recordBlade(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(ChassisNode),
            (std::vector<std::optional<std::string>>{"Main Server Chassis",
                                                     "Expansion Chassis"}));
}

TEST(ChassisNode, ChassisOfAnUndefinedTypeHasNoName) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(0x55)});
  HX::useLiveMachine(machine.root());

  const SeenNode chassis = nodesOf(ChassisNode).at(0);

  EXPECT_FALSE(chassis.name().has_value());
  EXPECT_EQ(chassis.number(PropChassisType), 0x55u);
}

TEST(ChassisNode, ChassisOfTheSameTypeGetDistinctNames) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(23), chassisOfType(23)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(ChassisNode),
            (std::vector<std::optional<std::string>>{
                "Rack Mount Chassis", "Rack Mount Chassis (2)"}));
}

TEST(ChassisNode, ManufacturerVersionSerialAssetTagAndSkuAreRead) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode chassis = nodesOf(ChassisNode).at(0);

  EXPECT_EQ(chassis.text(PropManufacturer), "Korvane");
  EXPECT_EQ(chassis.text(PropModel), "2U-8SFF Rev B");
  EXPECT_EQ(chassis.text(PropVersion), "2U-8SFF Rev B");
  EXPECT_EQ(chassis.text(PropSerialNumber), "CZJ7Q2481");
  EXPECT_EQ(chassis.text(PropAssetTag), "DC3-R12-U14");
  EXPECT_EQ(chassis.text(PropPartNumber), "874321-B21");
  EXPECT_EQ(chassis.text(PropSKU), "874321-B21");
}

TEST(ChassisNode, SkuIsFoundAfterTheContainedElements) {
  RecordedMachine machine;
  ChassisInformation chassis = chassisOfType(23);
  chassis.containedCount = 3;
  chassis.containedRecordLength = 5;
  chassis.containedElements = std::string(15, '\x01');
  chassis.sku = "SKU-AFTER-15";
  recordChassis(machine, {chassis});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).text(PropPartNumber), "SKU-AFTER-15");
}

TEST(ChassisNode, TableWithoutSkuFieldGivesNoPartNumber) {
  RecordedMachine machine;
  ChassisInformation chassis = chassisOfType(23);
  chassis.withSkuField = false;
  recordChassis(machine, {chassis});
  HX::useLiveMachine(machine.root());

  const SeenNode node = nodesOf(ChassisNode).at(0);

  EXPECT_FALSE(node.has(PropPartNumber));
  EXPECT_FALSE(node.has(PropSKU));
}

TEST(ChassisNode, StatusIsOkWhenEveryStateIsSafe) {
  RecordedMachine machine;
  recordChassis(machine, {chassisOfType(23)});
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).status, 1u);
}

TEST(ChassisNode, StatusFollowsTheWorstState) {
  struct Case {
    unsigned bootUp, powerSupply, thermal, status;
  };
  for (Case c : {Case{3, 4, 3, 21}, Case{5, 3, 4, 22}, Case{3, 3, 6, 23},
                 Case{2, 2, 2, 0}, Case{1, 3, 2, 1}}) {
    RecordedMachine machine;
    ChassisInformation chassis = chassisOfType(23);
    chassis.bootUpState = c.bootUp;
    chassis.powerSupplyState = c.powerSupply;
    chassis.thermalState = c.thermal;
    recordChassis(machine, {chassis});
    HX::useLiveMachine(machine.root());

    EXPECT_EQ(nodesOf(ChassisNode).at(0).status, c.status)
        << "states " << c.bootUp << ", " << c.powerSupply << ", " << c.thermal;
  }
}

TEST(ChassisNode, MachineWithoutSmbiosHasOneChassisOfUnknownType) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);

  ASSERT_EQ(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].path, "/System/Chassis 1");
  EXPECT_EQ(chassis[0].number(PropChassisType), 2u);
  EXPECT_EQ(chassis[0].number(PropPackageType), 3u);
  EXPECT_EQ(chassis[0].name(), "Unknown");
}

TEST(ChassisNode, TableWithoutChassisStillGivesTheMainChassis) {
  RecordedMachine machine;
  machine.writeSmbios(SmbiosTable().add(SystemInformation()).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);

  ASSERT_EQ(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].number(PropChassisType), 2u);
}

TEST(ChassisNode, DmiAttributesStandInWhenTheTableIsNotThere) {
  RecordedMachine machine;
  machine.writeDmiAttribute("chassis_type", "10");
  machine.writeDmiAttribute("chassis_vendor", "Korvane");
  machine.writeDmiAttribute("chassis_version", "Lumo 14");
  machine.writeDmiAttribute("chassis_serial", "LUMO-0001");
  machine.writeDmiAttribute("chassis_asset_tag", "No Asset Tag");
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);

  ASSERT_EQ(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].number(PropChassisType), 10u);
  EXPECT_EQ(chassis[0].name(), "Notebook");
  EXPECT_EQ(chassis[0].text(PropManufacturer), "Korvane");
  EXPECT_EQ(chassis[0].text(PropModel), "Lumo 14");
  EXPECT_EQ(chassis[0].text(PropSerialNumber), "LUMO-0001");
  EXPECT_FALSE(chassis[0].has(PropAssetTag));
}

TEST(ChassisNode, DmiAttributesStandInWhenTheTableCannotBeRead) {
  RecordedMachine machine;
  machine.writeFile("/sys/firmware/dmi/tables/smbios_entry_point",
                    entryPoint3(3, 3, 0));
  machine.makeDirectory("/sys/firmware/dmi/tables/DMI"); // read fails
  machine.writeDmiAttribute("chassis_type", "23");
  LoggedProblems problems;
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 23u);
  EXPECT_EQ(problems.mentioning("tables/DMI: cannot read"), 1);
}

} // namespace
