//===- HardwareSnapshot.cpp - One immutable reading of the hardware -------===//

#include "HardwareSnapshot.h"

#include "NodePath.h"

#include <algorithm>

namespace HX {
namespace detail {

using NodeLexicon::NodeType;

const PropertyValue *HardwareNode::find(NodeLexicon::Properties id) const {
  auto found = std::lower_bound(
      properties.begin(), properties.end(), id,
      [](const NodeProperty &entry, NodeLexicon::Properties wanted) {
        return entry.id < wanted;
      });
  if (found == properties.end() || found->id != id)
    return nullptr;
  return &found->value;
}

const std::vector<HardwareSnapshot::NodeIndex> &
HardwareSnapshot::nodesOfType(NodeType type) const {
  static const std::vector<NodeIndex> None;
  auto found = NodesByType.find(type);
  return found == NodesByType.end() ? None : found->second;
}

bool HardwareSnapshot::failsSelectionOf(NodeType type) const {
  return std::find(FailingSelections.begin(), FailingSelections.end(), type) !=
         FailingSelections.end();
}

SnapshotBuilder::SnapshotBuilder()
    : Snapshot(std::make_shared<HardwareSnapshot>()) {}

namespace {

/// Counts \p type among the children already placed and returns the count
/// before this one: the node's ordinal among same-typed siblings.
unsigned
takeOrdinal(std::vector<std::pair<NodeType, unsigned>> &childrenPerType,
            NodeType type) {
  for (auto &[seenType, count] : childrenPerType)
    if (seenType == type)
      return count++;
  childrenPerType.emplace_back(type, 1);
  return 0;
}

std::string typeLabel(NodeType type) {
  if (const char *name = NodeLexicon::nameOf(type))
    return name;
  return "Node" + std::to_string(static_cast<unsigned>(type));
}

/// Sorts by id and keeps the last entry given for each id.
std::vector<NodeProperty> normalised(std::vector<NodeProperty> properties) {
  std::stable_sort(properties.begin(), properties.end(),
                   [](const NodeProperty &a, const NodeProperty &b) {
                     return a.id < b.id;
                   });
  std::vector<NodeProperty> unique;
  unique.reserve(properties.size());
  for (NodeProperty &entry : properties) {
    if (!unique.empty() && unique.back().id == entry.id)
      unique.back() = std::move(entry);
    else
      unique.push_back(std::move(entry));
  }
  return unique;
}

} // namespace

std::string SnapshotBuilder::defaultSegment(
    Placement &siblings, NodeType type,
    const std::optional<std::string> &name) {
  unsigned ordinal = takeOrdinal(siblings.childrenPerType, type);
  if (name && !name->empty())
    return *name;
  return typeLabel(type) + "#" + std::to_string(ordinal);
}

SnapshotBuilder::NodeIndex SnapshotBuilder::addNode(NodeIndex parent,
                                                    NodeDescription node) {
  const bool isRoot = parent == NoParent || parent >= Placements.size();
  Placement &siblings = isRoot ? Roots : Placements[parent];
  std::string derived = defaultSegment(siblings, node.type, node.name);
  const std::string &segment =
      node.segment && !node.segment->empty() ? *node.segment : derived;
  const std::uint32_t position = siblings.childCount++;

  HardwareNode placed;
  placed.type = node.type;
  placed.status = node.status;
  placed.description = std::move(node.description);
  placed.internalPath =
      isRoot ? NodePath::forRoot(position, segment)
             : NodePath::forChild(Snapshot->Nodes[parent].internalPath,
                                  position, segment);
  if (node.name)
    node.properties.push_back(
        {NodeLexicon::PropNodeName, PropertyValue(std::move(*node.name))});
  placed.properties = normalised(std::move(node.properties));

  const auto index = static_cast<NodeIndex>(Snapshot->Nodes.size());
  Snapshot->Nodes.push_back(std::move(placed));
  Snapshot->NodesByType[node.type].push_back(index);
  Placements.emplace_back();
  return index;
}

void SnapshotBuilder::setSystemName(std::string name) {
  Snapshot->SystemName = std::move(name);
}

void SnapshotBuilder::failSelectionOf(NodeType type) {
  if (!Snapshot->failsSelectionOf(type))
    Snapshot->FailingSelections.push_back(type);
}

std::shared_ptr<const HardwareSnapshot> SnapshotBuilder::finish() {
  Placements.clear();
  Placements.shrink_to_fit();
  Roots = Placement();
  return std::move(Snapshot);
}

} // namespace detail
} // namespace HX
