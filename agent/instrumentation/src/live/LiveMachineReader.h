//===- LiveMachineReader.h - Reading the live machine per node type -------===//
//
/// \file
/// Each selection reads what its node type needs, once, into a snapshot:
///
/// - system, chassis and connectors: the SMBIOS table (or its fallback);
/// - slots: the same, and /sys/bus/pci/slots when the table lists no slots;
/// - network cards: the PCI functions of class 02 with the interfaces in
///   /sys/class/net they carry;
/// - storage controllers: the PCI functions of class 01 with the disks in
///   /sys/block below them.
///
/// The snapshot holds everything the cursor will be asked, so reading
/// properties, stepping and copying never touch the file system. What never
/// changes while a device stays plugged in (PCI ids and names, a card's
/// serial number, where a disk or interface sits) is kept across readings;
/// see PciFunctionCatalog.h and DeviceLinkCatalog.h.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_LIVEMACHINEREADER_H
#define HX_SRC_LIVE_LIVEMACHINEREADER_H

#include "HardwareSnapshot.h"
#include "live/DeviceLinkCatalog.h"
#include "live/NetworkInterfaceReader.h"
#include "live/PciFunctionCatalog.h"
#include "live/PciNameDatabase.h"
#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

#include <memory>
#include <string>
#include <vector>

namespace HX {
namespace detail {
namespace live {

class LiveMachineReader {
public:
  /// Reads the machine below \p fsRoot ("/" for this machine).
  explicit LiveMachineReader(const std::string &fsRoot);

  /// System, chassis, slots and connectors; the kernel's slots only when
  /// \p withKernelSlots (only slot selections need them).
  std::shared_ptr<const HardwareSnapshot> firmwareReading(bool withKernelSlots);
  std::shared_ptr<const HardwareSnapshot> networkCardReading();
  std::shared_ptr<const HardwareSnapshot> storageControllerReading();

private:
  const FileSystemRoot Root;
  ProblemLog Log;
  PciNameDatabase Names;
  PciFunctionCatalog Functions;
  DeviceLinkCatalog NetworkInterfaces;
  NetworkInterfaceReader InterfaceStates;
  DeviceLinkCatalog BlockDevices;
};

/// The PCI ID database files to try, in order: the usual places below
/// \p root, then (for another root) the same places of this machine.
std::vector<std::string> pciIdFileCandidates(const FileSystemRoot &root);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_LIVEMACHINEREADER_H
