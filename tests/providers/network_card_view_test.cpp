// The NetworkCard view used directly: its walk, its name filter, its own getters
// and the physical-element getters.
#include "NetworkCard.h"
#include "ProviderHarness.h"

#include <HX/HardwareSource.h>
#include <HX/Instrumentation.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using HX::PhysicalAssetProvider::NetworkCard;

// Four cards; the third has no name.
const char* const kFourCards = R"({"nodes": [
  {"type": "NetworkCardNode", "name": "eth0"},
  {"type": "NetworkCardNode", "name": "eth1"},
  {"type": "NetworkCardNode", "segment": "Unnamed"},
  {"type": "NetworkCardNode", "name": "eth1"}]})";

class NetworkCardViewTest : public ::testing::Test {
protected:
  void use(const std::string& json) {
    tree = std::make_unique<TreeFile>(json);
    HX::useHardwareTree(tree->path());
  }
  void TearDown() override { HX::useLiveMachine(); }

  // The name of the node the view stands on; "<none>" for a node without.
  static std::string nameAt(NetworkCard& card) {
    std::string name = "<none>";
    card.getElementName(name);
    return name;
  }

  // The names of the nodes the view stands on from here to its end.
  static std::vector<std::string> walk(NetworkCard& card) {
    std::vector<std::string> names;
    for (; card; ++card) names.push_back(nameAt(card));
    return names;
  }

  std::unique_ptr<TreeFile> tree;
};

TEST_F(NetworkCardViewTest, WalksEveryNetworkCardNodeInOrder) {
  use(kFourCards);
  NetworkCard card;
  EXPECT_THAT(walk(card), ElementsAre("eth0", "eth1", "<none>", "eth1"));
}

TEST_F(NetworkCardViewTest, StartsWithoutFilters) {
  use(kFourCards);
  NetworkCard card;
  EXPECT_FALSE(card.filterActive);
  EXPECT_TRUE(card.filters.empty());
}

TEST_F(NetworkCardViewTest, MachineWithoutCardsGivesAnEmptyView) {
  use(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  NetworkCard card;
  EXPECT_FALSE(static_cast<bool>(card));
}

TEST_F(NetworkCardViewTest, ThrowingSelectLeavesAnEmptyViewAndNoException) {
  use(R"({"faults": {"throwOnSelect": ["NetworkCardNode"]}, "nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  EXPECT_NO_THROW({
    NetworkCard card;
    EXPECT_FALSE(static_cast<bool>(card));
  });
}

TEST_F(NetworkCardViewTest, StepWithoutFilterReadsNoProperty) {
  use(kFourCards);
  NetworkCard card;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++card;
  ++card;
  ++card;
  ++card;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_FALSE(static_cast<bool>(card));
}

TEST_F(NetworkCardViewTest, SetFilterOnAPassingNodeStaysThere) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth0");
  ASSERT_TRUE(static_cast<bool>(card));
  EXPECT_EQ(nameAt(card), "eth0");
}

TEST_F(NetworkCardViewTest, StepAfterSetFilterMovesToTheNextPassingNode) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}, {"type": "NetworkCardNode", "name": "eth1"},
                    {"type": "NetworkCardNode", "name": "eth9"}, {"type": "NetworkCardNode", "name": "eth1"}]})");
  NetworkCard card;
  ++card; // on the first "eth1"
  card.setFilter(NetworkCard::FilterByName, "eth1");
  EXPECT_EQ(nameAt(card), "eth1");
  ++card; // "eth9" fails and is stepped over
  EXPECT_EQ(nameAt(card), "eth1");
  ++card;
  EXPECT_FALSE(static_cast<bool>(card));
}

TEST_F(NetworkCardViewTest, StepAfterSetFilterLetsANodeWithoutNamePass) {
  use(kFourCards);
  NetworkCard card;
  ++card; // on the first "eth1"
  card.setFilter(NetworkCard::FilterByName, "eth1");
  ++card;
  EXPECT_EQ(nameAt(card), "<none>");
  ++card;
  EXPECT_EQ(nameAt(card), "eth1");
}

TEST_F(NetworkCardViewTest, SetFilterSkipsFailingNodesFromWhereTheViewStands) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth1");
  EXPECT_THAT(walk(card), ElementsAre("eth1", "<none>", "eth1"));
}

