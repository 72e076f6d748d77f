//===- SmbiosDecoding.h - SMBIOS structures to firmware records -----------===//
//
/// \file
/// Reads the structures the hardware nodes need from a walked SMBIOS table:
/// the system (the first type 1), every chassis (type 3), every port
/// connector (type 8) and every system slot (type 9), in table order. A
/// field is read only when the structure's length covers it, so structures
/// of any SMBIOS version, and short or odd ones, decode to what they hold.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_SMBIOSDECODING_H
#define HX_SRC_LIVE_SMBIOSDECODING_H

#include "live/FirmwareInventory.h"
#include "live/SmbiosTable.h"

#include <string>
#include <vector>

namespace HX {
namespace detail {
namespace live {

/// Decodes \p walk. \p uuidFieldsLittleEndian: the first three UUID fields
/// are stored little-endian, as from SMBIOS 2.6 on. What is odd (strings
/// with bytes that are not text, string numbers past the strings present,
/// structures shorter than their type, contained elements that run past
/// their structure) is added to \p problems.
FirmwareInventory decodeSmbios(const SmbiosTableWalk &walk,
                               bool uuidFieldsLittleEndian,
                               std::vector<std::string> &problems);

/// The text form of the 16 UUID bytes of a type 1 structure, or nullopt
/// when they are all 0x00 ("not set") or all 0xFF ("not present").
OptionalText uuidText(std::string_view bytes, bool fieldsLittleEndian);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_SMBIOSDECODING_H
