//===- HX/NodeLexicon.h - Kinds of hardware node and their properties -----===//
//
/// \file
/// The vocabulary shared by the hardware sources, the cursor and its readers:
/// what kind of thing a hardware node is (`NodeType`) and which facts a node
/// can carry (`Properties`).
///
/// The numeric values are part of the library's interface: providers store
/// and compare them, so a value once given never changes meaning. The names
/// are the enumerator names; hardware-tree files and tools use them.
//
//===----------------------------------------------------------------------===//

#ifndef HX_NODELEXICON_H
#define HX_NODELEXICON_H

#include <optional>
#include <string_view>

namespace HX {
namespace NodeLexicon {

/// The kind of a hardware node.
///
/// The first group are the kinds the providers publish. The second group are
/// structural kinds: they give a tree its shape (a chassis holds a
/// baseboard, which holds processors and slots) and a live machine reports
/// them, but no provider lists them on their own.
enum NodeType : unsigned {
  ChassisNode = 1,
  NetworkCardNode = 12,
  SystemNode = 40,
  StorageControllerNode = 50,
  SlotNode = 62,
  ConnectorNode = 70,

  BaseboardNode = 1001,
  ProcessorNode = 1002,
  MemoryNode = 1003,
  MemoryModuleNode = 1004,
  PowerSupplyNode = 1005,
  FanNode = 1006,
  DiskNode = 1007,
  NetworkPortNode = 1008,
  PCIDeviceNode = 1009,
  FirmwareNode = 1010,
  SensorNode = 1011,
  EnclosureNode = 1012,
  BayNode = 1013,
};

/// A fact a hardware node can carry.
///
/// A node holds each of its properties either as a string or as an unsigned
/// 32-bit number; the comment on each enumerator names the form readers ask
/// for. A property held in the other form reads as absent.
enum Properties : unsigned {
  PropChassisType = 11,          ///< number: chassis type code
  PropManufacturer = 36,         ///< string
  PropModel = 39,                ///< string
  PropOtherIdentifyingInfo = 44, ///< string
  PropSerialNumber = 50,         ///< string
  PropUUID = 64,                 ///< string
  PropNumControlled = 81,        ///< number: devices a controller drives
  PropFormFactor = 85,           ///< number: form-factor code
  PropPartNumber = 86,           ///< string
  PropNodeName = 108,            ///< string: the node's name
  PropAdapterSerial = 121,       ///< string
  PropAdapterStatus = 123,       ///< number: adapter status code
  PropType = 128,                ///< number: kind-specific type code
  PropPortType = 185,            ///< number: connector/port type code
  PropPackageType = 213,         ///< number: package type code
  PropSlotNumber = 270,          ///< number

  PropVersion = 1001,              ///< string
  PropSKU = 1002,                  ///< string
  PropAssetTag = 1003,             ///< string
  PropPermanentAddress = 1004,     ///< string: MAC address, e.g. "52:54:00:12:34:56"
  PropSpeed = 1005,                ///< number: bits per second (saturates at 2^32-1)
  PropMaxSpeed = 1006,             ///< number: bits per second (saturates at 2^32-1)
  PropLinkTechnology = 1007,       ///< number: link technology code
  PropEnabledState = 1008,         ///< number: enabled-state code
  PropInterfaceName = 1009,        ///< string: operating-system interface name, e.g. "eth0"
  PropPCIAddress = 1010,           ///< string: "dddd:bb:dd.f"
  PropVendorID = 1011,             ///< number: PCI vendor ID
  PropDeviceID = 1012,             ///< number: PCI device ID
  PropSubsystemVendorID = 1013,    ///< number: PCI subsystem vendor ID
  PropSubsystemID = 1014,          ///< number: PCI subsystem ID
  PropDriver = 1015,               ///< string: bound kernel driver
  PropSlotType = 1016,             ///< number: slot type code
  PropSlotUsage = 1017,            ///< number: slot usage code
  PropFirmwareVersion = 1018,      ///< string
  PropLinkWidth = 1019,            ///< number: lanes in use
  PropMaxLinkWidth = 1020,         ///< number: lanes supported
  PropCapacity = 1021,             ///< number: size in mebibytes
  PropMACAddressCount = 1022,      ///< number: addresses a network card owns
};

/// Returns the enumerator name of \p type ("ChassisNode"), or nullptr when
/// \p type is not one of the enumerators above.
const char *nameOf(NodeType type);

/// Returns the enumerator name of \p property ("PropChassisType"), or
/// nullptr when \p property is not one of the enumerators above.
const char *nameOf(Properties property);

/// Returns the node type whose enumerator name is exactly \p name, or
/// nullopt. Names are case-sensitive.
std::optional<NodeType> nodeTypeNamed(std::string_view name);

/// Returns the property whose enumerator name is exactly \p name, or
/// nullopt. Names are case-sensitive.
std::optional<Properties> propertyNamed(std::string_view name);

} // namespace NodeLexicon
} // namespace HX

#endif // HX_NODELEXICON_H
