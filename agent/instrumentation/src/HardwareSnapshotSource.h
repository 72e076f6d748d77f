//===- HardwareSnapshotSource.h - Producer of hardware readings -----------===//
//
/// \file
/// The seam between the cursor and the hardware: a source hands out
/// snapshots and the cursor walks them. The tree-file source reads a JSON
/// description; the live source reads the running machine.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_HARDWARESNAPSHOTSOURCE_H
#define HX_SRC_HARDWARESNAPSHOTSOURCE_H

#include "HardwareSnapshot.h"

#include <memory>
#include <optional>
#include <string>

namespace HX {
namespace detail {

class HardwareSnapshotSource {
public:
  virtual ~HardwareSnapshotSource() = default;

  /// A current reading that holds at least every node of \p type (a source
  /// may return more). Called from any thread.
  ///
  /// \throws InstrumentationError when the hardware cannot be read.
  virtual std::shared_ptr<const HardwareSnapshot>
  snapshotFor(NodeLexicon::NodeType type) = 0;

  /// E.g. "tree file /x/y.json" or "live machine at /".
  virtual std::string describe() const = 0;

  /// The system name this source gives, if any. Never throws.
  virtual std::optional<std::string> systemName() { return std::nullopt; }
};

} // namespace detail
} // namespace HX

#endif // HX_SRC_HARDWARESNAPSHOTSOURCE_H