TEST_F(NetworkCardViewTest, NodesBeforeTheViewsPositionAreNotSeenAgain) {
  use(kFourCards);
  NetworkCard card;
  ++card;
  card.setFilter(NetworkCard::FilterByName, "eth0");
  // The only "eth0" lies behind; the unnamed node is the first to pass.
  EXPECT_THAT(walk(card), ElementsAre("<none>"));
}

TEST_F(NetworkCardViewTest, SetFilterWithNoPassingNodeEndsTheView) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}, {"type": "NetworkCardNode", "name": "eth1"}]})");
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth9");
  EXPECT_FALSE(static_cast<bool>(card));
}

TEST_F(NetworkCardViewTest, NameFilterComparesCaseAndLengthExactly) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "card a"}, {"type": "NetworkCardNode", "name": "eth0 "},
                    {"type": "NetworkCardNode", "name": "eth0"}]})");
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth0");
  EXPECT_THAT(walk(card), ElementsAre("eth0"));
}

TEST_F(NetworkCardViewTest, NodeWithoutNamePassesANameFilterOfAnyValue) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "segment": "Unnamed"}]})");
  for (const char* value : {"eth0", "", "Unnamed"}) {
    NetworkCard card;
    card.setFilter(NetworkCard::FilterByName, value);
    EXPECT_TRUE(static_cast<bool>(card)) << "filter value \"" << value << "\"";
  }
}

TEST_F(NetworkCardViewTest, OtherFilterTypesLetEveryNodePassButTurnTheFilterOn) {
  use(kFourCards);
  for (int value : {1, 42, -1}) {
    const NetworkCard::FilterType type = static_cast<NetworkCard::FilterType>(value);
    NetworkCard card;
    card.setFilter(type, "eth0");
    EXPECT_TRUE(card.filterActive);
    ASSERT_EQ(card.filters.size(), 1u);
    EXPECT_EQ(card.filters[0].type, type);
    EXPECT_EQ(card.filters[0].value, "eth0");
    EXPECT_THAT(walk(card), ElementsAre("eth0", "eth1", "<none>", "eth1")) << "type " << type;
  }
}

TEST_F(NetworkCardViewTest, StepUnderAnotherFilterTypeReadsNoProperty) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(static_cast<NetworkCard::FilterType>(1), "anything");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++card;
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
  EXPECT_EQ(nameAt(card), "eth1");
}

TEST_F(NetworkCardViewTest, StepUnderANameFilterReadsTheNodeName) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth0");
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  ++card;
  EXPECT_GT(HX::propertyReadsOnThisThread(), before);
}

TEST_F(NetworkCardViewTest, FiltersAccumulateAndMustAllPass) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth1");
  card.setFilter(NetworkCard::FilterByName, "eth0");
  EXPECT_EQ(card.filters.size(), 2u);
  // No named node is both; only the unnamed one passes both.
  EXPECT_THAT(walk(card), ElementsAre("<none>"));
}

TEST_F(NetworkCardViewTest, CopyCarriesFiltersAndPositionAndMovesOnItsOwn) {
  use(kFourCards);
  NetworkCard card;
  card.setFilter(NetworkCard::FilterByName, "eth1");
  NetworkCard copy = card;
  ++card;
  EXPECT_EQ(nameAt(copy), "eth1");
  EXPECT_EQ(nameAt(card), "<none>");
  EXPECT_TRUE(copy.filterActive);
  ++copy;
  ++copy;
  EXPECT_EQ(nameAt(copy), "eth1");
  ++copy;
  EXPECT_FALSE(static_cast<bool>(copy));
}

TEST_F(NetworkCardViewTest, TagAndElementNameReadTheNodeName) {
  use(kFourCards);
  NetworkCard card;
  std::string tag, elementName;
  EXPECT_TRUE(card.getTag(tag));
  EXPECT_TRUE(card.getElementName(elementName));
  EXPECT_EQ(tag, "eth0");
  EXPECT_EQ(elementName, "eth0");
}

