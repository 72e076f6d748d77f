//===- PciNodes.h - Network card and storage controller nodes -------------===//
//
/// \file
/// Turns what was read about a PCI function into its node: a network card
/// for base class 02, a storage controller for base class 01. Both stand
/// below the main chassis with their PCI address as path segment, which is
/// unique and stays the same across reboots while the card stays in its
/// slot.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_PCINODES_H
#define HX_SRC_LIVE_PCINODES_H

#include "HardwareSnapshot.h"
#include "live/NetworkInterfaceReader.h"
#include "live/PciFunctionCatalog.h"

#include <optional>
#include <string>
#include <vector>

namespace HX {
namespace detail {
namespace live {

struct NetworkCardFacts {
  PciFunction function;
  /// The interfaces it carries that could be read, in name order.
  std::vector<InterfaceState> interfaces;
  /// The serial number the card carries itself (VPD or Device Serial
  /// Number).
  std::optional<std::string> cardSerial;
  std::optional<std::string> driver;
};

struct StorageControllerFacts {
  PciFunction function;
  /// The block devices below it.
  unsigned blockDevices = 0;
  std::optional<std::string> driver;
};

NodeDescription networkCardNode(const NetworkCardFacts &card);
NodeDescription storageControllerNode(const StorageControllerFacts &controller);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PCINODES_H
