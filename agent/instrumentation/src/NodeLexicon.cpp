//===- NodeLexicon.cpp - Names of node types and properties ---------------===//

#include "HX/NodeLexicon.h"

#include <array>
#include <utility>

namespace HX {
namespace NodeLexicon {
namespace {

#define HX_NAMED(enumerator) std::pair{enumerator, #enumerator}

constexpr std::array NodeTypeNames{
    HX_NAMED(ChassisNode),      HX_NAMED(NetworkCardNode),
    HX_NAMED(SystemNode),       HX_NAMED(StorageControllerNode),
    HX_NAMED(SlotNode),         HX_NAMED(ConnectorNode),
    HX_NAMED(BaseboardNode),    HX_NAMED(ProcessorNode),
    HX_NAMED(MemoryNode),       HX_NAMED(MemoryModuleNode),
    HX_NAMED(PowerSupplyNode),  HX_NAMED(FanNode),
    HX_NAMED(DiskNode),         HX_NAMED(NetworkPortNode),
    HX_NAMED(PCIDeviceNode),    HX_NAMED(FirmwareNode),
    HX_NAMED(SensorNode),       HX_NAMED(EnclosureNode),
    HX_NAMED(BayNode),
};

constexpr std::array PropertyNames{
    HX_NAMED(PropChassisType),       HX_NAMED(PropManufacturer),
    HX_NAMED(PropModel),             HX_NAMED(PropOtherIdentifyingInfo),
    HX_NAMED(PropSerialNumber),      HX_NAMED(PropUUID),
    HX_NAMED(PropNumControlled),     HX_NAMED(PropFormFactor),
    HX_NAMED(PropPartNumber),        HX_NAMED(PropNodeName),
    HX_NAMED(PropAdapterSerial),     HX_NAMED(PropAdapterStatus),
    HX_NAMED(PropType),              HX_NAMED(PropPortType),
    HX_NAMED(PropPackageType),       HX_NAMED(PropSlotNumber),
    HX_NAMED(PropVersion),           HX_NAMED(PropSKU),
    HX_NAMED(PropAssetTag),          HX_NAMED(PropPermanentAddress),
    HX_NAMED(PropSpeed),             HX_NAMED(PropMaxSpeed),
    HX_NAMED(PropLinkTechnology),    HX_NAMED(PropEnabledState),
    HX_NAMED(PropInterfaceName),     HX_NAMED(PropPCIAddress),
    HX_NAMED(PropVendorID),          HX_NAMED(PropDeviceID),
    HX_NAMED(PropSubsystemVendorID), HX_NAMED(PropSubsystemID),
    HX_NAMED(PropDriver),            HX_NAMED(PropSlotType),
    HX_NAMED(PropSlotUsage),         HX_NAMED(PropFirmwareVersion),
    HX_NAMED(PropLinkWidth),         HX_NAMED(PropMaxLinkWidth),
    HX_NAMED(PropCapacity),          HX_NAMED(PropMACAddressCount),
};

#undef HX_NAMED

template <typename Table, typename Value>
const char *findName(const Table &table, Value value) {
  for (const auto &[enumerator, name] : table)
    if (enumerator == value)
      return name;
  return nullptr;
}

template <typename Table>
auto findValue(const Table &table, std::string_view wanted)
    -> std::optional<typename Table::value_type::first_type> {
  for (const auto &[enumerator, name] : table)
    if (wanted == name)
      return enumerator;
  return std::nullopt;
}

} // namespace

const char *nameOf(NodeType type) { return findName(NodeTypeNames, type); }

const char *nameOf(Properties property) {
  return findName(PropertyNames, property);
}

std::optional<NodeType> nodeTypeNamed(std::string_view name) {
  return findValue(NodeTypeNames, name);
}

std::optional<Properties> propertyNamed(std::string_view name) {
  return findValue(PropertyNames, name);
}

} // namespace NodeLexicon
} // namespace HX
