//===- StorageControllerNodeTest.cpp - Controllers from PCI class 01 ------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

class RackServerControllers : public ::testing::Test {
protected:
  void SetUp() override {
    recordRackServer(Machine);
    HX::useLiveMachine(Machine.root());
  }
  RecordedMachine Machine;
};

TEST_F(RackServerControllers, EveryFunctionOfClass01IsNamedByItsAddress) {
  EXPECT_EQ(namesOf(StorageControllerNode),
            (std::vector<std::optional<std::string>>{
                "0000:00:1f.2", "0000:18:00.0", "0000:d8:00.0"}));
}

TEST_F(RackServerControllers, ControllersStandBelowTheMainChassis) {
  EXPECT_EQ(pathsOf(StorageControllerNode),
            (std::vector<std::string>{"/System/Chassis 1/0000:00:1f.2",
                                      "/System/Chassis 1/0000:18:00.0",
                                      "/System/Chassis 1/0000:d8:00.0"}));
}

TEST_F(RackServerControllers, ManufacturerAndModelAreVendorAndDeviceNames) {
  const SeenNode raid = nodeNamed(StorageControllerNode, "0000:18:00.0");

  EXPECT_EQ(raid.text(PropManufacturer), "Broadcom / LSI");
  EXPECT_EQ(raid.text(PropModel), "MegaRAID Tri-Mode SAS3508");
  EXPECT_EQ(raid.description, "Broadcom / LSI MegaRAID Tri-Mode SAS3508");
  EXPECT_EQ(raid.status, 1u);
}

TEST_F(RackServerControllers, TypeIsTheSubclassName) {
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:00:1f.2").text(PropType),
            "SATA controller");
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:18:00.0").text(PropType),
            "RAID bus controller");
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:d8:00.0").text(PropType),
            "Non-Volatile memory controller");
}

TEST_F(RackServerControllers, NumControlledCountsTheDisksBelowEachController) {
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:00:1f.2")
                .number(PropNumControlled),
            1u);
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:18:00.0")
                .number(PropNumControlled),
            4u);
  EXPECT_EQ(nodeNamed(StorageControllerNode, "0000:d8:00.0")
                .number(PropNumControlled),
            1u);
}

TEST_F(RackServerControllers, NoControllerButIdeCarriesOtherIdentifyingInfo) {
  for (const SeenNode &controller : nodesOf(StorageControllerNode))
    EXPECT_FALSE(controller.has(PropOtherIdentifyingInfo)) << controller.path;
}

TEST_F(RackServerControllers, ControllerCarriesItsIdsAndDriver) {
  const SeenNode nvme = nodeNamed(StorageControllerNode, "0000:d8:00.0");

  EXPECT_EQ(nvme.number(PropVendorID), 0x144du);
  EXPECT_EQ(nvme.number(PropDeviceID), 0xa808u);
  EXPECT_EQ(nvme.text(PropPCIAddress), "0000:d8:00.0");
  EXPECT_EQ(nvme.text(PropDriver), "nvme");
}

TEST(StorageControllerNode, IdeInterfaceCarriesItsIdsAsOtherIdentifyingInfo) {
  RecordedMachine machine;
  machine.pciFunction("0000:00:01.1", 0x010180, 0x8086, 0x7010, 0x1af4, 0x1100);
  machine.writePciIds(RecordedPciIds);
  HX::useLiveMachine(machine.root());

  const SeenNode ide = nodesOf(StorageControllerNode).at(0);

  EXPECT_EQ(ide.text(PropOtherIdentifyingInfo), "8086:7010");
  EXPECT_EQ(ide.text(PropType), "IDE interface");
}

TEST(StorageControllerNode, VirtioBlockDeviceBelongsToItsFunction) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> controllers = nodesOf(StorageControllerNode);

  ASSERT_EQ(controllers.size(), 1u);
  EXPECT_EQ(controllers[0].name(), "0000:00:02.0");
  EXPECT_EQ(controllers[0].number(PropNumControlled), 1u);
  EXPECT_EQ(controllers[0].text(PropType), "Mass storage controller");
  EXPECT_EQ(controllers[0].description,
            "Red Hat, Inc. Virtio 1.0 block device");
}

TEST(StorageControllerNode, ControllerWithoutDisksControlsNone) {
  RecordedMachine machine;
  machine.pciFunction("0000:00:17.0", 0x010601, 0x8086, 0xa182, 0x8086, 0x0000);
  machine.virtualBlockDevice("loop0");
  machine.writePciIds(RecordedPciIds);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(StorageControllerNode).at(0).number(PropNumControlled), 0u);
}

TEST(StorageControllerNode, UnknownSubclassIsNamedAfterItsClassAndNumber) {
  RecordedMachine machine;
  machine.pciFunction("0000:00:17.0", 0x010900, 0x8086, 0xa182, 0x8086, 0x0000);
  machine.writePciIds(RecordedPciIds);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(StorageControllerNode).at(0).text(PropType),
            "Mass storage controller [0109]");
}

TEST(StorageControllerNode, ClassMissingFromTheDatabaseIsNamedByNumber) {
  RecordedMachine machine;
  machine.pciFunction("0000:00:17.0", 0x010900, 0x8086, 0xa182, 0x8086, 0x0000);
  machine.writePciIds("8086  Intel Corporation\n");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(StorageControllerNode).at(0).text(PropType), "Class 0109");
}

} // namespace
