//===- NetworkInterfaceReader.h - State of the network interfaces ---------===//

#ifndef HX_SRC_LIVE_NETWORKINTERFACEREADER_H
#define HX_SRC_LIVE_NETWORKINTERFACEREADER_H

#include "live/ProblemLog.h"
#include "live/SystemFiles.h"

#include <mutex>
#include <optional>
#include <string>
#include <unordered_map>

namespace HX {
namespace detail {
namespace live {

struct InterfaceState {
  std::string name;
  /// The administrator's choice (IFF_UP in "flags").
  bool up = false;
  /// A carrier on an interface that is up.
  bool hasLink = false;
  /// The hardware address when the kernel reported it as the device's own
  /// ("addr_assign_type" 0), not one set, stolen or made up.
  std::optional<std::string> permanentAddress;
};

/// Reads interfaces in /sys/class/net. Their state is read at every
/// reading; the permanent address, which cannot change while the interface
/// exists, once per interface (name and entry inode).
class NetworkInterfaceReader {
public:
  /// Reads in \p netDirectory ("<root>/sys/class/net").
  explicit NetworkInterfaceReader(std::string netDirectory);

  /// Reads the interface listed as \p entry; its permanent address only
  /// when \p withAddress. nullopt when the interface is gone: it was listed,
  /// so it vanished meanwhile, which is logged. Thread-safe.
  std::optional<InterfaceState> read(const DirectoryEntry &entry,
                                     bool withAddress, ProblemLog &log);

private:
  std::optional<std::string> permanentAddress(const DirectoryEntry &entry);

  struct KnownAddress {
    ino_t inode = 0;
    std::optional<std::string> address;
  };

  const std::string Directory;
  std::mutex Lock;
  std::unordered_map<std::string, KnownAddress> Addresses;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_NETWORKINTERFACEREADER_H
