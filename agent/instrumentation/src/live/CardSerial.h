//===- CardSerial.h - The serial number a PCI card carries ----------------===//
//
/// \file
/// A card states its serial number in its Vital Product Data (the "SN"
/// keyword of the read-only section) or in the PCI Express Device Serial
/// Number capability. Both live in the device, not in memory: every dword
/// is a transaction on the bus, so the readers fetch the few bytes they
/// walk through and nothing more.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_CARDSERIAL_H
#define HX_SRC_LIVE_CARDSERIAL_H

#include "live/SystemFiles.h"

#include <optional>
#include <string>

namespace HX {
namespace detail {
namespace live {

/// The "SN" keyword of the read-only section of the VPD in \p vpd, cleaned
/// and without placeholders; nullopt when there is none.
std::optional<std::string> vpdSerialNumber(const RandomAccessFile &vpd);

/// The Device Serial Number capability in the extended configuration space
/// of \p config, as "00-1b-21-ff-ff-8e-9f-b0" (most significant byte
/// first); nullopt when there is none, or the space cannot be read beyond
/// its first 256 bytes (conventional PCI, or a reader without the rights).
std::optional<std::string> deviceSerialNumber(const RandomAccessFile &config);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_CARDSERIAL_H
