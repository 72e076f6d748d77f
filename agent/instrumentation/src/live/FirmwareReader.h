//===- FirmwareReader.h - Reading what the firmware says of the machine ---===//
//
/// \file
/// The system, chassis, slots and connectors come from the SMBIOS table the
/// kernel exports (/sys/firmware/dmi/tables/smbios_entry_point and DMI).
/// When that cannot be read (an older kernel, a reader without the rights,
/// a table without a single whole structure), /sys/class/dmi/id gives the
/// system and one chassis, without slots or connectors. A machine with
/// neither, such as a virtual machine without SMBIOS, has no firmware facts
/// at all; that is normal and not logged.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_FIRMWAREREADER_H
#define HX_SRC_LIVE_FIRMWAREREADER_H

#include "live/FirmwareInventory.h"
#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

namespace HX {
namespace detail {
namespace live {

/// Reads the firmware facts of the machine below \p root. Problems with the
/// files (unreadable, cut short, odd) go to \p log.
FirmwareInventory readFirmwareInventory(const FileSystemRoot &root,
                                        ProblemLog &log);

/// Reads /sys/class/dmi/id below \p root; nullopt when it is not there.
std::optional<FirmwareInventory> readDmiAttributes(const FileSystemRoot &root,
                                                   ProblemLog &log);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_FIRMWAREREADER_H
