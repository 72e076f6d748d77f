//===- FirmwareNodes.cpp - System, chassis, slot and connector nodes ------===//

#include "live/FirmwareNodes.h"

#include "live/HardwareCodes.h"
#include "live/UniqueNames.h"

#include <unordered_set>

namespace HX {
namespace detail {
namespace live {
namespace {

using namespace NodeLexicon;
using NodeIndex = SnapshotBuilder::NodeIndex;

const std::string SystemSegment = "System";

std::string chassisSegment(std::size_t ordinal) {
  return "Chassis " + std::to_string(ordinal + 1);
}

/// Collects a node's properties, leaving out the absent ones.
class PropertyList {
public:
  void add(Properties id, const OptionalText &text) {
    if (text)
      List.push_back({id, *text});
  }
  void add(Properties id, std::optional<unsigned> number) {
    if (number)
      List.push_back({id, *number});
  }
  void add(Properties id, unsigned number) { List.push_back({id, number}); }
  std::vector<NodeProperty> take() { return std::move(List); }

private:
  std::vector<NodeProperty> List;
};

NodeDescription systemNode(const std::optional<SystemRecord> &system) {
  NodeDescription node;
  node.type = SystemNode;
  node.segment = SystemSegment;
  if (!system)
    return node;
  node.name = system->productName;
  PropertyList properties;
  properties.add(PropManufacturer, system->manufacturer);
  properties.add(PropModel, system->productName);
  properties.add(PropVersion, system->version);
  properties.add(PropSerialNumber, system->serialNumber);
  properties.add(PropUUID, system->uuid);
  properties.add(PropSKU, system->sku);
  node.properties = properties.take();
  return node;
}

NodeDescription chassisNode(const ChassisRecord &chassis, OptionalText name,
                            std::size_t ordinal) {
  NodeDescription node;
  node.type = ChassisNode;
  node.name = std::move(name);
  node.segment = chassisSegment(ordinal);
  node.status = chassis.status.value_or(0);
  PropertyList properties;
  properties.add(PropChassisType, chassis.chassisType);
  properties.add(PropPackageType, packageTypeOfChassis(chassis.chassisType));
  properties.add(PropManufacturer, chassis.manufacturer);
  properties.add(PropModel, chassis.version);
  properties.add(PropVersion, chassis.version);
  properties.add(PropSerialNumber, chassis.serialNumber);
  properties.add(PropAssetTag, chassis.assetTag);
  properties.add(PropSKU, chassis.sku);
  properties.add(PropPartNumber, chassis.sku);
  node.properties = properties.take();
  return node;
}

NodeDescription slotNode(const SlotRecord &slot) {
  NodeDescription node;
  node.type = SlotNode;
  PropertyList properties;
  properties.add(PropSlotNumber, slot.number);
  properties.add(PropType, slot.connectorLayout);
  properties.add(PropSlotType, slot.smbiosSlotType);
  properties.add(PropSlotUsage, slot.usage);
  properties.add(PropMaxLinkWidth, slot.laneCount);
  if (slot.pciAddress && !slot.pciAddress->empty())
    properties.add(PropPCIAddress, slot.pciAddress);
  node.properties = properties.take();
  return node;
}

NodeDescription connectorNode(const ConnectorRecord &connector) {
  NodeDescription node;
  node.type = ConnectorNode;
  PropertyList properties;
  properties.add(PropPortType, connector.portType);
  node.properties = properties.take();
  return node;
}

/// Names nodes of one kind: their own names made unique, and segments
/// (the name, else "<type>#<n>") made unique among all of \p taken.
void nameSiblings(std::vector<NodeDescription> &nodes,
                  std::vector<OptionalText> names,
                  std::unordered_set<std::string> &segmentsTaken) {
  std::unordered_set<std::string> namesTaken;
  makeUnique(names, namesTaken);
  std::vector<OptionalText> segments;
  for (std::size_t i = 0; i < nodes.size(); ++i) {
    nodes[i].name = names[i];
    segments.push_back(names[i] ? *names[i]
                                : std::string(nameOf(nodes[i].type)) + "#" +
                                      std::to_string(i));
  }
  makeUnique(segments, segmentsTaken);
  for (std::size_t i = 0; i < nodes.size(); ++i)
    nodes[i].segment = segments[i];
}

std::vector<NodeDescription>
slotNodes(const std::vector<SlotRecord> &slots,
          std::unordered_set<std::string> &segmentsTaken) {
  std::vector<NodeDescription> nodes;
  std::vector<OptionalText> names;
  for (const SlotRecord &slot : slots) {
    nodes.push_back(slotNode(slot));
    names.push_back(slot.designation);
  }
  nameSiblings(nodes, std::move(names), segmentsTaken);
  return nodes;
}

std::vector<NodeDescription>
connectorNodes(const std::vector<ConnectorRecord> &connectors,
               std::unordered_set<std::string> &segmentsTaken) {
  std::vector<NodeDescription> nodes;
  std::vector<OptionalText> names;
  for (const ConnectorRecord &connector : connectors) {
    nodes.push_back(connectorNode(connector));
    names.push_back(connector.externalDesignator
                        ? connector.externalDesignator
                        : connector.internalDesignator);
  }
  nameSiblings(nodes, std::move(names), segmentsTaken);
  return nodes;
}

} // namespace

void addFirmwareNodes(SnapshotBuilder &builder,
                      const FirmwareInventory &firmware,
                      const std::vector<SlotRecord> &kernelSlots) {
  const NodeIndex system =
      builder.addNode(SnapshotBuilder::NoParent, systemNode(firmware.system));

  std::vector<ChassisRecord> chassis = firmware.chassis;
  if (chassis.empty())
    chassis.emplace_back();
  std::vector<OptionalText> chassisNames;
  for (const ChassisRecord &record : chassis)
    if (std::optional<std::string_view> name =
            chassisTypeName(record.chassisType))
      chassisNames.emplace_back(std::string(*name));
    else
      chassisNames.emplace_back();
  std::unordered_set<std::string> chassisNamesTaken;
  makeUnique(chassisNames, chassisNamesTaken);

  // Firmware slots and connectors are named first, so that their segments
  // stay the same whether or not a reading also lists the kernel's slots.
  std::unordered_set<std::string> segmentsTaken;
  std::vector<NodeDescription> slots = slotNodes(firmware.slots, segmentsTaken);
  std::vector<NodeDescription> connectors =
      connectorNodes(firmware.connectors, segmentsTaken);
  if (firmware.slots.empty())
    slots = slotNodes(kernelSlots, segmentsTaken);

  for (std::size_t i = 0; i < chassis.size(); ++i) {
    const NodeIndex placed =
        builder.addNode(system, chassisNode(chassis[i], chassisNames[i], i));
    if (i != 0)
      continue;
    for (NodeDescription &slot : slots)
      builder.addNode(placed, std::move(slot));
    for (NodeDescription &connector : connectors)
      builder.addNode(placed, std::move(connector));
  }
}

SnapshotBuilder::NodeIndex addMainChassisPath(SnapshotBuilder &builder) {
  NodeDescription system;
  system.type = SystemNode;
  system.segment = SystemSegment;
  const NodeIndex systemIndex =
      builder.addNode(SnapshotBuilder::NoParent, std::move(system));
  NodeDescription chassis;
  chassis.type = ChassisNode;
  chassis.segment = chassisSegment(0);
  return builder.addNode(systemIndex, std::move(chassis));
}

} // namespace live
} // namespace detail
} // namespace HX