TEST_F(NetworkCardViewTest, NodeWithoutNameAnswersFalseAndLeavesTheText) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "segment": "Unnamed"}]})");
  NetworkCard card;
  std::string text = "untouched";
  EXPECT_FALSE(card.getTag(text));
  EXPECT_FALSE(card.getElementName(text));
  EXPECT_EQ(text, "untouched");
}

// A card whose node holds every property a physical-element getter could be
// thought to read.
const char* const kRichCard = R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "status": 1,
  "description": "Dual-port 10GbE adapter",
  "properties": {"PropAdapterSerial": "3c:fd:fe:a0:11:20", "PropAdapterStatus": 1, "PropManufacturer": "Northwind",
                 "PropModel": "NW-X710", "PropSerialNumber": "SN-1", "PropPartNumber": "PN-1",
                 "PropOtherIdentifyingInfo": "rev B", "PropPackageType": 5, "PropType": 7, "PropUUID": "u-1",
                 "PropFormFactor": 3, "PropVersion": "1.2", "PropSKU": "SKU-1"}}]})";

std::string cardWithStatus(const std::string& adapterStatus) {
  return R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "properties": {"PropAdapterStatus": )" +
         adapterStatus + "}}]}";
}

// Calls a placeholder getter with a value the caller put there and checks
// that it answers false and leaves that value alone.
template <class T>
void expectPlaceholder(NetworkCard& card, bool (NetworkCard::*getter)(T&), const T& callersValue,
                       const char* name) {
  T value = callersValue;
  EXPECT_FALSE((card.*getter)(value)) << name;
  EXPECT_TRUE(value == callersValue) << name << " changed its argument";
}

TEST_F(NetworkCardViewTest, EveryPlaceholderAnswersFalseAndLeavesTheArgument) {
  use(kRichCard);
  NetworkCard card;
  ASSERT_TRUE(static_cast<bool>(card));
  const std::string text = "caller's text";
  const std::vector<std::string> texts = {"caller's", "texts"};
  const unsigned short number = 4242;
  const float real = 2.5f;
  const std::vector<short> voltages = {-12, 5};
  for (bool flag : {false, true}) {
    expectPlaceholder(card, &NetworkCard::canBeFRUed, flag, "canBeFRUed");
    expectPlaceholder(card, &NetworkCard::getRemovable, flag, "getRemovable");
    expectPlaceholder(card, &NetworkCard::isHostingBoard, flag, "isHostingBoard");
    expectPlaceholder(card, &NetworkCard::requiresDaughterBoard, flag, "requiresDaughterBoard");
    expectPlaceholder(card, &NetworkCard::hasSpecialRequirements, flag, "hasSpecialRequirements");
  }
  expectPlaceholder(card, &NetworkCard::getCaption, text, "getCaption");
  expectPlaceholder(card, &NetworkCard::getInstallDate, text, "getInstallDate");
  expectPlaceholder(card, &NetworkCard::getStatusDescriptions, texts, "getStatusDescriptions");
  expectPlaceholder(card, &NetworkCard::getHealthState, number, "getHealthState");
  expectPlaceholder(card, &NetworkCard::getPrimaryStatus, number, "getPrimaryStatus");
  expectPlaceholder(card, &NetworkCard::getDetailedStatus, number, "getDetailedStatus");
  expectPlaceholder(card, &NetworkCard::getOperatingStatus, number, "getOperatingStatus");
  expectPlaceholder(card, &NetworkCard::getCommunicationStatus, number, "getCommunicationStatus");
  expectPlaceholder(card, &NetworkCard::getManufacturer, text, "getManufacturer");
  expectPlaceholder(card, &NetworkCard::getModel, text, "getModel");
  expectPlaceholder(card, &NetworkCard::getSKU, text, "getSKU");
  expectPlaceholder(card, &NetworkCard::getVersion, text, "getVersion");
  expectPlaceholder(card, &NetworkCard::getPartNumber, text, "getPartNumber");
  expectPlaceholder(card, &NetworkCard::getOtherIdentifyingInfo, text, "getOtherIdentifyingInfo");
  expectPlaceholder(card, &NetworkCard::getManufactureDate, text, "getManufactureDate");
  expectPlaceholder(card, &NetworkCard::getVendorEquipmentType, text, "getVendorEquipmentType");
  expectPlaceholder(card, &NetworkCard::getUserTracking, text, "getUserTracking");
  expectPlaceholder(card, &NetworkCard::getRemovalConditions, number, "getRemovalConditions");
  expectPlaceholder(card, &NetworkCard::getHeight, real, "getHeight");
  expectPlaceholder(card, &NetworkCard::getDepth, real, "getDepth");
  expectPlaceholder(card, &NetworkCard::getWidth, real, "getWidth");
  expectPlaceholder(card, &NetworkCard::getWeight, real, "getWeight");
  expectPlaceholder(card, &NetworkCard::getOtherPackageType, text, "getOtherPackageType");
  expectPlaceholder(card, &NetworkCard::getVendorCompatibilityStrings, texts, "getVendorCompatibilityStrings");
  expectPlaceholder(card, &NetworkCard::getSlotLayout, text, "getSlotLayout");
  expectPlaceholder(card, &NetworkCard::getRequirementsDescription, text, "getRequirementsDescription");
  expectPlaceholder(card, &NetworkCard::getOperatingVoltages, voltages, "getOperatingVoltages");
}

