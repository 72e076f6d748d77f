//===- LiveMachineSource.cpp - Hardware of the running machine ------------===//

#include "LiveMachineSource.h"

#include "live/LiveMachineReader.h"

namespace HX {
namespace detail {

LiveMachineSource::LiveMachineSource(std::string fsRoot)
    : FsRoot(fsRoot.empty() ? std::string("/") : std::move(fsRoot)),
      Reader(std::make_unique<live::LiveMachineReader>(FsRoot)) {}

LiveMachineSource::~LiveMachineSource() = default;

std::shared_ptr<const HardwareSnapshot>
LiveMachineSource::snapshotFor(NodeLexicon::NodeType type) {
  using namespace NodeLexicon;
  switch (type) {
  case SystemNode:
  case ChassisNode:
  case ConnectorNode:
    return Reader->firmwareReading(false);
  case SlotNode:
    return Reader->firmwareReading(true);
  case NetworkCardNode:
    return Reader->networkCardReading();
  case StorageControllerNode:
    return Reader->storageControllerReading();
  default: {
    // The live machine reports the kinds the providers publish; the
    // structural kinds are not read from it.
    static const std::shared_ptr<const HardwareSnapshot> NoNodes =
        SnapshotBuilder().finish();
    return NoNodes;
  }
  }
}

std::string LiveMachineSource::describe() const {
  return "live machine at " + FsRoot;
}

} // namespace detail
} // namespace HX
