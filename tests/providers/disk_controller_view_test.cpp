// The DiskController view used directly: its getters, the placeholders of
// the physical-element getters, copies and the name filter.
#include "DiskController.h"
#include "ProviderHarness.h"

#include <HX/HardwareSource.h>

#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using HX::PhysicalAssetProvider::DiskController;

// One controller with every property a storage controller node can carry.
const char* const kFullController = R"({"nodes": [
  {"type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 1,
   "description": "Chipset SATA controller",
   "properties": {"PropManufacturer": "Northwind", "PropModel": "C620", "PropType": "IDE interface",
                  "PropOtherIdentifyingInfo": "IDE mode", "PropNumControlled": 2, "PropPortType": 36,
                  "PropFormFactor": 7, "PropSerialNumber": "SN-9", "PropPartNumber": "PN-9",
                  "PropSKU": "SKU-9", "PropVersion": "1.0"}}]})";

// Three named controllers and one without a name, in this order.
const char* const kFourControllers = R"({"nodes": [
  {"type": "StorageControllerNode", "name": "A"},
  {"type": "StorageControllerNode", "name": "B"},
  {"type": "StorageControllerNode", "segment": "Unnamed"},
  {"type": "StorageControllerNode", "name": "A"}]})";

class DiskControllerViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }

  static std::string tagOf(DiskController& dc) {
    std::string text;
    dc.getTag(text);
    return text;
  }

  std::unique_ptr<TreeFile> tree;
};

TEST_F(DiskControllerViewTest, MachineWithoutStorageControllerGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  DiskController dc;
  EXPECT_FALSE(static_cast<bool>(dc));
}

TEST_F(DiskControllerViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["StorageControllerNode"]},
          "nodes": [{"type": "StorageControllerNode", "name": "C"}]})");
  EXPECT_NO_THROW({
    DiskController dc;
    EXPECT_FALSE(static_cast<bool>(dc));
  });
}

TEST_F(DiskControllerViewTest, TagIsThePathTextOfTheNode) {
  use(R"({"nodes": [{"type": "SystemNode", "name": "System", "children": [
          {"type": "StorageControllerNode", "name": "0000:18:00.0"}]}]})");
  DiskController dc;
  std::string text = "old";
  EXPECT_TRUE(dc.getTag(text));
  EXPECT_EQ(text, "/System/0000:18:00.0");
}

TEST_F(DiskControllerViewTest, ElementNameIsTheTagWithThePrefix) {
  use(kFullController);
  DiskController dc;
  std::string text = "old";
  EXPECT_TRUE(dc.getElementName(text));
  EXPECT_EQ(text, "DiskController-/0000:00:1f.2");
}

