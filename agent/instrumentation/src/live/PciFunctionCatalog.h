//===- PciFunctionCatalog.h - The PCI functions of the machine ------------===//
//
/// \file
/// Lists /sys/bus/pci/devices and reads what identifies each function: its
/// class code, vendor, device and subsystem ids, their names, whether it is
/// an SR-IOV virtual function, and (for cards) the serial number it carries.
///
/// None of that changes while a device stays plugged in, and the kernel
/// gives a device that is plugged in anew a new directory entry (a new
/// inode number). So the catalog keeps what it read per address and entry
/// inode, and a reading costs one directory listing plus the functions it
/// has not met before; on a large server that is the difference between
/// hundreds of file reads per selection and none. What does change (the
/// driver, interfaces, link state, disks) is read by the callers at every
/// reading.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_PCIFUNCTIONCATALOG_H
#define HX_SRC_LIVE_PCIFUNCTIONCATALOG_H

#include "live/PciNameDatabase.h"
#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

#include <cstdint>
#include <mutex>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace HX {
namespace detail {
namespace live {

/// What identifies one PCI function. Ids that could not be read (the device
/// went away while it was read) are absent, and so are the names made from
/// them.
struct PciFunction {
  /// "0000:3b:00.0".
  std::string address;
  /// The function's sysfs directory below the root.
  std::string directory;
  /// The inode of the function's entry in the listing it came from.
  ino_t entryInode = 0;
  /// Base class, subclass and programming interface, 0xBBSSPP.
  std::uint32_t classCode = 0;
  std::optional<unsigned> vendor;
  std::optional<unsigned> device;
  std::optional<unsigned> subsystemVendor;
  std::optional<unsigned> subsystemDevice;
  /// True for an SR-IOV virtual function (it has a "physfn" link).
  bool virtualFunction = false;
  /// The database's names, else "Vendor 8086", "Device 1572", "Class 0180".
  std::optional<std::string> vendorName;
  std::optional<std::string> deviceName;
  std::string subclassName;

  unsigned baseClass() const { return classCode >> 16; }
  unsigned subclass() const { return (classCode >> 8) & 0xFFu; }
};

class PciFunctionCatalog {
public:
  /// Reads below \p root, names through \p names; both outlive the catalog.
  PciFunctionCatalog(const FileSystemRoot &root, PciNameDatabase &names);

  /// The functions of PCI base class \p baseClass, in address order. A
  /// function that vanishes while it is read is left out (when its class
  /// cannot be read) or kept with what could be read; either is logged.
  /// Thread-safe.
  std::vector<PciFunction> functionsOfClass(std::uint8_t baseClass,
                                            ProblemLog &log);

  /// The serial number \p function carries (VPD, else Device Serial
  /// Number), read once for as long as the function stays plugged in.
  std::optional<std::string> cardSerial(const PciFunction &function);

private:
  struct Known {
    ino_t inode = 0;
    std::uint32_t classCode = 0;
    /// Set once every id was read.
    std::optional<PciFunction> identity;
    /// Set once the serial number was looked for.
    std::optional<std::optional<std::string>> serial;
  };

  /// Reads the ids of the function at \p address and names them; sets
  /// \p complete when every id could be read.
  PciFunction readIdentity(const std::string &address, std::uint32_t classCode,
                           bool &complete, ProblemLog &log);

  const std::string DevicesDirectory;
  PciNameDatabase &Names;
  std::mutex Lock;
  std::unordered_map<std::string, Known> Cache;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PCIFUNCTIONCATALOG_H