TEST_F(NetworkCardViewTest, PlaceholdersReadNothing) {
  use(kRichCard);
  NetworkCard card;
  std::string text;
  unsigned short number = 0;
  const std::uint64_t before = HX::propertyReadsOnThisThread();
  card.getCaption(text);
  card.getManufacturer(text);
  card.getModel(text);
  card.getPartNumber(text);
  card.getOtherIdentifyingInfo(text);
  card.getHealthState(number);
  EXPECT_EQ(HX::propertyReadsOnThisThread(), before);
}

TEST_F(NetworkCardViewTest, PlaceholdersAnswerFalseOffANodeToo) {
  use(R"({"nodes": []})");
  NetworkCard card;
  ASSERT_FALSE(static_cast<bool>(card));
  std::string text = "kept";
  EXPECT_FALSE(card.getModel(text));
  EXPECT_EQ(text, "kept");
}

TEST_F(NetworkCardViewTest, NameTagAndElementNameReadTheNodeName) {
  use(kRichCard);
  NetworkCard card;
  std::string name, tag, elementName;
  EXPECT_TRUE(card.getName(name));
  EXPECT_TRUE(card.getTag(tag));
  EXPECT_TRUE(card.getElementName(elementName));
  EXPECT_EQ(name, "eth0");
  EXPECT_EQ(tag, "eth0");
  EXPECT_EQ(elementName, "eth0");
}

TEST_F(NetworkCardViewTest, CardWithoutNameAnswersFalseFromTheNameGettersAndLeavesTheText) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "segment": "Unnamed"}]})");
  NetworkCard card;
  std::string text = "untouched";
  EXPECT_FALSE(card.getName(text));
  EXPECT_FALSE(card.getTag(text));
  EXPECT_FALSE(card.getElementName(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(NetworkCardViewTest, SerialNumberIsTheAdapterSerial) {
  use(kRichCard);
  NetworkCard card;
  std::string serial;
  EXPECT_TRUE(card.getSerialNumber(serial));
  EXPECT_EQ(serial, "3c:fd:fe:a0:11:20");
}

TEST_F(NetworkCardViewTest, CardWithoutAdapterSerialAnswersFalseAndLeavesTheText) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "properties": {"PropSerialNumber": "SN-1"}}]})");
  NetworkCard card;
  std::string serial = "untouched";
  EXPECT_FALSE(card.getSerialNumber(serial));
  EXPECT_EQ(serial, "untouched");
}

TEST_F(NetworkCardViewTest, CreationClassNameIsTheClassName) {
  use(kRichCard);
  NetworkCard card;
  std::string text = "previous";
  EXPECT_TRUE(card.getCreationClassName(text));
  EXPECT_EQ(text, "TVRHX_NetworkCard");
}

TEST_F(NetworkCardViewTest, DescriptionIsTheNodeDescription) {
  use(kRichCard);
  NetworkCard card;
  std::string text = "previous";
  EXPECT_TRUE(card.getDescription(text));
  EXPECT_EQ(text, "Dual-port 10GbE adapter");
}

