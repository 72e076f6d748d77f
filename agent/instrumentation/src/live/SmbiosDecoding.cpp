//===- SmbiosDecoding.cpp - SMBIOS structures to firmware records ---------===//

#include "live/SmbiosDecoding.h"

#include "live/FirmwareText.h"
#include "live/HardwareCodes.h"
#include "live/LittleEndian.h"

#include <cstdio>

namespace HX {
namespace detail {
namespace live {
namespace {

/// Structure types and the lengths their first SMBIOS version gave them.
namespace Type {
constexpr std::uint8_t System = 1;
constexpr std::uint8_t Chassis = 3;
constexpr std::uint8_t PortConnector = 8;
constexpr std::uint8_t SystemSlot = 9;
} // namespace Type

std::size_t shortestLength(std::uint8_t type) {
  switch (type) {
  case Type::System:
    return 0x08;
  case Type::Chassis:
  case Type::PortConnector:
    return 0x09;
  case Type::SystemSlot:
    return 0x0C;
  default:
    return 0x04;
  }
}

constexpr std::size_t UuidLength = 16;

/// Reads the fields of one structure, noting what is odd about them.
class FieldReader {
public:
  FieldReader(const SmbiosStructure &structure,
              std::vector<std::string> &problems)
      : Structure(structure), Problems(problems) {
    if (structure.formatted.size() < shortestLength(structure.type))
      Problems.push_back("the structure (" + structure.label() + ") is " +
                         std::to_string(structure.formatted.size()) +
                         " bytes long, shorter than the " +
                         std::to_string(shortestLength(structure.type)) +
                         " its type needs; its missing fields are left out");
  }

  /// The text of the string the byte at \p field refers to; nullopt when
  /// the field is missing, refers to no string, or holds a placeholder.
  OptionalText text(std::size_t field) {
    std::optional<std::uint8_t> number = Structure.byteField(field);
    if (!number || *number == 0)
      return std::nullopt;
    if (*number > Structure.strings.size()) {
      Problems.push_back("the structure (" + Structure.label() +
                         ") refers to string " + std::to_string(*number) +
                         " but has " +
                         std::to_string(Structure.strings.size()));
      return std::nullopt;
    }
    bool odd = false;
    OptionalText value = meaningfulText(Structure.strings[*number - 1], odd);
    if (odd)
      Problems.push_back("string " + std::to_string(*number) +
                         " of the structure (" + Structure.label() +
                         ") holds bytes that are not text; they read as "
                         "U+FFFD");
    return value;
  }

  std::optional<unsigned> byte(std::size_t field) const {
    return Structure.byteField(field);
  }

  std::optional<unsigned> word(std::size_t field) const {
    return Structure.wordField(field);
  }

  std::string_view bytes(std::size_t field, std::size_t size) const {
    if (field + size > Structure.formatted.size())
      return {};
    return Structure.formatted.substr(field, size);
  }

