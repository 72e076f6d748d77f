// Fuzz target: the hardware-tree file reader. Any bytes end in a snapshot or
// in one refusal that names the file; never in a crash, a hang or an
// exception. An accepted tree must be one the cursor can walk: every node
// with a readable path, its properties sorted and unique, and the index of
// each node type pointing at nodes of that type.
#include "FuzzCheck.h"
#include "NodePath.h"
#include "TreeFileFormat.h"

#include <cstddef>
#include <cstdint>
#include <map>

namespace {

using HX::detail::HardwareNode;
using HX::detail::HardwareSnapshot;

void checkNode(const HardwareNode& node) {
  const std::optional<std::string_view> text = HX::detail::NodePath::readableText(node.internalPath);
  tvr::fuzz::require(text && text->size() >= 2 && text->front() == '/', "every node has a readable path");
  for (std::size_t i = 1; i < node.properties.size(); ++i)
    tvr::fuzz::require(node.properties[i - 1].id < node.properties[i].id, "properties are sorted and unique");
}

void checkSnapshot(const HardwareSnapshot& snapshot) {
  std::map<HX::NodeLexicon::NodeType, std::size_t> nodesPerType;
  for (HardwareSnapshot::NodeIndex i = 0; i < snapshot.size(); ++i) {
    checkNode(snapshot.node(i));
    ++nodesPerType[snapshot.node(i).type];
  }
  for (const auto& [type, count] : nodesPerType) {
    const std::vector<HardwareSnapshot::NodeIndex>& indexed = snapshot.nodesOfType(type);
    tvr::fuzz::require(indexed.size() == count, "every node is indexed under its type");
    for (std::size_t i = 0; i < indexed.size(); ++i) {
      tvr::fuzz::require(indexed[i] < snapshot.size() && snapshot.node(indexed[i]).type == type,
                         "the type index points at nodes of its type");
      tvr::fuzz::require(i == 0 || indexed[i - 1] < indexed[i], "the type index is in document order");
    }
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  const HX::detail::TreeReading reading = HX::detail::readHardwareTree(text, "fuzz.json");
  tvr::fuzz::require((reading.snapshot != nullptr) != !reading.refusal.empty(),
                     "a reading is a snapshot or a refusal, not both or neither");
  if (reading.snapshot) checkSnapshot(*reading.snapshot);
  else tvr::fuzz::require(reading.refusal.rfind("fuzz.json: ", 0) == 0, "a refusal starts with the file's name");
  return 0;
}