TEST_F(NetworkCardViewTest, MissingDescriptionIsAnEmptyTextAndStillTrue) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0"}]})");
  NetworkCard card;
  std::string text = "previous";
  EXPECT_TRUE(card.getDescription(text));
  EXPECT_EQ(text, "");
}

TEST_F(NetworkCardViewTest, PackageTypeIsModuleCardWhateverTheNodeHolds) {
  use(kRichCard);
  NetworkCard card;
  unsigned short value = 0;
  EXPECT_TRUE(card.getPackageType(value));
  EXPECT_EQ(value, 9);
}

TEST_F(NetworkCardViewTest, PoweredOnFollowsNodeStatusOne) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "a", "status": 1},
                    {"type": "NetworkCardNode", "name": "b", "status": 0},
                    {"type": "NetworkCardNode", "name": "c", "status": 2},
                    {"type": "NetworkCardNode", "name": "d", "status": 20}]})");
  NetworkCard card;
  std::vector<bool> poweredOn;
  for (; card; ++card) {
    bool value = false;
    EXPECT_TRUE(card.isPoweredOn(value));
    poweredOn.push_back(value);
  }
  EXPECT_THAT(poweredOn, ElementsAre(true, false, false, false));
}

TEST_F(NetworkCardViewTest, StatusIsOkOnlyForAdapterStatusOne) {
  const std::vector<std::pair<const char*, const char*>> cases = {
      {"0", "Stopped"}, {"1", "OK"}, {"2", "Stopped"}, {"12", "Stopped"}, {"16", "Stopped"}, {"65537", "Stopped"}};
  for (const auto& [adapterStatus, expected] : cases) {
    use(cardWithStatus(adapterStatus));
    NetworkCard card;
    std::string text = "previous";
    EXPECT_TRUE(card.getStatus(text)) << adapterStatus;
    EXPECT_EQ(text, expected) << "adapter status " << adapterStatus;
  }
}

TEST_F(NetworkCardViewTest, StatusOfACardWithoutAdapterStatusIsFalseAndLeavesTheText) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "status": 1}]})");
  NetworkCard card;
  std::string text = "untouched";
  EXPECT_FALSE(card.getStatus(text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(NetworkCardViewTest, OperationalStatusMapsTheAdapterStatus) {
  const std::vector<std::pair<const char*, unsigned short>> cases = {
      {"0", 13}, {"1", 2}, {"2", 13}, {"12", 13}, {"16", 10}, {"17", 13}, {"65537", 13}};
  for (const auto& [adapterStatus, expected] : cases) {
    use(cardWithStatus(adapterStatus));
    NetworkCard card;
    std::vector<unsigned short> values;
    EXPECT_TRUE(card.getOperationalStatus(values)) << adapterStatus;
    EXPECT_THAT(values, ElementsAre(expected)) << "adapter status " << adapterStatus;
  }
}

TEST_F(NetworkCardViewTest, OperationalStatusIsAppendedToWhatTheCallerHas) {
  use(cardWithStatus("16"));
  NetworkCard card;
  std::vector<unsigned short> values = {7};
  EXPECT_TRUE(card.getOperationalStatus(values));
  EXPECT_THAT(values, ElementsAre(7, 10));
}

TEST_F(NetworkCardViewTest, OperationalStatusOfACardWithoutAdapterStatusIsFalseAndAddsNothing) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "status": 1}]})");
  NetworkCard card;
  std::vector<unsigned short> values = {7};
  EXPECT_FALSE(card.getOperationalStatus(values));
  EXPECT_THAT(values, ElementsAre(7));
}

TEST_F(NetworkCardViewTest, AdapterStatusGivenAsTextCountsAsMissing) {
  use(R"({"nodes": [{"type": "NetworkCardNode", "name": "eth0", "properties": {"PropAdapterStatus": "1"}}]})");
  NetworkCard card;
  std::string text = "untouched";
  std::vector<unsigned short> values;
  EXPECT_FALSE(card.getStatus(text));
  EXPECT_FALSE(card.getOperationalStatus(values));
  EXPECT_EQ(text, "untouched");
  EXPECT_THAT(values, ::testing::IsEmpty());
}

} // namespace
} // namespace tvr::test
