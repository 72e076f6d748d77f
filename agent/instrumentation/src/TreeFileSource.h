//===- TreeFileSource.h - Hardware described by a tree file ---------------===//

#ifndef HX_SRC_TREEFILESOURCE_H
#define HX_SRC_TREEFILESOURCE_H

#include "FileSnapshot.h"
#include "HardwareSnapshotSource.h"
#include "TreeFileFormat.h"

#include <cstdint>
#include <mutex>

namespace HX {
namespace detail {

/// Reads the hardware from a hardware-tree file. The last reading is kept
/// while the file's identity stays the same, so each selection costs one
/// stat unless the file changed.
class TreeFileSource final : public HardwareSnapshotSource {
public:
  explicit TreeFileSource(std::string path);

  std::shared_ptr<const HardwareSnapshot>
  snapshotFor(NodeLexicon::NodeType type) override;
  std::string describe() const override;
  std::optional<std::string> systemName() override;

private:
  /// The current reading of the file; throws InstrumentationError when the
  /// file is refused, after logging the refusal.
  std::shared_ptr<const HardwareSnapshot> current();
  TreeReading currentReading();

  const std::string Path;
  std::mutex Lock;
  std::optional<FileIdentity> CachedIdentity;
  TreeReading Cached;
};

/// How often a tree file has been read for cursors in this process.
std::uint64_t treeFileReads();

/// Reads and checks the file at \p path without a cache: the outcome of
/// selecting from it.
TreeReading readHardwareTreeFile(const std::string &path);

} // namespace detail
} // namespace HX

#endif // HX_SRC_TREEFILESOURCE_H
