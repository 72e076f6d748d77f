//===- PciAddress.cpp - PCI function addresses in sysfs paths -------------===//

#include "live/PciAddress.h"

namespace HX {
namespace detail {
namespace live {
namespace {

bool isHexDigit(char c) {
  return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f');
}

bool allHex(std::string_view text) {
  for (char c : text)
    if (!isHexDigit(c))
      return false;
  return !text.empty();
}

} // namespace

bool isPciAddress(std::string_view text) {
  // The part after the domain, ":bb:dd.f", has a fixed length.
  constexpr std::size_t RestLength = 8;
  if (text.size() < 4 + RestLength || text.size() > 8 + RestLength)
    return false;
  const std::size_t domainLength = text.size() - RestLength;
  std::string_view domain = text.substr(0, domainLength);
  std::string_view rest = text.substr(domainLength);
  return allHex(domain) && rest[0] == ':' && allHex(rest.substr(1, 2)) &&
         rest[3] == ':' && allHex(rest.substr(4, 2)) && rest[6] == '.' &&
         rest[7] >= '0' && rest[7] <= '7';
}

std::optional<std::string> owningPciFunction(std::string_view devicePath) {
  std::optional<std::string> owner;
  while (!devicePath.empty()) {
    const std::size_t slash = devicePath.find('/');
    std::string_view component = devicePath.substr(0, slash);
    if (isPciAddress(component))
      owner = std::string(component);
    if (slash == std::string_view::npos)
      break;
    devicePath.remove_prefix(slash + 1);
  }
  return owner;
}

} // namespace live
} // namespace detail
} // namespace HX
