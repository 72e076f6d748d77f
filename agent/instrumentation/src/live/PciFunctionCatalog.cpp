//===- PciFunctionCatalog.cpp - The PCI functions of the machine ----------===//

#include "live/PciFunctionCatalog.h"

#include "live/CardSerial.h"
#include "live/PciAddress.h"

#include <algorithm>
#include <cstdio>
#include <unordered_set>

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::string_view DevicesDirectoryPath = "/sys/bus/pci/devices";

std::string numbered(const char *word, unsigned number) {
  char text[32];
  std::snprintf(text, sizeof text, "%s %04x", word, number);
  return text;
}

/// Reads a hexadecimal attribute of a function; logs it when it cannot be
/// had, which for a listed function means it went away meanwhile.
std::optional<std::uint32_t> hexAttribute(const std::string &directory,
                                          const char *name,
                                          std::uint32_t maximum,
                                          ProblemLog &log) {
  const std::string path = directory + "/" + name;
  FileText file = readFileText(path);
  if (!file.ok()) {
    log.report(path + ": cannot read: " + errorText(file.error));
    return std::nullopt;
  }
  std::optional<std::uint32_t> value =
      parseHex(attributeValue(file.contents), maximum);
  if (!value)
    log.report(path + ": holds \"" +
               std::string(attributeValue(file.contents).substr(0, 32)) +
               "\", not a hexadecimal number");
  return value;
}

} // namespace

PciFunctionCatalog::PciFunctionCatalog(const FileSystemRoot &root,
                                       PciNameDatabase &names)
    : DevicesDirectory(root.path(DevicesDirectoryPath)), Names(names) {}

PciFunction PciFunctionCatalog::readIdentity(const std::string &address,
                                             std::uint32_t classCode,
                                             bool &complete, ProblemLog &log) {
  PciFunction function;
  function.address = address;
  function.directory = DevicesDirectory + "/" + address;
  function.classCode = classCode;
  function.vendor = hexAttribute(function.directory, "vendor", 0xFFFF, log);
  function.device = hexAttribute(function.directory, "device", 0xFFFF, log);
  function.subsystemVendor =
      hexAttribute(function.directory, "subsystem_vendor", 0xFFFF, log);
  function.subsystemDevice =
      hexAttribute(function.directory, "subsystem_device", 0xFFFF, log);
  function.virtualFunction = readLinkText(function.directory + "/physfn").ok();
  complete = function.vendor && function.device && function.subsystemVendor &&
             function.subsystemDevice;

  if (function.vendor) {
    function.vendorName =
        Names.vendorName(static_cast<std::uint16_t>(*function.vendor));
    if (!function.vendorName)
      function.vendorName = numbered("Vendor", *function.vendor);
  }
  if (function.device) {
    if (function.vendor)
      function.deviceName =
          Names.deviceName(static_cast<std::uint16_t>(*function.vendor),
                           static_cast<std::uint16_t>(*function.device));
    if (!function.deviceName)
      function.deviceName = numbered("Device", *function.device);
  }
  const auto baseClass = static_cast<std::uint8_t>(function.baseClass());
  const auto subclass = static_cast<std::uint8_t>(function.subclass());
  std::optional<std::string> subclassName =
      Names.subclassName(baseClass, subclass);
  function.subclassName =
      subclassName ? *subclassName : numbered("Class", classCode >> 8);
  return function;
}

std::vector<PciFunction>
PciFunctionCatalog::functionsOfClass(std::uint8_t baseClass, ProblemLog &log) {
  DirectoryListing listing = listDirectory(DevicesDirectory);
  if (!listing.ok()) {
    if (!isGone(listing.error))
      log.report(DevicesDirectory +
                 ": cannot list: " + errorText(listing.error));
    return {};
  }
  std::vector<DirectoryEntry> entries;
  for (DirectoryEntry &entry : listing.entries)
    if (isPciAddress(entry.name))
      entries.push_back(std::move(entry));
  std::sort(entries.begin(), entries.end(),
            [](const DirectoryEntry &a, const DirectoryEntry &b) {
              return a.name < b.name;
            });

  std::vector<std::optional<Known>> known(entries.size());
  {
    std::lock_guard<std::mutex> guard(Lock);
    std::unordered_set<std::string> listed;
    for (std::size_t i = 0; i < entries.size(); ++i) {
      listed.insert(entries[i].name);
      auto found = Cache.find(entries[i].name);
      if (found != Cache.end() && found->second.inode == entries[i].inode)
        known[i] = found->second;
    }
    // Functions that are gone or were replaced are forgotten.
    for (auto it = Cache.begin(); it != Cache.end();)
      it = listed.count(it->first) ? std::next(it) : Cache.erase(it);
  }

  std::vector<PciFunction> functions;
  std::vector<std::pair<std::string, Known>> learnt;
  for (std::size_t i = 0; i < entries.size(); ++i) {
    const std::string &address = entries[i].name;
    bool changed = false;
    if (!known[i]) {
      std::optional<std::uint32_t> classCode = hexAttribute(
          DevicesDirectory + "/" + address, "class", 0xFFFFFF, log);
      if (!classCode)
        continue;
      known[i] =
          Known{entries[i].inode, *classCode, std::nullopt, std::nullopt};
      changed = true;
    }
    if ((known[i]->classCode >> 16) == baseClass) {
      if (!known[i]->identity) {
        bool complete = false;
        PciFunction identity =
            readIdentity(address, known[i]->classCode, complete, log);
        identity.entryInode = entries[i].inode;
        if (!complete) {
          // Ids that vanished while being read mean the function is going
          // away: it is reported as read, and not remembered.
          functions.push_back(std::move(identity));
          continue;
        }
        known[i]->identity = std::move(identity);
        changed = true;
      }
      functions.push_back(*known[i]->identity);
    }
    if (changed)
      learnt.emplace_back(address, std::move(*known[i]));
  }

  std::lock_guard<std::mutex> guard(Lock);
  for (auto &[address, entry] : learnt)
    Cache[address] = std::move(entry);
  return functions;
}

std::optional<std::string>
PciFunctionCatalog::cardSerial(const PciFunction &function) {
  {
    std::lock_guard<std::mutex> guard(Lock);
    auto found = Cache.find(function.address);
    if (found != Cache.end() && found->second.inode == function.entryInode &&
        found->second.serial)
      return *found->second.serial;
  }
  std::optional<std::string> serial =
      vpdSerialNumber(RandomAccessFile(function.directory + "/vpd"));
  if (!serial)
    serial =
        deviceSerialNumber(RandomAccessFile(function.directory + "/config"));

  std::lock_guard<std::mutex> guard(Lock);
  auto found = Cache.find(function.address);
  if (found != Cache.end() && found->second.inode == function.entryInode)
    found->second.serial = serial;
  return serial;
}

} // namespace live
} // namespace detail
} // namespace HX
