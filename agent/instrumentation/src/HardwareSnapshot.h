//===- HardwareSnapshot.h - One immutable reading of the hardware ---------===//
//
/// \file
/// What a hardware source produces and cursors walk: every node of one
/// reading of the hardware, in document order, with the per-node facts
/// readers ask for precomputed (the node path, the typed properties) and an
/// index of node positions per node type.
///
/// A snapshot never changes once built, so any number of cursors on any
/// number of threads read it without locks; they share it through
/// std::shared_ptr<const HardwareSnapshot>.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_HARDWARESNAPSHOT_H
#define HX_SRC_HARDWARESNAPSHOT_H

#include "HX/NodeLexicon.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <variant>
#include <vector>

namespace HX {
namespace detail {

/// A property is held as text or as an unsigned 32-bit number.
using PropertyValue = std::variant<std::string, unsigned int>;

struct NodeProperty {
  NodeLexicon::Properties id;
  PropertyValue value;
};

/// One node as cursors read it.
struct HardwareNode {
  NodeLexicon::NodeType type{};
  unsigned status = 0;
  std::string description;
  /// The node's internal path (see NodePath.h): unique within the snapshot
  /// and carrying the readable path text.
  std::string internalPath;
  /// Sorted by id, one entry per id; the node's name is its PropNodeName.
  std::vector<NodeProperty> properties;

  /// Returns the node's value of \p id, or nullptr when it has none.
  const PropertyValue *find(NodeLexicon::Properties id) const;
};

class HardwareSnapshot {
public:
  using NodeIndex = std::uint32_t;

  const HardwareNode &node(NodeIndex index) const { return Nodes[index]; }
  std::size_t size() const { return Nodes.size(); }

  /// The nodes of \p type in document order (empty when there are none).
  const std::vector<NodeIndex> &nodesOfType(NodeLexicon::NodeType type) const;

  /// The system name the source gives, if it gives one.
  const std::optional<std::string> &systemName() const { return SystemName; }

  /// True when selecting \p type must fail (a fault a hardware tree injects
  /// to exercise the providers' error paths).
  bool failsSelectionOf(NodeLexicon::NodeType type) const;

private:
  friend class SnapshotBuilder;

  std::vector<HardwareNode> Nodes;
  std::unordered_map<unsigned, std::vector<NodeIndex>> NodesByType;
  std::optional<std::string> SystemName;
  std::vector<NodeLexicon::NodeType> FailingSelections;
};

/// What a hardware source knows about one node before it is placed in the
/// tree.
struct NodeDescription {
  NodeLexicon::NodeType type{};
  /// The node's name (its PropNodeName), if it has one.
  std::optional<std::string> name;
  /// The node's path segment; when absent or empty the segment is the name,
  /// or "<type name>#<n>" with n counting the nodes of that type among the
  /// node's siblings from 0.
  std::optional<std::string> segment;
  unsigned status = 0;
  std::string description;
  /// Properties other than PropNodeName; a later entry for the same id
  /// replaces an earlier one.
  std::vector<NodeProperty> properties;
};

/// Assembles a snapshot. Sources add nodes depth first, each parent before
/// its children: selection walks the nodes of a type in the order they were
/// added, which is then document order.
class SnapshotBuilder {
public:
  using NodeIndex = HardwareSnapshot::NodeIndex;
  static constexpr NodeIndex NoParent = UINT32_MAX;

  SnapshotBuilder();

  /// Adds \p node as the last child of \p parent (NoParent for a root node)
  /// and returns its index.
  NodeIndex addNode(NodeIndex parent, NodeDescription node);

  void setSystemName(std::string name);
  void failSelectionOf(NodeLexicon::NodeType type);

  /// Hands over the finished snapshot; the builder is spent afterwards.
  std::shared_ptr<const HardwareSnapshot> finish();

private:
  /// Per-node bookkeeping needed only while children are still added.
  struct Placement {
    std::uint32_t childCount = 0;
    std::vector<std::pair<NodeLexicon::NodeType, unsigned>> childrenPerType;
  };

  std::string defaultSegment(Placement &siblings, NodeLexicon::NodeType type,
                             const std::optional<std::string> &name);

  std::shared_ptr<HardwareSnapshot> Snapshot;
  Placement Roots;
  std::vector<Placement> Placements;
};

} // namespace detail
} // namespace HX

#endif // HX_SRC_HARDWARESNAPSHOT_H
