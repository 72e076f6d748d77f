//===- Instrumentation.cpp - Cursor over hardware nodes -------------------===//

#include "HX/Instrumentation.h"

#include "CurrentSource.h"
#include "HardwareSnapshot.h"
#include "NodePath.h"

namespace HX {

Instrumentation::Instrumentation(Instrumentation &&other) noexcept
    : Snapshot(std::move(other.Snapshot)), Selection(other.Selection),
      Position(other.Position) {
  other.Selection = nullptr;
  other.Position = 0;
}

Instrumentation &Instrumentation::operator=(Instrumentation &&other) noexcept {
  if (this != &other) {
    Snapshot = std::move(other.Snapshot);
    Selection = other.Selection;
    Position = other.Position;
    other.Selection = nullptr;
    other.Position = 0;
  }
  return *this;
}

void Instrumentation::selectNode(NodeLexicon::NodeType type) {
  Snapshot.reset();
  Selection = nullptr;
  Position = 0;

  std::shared_ptr<detail::HardwareSnapshotSource> source =
      detail::currentSource();
  std::shared_ptr<const detail::HardwareSnapshot> reading =
      source->snapshotFor(type);
  if (reading->failsSelectionOf(type)) {
    const char *name = NodeLexicon::nameOf(type);
    throw InstrumentationError(source->describe() + ": selecting " +
                               (name ? name : std::to_string(type)) +
                               " fails as the tree's faults.throwOnSelect asks");
  }
  Selection = &reading->nodesOfType(type);
  Snapshot = std::move(reading);
}

const detail::HardwareNode *Instrumentation::node() const {
  if (!Snapshot || !Selection || Position >= Selection->size())
    return nullptr;
  return &Snapshot->node((*Selection)[Position]);
}

Instrumentation &Instrumentation::operator++() {
  if (node())
    ++Position;
  return *this;
}

namespace {
thread_local std::uint64_t PropertyReads = 0;
} // namespace

std::uint64_t propertyReadsOnThisThread() { return PropertyReads; }

bool Instrumentation::getProperty(NodeLexicon::Properties property,
                                  std::string &value) const {
  ++PropertyReads;
  const detail::HardwareNode *current = node();
  if (!current)
    return false;
  const detail::PropertyValue *found = current->find(property);
  const auto *text = found ? std::get_if<std::string>(found) : nullptr;
  if (!text)
    return false;
  value = *text;
  return true;
}

bool Instrumentation::getProperty(NodeLexicon::Properties property,
                                  unsigned int &value) const {
  ++PropertyReads;
  const detail::HardwareNode *current = node();
  if (!current)
    return false;
  const detail::PropertyValue *found = current->find(property);
  const auto *number = found ? std::get_if<unsigned int>(found) : nullptr;
  if (!number)
    return false;
  value = *number;
  return true;
}

std::string Instrumentation::getPathToNode() const {
  const detail::HardwareNode *current = node();
  return current ? current->internalPath : std::string();
}

std::string Instrumentation::convertPathToString(const std::string &path) const {
  std::optional<std::string_view> text = detail::NodePath::readableText(path);
  return text ? std::string(*text) : path;
}

unsigned Instrumentation::getNodeStatus() const {
  const detail::HardwareNode *current = node();
  return current ? current->status : 0;
}

std::string Instrumentation::getNodeDescription() const {
  const detail::HardwareNode *current = node();
  return current ? current->description : std::string();
}

} // namespace HX
