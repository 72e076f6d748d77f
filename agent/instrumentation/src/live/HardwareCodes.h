//===- HardwareCodes.h - SMBIOS codes and the CIM values they map to ------===//
//
/// \file
/// The SMBIOS reference (DSP0134) codes chassis types, chassis states and
/// slot types; the providers publish CIM values (PackageType,
/// ConnectorLayout) and node status codes. The translations live here, in
/// one place, so that the mapping document and the tests can pin them.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_HARDWARECODES_H
#define HX_SRC_LIVE_HARDWARECODES_H

#include <optional>
#include <string_view>

namespace HX {
namespace detail {
namespace live {

/// The SMBIOS name of chassis type \p type ("Rack Mount Chassis"), or
/// nullopt for a code the reference does not define.
std::optional<std::string_view> chassisTypeName(unsigned type);

/// The CIM PackageType of a chassis of SMBIOS type \p type: 16 (Blade) for
/// a main server chassis (17) or a blade (28), 17 (Blade Expansion) for an
/// expansion chassis (18), and 3 (Chassis/Frame) for every other enclosure.
unsigned packageTypeOfChassis(unsigned type);

/// The node status of a chassis whose SMBIOS boot-up, power-supply and
/// thermal states are given: the worst of them decides. 1 (OK) when all
/// known ones are "Safe", 21 for "Warning", 22 for "Critical", 23 for
/// "Non-recoverable"; nullopt when none is known ("Other", "Unknown").
std::optional<unsigned> chassisStatus(std::optional<unsigned> bootUpState,
                                      std::optional<unsigned> powerSupplyState,
                                      std::optional<unsigned> thermalState);

/// The lanes of an SMBIOS slot data bus width code (0x08 "x1" to 0x0E
/// "x32"), or nullopt for the widths that are not lane counts.
std::optional<unsigned> laneCountOfBusWidth(unsigned dataBusWidth);

/// The CIM ConnectorLayout of an SMBIOS slot: 16 PCI, 17 PCI-X, 18 PCI-E,
/// 19 to 24 PCI-E x1 to x32 (from the slot type, else from the lane count
/// for PCI Express families), 7 Slot for the other buses, 1 Other, and 0
/// Unknown for "Unknown" and codes the reference does not define.
unsigned connectorLayoutOfSlot(unsigned slotType,
                               std::optional<unsigned> laneCount);

/// The CIM ConnectorLayout of a slot the kernel describes by its bus speed
/// text ("8.0 GT/s PCIe", "66 MHz PCI-X", "33 MHz PCI"): 18, 17, 16, or 0
/// when the text does not tell.
unsigned connectorLayoutOfBusSpeed(std::string_view speed);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_HARDWARECODES_H
