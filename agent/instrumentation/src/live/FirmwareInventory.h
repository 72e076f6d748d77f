//===- FirmwareInventory.h - What the firmware tells about the machine ----===//
//
/// \file
/// The facts the system, chassis, slot and connector nodes are made of, as
/// read from the SMBIOS table, from /sys/class/dmi/id, or (slots only) from
/// /sys/bus/pci/slots. Every text is cleaned and free of placeholders (see
/// FirmwareText.h); a fact the source does not give is absent.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_FIRMWAREINVENTORY_H
#define HX_SRC_LIVE_FIRMWAREINVENTORY_H

#include <optional>
#include <string>
#include <vector>

namespace HX {
namespace detail {
namespace live {

using OptionalText = std::optional<std::string>;

struct SystemRecord {
  OptionalText manufacturer;
  OptionalText productName;
  OptionalText version;
  OptionalText serialNumber;
  /// "4c4c4544-0043-3610-8052-b4c04f4e3132": lower case, 8-4-4-4-12.
  OptionalText uuid;
  OptionalText sku;
  OptionalText family;
};

struct ChassisRecord {
  /// The SMBIOS chassis type, lock bit masked (2 "Unknown" when the
  /// machine gives none).
  unsigned chassisType = 2;
  OptionalText manufacturer;
  OptionalText version;
  OptionalText serialNumber;
  OptionalText assetTag;
  OptionalText sku;
  /// The node status the chassis's boot-up, power-supply and thermal states
  /// add up to, when the firmware reports them.
  std::optional<unsigned> status;
};

struct SlotRecord {
  /// The slot's designation as printed on the board.
  OptionalText designation;
  /// The SMBIOS slot ID, or the number sysfs names the slot by.
  std::optional<unsigned> number;
  /// The CIM ConnectorLayout that fits the slot type.
  unsigned connectorLayout = 0;
  /// The SMBIOS slot type, current usage and data bus width codes.
  std::optional<unsigned> smbiosSlotType;
  std::optional<unsigned> usage;
  std::optional<unsigned> laneCount;
  /// "dddd:bb:dd.f" (SMBIOS) or "dddd:bb:dd" (sysfs) of what sits in it.
  OptionalText pciAddress;
};

struct ConnectorRecord {
  OptionalText internalDesignator;
  OptionalText externalDesignator;
  /// The SMBIOS port type code; absent for 0 ("None").
  std::optional<unsigned> portType;
};

/// Where the firmware facts came from.
enum class FirmwareSource { SmbiosTable, DmiAttributes, None };

struct FirmwareInventory {
  FirmwareSource source = FirmwareSource::None;
  std::optional<SystemRecord> system;
  std::vector<ChassisRecord> chassis;
  std::vector<SlotRecord> slots;
  std::vector<ConnectorRecord> connectors;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_FIRMWAREINVENTORY_H