TEST_F(DiskControllerViewTest, CreationClassNameIsTheClass) {
  use(kFullController);
  DiskController dc;
  std::string text;
  EXPECT_TRUE(dc.getCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_DiskController");
}

TEST_F(DiskControllerViewTest, DescriptionIsTheNodeDescriptionAndAlwaysTrue) {
  use(kFullController);
  DiskController dc;
  std::string text;
  EXPECT_TRUE(dc.getDescription(text));
  EXPECT_EQ(text, "Chipset SATA controller");
}

TEST_F(DiskControllerViewTest, DescriptionOfANodeWithoutOneIsEmptyAndTrue) {
  use(R"({"nodes": [{"type": "StorageControllerNode", "name": "C"}]})");
  DiskController dc;
  std::string text = "old";
  EXPECT_TRUE(dc.getDescription(text));
  EXPECT_EQ(text, "");
}

TEST_F(DiskControllerViewTest, NodePropertiesAreReadByTheirGetters) {
  use(kFullController);
  DiskController dc;
  std::string text;
  EXPECT_TRUE(dc.getManufacturer(text));
  EXPECT_EQ(text, "Northwind");
  EXPECT_TRUE(dc.getModel(text));
  EXPECT_EQ(text, "C620");
  EXPECT_TRUE(dc.getCaption(text));
  EXPECT_EQ(text, "IDE interface");
  EXPECT_TRUE(dc.getOtherIdentifyingInfo(text));
  EXPECT_EQ(text, "IDE mode");
  unsigned number = 0;
  EXPECT_TRUE(dc.getNumControlled(number));
  EXPECT_EQ(number, 2u);
  EXPECT_TRUE(dc.getPortType(number));
  EXPECT_EQ(number, 36u);
  EXPECT_TRUE(dc.getFormFactor(number));
  EXPECT_EQ(number, 7u);
}

TEST_F(DiskControllerViewTest, GettersOfAbsentPropertiesAnswerFalseAndLeaveTheArgument) {
  use(R"({"nodes": [{"type": "StorageControllerNode", "name": "C"}]})");
  DiskController dc;
  std::string text = "untouched";
  EXPECT_FALSE(dc.getManufacturer(text));
  EXPECT_FALSE(dc.getModel(text));
  EXPECT_FALSE(dc.getCaption(text));
  EXPECT_FALSE(dc.getOtherIdentifyingInfo(text));
  EXPECT_EQ(text, "untouched");
  unsigned number = 4242;
  EXPECT_FALSE(dc.getNumControlled(number));
  EXPECT_FALSE(dc.getPortType(number));
  EXPECT_FALSE(dc.getFormFactor(number));
  EXPECT_EQ(number, 4242u);
}

TEST_F(DiskControllerViewTest, CaptionReadsTheTypeOnlyAsText) {
  use(R"({"nodes": [{"type": "StorageControllerNode", "name": "C", "properties": {"PropType": 1}}]})");
  DiskController dc;
  std::string text = "untouched";
  EXPECT_FALSE(dc.getCaption(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(DiskControllerViewTest, HealthStateIsTheLow16BitsOfTheRawNodeStatus) {
  use(R"({"nodes": [
    {"type": "StorageControllerNode", "name": "A", "status": 22},
    {"type": "StorageControllerNode", "name": "B", "status": 65537}]})");
  DiskController dc;
  unsigned short value = 0;
  EXPECT_TRUE(dc.getHealthState(value));
  EXPECT_EQ(value, 22);
  ++dc;
  EXPECT_TRUE(dc.getHealthState(value));
  EXPECT_EQ(value, 1);
}

TEST_F(DiskControllerViewTest, PackageTypeIsFifteenWhateverTheNodeHolds) {
  use(R"({"nodes": [{"type": "StorageControllerNode", "name": "C", "properties": {"PropPackageType": 3}}]})");
  DiskController dc;
  unsigned short value = 0;
  EXPECT_TRUE(dc.getPackageType(value));
  EXPECT_EQ(value, 15);
}

TEST_F(DiskControllerViewTest, EveryPlaceholderAnswersFalseAndLeavesItsArgument) {
  // The node holds what several placeholders are named after; they read
  // nothing all the same.
  use(kFullController);
  DiskController dc;
  ASSERT_TRUE(static_cast<bool>(dc));
  const std::uint64_t readsBefore = HX::propertyReadsOnThisThread();

  std::string text = "untouched";
  EXPECT_FALSE(dc.getInstallDate(text));
  EXPECT_FALSE(dc.getName(text));
  EXPECT_FALSE(dc.getSKU(text));
  EXPECT_FALSE(dc.getSerialNumber(text));
  EXPECT_FALSE(dc.getVersion(text));
  EXPECT_FALSE(dc.getPartNumber(text));
  EXPECT_FALSE(dc.getManufactureDate(text));
  EXPECT_FALSE(dc.getVendorEquipmentType(text));
  EXPECT_FALSE(dc.getUserTracking(text));
  EXPECT_FALSE(dc.getOtherPackageType(text));
  EXPECT_FALSE(dc.getSlotLayout(text));
  EXPECT_FALSE(dc.getRequirementsDescription(text));
  EXPECT_EQ(text, "untouched");

  std::vector<std::string> texts = {"kept"};
  EXPECT_FALSE(dc.getStatusDescriptions(texts));
  EXPECT_FALSE(dc.getVendorCompatibilityStrings(texts));
  EXPECT_EQ(texts, std::vector<std::string>{"kept"});

  std::vector<unsigned short> statuses = {9};
  EXPECT_FALSE(dc.getOperationalStatus(statuses));
  EXPECT_EQ(statuses, std::vector<unsigned short>{9});

  std::vector<short> voltages = {-5};
  EXPECT_FALSE(dc.getOperatingVoltages(voltages));
  EXPECT_EQ(voltages, std::vector<short>{-5});

  unsigned short number = 4242;
  EXPECT_FALSE(dc.getPrimaryStatus(number));
  EXPECT_FALSE(dc.getDetailedStatus(number));
  EXPECT_FALSE(dc.getOperatingStatus(number));
  EXPECT_FALSE(dc.getCommunicationStatus(number));
  EXPECT_FALSE(dc.getRemovalConditions(number));
  EXPECT_EQ(number, 4242);

  for (bool initial : {false, true}) {
    bool flag = initial;
    EXPECT_FALSE(dc.isPoweredOn(flag));
    EXPECT_FALSE(dc.canBeFRUed(flag));
    EXPECT_FALSE(dc.getRemovable(flag));
    EXPECT_FALSE(dc.isHostingBoard(flag));
    EXPECT_FALSE(dc.requiresDaughterBoard(flag));
    EXPECT_FALSE(dc.hasSpecialRequirements(flag));
    EXPECT_EQ(flag, initial);
  }

  float size = 1.5f;
  EXPECT_FALSE(dc.getHeight(size));
  EXPECT_FALSE(dc.getDepth(size));
  EXPECT_FALSE(dc.getWidth(size));
  EXPECT_FALSE(dc.getWeight(size));
  EXPECT_EQ(size, 1.5f);

  EXPECT_EQ(HX::propertyReadsOnThisThread(), readsBefore);
}

TEST_F(DiskControllerViewTest, CopyStandsOnTheSameNodeAndMovesOnItsOwn) {
  use(kFourControllers);
  DiskController dc;
  DiskController copy = dc;
  ++dc;
  EXPECT_EQ(tagOf(dc), "/B");
  EXPECT_EQ(tagOf(copy), "/A");
}

TEST_F(DiskControllerViewTest, StepWithoutFiltersReadsNoProperty) {
  use(kFourControllers);
  DiskController dc;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  int nodes = 0;
  for (; dc; ++dc) ++nodes;
  EXPECT_EQ(nodes, 4);
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
}

TEST_F(DiskControllerViewTest, NameFilterOnAPassingNodeStaysAndStepsToTheNextPassingNode) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(DiskController::FilterByName, "A");
  EXPECT_EQ(tagOf(dc), "/A");
  ++dc;
  EXPECT_EQ(tagOf(dc), "/Unnamed") << "a node without a name passes every name filter";
  ++dc;
  EXPECT_EQ(tagOf(dc), "/A");
  ++dc;
  EXPECT_FALSE(static_cast<bool>(dc));
}

TEST_F(DiskControllerViewTest, NameFilterMovesForwardToTheFirstPassingNode) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(DiskController::FilterByName, "B");
  EXPECT_EQ(tagOf(dc), "/B");
}

