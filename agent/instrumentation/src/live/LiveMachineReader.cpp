//===- LiveMachineReader.cpp - Reading the live machine per node type -----===//

#include "live/LiveMachineReader.h"

#include "live/FirmwareNodes.h"
#include "live/FirmwareReader.h"
#include "live/NetworkInterfaceReader.h"
#include "live/PciNodes.h"
#include "live/PciSlotReader.h"

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::string_view NetworkInterfacesDirectory = "/sys/class/net";
constexpr std::string_view BlockDevicesDirectory = "/sys/block";

/// PCI base classes.
constexpr std::uint8_t MassStorageController = 0x01;
constexpr std::uint8_t NetworkController = 0x02;

constexpr std::string_view PciIdFiles[] = {
    "/usr/share/misc/pci.ids",
    "/usr/share/hwdata/pci.ids",
    "/usr/share/pci.ids",
};

/// The kernel driver bound to \p function; nullopt when none is.
std::optional<std::string> driverOf(const PciFunction &function) {
  LinkText link = readLinkText(function.directory + "/driver");
  if (!link.ok())
    return std::nullopt;
  const std::size_t slash = link.target.rfind('/');
  return slash == std::string::npos ? link.target
                                    : link.target.substr(slash + 1);
}

using EntriesByFunction = std::map<std::string, std::vector<DirectoryEntry>>;

const std::vector<DirectoryEntry> &entriesBelow(const EntriesByFunction &all,
                                                const std::string &address) {
  static const std::vector<DirectoryEntry> None;
  auto found = all.find(address);
  return found == all.end() ? None : found->second;
}

} // namespace

std::vector<std::string> pciIdFileCandidates(const FileSystemRoot &root) {
  std::vector<std::string> candidates;
  for (std::string_view file : PciIdFiles)
    candidates.push_back(root.path(file));
  for (std::string_view file : PciIdFiles)
    if (root.path(file) != file)
      candidates.emplace_back(file);
  return candidates;
}

LiveMachineReader::LiveMachineReader(const std::string &fsRoot)
    : Root(fsRoot), Names(pciIdFileCandidates(Root), Log),
      Functions(Root, Names),
      NetworkInterfaces(Root.path(NetworkInterfacesDirectory)),
      InterfaceStates(Root.path(NetworkInterfacesDirectory)),
      BlockDevices(Root.path(BlockDevicesDirectory)) {}

std::shared_ptr<const HardwareSnapshot>
LiveMachineReader::firmwareReading(bool withKernelSlots) {
  FirmwareInventory firmware = readFirmwareInventory(Root, Log);
  std::vector<SlotRecord> kernelSlots;
  if (withKernelSlots && firmware.slots.empty())
    kernelSlots = readPciSlots(Root, Log);
  SnapshotBuilder builder;
  addFirmwareNodes(builder, firmware, kernelSlots);
  return builder.finish();
}

std::shared_ptr<const HardwareSnapshot>
LiveMachineReader::networkCardReading() {
  std::vector<PciFunction> functions =
      Functions.functionsOfClass(NetworkController, Log);
  EntriesByFunction interfaces = NetworkInterfaces.entriesByFunction(Log);
  SnapshotBuilder builder;
  const SnapshotBuilder::NodeIndex chassis = addMainChassisPath(builder);
  for (PciFunction &function : functions) {
    // A virtual function is a share of a card, not a card of its own.
    if (function.virtualFunction)
      continue;
    NetworkCardFacts card;
    for (const DirectoryEntry &entry :
         entriesBelow(interfaces, function.address))
      if (std::optional<InterfaceState> state =
              InterfaceStates.read(entry, card.interfaces.empty(), Log))
        card.interfaces.push_back(std::move(*state));
    card.driver = driverOf(function);
    card.cardSerial = Functions.cardSerial(function);
    card.function = std::move(function);
    builder.addNode(chassis, networkCardNode(card));
  }
  return builder.finish();
}

std::shared_ptr<const HardwareSnapshot>
LiveMachineReader::storageControllerReading() {
  std::vector<PciFunction> functions =
      Functions.functionsOfClass(MassStorageController, Log);
  EntriesByFunction disks = BlockDevices.entriesByFunction(Log);
  SnapshotBuilder builder;
  const SnapshotBuilder::NodeIndex chassis = addMainChassisPath(builder);
  for (PciFunction &function : functions) {
    if (function.virtualFunction)
      continue;
    StorageControllerFacts controller;
    controller.blockDevices =
        static_cast<unsigned>(entriesBelow(disks, function.address).size());
    controller.driver = driverOf(function);
    controller.function = std::move(function);
    builder.addNode(chassis, storageControllerNode(controller));
  }
  return builder.finish();
}

} // namespace live
} // namespace detail
} // namespace HX
