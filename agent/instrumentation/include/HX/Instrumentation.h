//===- HX/Instrumentation.h - Cursor over hardware nodes ------------------===//
//
/// \file
/// The one way the providers read the hardware: a cursor that stands on one
/// node of one kind at a time.
///
/// \code
///   HX::Instrumentation slots;
///   for (slots.selectNode(HX::NodeLexicon::SlotNode); slots; ++slots) {
///     unsigned number;
///     if (slots.getProperty(HX::NodeLexicon::PropSlotNumber, number))
///       ...
///   }
/// \endcode
///
/// Each selectNode takes a fresh reading of the hardware (see
/// HX/HardwareSource.h for where it comes from). The reading is immutable
/// and shared: copying a cursor copies a reference and a position, never
/// node data, so cursors are cheap to construct, copy and pass by value.
/// Distinct cursors may be used on distinct threads at the same time; one
/// cursor is not to be used by two threads at once.
///
/// Nothing but selectNode throws. Off a node (before selectNode, after the
/// last node, after a failed selectNode) every reader reports "nothing":
/// false, an empty string or 0.
//
//===----------------------------------------------------------------------===//

#ifndef HX_INSTRUMENTATION_H
#define HX_INSTRUMENTATION_H

#include "HX/InstrumentationError.h"
#include "HX/NodeLexicon.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace HX {

namespace detail {
class HardwareSnapshot;
struct HardwareNode;
} // namespace detail

class Instrumentation {
public:
  /// Makes a cursor standing on no node. Does no I/O.
  Instrumentation() = default;

  /// The copy stands on the same node of the same reading and then moves
  /// independently of the original.
  Instrumentation(const Instrumentation &other) = default;
  Instrumentation &operator=(const Instrumentation &other) = default;

  /// The moved-from cursor stands on no node.
  Instrumentation(Instrumentation &&other) noexcept;
  Instrumentation &operator=(Instrumentation &&other) noexcept;

  ~Instrumentation() = default;

  /// Reads the hardware anew and stands on its first node of \p type in
  /// document order (depth first, parents before children), or on no node
  /// when it has none.
  ///
  /// \throws InstrumentationError when the hardware-tree file in use is
  ///   refused, or when the tree lists \p type in faults.throwOnSelect. The
  ///   cursor then stands on no node.
  void selectNode(NodeLexicon::NodeType type);

  /// True while the cursor stands on a node.
  explicit operator bool() const { return node() != nullptr; }

  /// Moves to the next node of the selected type. Past the last one the
  /// cursor stands on no node and stays there; off a node this does nothing.
  Instrumentation &operator++();

  /// Reads a string property of the current node.
  ///
  /// \returns true and sets \p value when the node holds \p property as a
  ///   string; otherwise false, leaving \p value untouched (also when the
  ///   node holds it as a number, or the cursor is off a node).
  bool getProperty(NodeLexicon::Properties property, std::string &value) const;

  /// Reads a numeric property of the current node.
  ///
  /// \returns true and sets \p value when the node holds \p property as a
  ///   number; otherwise false, leaving \p value untouched (also when the
  ///   node holds it as a string, or the cursor is off a node).
  bool getProperty(NodeLexicon::Properties property,
                   unsigned int &value) const;

  /// The current node's path in the library's internal form: unique per
  /// node within one reading, even where readable paths coincide. Meant for
  /// convertPathToString and for telling nodes apart, not for display.
  /// Empty off a node.
  std::string getPathToNode() const;

  /// The readable form of an internal \p path: "/" followed by the segments
  /// from the root to the node joined by "/", e.g.
  /// "/System/Chassis 1/PCIe Slot 3". The same node always gives the same
  /// text. Text that is not an internal path is returned unchanged. Does not
  /// depend on where this cursor stands.
  std::string convertPathToString(const std::string &path) const;

  /// The current node's status (0 when the source gives none); 0 off a node.
  unsigned getNodeStatus() const;

  /// The current node's description (empty when the source gives none);
  /// empty off a node.
  std::string getNodeDescription() const;

private:
  const detail::HardwareNode *node() const;

  /// The reading this cursor walks; shared with its copies, never modified.
  std::shared_ptr<const detail::HardwareSnapshot> Snapshot;
  /// The reading's node indices of the selected type, in document order.
  const std::vector<std::uint32_t> *Selection = nullptr;
  std::size_t Position = 0;
};

/// How many property reads (getProperty, either overload) cursors have made
/// on the calling thread since it started. A diagnostic: it shows what a
/// walk reads without timing it.
std::uint64_t propertyReadsOnThisThread();

} // namespace HX

#endif // HX_INSTRUMENTATION_H
