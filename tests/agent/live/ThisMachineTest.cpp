//===- ThisMachineTest.cpp - The machine the tests run on -----------------===//
//
// Whatever machine this is, reading it must not fail, and it has at least the
// one chassis every machine has. Nothing else about its hardware is assumed.
//
//===----------------------------------------------------------------------===//

#include "LiveSourceTesting.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

TEST(ThisMachine, EveryNodeTypeCanBeReadAndThereIsAChassis) {
  HX::useLiveMachine("/");

  for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode,
                        NetworkCardNode, StorageControllerNode, BaseboardNode})
    EXPECT_NO_THROW(nodesOf(type)) << nameOf(type);

  const std::vector<SeenNode> chassis = nodesOf(ChassisNode);
  ASSERT_GE(chassis.size(), 1u);
  EXPECT_EQ(chassis[0].path, "/System/Chassis 1");
  EXPECT_TRUE(chassis[0].number(PropChassisType).has_value());
  EXPECT_TRUE(chassis[0].number(PropPackageType).has_value());
  EXPECT_EQ(HX::describeHardwareSource(), "live machine at /");
}

} // namespace
