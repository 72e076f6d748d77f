//===- DeviceLinkCatalog.h - The PCI function below which a device sits ---===//
//
/// \file
/// /sys/class/net and /sys/block list the machine's network interfaces and
/// disks as links into the device tree, e.g.
///
/// \code
///   eth0 -> ../../devices/pci0000:00/0000:00:03.0/virtio2/net/eth0
///   sda  -> ../devices/pci0000:00/0000:00:1f.2/ata1/host0/target0:0:0/...
/// \endcode
///
/// so the last PCI address in the link names the function that carries the
/// interface or controls the disk, whatever lies between (virtio, SCSI
/// hosts, NVMe namespaces). A link never changes while its entry exists, and
/// a new device gets a new entry, so targets are kept per entry name and
/// inode and a reading costs one listing.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_DEVICELINKCATALOG_H
#define HX_SRC_LIVE_DEVICELINKCATALOG_H

#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

#include <map>
#include <mutex>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include <sys/types.h>

namespace HX {
namespace detail {
namespace live {

class DeviceLinkCatalog {
public:
  /// Lists \p directory ("<root>/sys/class/net", "<root>/sys/block").
  explicit DeviceLinkCatalog(std::string directory);

  /// The directory's entries by the address of the PCI function they sit
  /// below, each list in name order; entries below no PCI function (virtual
  /// devices) are left out. An entry whose link cannot be read is logged and
  /// left out. Thread-safe.
  std::map<std::string, std::vector<DirectoryEntry>>
  entriesByFunction(ProblemLog &log);

  const std::string &directory() const { return Directory; }

private:
  struct Known {
    ino_t inode = 0;
    std::optional<std::string> function;
  };

  const std::string Directory;
  std::mutex Lock;
  std::unordered_map<std::string, Known> Cache;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_DEVICELINKCATALOG_H
