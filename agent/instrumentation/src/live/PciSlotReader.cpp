//===- PciSlotReader.cpp - The kernel's list of physical PCI slots --------===//

#include "live/PciSlotReader.h"

#include "live/HardwareCodes.h"

#include <algorithm>

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::string_view SlotsDirectory = "/sys/bus/pci/slots";

/// Numbered slots first, by number; then the others by name.
bool inSlotOrder(const std::string &a, const std::string &b) {
  std::optional<std::uint32_t> numberA = parseDecimal(a);
  std::optional<std::uint32_t> numberB = parseDecimal(b);
  if (numberA && numberB)
    return *numberA < *numberB;
  if (numberA || numberB)
    return numberA.has_value();
  return a < b;
}

/// An attribute of the slot, or nullopt; a slot that vanished while it was
/// being read is logged (a missing optional attribute is not).
std::optional<std::string> attribute(const std::string &slotDirectory,
                                     const char *name, bool required,
                                     ProblemLog &log) {
  const std::string path = slotDirectory + "/" + name;
  FileText file = readFileText(path);
  if (file.ok())
    return std::string(attributeValue(file.contents));
  if (required || !isGone(file.error))
    log.report(path + ": cannot read: " + errorText(file.error));
  return std::nullopt;
}

} // namespace

std::vector<SlotRecord> readPciSlots(const FileSystemRoot &root,
                                     ProblemLog &log) {
  const std::string directory = root.path(SlotsDirectory);
  DirectoryListing listing = listDirectory(directory);
  if (!listing.ok()) {
    if (!isGone(listing.error))
      log.report(directory + ": cannot list: " + errorText(listing.error));
    return {};
  }
  std::vector<std::string> names;
  for (const DirectoryEntry &entry : listing.entries)
    names.push_back(entry.name);
  std::sort(names.begin(), names.end(), inSlotOrder);

  std::vector<SlotRecord> slots;
  for (const std::string &name : names) {
    const std::string slotDirectory = directory + "/" + name;
    SlotRecord slot;
    slot.designation = "Slot " + name;
    if (std::optional<std::uint32_t> number = parseDecimal(name))
      slot.number = *number;
    slot.pciAddress = attribute(slotDirectory, "address", true, log);
    if (std::optional<std::string> speed =
            attribute(slotDirectory, "max_bus_speed", false, log))
      slot.connectorLayout = connectorLayoutOfBusSpeed(*speed);
    slots.push_back(std::move(slot));
  }
  return slots;
}

} // namespace live
} // namespace detail
} // namespace HX
