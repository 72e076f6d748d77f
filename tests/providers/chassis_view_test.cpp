// The Chassis view and the package type mapping, used directly.
#include "Chassis.h"
#include "ProviderHarness.h"

#include <HX/HardwareSource.h>

#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using HX::PhysicalAssetProvider::Chassis;
using HX::PhysicalAssetProvider::mapPackageType;

class ChassisViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }
  std::unique_ptr<TreeFile> tree;
};

TEST_F(ChassisViewTest, MachineWithoutChassisGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  Chassis chassis;
  EXPECT_FALSE(static_cast<bool>(chassis));
}

TEST_F(ChassisViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["ChassisNode"]}, "nodes": [{"type": "ChassisNode", "name": "C"}]})");
  EXPECT_NO_THROW({
    Chassis chassis;
    EXPECT_FALSE(static_cast<bool>(chassis));
  });
}

TEST_F(ChassisViewTest, ModelOfANodeWithoutOneIsTrueAndLeavesTheText) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  Chassis chassis;
  ASSERT_TRUE(static_cast<bool>(chassis));
  std::string text = "untouched";
  EXPECT_TRUE(chassis.getModel(text));
  EXPECT_EQ(text, "untouched");
  EXPECT_TRUE(chassis.getManufacturer(text));
  EXPECT_TRUE(chassis.getSerialNumber(text));
  EXPECT_TRUE(chassis.getPartNumber(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(ChassisViewTest, CaptionAndDescriptionPassOnTheReadResult) {
  use(R"({"nodes": [{"type": "ChassisNode", "segment": "NoName"}]})");
  Chassis chassis;
  std::string text = "untouched";
  EXPECT_FALSE(chassis.getCaption(text));
  EXPECT_FALSE(chassis.getDescription(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(ChassisViewTest, ExpansionChassisAnswersFalseFromGetPackageType) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "X", "properties": {"PropChassisType": 18, "PropPackageType": 5}}]})");
  Chassis chassis;
  unsigned value = 99;
  EXPECT_FALSE(chassis.getPackageType(value));
  EXPECT_EQ(value, 3u);
}

TEST_F(ChassisViewTest, ExpansionLookupWithAThrowingCursorLeavesThree) {
  use(R"({"faults": {"throwOnSelect": ["ChassisNode"]}, "nodes": [{"type": "ChassisNode", "name": "C"}]})");
  Chassis chassis;
  unsigned value = 99;
  chassis.getPackageTypeForExpansion(value);
  EXPECT_EQ(value, 3u);
}

TEST_F(ChassisViewTest, CopyStandsOnTheSameNodeAndMovesOnItsOwn) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "A"}, {"type": "ChassisNode", "name": "B"}]})");
  Chassis chassis;
  Chassis copy = chassis;
  ++chassis;
  std::string original, copied;
  chassis.getTag(original);
  copy.getTag(copied);
  EXPECT_EQ(original, "/B");
  EXPECT_EQ(copied, "/A");
}

TEST(MapPackageTypeTest, MapsEachKnownCodeAndLeavesTheRest) {
  struct Case {
    unsigned value;
    int withoutFlag; // -1: unchanged
    int withFlag;
  };
  const Case cases[] = {{0, 0, 0}, {1, 3, 3}, {2, 1, 2}, {3, 28, 16}, {4, -1, -1},
                        {5, -1, -1}, {6, 1, 12}, {7, -1, -1}, {1000, -1, -1}};
  for (const Case& c : cases) {
    for (bool flag : {false, true}) {
      unsigned short out = 4242;
      mapPackageType(c.value, out, flag);
      const int expected = flag ? c.withFlag : c.withoutFlag;
      EXPECT_EQ(out, expected < 0 ? 4242 : expected) << "value " << c.value << " flag " << flag;
    }
  }
}

} // namespace
} // namespace tvr::test
