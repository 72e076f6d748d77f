// The Connector view used directly: its walk, its name filter and its getters.
#include "Connector.h"
#include "ProviderHarness.h"

#include <HX/HardwareSource.h>
#include <HX/Instrumentation.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using HX::PhysicalAssetProvider::Connector;

// Four connectors; the third has no name.
const char* const kFourConnectors = R"({"nodes": [
  {"type": "ConnectorNode", "name": "Port A"},
  {"type": "ConnectorNode", "name": "Port B"},
  {"type": "ConnectorNode", "segment": "Unnamed"},
  {"type": "ConnectorNode", "name": "Port B"}]})";

class ConnectorViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }

  // The name of the node the view stands on; "<none>" for a node without.
  static std::string nameAt(Connector& connector) {
    std::string name = "<none>";
    connector.getElementName(name);
    return name;
  }

  // The names of the nodes the view stands on from here to its end.
  static std::vector<std::string> walk(Connector& connector) {
    std::vector<std::string> names;
    for (; connector; ++connector) names.push_back(nameAt(connector));
    return names;
  }

  std::unique_ptr<TreeFile> tree;
};

TEST_F(ConnectorViewTest, WalksEveryConnectorNodeInOrder) {
  use(kFourConnectors);
  Connector connector;
  EXPECT_THAT(walk(connector), ElementsAre("Port A", "Port B", "<none>", "Port B"));
}

TEST_F(ConnectorViewTest, StartsWithoutFilters) {
  use(kFourConnectors);
  Connector connector;
  EXPECT_FALSE(connector.filterActive);
  EXPECT_TRUE(connector.filters.empty());
}

TEST_F(ConnectorViewTest, MachineWithoutConnectorsGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  Connector connector;
  EXPECT_FALSE(static_cast<bool>(connector));
}

TEST_F(ConnectorViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["ConnectorNode"]}, "nodes": [{"type": "ConnectorNode", "name": "P"}]})");
  EXPECT_NO_THROW({
    Connector connector;
    EXPECT_FALSE(static_cast<bool>(connector));
  });
}

TEST_F(ConnectorViewTest, StepWithoutFilterReadsNoProperty) {
  use(kFourConnectors);
  Connector connector;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++connector;
  ++connector;
  ++connector;
  ++connector;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_FALSE(static_cast<bool>(connector));
}

TEST_F(ConnectorViewTest, SetFilterOnAPassingNodeStaysThere) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port A");
  ASSERT_TRUE(static_cast<bool>(connector));
  EXPECT_EQ(nameAt(connector), "Port A");
}

TEST_F(ConnectorViewTest, StepAfterSetFilterMovesToTheNextPassingNode) {
  use(R"({"nodes": [{"type": "ConnectorNode", "name": "Port A"}, {"type": "ConnectorNode", "name": "Port B"},
                    {"type": "ConnectorNode", "name": "Port C"}, {"type": "ConnectorNode", "name": "Port B"}]})");
  Connector connector;
  ++connector; // on the first "Port B"
  connector.setFilter(Connector::FilterByName, "Port B");
  EXPECT_EQ(nameAt(connector), "Port B");
  ++connector; // "Port C" fails and is stepped over
  EXPECT_EQ(nameAt(connector), "Port B");
  ++connector;
  EXPECT_FALSE(static_cast<bool>(connector));
}

TEST_F(ConnectorViewTest, StepAfterSetFilterLetsANodeWithoutNamePass) {
  use(kFourConnectors);
  Connector connector;
  ++connector; // on the first "Port B"
  connector.setFilter(Connector::FilterByName, "Port B");
  ++connector;
  EXPECT_EQ(nameAt(connector), "<none>");
  ++connector;
  EXPECT_EQ(nameAt(connector), "Port B");
}

TEST_F(ConnectorViewTest, SetFilterSkipsFailingNodesFromWhereTheViewStands) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port B");
  EXPECT_THAT(walk(connector), ElementsAre("Port B", "<none>", "Port B"));
}

TEST_F(ConnectorViewTest, NodesBeforeTheViewsPositionAreNotSeenAgain) {
  use(kFourConnectors);
  Connector connector;
  ++connector;
  connector.setFilter(Connector::FilterByName, "Port A");
  // The only "Port A" lies behind; the unnamed node is the first to pass.
  EXPECT_THAT(walk(connector), ElementsAre("<none>"));
}

TEST_F(ConnectorViewTest, SetFilterWithNoPassingNodeEndsTheView) {
  use(R"({"nodes": [{"type": "ConnectorNode", "name": "Port A"}, {"type": "ConnectorNode", "name": "Port B"}]})");
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port C");
  EXPECT_FALSE(static_cast<bool>(connector));
}

