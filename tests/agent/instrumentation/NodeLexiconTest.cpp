//===- NodeLexiconTest.cpp - Values and names of node types, properties ---===//

#include "HX/NodeLexicon.h"

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace {

using namespace HX::NodeLexicon;

const std::vector<NodeType> AllNodeTypes = {
    ChassisNode,      NetworkCardNode, SystemNode,    StorageControllerNode,
    SlotNode,         ConnectorNode,   BaseboardNode, ProcessorNode,
    MemoryNode,       MemoryModuleNode, PowerSupplyNode, FanNode,
    DiskNode,         NetworkPortNode, PCIDeviceNode, FirmwareNode,
    SensorNode,       EnclosureNode,   BayNode};

const std::vector<Properties> AllProperties = {
    PropChassisType,   PropManufacturer,      PropModel,
    PropOtherIdentifyingInfo, PropSerialNumber, PropUUID,
    PropNumControlled, PropFormFactor,        PropPartNumber,
    PropNodeName,      PropAdapterSerial,     PropAdapterStatus,
    PropType,          PropPortType,          PropPackageType,
    PropSlotNumber,    PropVersion,           PropSKU,
    PropAssetTag,      PropPermanentAddress,  PropSpeed,
    PropMaxSpeed,      PropLinkTechnology,    PropEnabledState,
    PropInterfaceName, PropPCIAddress,        PropVendorID,
    PropDeviceID,      PropSubsystemVendorID, PropSubsystemID,
    PropDriver,        PropSlotType,          PropSlotUsage,
    PropFirmwareVersion, PropLinkWidth,       PropMaxLinkWidth,
    PropCapacity,      PropMACAddressCount};

TEST(NodeLexiconTest, PublishedNodeTypesKeepTheirValues) {
  EXPECT_EQ(ChassisNode, 1u);
  EXPECT_EQ(NetworkCardNode, 12u);
  EXPECT_EQ(SystemNode, 40u);
  EXPECT_EQ(StorageControllerNode, 50u);
  EXPECT_EQ(SlotNode, 62u);
  EXPECT_EQ(ConnectorNode, 70u);
}

TEST(NodeLexiconTest, PublishedPropertiesKeepTheirValues) {
  EXPECT_EQ(PropChassisType, 11u);
  EXPECT_EQ(PropManufacturer, 36u);
  EXPECT_EQ(PropModel, 39u);
  EXPECT_EQ(PropOtherIdentifyingInfo, 44u);
  EXPECT_EQ(PropSerialNumber, 50u);
  EXPECT_EQ(PropUUID, 64u);
  EXPECT_EQ(PropNumControlled, 81u);
  EXPECT_EQ(PropFormFactor, 85u);
  EXPECT_EQ(PropPartNumber, 86u);
  EXPECT_EQ(PropNodeName, 108u);
  EXPECT_EQ(PropAdapterSerial, 121u);
  EXPECT_EQ(PropAdapterStatus, 123u);
  EXPECT_EQ(PropType, 128u);
  EXPECT_EQ(PropPortType, 185u);
  EXPECT_EQ(PropPackageType, 213u);
  EXPECT_EQ(PropSlotNumber, 270u);
}

TEST(NodeLexiconTest, NoTwoNodeTypesShareAValue) {
  std::set<unsigned> values(AllNodeTypes.begin(), AllNodeTypes.end());
  EXPECT_EQ(values.size(), AllNodeTypes.size());
}

TEST(NodeLexiconTest, NoTwoPropertiesShareAValue) {
  std::set<unsigned> values(AllProperties.begin(), AllProperties.end());
  EXPECT_EQ(values.size(), AllProperties.size());
}

TEST(NodeLexiconTest, EveryNodeTypeNameLeadsBackToItsType) {
  for (NodeType type : AllNodeTypes) {
    const char *name = nameOf(type);
    ASSERT_NE(name, nullptr) << static_cast<unsigned>(type);
    EXPECT_EQ(nodeTypeNamed(name), type) << name;
  }
}

TEST(NodeLexiconTest, EveryPropertyNameLeadsBackToItsProperty) {
  for (Properties property : AllProperties) {
    const char *name = nameOf(property);
    ASSERT_NE(name, nullptr) << static_cast<unsigned>(property);
    EXPECT_EQ(propertyNamed(name), property) << name;
  }
}

TEST(NodeLexiconTest, NamesAreTheEnumeratorNames) {
  EXPECT_STREQ(nameOf(ChassisNode), "ChassisNode");
  EXPECT_STREQ(nameOf(StorageControllerNode), "StorageControllerNode");
  EXPECT_STREQ(nameOf(PropChassisType), "PropChassisType");
  EXPECT_STREQ(nameOf(PropPermanentAddress), "PropPermanentAddress");
}

TEST(NodeLexiconTest, ValueThatIsNoEnumeratorHasNoName) {
  EXPECT_EQ(nameOf(static_cast<NodeType>(2)), nullptr);
  EXPECT_EQ(nameOf(static_cast<Properties>(12)), nullptr);
}

TEST(NodeLexiconTest, UnknownOrMiscasedNamesFindNothing) {
  EXPECT_EQ(nodeTypeNamed("GizmoNode"), std::nullopt);
  EXPECT_EQ(nodeTypeNamed("chassisnode"), std::nullopt);
  EXPECT_EQ(nodeTypeNamed(""), std::nullopt);
  EXPECT_EQ(propertyNamed("PropColour"), std::nullopt);
  EXPECT_EQ(propertyNamed("propmodel"), std::nullopt);
}

} // namespace
