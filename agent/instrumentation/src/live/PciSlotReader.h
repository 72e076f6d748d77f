//===- PciSlotReader.h - The kernel's list of physical PCI slots ----------===//
//
/// \file
/// Where the SMBIOS table lists no slots, the kernel may know them all the
/// same, from ACPI or from PCI Express hot-plug: /sys/bus/pci/slots holds
/// one directory per physical slot, named by its slot number.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_PCISLOTREADER_H
#define HX_SRC_LIVE_PCISLOTREADER_H

#include "live/FirmwareInventory.h"
#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

#include <vector>

namespace HX {
namespace detail {
namespace live {

/// The slots below \p root, in slot-number order: designation "Slot
/// <name>", the number when the name is one, the layout from the bus speed
/// the kernel reports, and the address of the device position behind it.
std::vector<SlotRecord> readPciSlots(const FileSystemRoot &root,
                                     ProblemLog &log);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PCISLOTREADER_H
