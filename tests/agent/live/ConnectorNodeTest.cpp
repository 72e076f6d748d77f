//===- ConnectorNodeTest.cpp - Connector nodes from SMBIOS type 8 ---------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

PortConnector connector(const std::string &internal,
                        const std::string &external) {
  PortConnector port;
  port.internalDesignator = internal;
  port.externalDesignator = external;
  return port;
}

TEST(ConnectorNode, NameIsTheExternalDesignator) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(ConnectorNode), (std::vector<std::optional<std::string>>{
                                        "USB 1", "USB 2", "VGA", "iLO"}));
}

TEST(ConnectorNode, NameFallsBackToTheInternalDesignator) {
  RecordedMachine machine;
  machine.writeSmbios(SmbiosTable()
                          .add(connector("JAUD1", ""))
                          .add(connector("JFP1", "Not Specified"))
                          .add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(ConnectorNode),
            (std::vector<std::optional<std::string>>{"JAUD1", "JFP1"}));
}

TEST(ConnectorNode, ConnectorsStandBelowTheMainChassisAfterTheSlots) {
  RecordedMachine machine;
  recordBlade(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(pathsOf(ConnectorNode),
            (std::vector<std::string>{"/System/Chassis 1/Compute Module Port 1",
                                      "/System/Chassis 1/PEN Port 1"}));
}

TEST(ConnectorNode, TwoConnectorsDesignatedNotSpecifiedHaveDistinctPaths) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  const std::vector<SeenNode> connectors = nodesOf(ConnectorNode);

  ASSERT_EQ(connectors.size(), 4u);
  EXPECT_FALSE(connectors[0].name().has_value());
  EXPECT_FALSE(connectors[1].name().has_value());
  EXPECT_EQ(connectors[0].path, "/System/Chassis 1/ConnectorNode#0");
  EXPECT_EQ(connectors[1].path, "/System/Chassis 1/ConnectorNode#1");
}

TEST(ConnectorNode, ConnectorNamedLikeASlotGetsAPathOfItsOwn) {
  RecordedMachine machine;
  SystemSlot slot;
  slot.designation = "J5";
  machine.writeSmbios(
      SmbiosTable().add(slot).add(connector("J5", "")).add(endOfTable()));
  HX::useLiveMachine(machine.root());

  const SeenNode port = nodesOf(ConnectorNode).at(0);

  EXPECT_EQ(port.name(), "J5");
  EXPECT_EQ(port.path, "/System/Chassis 1/J5 (2)");
  EXPECT_EQ(pathsOf(SlotNode),
            std::vector<std::string>{"/System/Chassis 1/J5"});
}

TEST(ConnectorNode, ConnectorsWithTheSameDesignatorGetDistinctNames) {
  RecordedMachine machine;
  machine.writeSmbios(SmbiosTable()
                          .add(connector("", "USB"))
                          .add(connector("", "USB"))
                          .add(endOfTable()));
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(namesOf(ConnectorNode),
            (std::vector<std::optional<std::string>>{"USB", "USB (2)"}));
}

TEST(ConnectorNode, PortTypeIsTheSmbiosPortType) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodeNamed(ConnectorNode, "VGA").number(PropPortType), 0x1Cu);
}

TEST(ConnectorNode, PortTypeNoneIsAbsent) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_FALSE(nodeNamed(ConnectorNode, "JAUD1").has(PropPortType));
}

TEST(ConnectorNode, MachineWithoutSmbiosHasNoConnectors) {
  RecordedMachine machine;
  recordVirtualMachine(machine);
  HX::useLiveMachine(machine.root());

  EXPECT_TRUE(nodesOf(ConnectorNode).empty());
}

} // namespace
