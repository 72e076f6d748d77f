//===- PciNameDatabase.h - Vendor, device and class names of PCI ids ------===//
//
/// \file
/// Names from the PCI ID database (pci.ids), looked up through libpci. The
/// database is parsed once, at the first lookup, and kept for the life of
/// the source: parsing the full database takes milliseconds, a lookup after
/// that well under a microsecond. libpci is asked for the file alone: not
/// udev's hardware database, not its DNS lookups, not its cache in $HOME.
///
/// libpci ends the process when the file it parses is malformed; here such a
/// file is logged once and the names fall back to numbers instead.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_PCINAMEDATABASE_H
#define HX_SRC_LIVE_PCINAMEDATABASE_H

#include "live/ProblemLog.h"

#include <cstdint>
#include <mutex>
#include <optional>
#include <string>
#include <vector>

struct pci_access;

namespace HX {
namespace detail {
namespace live {

class PciNameDatabase {
public:
  /// Uses the first of \p candidateFiles that exists when the first name is
  /// looked up; problems with it go to \p log, which must outlive this.
  PciNameDatabase(std::vector<std::string> candidateFiles, ProblemLog &log);
  PciNameDatabase(const PciNameDatabase &) = delete;
  PciNameDatabase &operator=(const PciNameDatabase &) = delete;
  ~PciNameDatabase();

  /// The names the database gives, or nullopt. Thread-safe.
  std::optional<std::string> vendorName(std::uint16_t vendor);
  std::optional<std::string> deviceName(std::uint16_t vendor,
                                        std::uint16_t device);
  std::optional<std::string> subclassName(std::uint8_t baseClass,
                                          std::uint8_t subclass);

private:
  /// Loads the database on first use; false when there is none to use.
  bool ready();
  std::optional<std::string> lookUp(int what, unsigned first, unsigned second);

  const std::vector<std::string> CandidateFiles;
  ProblemLog &Log;
  std::mutex Lock;
  bool Tried = false;
  pci_access *Access = nullptr;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PCINAMEDATABASE_H
