//===- LiveMachineSource.h - Hardware of the running machine --------------===//

#ifndef HX_SRC_LIVEMACHINESOURCE_H
#define HX_SRC_LIVEMACHINESOURCE_H

#include "HardwareSnapshotSource.h"

namespace HX {
namespace detail {

/// Reads the machine the library runs on, with every system file (SMBIOS
/// tables, sysfs) looked up below a file-system root so that a copied tree
/// of those files can stand in for a machine.
class LiveMachineSource final : public HardwareSnapshotSource {
public:
  explicit LiveMachineSource(std::string fsRoot);

  std::shared_ptr<const HardwareSnapshot>
  snapshotFor(NodeLexicon::NodeType type) override;
  std::string describe() const override;

private:
  std::string FsRoot;
};

} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVEMACHINESOURCE_H
