// The Slot view used directly: its walk, its name filter and its getters.
#include "ProviderHarness.h"
#include "Slot.h"

#include <HX/HardwareSource.h>
#include <HX/Instrumentation.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using HX::PhysicalAssetProvider::Slot;

// Four slots; the third has no name.
const char* const kFourSlots = R"({"nodes": [
  {"type": "SlotNode", "name": "Slot A"},
  {"type": "SlotNode", "name": "Slot B"},
  {"type": "SlotNode", "segment": "Unnamed"},
  {"type": "SlotNode", "name": "Slot B"}]})";

class SlotViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }

  // The name of the node the view stands on; "<none>" for a node without.
  static std::string nameAt(Slot& slot) {
    std::string name = "<none>";
    slot.getElementName(name);
    return name;
  }

  // The names of the nodes the view stands on from here to its end.
  static std::vector<std::string> walk(Slot& slot) {
    std::vector<std::string> names;
    for (; slot; ++slot) names.push_back(nameAt(slot));
    return names;
  }

  std::unique_ptr<TreeFile> tree;
};

TEST_F(SlotViewTest, WalksEverySlotNodeInOrder) {
  use(kFourSlots);
  Slot slot;
  EXPECT_THAT(walk(slot), ElementsAre("Slot A", "Slot B", "<none>", "Slot B"));
}

TEST_F(SlotViewTest, StartsWithoutFilters) {
  use(kFourSlots);
  Slot slot;
  EXPECT_FALSE(slot.filterActive);
  EXPECT_TRUE(slot.filters.empty());
}

TEST_F(SlotViewTest, MachineWithoutSlotsGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  Slot slot;
  EXPECT_FALSE(static_cast<bool>(slot));
}

TEST_F(SlotViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["SlotNode"]}, "nodes": [{"type": "SlotNode", "name": "S"}]})");
  EXPECT_NO_THROW({
    Slot slot;
    EXPECT_FALSE(static_cast<bool>(slot));
  });
}

TEST_F(SlotViewTest, StepWithoutFilterReadsNoProperty) {
  use(kFourSlots);
  Slot slot;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++slot;
  ++slot;
  ++slot;
  ++slot;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_FALSE(static_cast<bool>(slot));
}

TEST_F(SlotViewTest, SetFilterOnAPassingNodeStaysThere) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot A");
  ASSERT_TRUE(static_cast<bool>(slot));
  EXPECT_EQ(nameAt(slot), "Slot A");
}

TEST_F(SlotViewTest, StepAfterSetFilterMovesToTheNextPassingNode) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "Slot A"}, {"type": "SlotNode", "name": "Slot B"},
                    {"type": "SlotNode", "name": "Slot C"}, {"type": "SlotNode", "name": "Slot B"}]})");
  Slot slot;
  ++slot; // on the first "Slot B"
  slot.setFilter(Slot::FilterByName, "Slot B");
  EXPECT_EQ(nameAt(slot), "Slot B");
  ++slot; // "Slot C" fails and is stepped over
  EXPECT_EQ(nameAt(slot), "Slot B");
  ++slot;
  EXPECT_FALSE(static_cast<bool>(slot));
}

TEST_F(SlotViewTest, StepAfterSetFilterLetsANodeWithoutNamePass) {
  use(kFourSlots);
  Slot slot;
  ++slot; // on the first "Slot B"
  slot.setFilter(Slot::FilterByName, "Slot B");
  ++slot;
  EXPECT_EQ(nameAt(slot), "<none>");
  ++slot;
  EXPECT_EQ(nameAt(slot), "Slot B");
}

TEST_F(SlotViewTest, SetFilterSkipsFailingNodesFromWhereTheViewStands) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot B");
  EXPECT_THAT(walk(slot), ElementsAre("Slot B", "<none>", "Slot B"));
}

TEST_F(SlotViewTest, NodesBeforeTheViewsPositionAreNotSeenAgain) {
  use(kFourSlots);
  Slot slot;
  ++slot;
  slot.setFilter(Slot::FilterByName, "Slot A");
  // The only "Slot A" lies behind; the unnamed node is the first to pass.
  EXPECT_THAT(walk(slot), ElementsAre("<none>"));
}

TEST_F(SlotViewTest, SetFilterWithNoPassingNodeEndsTheView) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "Slot A"}, {"type": "SlotNode", "name": "Slot B"}]})");
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot C");
  EXPECT_FALSE(static_cast<bool>(slot));
}

TEST_F(SlotViewTest, NameFilterComparesCaseAndLengthExactly) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "slot a"}, {"type": "SlotNode", "name": "Slot A "},
                    {"type": "SlotNode", "name": "Slot A"}]})");
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot A");
  EXPECT_THAT(walk(slot), ElementsAre("Slot A"));
}

TEST_F(SlotViewTest, NodeWithoutNamePassesANameFilterOfAnyValue) {
  use(R"({"nodes": [{"type": "SlotNode", "segment": "Unnamed"}]})");
  for (const char* value : {"Slot A", "", "Unnamed"}) {
    Slot slot;
    slot.setFilter(Slot::FilterByName, value);
    EXPECT_TRUE(static_cast<bool>(slot)) << "filter value \"" << value << "\"";
  }
}

