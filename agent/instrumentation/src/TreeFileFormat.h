//===- TreeFileFormat.h - Reading the hardware-tree JSON format -----------===//
//
/// \file
/// Turns the text of a hardware-tree file into a snapshot, or into the one
/// message that says why the file is refused. The format is described in
/// HX/HardwareSource.h; other tools write files in it, so it is checked
/// strictly: anything not described there is refused rather than ignored.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_TREEFILEFORMAT_H
#define HX_SRC_TREEFILEFORMAT_H

#include "HardwareSnapshot.h"

#include <memory>
#include <string>
#include <string_view>

namespace HX {
namespace detail {

/// Nodes may nest this many levels deep (a root node is level 1).
constexpr unsigned MaxTreeDepth = 64;

/// The outcome of reading a tree: exactly one of the members is set.
struct TreeReading {
  std::shared_ptr<const HardwareSnapshot> snapshot;
  /// "<file>: <JSON pointer>: <what is wrong>" or "<file>: parse error ...".
  std::string refusal;
};

/// Parses and checks \p text; \p fileName starts every refusal message.
TreeReading readHardwareTree(std::string_view text,
                             const std::string &fileName);

} // namespace detail
} // namespace HX

#endif // HX_SRC_TREEFILEFORMAT_H
