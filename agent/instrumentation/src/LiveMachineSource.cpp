//===- LiveMachineSource.cpp - Hardware of the running machine ------------===//

#include "LiveMachineSource.h"

namespace HX {
namespace detail {

LiveMachineSource::LiveMachineSource(std::string fsRoot)
    : FsRoot(fsRoot.empty() ? std::string("/") : std::move(fsRoot)) {}

std::shared_ptr<const HardwareSnapshot>
LiveMachineSource::snapshotFor(NodeLexicon::NodeType) {
  // The live reader is the next piece of work: it will walk the SMBIOS
  // tables and sysfs below FsRoot and add one node per chassis, slot,
  // connector, network card and storage controller through SnapshotBuilder,
  // reading only what the requested type needs. Until then the live machine
  // has no nodes, so every selection ends empty.
  static const std::shared_ptr<const HardwareSnapshot> NoNodes =
      SnapshotBuilder().finish();
  return NoNodes;
}

std::string LiveMachineSource::describe() const {
  return "live machine at " + FsRoot;
}

} // namespace detail
} // namespace HX
