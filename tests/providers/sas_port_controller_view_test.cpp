// The SASPortController view used directly: its keys, copies and the name
// filter.
#include "DiskController.h"
#include "ProviderHarness.h"
#include "SASPortController.h"

#include <HX/HardwareSource.h>

#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using HX::PhysicalAssetProvider::DiskController;
using HX::PhysicalAssetProvider::SASPortController;

// Three named controllers and one without a name, in this order.
const char* const kFourControllers = R"({"nodes": [
  {"type": "StorageControllerNode", "name": "A"},
  {"type": "StorageControllerNode", "name": "B"},
  {"type": "StorageControllerNode", "segment": "Unnamed"},
  {"type": "StorageControllerNode", "name": "A"}]})";

class SASPortControllerViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }

  static std::string idOf(SASPortController& controller) {
    std::string text;
    controller.getDeviceID(text);
    return text;
  }

  std::unique_ptr<TreeFile> tree;
};

TEST_F(SASPortControllerViewTest, MachineWithoutStorageControllerGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  SASPortController controller;
  EXPECT_FALSE(static_cast<bool>(controller));
}

TEST_F(SASPortControllerViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["StorageControllerNode"]},
          "nodes": [{"type": "StorageControllerNode", "name": "C"}]})");
  EXPECT_NO_THROW({
    SASPortController controller;
    EXPECT_FALSE(static_cast<bool>(controller));
  });
}

TEST_F(SASPortControllerViewTest, ClassNamesAreConstants) {
  use(kFourControllers);
  SASPortController controller;
  std::string text;
  EXPECT_TRUE(controller.getSystemCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_ComputerSystem");
  EXPECT_TRUE(controller.getCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_SASPortController");
}

TEST_F(SASPortControllerViewTest, DeviceIDIsThePathTextOfTheNode) {
  use(R"({"nodes": [{"type": "SystemNode", "name": "System", "children": [
          {"type": "StorageControllerNode", "name": "0000:18:00.0"}]}]})");
  SASPortController controller;
  std::string text = "old";
  EXPECT_TRUE(controller.getDeviceID(text));
  EXPECT_EQ(text, "/System/0000:18:00.0");
}

TEST_F(SASPortControllerViewTest, DeviceIDIsTheDiskControllerTagOfTheSameNode) {
  use(R"({"nodes": [{"type": "SystemNode", "name": "System", "children": [
          {"type": "StorageControllerNode", "name": "x"},
          {"type": "StorageControllerNode"}]}]})");
  SASPortController controller;
  DiskController dc;
  int nodes = 0;
  for (; controller && dc; ++controller, ++dc, ++nodes) {
    std::string tag;
    dc.getTag(tag);
    EXPECT_EQ(idOf(controller), tag);
  }
  EXPECT_EQ(nodes, 2);
  EXPECT_FALSE(static_cast<bool>(controller));
  EXPECT_FALSE(static_cast<bool>(dc));
}

TEST_F(SASPortControllerViewTest, DeviceIDOfANodeWithoutANameUsesItsSegment) {
  use(R"({"nodes": [{"type": "StorageControllerNode"}, {"type": "StorageControllerNode"}]})");
  SASPortController controller;
  EXPECT_EQ(idOf(controller), "/StorageControllerNode#0");
  ++controller;
  EXPECT_EQ(idOf(controller), "/StorageControllerNode#1");
}

TEST_F(SASPortControllerViewTest, CopyStandsOnTheSameNodeAndMovesOnItsOwn) {
  use(kFourControllers);
  SASPortController controller;
  SASPortController copy = controller;
  ++controller;
  EXPECT_EQ(idOf(controller), "/B");
  EXPECT_EQ(idOf(copy), "/A");
}

TEST_F(SASPortControllerViewTest, StepWithoutFiltersReadsNoProperty) {
  use(kFourControllers);
  SASPortController controller;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  int nodes = 0;
  for (; controller; ++controller) ++nodes;
  EXPECT_EQ(nodes, 4);
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
}

TEST_F(SASPortControllerViewTest, NameFilterOnAPassingNodeStaysAndStepsToTheNextPassingNode) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(SASPortController::FilterByName, "A");
  EXPECT_EQ(idOf(controller), "/A");
  ++controller;
  EXPECT_EQ(idOf(controller), "/Unnamed") << "a node without a name passes every name filter";
  ++controller;
  EXPECT_EQ(idOf(controller), "/A");
  ++controller;
  EXPECT_FALSE(static_cast<bool>(controller));
}

TEST_F(SASPortControllerViewTest, NameFilterMovesForwardToTheFirstPassingNode) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(SASPortController::FilterByName, "B");
  EXPECT_EQ(idOf(controller), "/B");
}

TEST_F(SASPortControllerViewTest, NameFilterComparesCaseExactly) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(SASPortController::FilterByName, "a");
  EXPECT_EQ(idOf(controller), "/Unnamed");
}

TEST_F(SASPortControllerViewTest, NameFiltersTogetherMustAllPass) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(SASPortController::FilterByName, "B");
  controller.setFilter(SASPortController::FilterByName, "A");
  EXPECT_EQ(idOf(controller), "/Unnamed");
}

TEST_F(SASPortControllerViewTest, FilterOfAnotherTypeLetsEveryNodePass) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(static_cast<SASPortController::FilterType>(2), "nothing matches this");
  EXPECT_EQ(idOf(controller), "/A");
  ++controller;
  EXPECT_EQ(idOf(controller), "/B");
}

TEST_F(SASPortControllerViewTest, NodesBeforeTheFilteredPositionAreNotSeenAgain) {
  use(kFourControllers);
  SASPortController controller;
  ++controller;
  controller.setFilter(SASPortController::FilterByName, "A");
  EXPECT_EQ(idOf(controller), "/Unnamed");
}

TEST_F(SASPortControllerViewTest, FiltersTravelWithACopy) {
  use(kFourControllers);
  SASPortController controller;
  controller.setFilter(SASPortController::FilterByName, "A");
  SASPortController copy = controller;
  ++copy;
  EXPECT_EQ(idOf(copy), "/Unnamed");
  EXPECT_EQ(idOf(controller), "/A");
}

} // namespace
} // namespace tvr::test