TEST_F(SlotViewTest, OtherFilterTypesLetEveryNodePassButTurnTheFilterOn) {
  use(kFourSlots);
  for (int value : {1, 42, -1}) {
    const Slot::FilterType type = static_cast<Slot::FilterType>(value);
    Slot slot;
    slot.setFilter(type, "Slot A");
    EXPECT_TRUE(slot.filterActive);
    ASSERT_EQ(slot.filters.size(), 1u);
    EXPECT_EQ(slot.filters[0].type, type);
    EXPECT_EQ(slot.filters[0].value, "Slot A");
    EXPECT_THAT(walk(slot), ElementsAre("Slot A", "Slot B", "<none>", "Slot B")) << "type " << type;
  }
}

TEST_F(SlotViewTest, StepUnderAnotherFilterTypeReadsNoProperty) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(static_cast<Slot::FilterType>(1), "anything");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++slot;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_EQ(nameAt(slot), "Slot B");
}

TEST_F(SlotViewTest, StepUnderANameFilterReadsTheNodeName) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot A");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++slot;
  EXPECT_GT(HX::propertyReadsOnThisThread(), before);
}

TEST_F(SlotViewTest, FiltersAccumulateAndMustAllPass) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot B");
  slot.setFilter(Slot::FilterByName, "Slot A");
  EXPECT_EQ(slot.filters.size(), 2u);
  // No named node is both; only the unnamed one passes both.
  EXPECT_THAT(walk(slot), ElementsAre("<none>"));
}

TEST_F(SlotViewTest, CopyCarriesFiltersAndPositionAndMovesOnItsOwn) {
  use(kFourSlots);
  Slot slot;
  slot.setFilter(Slot::FilterByName, "Slot B");
  Slot copy = slot;
  ++slot;
  EXPECT_EQ(nameAt(copy), "Slot B");
  EXPECT_EQ(nameAt(slot), "<none>");
  EXPECT_TRUE(copy.filterActive);
  ++copy;
  ++copy;
  EXPECT_EQ(nameAt(copy), "Slot B");
  ++copy;
  EXPECT_FALSE(static_cast<bool>(copy));
}

TEST_F(SlotViewTest, TagAndElementNameReadTheNodeName) {
  use(kFourSlots);
  Slot slot;
  std::string tag, elementName;
  EXPECT_TRUE(slot.getTag(tag));
  EXPECT_TRUE(slot.getElementName(elementName));
  EXPECT_EQ(tag, "Slot A");
  EXPECT_EQ(elementName, "Slot A");
}

TEST_F(SlotViewTest, NodeWithoutNameAnswersFalseAndLeavesTheText) {
  use(R"({"nodes": [{"type": "SlotNode", "segment": "Unnamed"}]})");
  Slot slot;
  std::string text = "untouched";
  EXPECT_FALSE(slot.getTag(text));
  EXPECT_FALSE(slot.getElementName(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(SlotViewTest, NumberAndLayoutAreTheLow16Bits) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "S",
                     "properties": {"PropSlotNumber": 65539, "PropType": 65609}}]})");
  Slot slot;
  unsigned short number = 0, layout = 0;
  EXPECT_TRUE(slot.getNumber(number));
  EXPECT_TRUE(slot.getConnectorLayout(layout));
  EXPECT_EQ(number, 3);
  EXPECT_EQ(layout, 73);
}

TEST_F(SlotViewTest, MissingNumberAndLayoutAreZeroAndAnswerFalse) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  Slot slot;
  unsigned short number = 777, layout = 777;
  EXPECT_FALSE(slot.getNumber(number));
  EXPECT_FALSE(slot.getConnectorLayout(layout));
  EXPECT_EQ(number, 0);
  EXPECT_EQ(layout, 0);
}

TEST_F(SlotViewTest, LayoutGivenAsTextIsNoLayout) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "S", "properties": {"PropType": "PCIe"}}]})");
  Slot slot;
  unsigned short layout = 777;
  EXPECT_FALSE(slot.getConnectorLayout(layout));
  EXPECT_EQ(layout, 0);
}

TEST_F(SlotViewTest, CreationClassNameIsTheClassName) {
  use(kFourSlots);
  Slot slot;
  std::string text = "previous";
  EXPECT_TRUE(slot.getCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_Slot");
}

TEST_F(SlotViewTest, VendorCompatibilityStringIsAppendedAsTvrAndTheName) {
  use(kFourSlots);
  Slot slot;
  std::vector<std::string> strings = {"earlier"};
  EXPECT_TRUE(slot.getVendorCompatSring(strings));
  EXPECT_THAT(strings, ElementsAre("earlier", "TVR:Slot A"));
}

TEST_F(SlotViewTest, VendorCompatibilityStringOfAnUnnamedNodeIsTvrAndColon) {
  use(R"({"nodes": [{"type": "SlotNode", "segment": "Unnamed"}]})");
  Slot slot;
  std::vector<std::string> strings;
  EXPECT_TRUE(slot.getVendorCompatSring(strings));
  EXPECT_THAT(strings, ElementsAre("TVR:"));
}

} // namespace
} // namespace tvr::test
