//===- NetworkInterfaceReader.cpp - State of the network interfaces -------===//

#include "live/NetworkInterfaceReader.h"

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::uint32_t InterfaceUp = 0x1;         // IFF_UP
constexpr std::string_view PermanentAddress = "0"; // NET_ADDR_PERM

std::optional<std::string> value(const std::string &path) {
  FileText file = readFileText(path);
  if (!file.ok())
    return std::nullopt;
  return std::string(attributeValue(file.contents));
}

bool isZeroAddress(const std::string &address) {
  return address.find_first_not_of("0:") == std::string::npos;
}

/// Interfaces come and go with containers; the memory of their addresses is
/// bounded, and refilled when it overflows.
constexpr std::size_t MaxRemembered = 4096;

} // namespace

NetworkInterfaceReader::NetworkInterfaceReader(std::string netDirectory)
    : Directory(std::move(netDirectory)) {}

std::optional<std::string>
NetworkInterfaceReader::permanentAddress(const DirectoryEntry &entry) {
  {
    std::lock_guard<std::mutex> guard(Lock);
    auto found = Addresses.find(entry.name);
    if (found != Addresses.end() && found->second.inode == entry.inode)
      return found->second.address;
  }
  const std::string directory = Directory + "/" + entry.name;
  std::optional<std::string> assignment =
      value(directory + "/addr_assign_type");
  std::optional<std::string> address = value(directory + "/address");
  if (!assignment || !address)
    return std::nullopt; // Gone or unreadable: asked again next time.
  KnownAddress known{entry.inode, std::nullopt};
  if (*assignment == PermanentAddress && !address->empty() &&
      !isZeroAddress(*address))
    known.address = std::move(*address);

  std::lock_guard<std::mutex> guard(Lock);
  if (Addresses.size() >= MaxRemembered)
    Addresses.clear();
  Addresses[entry.name] = known;
  return known.address;
}

std::optional<InterfaceState>
NetworkInterfaceReader::read(const DirectoryEntry &entry, bool withAddress,
                             ProblemLog &log) {
  const std::string directory = Directory + "/" + entry.name;
  FileText flags = readFileText(directory + "/flags");
  if (!flags.ok()) {
    log.report(directory + "/flags: cannot read: " + errorText(flags.error));
    return std::nullopt;
  }
  InterfaceState state;
  state.name = entry.name;
  std::optional<std::uint32_t> bits =
      parseHex(attributeValue(flags.contents), UINT32_MAX);
  state.up = bits && (*bits & InterfaceUp) != 0;
  // The kernel refuses to tell the carrier of an interface that is down.
  if (state.up)
    state.hasLink = value(directory + "/carrier") == std::string("1");
  if (withAddress)
    state.permanentAddress = permanentAddress(entry);
  return state;
}

} // namespace live
} // namespace detail
} // namespace HX
