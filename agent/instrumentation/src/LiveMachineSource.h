//===- LiveMachineSource.h - Hardware of the running machine --------------===//

#ifndef HX_SRC_LIVEMACHINESOURCE_H
#define HX_SRC_LIVEMACHINESOURCE_H

#include "HardwareSnapshotSource.h"

#include <memory>

namespace HX {
namespace detail {

namespace live {
class LiveMachineReader;
} // namespace live

/// Reads the machine the library runs on, with every system file (SMBIOS
/// tables, sysfs) looked up below a file-system root so that a recorded
/// tree of those files can stand in for a machine. Each selection reads
/// what its node type needs; see live/LiveMachineReader.h, and
/// LIVE-SOURCE.md for the nodes and where each of their properties comes
/// from.
class LiveMachineSource final : public HardwareSnapshotSource {
public:
  explicit LiveMachineSource(std::string fsRoot);
  ~LiveMachineSource() override;

  std::shared_ptr<const HardwareSnapshot>
  snapshotFor(NodeLexicon::NodeType type) override;
  std::string describe() const override;

private:
  std::string FsRoot;
  std::unique_ptr<live::LiveMachineReader> Reader;
};

} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVEMACHINESOURCE_H