TEST_F(DiskControllerViewTest, NameFilterComparesCaseAndLengthExactly) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(DiskController::FilterByName, "b");
  EXPECT_EQ(tagOf(dc), "/Unnamed");
  DiskController other;
  other.setFilter(DiskController::FilterByName, "A ");
  EXPECT_EQ(tagOf(other), "/Unnamed");
}

TEST_F(DiskControllerViewTest, NameFiltersTogetherMustAllPass) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(DiskController::FilterByName, "A");
  dc.setFilter(DiskController::FilterByName, "B");
  EXPECT_EQ(tagOf(dc), "/Unnamed");
  ++dc;
  EXPECT_FALSE(static_cast<bool>(dc));
}

TEST_F(DiskControllerViewTest, FilterOfAnotherTypeLetsEveryNodePass) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(static_cast<DiskController::FilterType>(1), "nothing matches this");
  EXPECT_EQ(tagOf(dc), "/A");
  ++dc;
  EXPECT_EQ(tagOf(dc), "/B");
}

TEST_F(DiskControllerViewTest, NameFilterAfterAFilterOfAnotherTypeStillNarrows) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(static_cast<DiskController::FilterType>(7), "B");
  dc.setFilter(DiskController::FilterByName, "B");
  EXPECT_EQ(tagOf(dc), "/B");
  ++dc;
  EXPECT_EQ(tagOf(dc), "/Unnamed");
}

TEST_F(DiskControllerViewTest, NodesBeforeTheFilteredPositionAreNotSeenAgain) {
  use(kFourControllers);
  DiskController dc;
  ++dc;
  dc.setFilter(DiskController::FilterByName, "A");
  EXPECT_EQ(tagOf(dc), "/Unnamed");
}

TEST_F(DiskControllerViewTest, FiltersTravelWithACopy) {
  use(kFourControllers);
  DiskController dc;
  dc.setFilter(DiskController::FilterByName, "A");
  DiskController copy = dc;
  ++copy;
  EXPECT_EQ(tagOf(copy), "/Unnamed");
  EXPECT_EQ(tagOf(dc), "/A");
}

} // namespace
} // namespace tvr::test