  void note(std::string problem) { Problems.push_back(std::move(problem)); }
  const SmbiosStructure &structure() const { return Structure; }

private:
  const SmbiosStructure &Structure;
  std::vector<std::string> &Problems;
};

SystemRecord decodeSystem(FieldReader fields, bool uuidFieldsLittleEndian) {
  SystemRecord system;
  system.manufacturer = fields.text(0x04);
  system.productName = fields.text(0x05);
  system.version = fields.text(0x06);
  system.serialNumber = fields.text(0x07);
  system.uuid =
      uuidText(fields.bytes(0x08, UuidLength), uuidFieldsLittleEndian);
  system.sku = fields.text(0x19);
  system.family = fields.text(0x1A);
  return system;
}

/// The SKU number follows the contained elements, whose count and record
/// length the structure gives itself (DSP0134 7.4).
OptionalText chassisSku(FieldReader &fields) {
  std::optional<unsigned> count = fields.byte(0x13);
  std::optional<unsigned> recordLength = fields.byte(0x14);
  if (!count || !recordLength)
    return std::nullopt;
  const std::size_t skuField = 0x15 + std::size_t{*count} * *recordLength;
  const std::size_t length = fields.structure().formatted.size();
  if (skuField > length) {
    fields.note("the structure (" + fields.structure().label() +
                ") announces " + std::to_string(*count) +
                " contained elements of " + std::to_string(*recordLength) +
                " bytes, more than its " + std::to_string(length) +
                " bytes hold");
    return std::nullopt;
  }
  return fields.text(skuField);
}

ChassisRecord decodeChassis(FieldReader fields) {
  ChassisRecord chassis;
  if (std::optional<unsigned> type = fields.byte(0x05))
    chassis.chassisType = *type & 0x7Fu;
  chassis.manufacturer = fields.text(0x04);
  chassis.version = fields.text(0x06);
  chassis.serialNumber = fields.text(0x07);
  chassis.assetTag = fields.text(0x08);
  chassis.status =
      chassisStatus(fields.byte(0x09), fields.byte(0x0A), fields.byte(0x0B));
  chassis.sku = chassisSku(fields);
  return chassis;
}

ConnectorRecord decodeConnector(FieldReader fields) {
  ConnectorRecord connector;
  connector.internalDesignator = fields.text(0x04);
  connector.externalDesignator = fields.text(0x06);
  std::optional<unsigned> portType = fields.byte(0x08);
  if (portType && *portType != 0)
    connector.portType = portType;
  return connector;
}

/// Segment, bus and device/function of a slot, when the firmware gives
/// them (0xFF bus and device/function mean it does not).
OptionalText slotPciAddress(const FieldReader &fields) {
  std::optional<unsigned> segment = fields.word(0x0D);
  std::optional<unsigned> bus = fields.byte(0x0F);
  std::optional<unsigned> deviceFunction = fields.byte(0x10);
  if (!segment || !bus || !deviceFunction || *bus == 0xFF ||
      *deviceFunction == 0xFF)
    return std::nullopt;
  char text[24];
  std::snprintf(text, sizeof text, "%04x:%02x:%02x.%x", *segment, *bus,
                *deviceFunction >> 3, *deviceFunction & 0x7u);
  return std::string(text);
}

SlotRecord decodeSlot(FieldReader fields) {
  SlotRecord slot;
  slot.designation = fields.text(0x04);
  slot.smbiosSlotType = fields.byte(0x05);
  if (std::optional<unsigned> width = fields.byte(0x06))
    slot.laneCount = laneCountOfBusWidth(*width);
  slot.usage = fields.byte(0x07);
  slot.number = fields.word(0x09);
  slot.connectorLayout =
      slot.smbiosSlotType
          ? connectorLayoutOfSlot(*slot.smbiosSlotType, slot.laneCount)
          : 0;
  slot.pciAddress = slotPciAddress(fields);
  return slot;
}

} // namespace

OptionalText uuidText(std::string_view bytes, bool fieldsLittleEndian) {
  if (bytes.size() != UuidLength)
    return std::nullopt;
  if (bytes.find_first_not_of('\0') == std::string_view::npos ||
      bytes.find_first_not_of('\xFF') == std::string_view::npos)
    return std::nullopt;
  const std::uint32_t timeLow =
      fieldsLittleEndian
          ? dwordAt(bytes, 0)
          : (std::uint32_t{byteAt(bytes, 0)} << 24) |
                (std::uint32_t{byteAt(bytes, 1)} << 16) |
                (std::uint32_t{byteAt(bytes, 2)} << 8) | byteAt(bytes, 3);
  const auto pair = [&](std::size_t at) -> unsigned {
    return fieldsLittleEndian
               ? wordAt(bytes, at)
               : (unsigned{byteAt(bytes, at)} << 8) | byteAt(bytes, at + 1);
  };
  char text[40];
  std::snprintf(text, sizeof text,
                "%08x-%04x-%04x-%02x%02x-%02x%02x%02x%02x%02x%02x", timeLow,
                pair(4), pair(6), byteAt(bytes, 8), byteAt(bytes, 9),
                byteAt(bytes, 10), byteAt(bytes, 11), byteAt(bytes, 12),
                byteAt(bytes, 13), byteAt(bytes, 14), byteAt(bytes, 15));
  return std::string(text);
}

FirmwareInventory decodeSmbios(const SmbiosTableWalk &walk,
                               bool uuidFieldsLittleEndian,
                               std::vector<std::string> &problems) {
  FirmwareInventory inventory;
  inventory.source = FirmwareSource::SmbiosTable;
  for (const SmbiosStructure &structure : walk.structures) {
    switch (structure.type) {
    case Type::System:
      if (!inventory.system)
        inventory.system = decodeSystem(FieldReader(structure, problems),
                                        uuidFieldsLittleEndian);
      break;
    case Type::Chassis:
      inventory.chassis.push_back(
          decodeChassis(FieldReader(structure, problems)));
      break;
    case Type::PortConnector:
      inventory.connectors.push_back(
          decodeConnector(FieldReader(structure, problems)));
      break;
    case Type::SystemSlot:
      inventory.slots.push_back(decodeSlot(FieldReader(structure, problems)));
      break;
    default:
      break;
    }
  }
  return inventory;
}

} // namespace live
} // namespace detail
} // namespace HX