TEST_F(ConnectorViewTest, NameFilterComparesCaseAndLengthExactly) {
  use(R"({"nodes": [{"type": "ConnectorNode", "name": "connector a"}, {"type": "ConnectorNode", "name": "Port A "},
                    {"type": "ConnectorNode", "name": "Port A"}]})");
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port A");
  EXPECT_THAT(walk(connector), ElementsAre("Port A"));
}

TEST_F(ConnectorViewTest, NodeWithoutNamePassesANameFilterOfAnyValue) {
  use(R"({"nodes": [{"type": "ConnectorNode", "segment": "Unnamed"}]})");
  for (const char* value : {"Port A", "", "Unnamed"}) {
    Connector connector;
    connector.setFilter(Connector::FilterByName, value);
    EXPECT_TRUE(static_cast<bool>(connector)) << "filter value \"" << value << "\"";
  }
}

TEST_F(ConnectorViewTest, OtherFilterTypesLetEveryNodePassButTurnTheFilterOn) {
  use(kFourConnectors);
  for (int value : {1, 42, -1}) {
    const Connector::FilterType type = static_cast<Connector::FilterType>(value);
    Connector connector;
    connector.setFilter(type, "Port A");
    EXPECT_TRUE(connector.filterActive);
    ASSERT_EQ(connector.filters.size(), 1u);
    EXPECT_EQ(connector.filters[0].type, type);
    EXPECT_EQ(connector.filters[0].value, "Port A");
    EXPECT_THAT(walk(connector), ElementsAre("Port A", "Port B", "<none>", "Port B")) << "type " << type;
  }
}

TEST_F(ConnectorViewTest, StepUnderAnotherFilterTypeReadsNoProperty) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(static_cast<Connector::FilterType>(1), "anything");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++connector;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_EQ(nameAt(connector), "Port B");
}

TEST_F(ConnectorViewTest, StepUnderANameFilterReadsTheNodeName) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port A");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++connector;
  EXPECT_GT(HX::propertyReadsOnThisThread(), before);
}

TEST_F(ConnectorViewTest, FiltersAccumulateAndMustAllPass) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port B");
  connector.setFilter(Connector::FilterByName, "Port A");
  EXPECT_EQ(connector.filters.size(), 2u);
  // No named node is both; only the unnamed one passes both.
  EXPECT_THAT(walk(connector), ElementsAre("<none>"));
}

TEST_F(ConnectorViewTest, CopyCarriesFiltersAndPositionAndMovesOnItsOwn) {
  use(kFourConnectors);
  Connector connector;
  connector.setFilter(Connector::FilterByName, "Port B");
  Connector copy = connector;
  ++connector;
  EXPECT_EQ(nameAt(copy), "Port B");
  EXPECT_EQ(nameAt(connector), "<none>");
  EXPECT_TRUE(copy.filterActive);
  ++copy;
  ++copy;
  EXPECT_EQ(nameAt(copy), "Port B");
  ++copy;
  EXPECT_FALSE(static_cast<bool>(copy));
}

TEST_F(ConnectorViewTest, TagAndElementNameReadTheNodeName) {
  use(kFourConnectors);
  Connector connector;
  std::string tag, elementName;
  EXPECT_TRUE(connector.getTag(tag));
  EXPECT_TRUE(connector.getElementName(elementName));
  EXPECT_EQ(tag, "Port A");
  EXPECT_EQ(elementName, "Port A");
}

TEST_F(ConnectorViewTest, NodeWithoutNameAnswersFalseAndLeavesTheText) {
  use(R"({"nodes": [{"type": "ConnectorNode", "segment": "Unnamed"}]})");
  Connector connector;
  std::string text = "untouched";
  EXPECT_FALSE(connector.getTag(text));
  EXPECT_FALSE(connector.getElementName(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(ConnectorViewTest, LayoutIsOneWhateverTheNodeHolds) {
  use(R"({"nodes": [{"type": "ConnectorNode", "name": "P", "properties": {"PropType": 73}}]})");
  Connector connector;
  unsigned short layout = 777;
  EXPECT_TRUE(connector.getConnectorLayout(layout));
  EXPECT_EQ(layout, 1);
}

TEST_F(ConnectorViewTest, LayoutReadsNoProperty) {
  use(kFourConnectors);
  Connector connector;
  unsigned short layout = 0;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  connector.getConnectorLayout(layout);
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
}

TEST_F(ConnectorViewTest, CreationClassNameIsTheClassName) {
  use(kFourConnectors);
  Connector connector;
  std::string text = "previous";
  EXPECT_TRUE(connector.getCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_Connector");
}

} // namespace
} // namespace tvr::test
