// Fuzz target: the live source's SMBIOS reader, from the bytes the kernel
// exports to the nodes they become: the entry point, the walk over the
// table's structures, their decoding into firmware facts, and the system,
// chassis, slot and connector nodes made of those. Firmware gets these
// tables wrong in every way (tables cut short, lengths that lie, string sets
// without their terminator, counts far beyond the table); whatever the
// bytes, the reader keeps what is whole and never reads outside them.
//
// Input: one byte n, then n bytes of entry point, then the table.
#include "FuzzCheck.h"
#include "ReadableText.h"

#include "HardwareSnapshot.h"
#include "NodePath.h"
#include "live/FirmwareNodes.h"
#include "live/SmbiosDecoding.h"
#include "live/SmbiosEntryPoint.h"
#include "live/SmbiosTable.h"

#include <cstddef>
#include <cstdint>
#include <set>

namespace {

using namespace HX::detail::live;
using tvr::fuzz::require;

bool lies(std::string_view part, std::string_view whole) {
  return part.data() >= whole.data() && part.data() + part.size() <= whole.data() + whole.size();
}

void checkWalk(const SmbiosTableWalk& walk, std::string_view table, std::optional<unsigned> announced) {
  if (announced) require(walk.structures.size() <= *announced, "no more structures than the entry point announces");
  std::size_t end = 0;
  for (std::size_t i = 0; i < walk.structures.size(); ++i) {
    const SmbiosStructure& s = walk.structures[i];
    require(lies(s.formatted, table), "a structure lies inside the table");
    require(s.formatted.size() >= 4, "a structure holds at least its header");
    require(s.offset == static_cast<std::size_t>(s.formatted.data() - table.data()), "a structure starts at its offset");
    require(s.offset >= end, "structures follow each other without overlapping");
    require(s.type == static_cast<std::uint8_t>(table[s.offset]), "the type is the structure's first byte");
    end = s.offset + s.formatted.size();
    for (std::string_view text : s.strings) {
      require(lies(text, table), "a string lies inside the table");
      require(text.find('\0') == std::string_view::npos, "a string ends at its terminator");
    }
    require(s.type != 127 || i + 1 == walk.structures.size(), "the walk ends at the end-of-table structure");
  }
  if (walk.structures.empty()) require(table.empty() || !walk.problems.empty() || announced == 0u,
                                       "a table with bytes but no structure says why");
}

void checkText(const OptionalText& text) {
  if (text) require(tvr::fuzz::isReadableText(*text), "firmware texts are readable: '" + *text + "'");
}

void checkInventory(const FirmwareInventory& inventory) {
  if (inventory.system) {
    const SystemRecord& system = *inventory.system;
    for (const OptionalText* text : {&system.manufacturer, &system.productName, &system.version,
                                     &system.serialNumber, &system.sku, &system.family})
      checkText(*text);
    if (system.uuid) require(system.uuid->size() == 36, "a UUID has the 8-4-4-4-12 form");
  }
  for (const ChassisRecord& chassis : inventory.chassis) {
    require(chassis.chassisType <= 0x7F, "the chassis type has its lock bit masked");
    for (const OptionalText* text : {&chassis.manufacturer, &chassis.version, &chassis.serialNumber,
                                     &chassis.assetTag, &chassis.sku})
      checkText(*text);
  }
  for (const SlotRecord& slot : inventory.slots) checkText(slot.designation);
  for (const ConnectorRecord& connector : inventory.connectors) {
    checkText(connector.internalDesignator);
    checkText(connector.externalDesignator);
  }
}

void checkNodes(const FirmwareInventory& inventory) {
  HX::detail::SnapshotBuilder builder;
  addFirmwareNodes(builder, inventory, {});
  const std::shared_ptr<const HX::detail::HardwareSnapshot> snapshot = builder.finish();
  require(!snapshot->nodesOfType(HX::NodeLexicon::ChassisNode).empty(), "every machine has a main chassis");
  require(snapshot->nodesOfType(HX::NodeLexicon::SlotNode).size() == inventory.slots.size(),
          "every slot of the table becomes a node");
  require(snapshot->nodesOfType(HX::NodeLexicon::ConnectorNode).size() == inventory.connectors.size(),
          "every connector of the table becomes a node");
  std::set<std::string_view> paths;
  for (HX::NodeLexicon::NodeType type : {HX::NodeLexicon::SlotNode, HX::NodeLexicon::ConnectorNode})
    for (HX::detail::HardwareSnapshot::NodeIndex index : snapshot->nodesOfType(type)) {
      const std::optional<std::string_view> path =
          HX::detail::NodePath::readableText(snapshot->node(index).internalPath);
      require(path && paths.insert(*path).second, "slots and connectors have paths of their own");
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size == 0) return 0;
  const std::string_view bytes(reinterpret_cast<const char*>(data), size);
  const std::size_t entryLength = std::min<std::size_t>(data[0], size - 1);
  const std::string_view entryBytes = bytes.substr(1, entryLength);
  const std::string_view table = bytes.substr(1 + entryLength);

  const EntryPointReading entry = parseSmbiosEntryPoint(entryBytes);
  require(entry.entryPoint || !entry.problems.empty(), "an entry point that cannot be read says why");
  const std::optional<unsigned> announced = entry.entryPoint ? entry.entryPoint->structureCount : std::nullopt;

  const SmbiosTableWalk walk = walkSmbiosTable(table, announced);
  checkWalk(walk, table, announced);
  for (bool uuidFieldsLittleEndian : {true, false}) {
    std::vector<std::string> problems;
    const FirmwareInventory inventory = decodeSmbios(walk, uuidFieldsLittleEndian, problems);
    checkInventory(inventory);
    checkNodes(inventory);
  }
  return 0;
}
