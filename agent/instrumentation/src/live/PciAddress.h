//===- PciAddress.h - PCI function addresses in sysfs paths ---------------===//

#ifndef HX_SRC_LIVE_PCIADDRESS_H
#define HX_SRC_LIVE_PCIADDRESS_H

#include <optional>
#include <string>
#include <string_view>

namespace HX {
namespace detail {
namespace live {

/// True for a PCI function address as sysfs writes it: "dddd:bb:dd.f" in
/// lower-case hexadecimal, with a domain of 4 to 8 digits.
bool isPciAddress(std::string_view text);

/// The address of the PCI function a device sits below: the last path
/// component of \p devicePath that is a PCI function address. A disk behind
/// a RAID controller behind a PCI Express switch gives the controller's
/// address; a virtual device gives none.
std::optional<std::string> owningPciFunction(std::string_view devicePath);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PCIADDRESS_H
