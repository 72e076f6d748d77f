//===- FirmwareNodes.h - System, chassis, slot and connector nodes --------===//
//
/// \file
/// The shape of the live machine's tree:
///
/// \code
///   /System                          SystemNode (SMBIOS type 1)
///   /System/Chassis 1                ChassisNode, the main chassis
///   /System/Chassis 1/<slot>         SlotNode (SMBIOS type 9 or sysfs)
///   /System/Chassis 1/<connector>    ConnectorNode (SMBIOS type 8)
///   /System/Chassis 1/<PCI address>  NetworkCardNode, StorageControllerNode
///   /System/Chassis 2                ChassisNode, further chassis in
///   ...                              table order
/// \endcode
///
/// The system and chassis segments are fixed words and numbers, so the
/// paths of cards and controllers do not depend on the firmware and their
/// readings need not read it. Every machine has a main chassis: without
/// firmware facts it is one of type 2 (Unknown).
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_FIRMWARENODES_H
#define HX_SRC_LIVE_FIRMWARENODES_H

#include "HardwareSnapshot.h"
#include "live/FirmwareInventory.h"

#include <vector>

namespace HX {
namespace detail {
namespace live {

/// Adds the system, every chassis, and below the main chassis the slots and
/// connectors of \p firmware. \p kernelSlots are the slots the kernel lists,
/// used when the firmware lists none.
void addFirmwareNodes(SnapshotBuilder &builder,
                      const FirmwareInventory &firmware,
                      const std::vector<SlotRecord> &kernelSlots);

/// Adds the system and main chassis as bare nodes (no name, no properties):
/// the ancestors of the card and controller nodes in a reading that did not
/// read the firmware. Returns the main chassis.
SnapshotBuilder::NodeIndex addMainChassisPath(SnapshotBuilder &builder);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_FIRMWARENODES_H
