//===- RecordedMachinesTest.cpp - The four recorded machines as a whole ---===//

#include "RecordedMachines.h"
#include "LiveSourceTesting.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

std::size_t countOf(NodeType type) { return nodesOf(type).size(); }

TEST(RecordedMachines, TwoSocketRackServer) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_TRUE(nodesOf(SystemNode).at(0).has(PropUUID));
  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);
  ASSERT_EQ(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].name(), "Rack Mount Chassis");
  EXPECT_EQ(chassis[0].number(PropChassisType), 23u);
  EXPECT_EQ(chassis[0].number(PropPackageType), 3u);
  EXPECT_EQ(countOf(SlotNode), 4u);
  EXPECT_EQ(countOf(ConnectorNode), 4u);
  EXPECT_EQ(countOf(NetworkCardNode), 4u);
  EXPECT_EQ(countOf(StorageControllerNode), 3u);
}

TEST(RecordedMachines, BladeWithMainAndExpansionChassis) {
  RecordedMachine machine;
  recordBlade(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);
  ASSERT_EQ(chassis.size(), 2u);
  EXPECT_EQ(chassis[0].number(PropChassisType), 17u);
  EXPECT_EQ(chassis[0].number(PropPackageType), 16u);
  EXPECT_EQ(chassis[0].text(PropSerialNumber), "BLD0042");
  EXPECT_EQ(chassis[1].number(PropChassisType), 18u);
  EXPECT_EQ(chassis[1].number(PropPackageType), 17u);
  EXPECT_EQ(chassis[1].text(PropSerialNumber), "PXU0007");
  EXPECT_EQ(namesOf(SlotNode),
            (std::vector<std::optional<std::string>>{
                "Mezzanine Slot 1", "PXU Slot 1", "PXU Slot 2"}));
  EXPECT_EQ(nodeNamed(SlotNode, "Mezzanine Slot 1").number(PropType), 22u);
  EXPECT_EQ(namesOf(ConnectorNode),
            (std::vector<std::optional<std::string>>{"Compute Module Port 1",
                                                     "PEN Port 1"}));
  EXPECT_EQ(namesOf(NetworkCardNode),
            std::vector<std::optional<std::string>>{"ens2f0"});
  EXPECT_EQ(nodesOf(StorageControllerNode).at(0).number(PropNumControlled), 1u);
}

TEST(RecordedMachines, Laptop) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode chassis = nodesOf(ChassisNode).at(0);
  EXPECT_EQ(chassis.name(), "Notebook");
  EXPECT_EQ(chassis.number(PropChassisType), 10u);
  EXPECT_EQ(chassis.number(PropPackageType), 3u);
  EXPECT_EQ(nodesOf(SystemNode).at(0).text(PropUUID),
            "00020003-0004-0005-0006-000700080009");
  EXPECT_EQ(nodeNamed(SlotNode, "M.2 Slot").number(PropType), 21u);
  EXPECT_EQ(countOf(ConnectorNode), 4u);
  EXPECT_EQ(nodeNamed(NetworkCardNode, "wlp2s0").number(PropAdapterStatus),
            16u);
  EXPECT_EQ(nodeNamed(NetworkCardNode, "enp3s0").number(PropAdapterStatus),
            12u);
  EXPECT_EQ(nodesOf(StorageControllerNode).at(0).text(PropType),
            "SATA controller");
}

TEST(RecordedMachines, VirtualMachineWithoutSmbios) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  LoggedProblems problems;
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodesOf(SystemNode).at(0).has(PropUUID));
  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);
  ASSERT_EQ(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].number(PropChassisType), 2u);
  EXPECT_EQ(countOf(SlotNode), 0u);
  EXPECT_EQ(countOf(ConnectorNode), 0u);
  const SeenNode card = nodesOf(NetworkCardNode).at(0);
  EXPECT_EQ(card.name(), "eth0");
  EXPECT_EQ(card.number(PropAdapterStatus), 1u);
  EXPECT_EQ(card.text(PropAdapterSerial), "02:fc:00:00:00:01");
  EXPECT_EQ(card.description, "Red Hat, Inc. Virtio 1.0 network device");
  const SeenNode controller = nodesOf(StorageControllerNode).at(0);
  EXPECT_EQ(controller.number(PropNumControlled), 1u);
  EXPECT_TRUE(problems.texts().empty()) << problems.texts().at(0);
}

TEST(RecordedMachines, EveryReadingGivesTheSamePathsAndNames) {
  RecordedMachine machine;
  recordLaptop(machine);
  const auto reading = [&] {
    HX::useLiveMachine(machine.root()); // a fresh source: nothing kept
    std::vector<std::pair<std::string, std::optional<std::string>>> seenNodes;
    for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode,
                          NetworkCardNode, StorageControllerNode})
      for (const SeenNode &node : nodesOf(type))
        seenNodes.emplace_back(node.path, node.name());
    return seenNodes;
  };

  const auto first = reading();

  EXPECT_EQ(first.size(), 10u);
  EXPECT_EQ(reading(), first);
}

} // namespace
