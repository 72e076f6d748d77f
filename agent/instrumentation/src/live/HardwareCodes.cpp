//===- HardwareCodes.cpp - SMBIOS codes and the CIM values they map to ----===//

#include "live/HardwareCodes.h"

#include <algorithm>
#include <iterator>

namespace HX {
namespace detail {
namespace live {
namespace {

/// DSP0134 7.4.1, codes 0x01 to 0x24 in order.
// clang-format off
constexpr std::string_view ChassisTypeNames[] = {
    "Other",              "Unknown",
    "Desktop",            "Low Profile Desktop",
    "Pizza Box",          "Mini Tower",
    "Tower",              "Portable",
    "Laptop",             "Notebook",
    "Hand Held",          "Docking Station",
    "All in One",         "Sub Notebook",
    "Space-saving",       "Lunch Box",
    "Main Server Chassis", "Expansion Chassis",
    "SubChassis",         "Bus Expansion Chassis",
    "Peripheral Chassis", "RAID Chassis",
    "Rack Mount Chassis", "Sealed-case PC",
    "Multi-system chassis", "Compact PCI",
    "Advanced TCA",       "Blade",
    "Blade Enclosure",    "Tablet",
    "Convertible",        "Detachable",
    "IoT Gateway",        "Embedded PC",
    "Mini PC",            "Stick PC",
};
// clang-format on

namespace Chassis {
constexpr unsigned MainServerChassis = 0x11;
constexpr unsigned ExpansionChassis = 0x12;
constexpr unsigned Blade = 0x1C;
} // namespace Chassis

namespace PackageType {
constexpr unsigned ChassisFrame = 3;
constexpr unsigned Blade = 16;
constexpr unsigned BladeExpansion = 17;
} // namespace PackageType

namespace State {
constexpr unsigned Safe = 0x03;
constexpr unsigned Warning = 0x04;
constexpr unsigned Critical = 0x05;
constexpr unsigned NonRecoverable = 0x06;
} // namespace State

namespace Layout {
constexpr unsigned Unknown = 0;
constexpr unsigned Other = 1;
constexpr unsigned Slot = 7;
constexpr unsigned PCI = 16;
constexpr unsigned PCIX = 17;
constexpr unsigned PCIE = 18;
constexpr unsigned PCIEx1 = 19;
} // namespace Layout

/// How bad a chassis state is; 0 for states that say nothing.
unsigned severity(std::optional<unsigned> state) {
  if (!state)
    return 0;
  switch (*state) {
  case State::Safe:
    return 1;
  case State::Warning:
    return 2;
  case State::Critical:
    return 3;
  case State::NonRecoverable:
    return 4;
  default:
    return 0;
  }
}

/// The ConnectorLayout of a PCI Express link of \p lanes lanes.
unsigned layoutOfLanes(std::optional<unsigned> lanes) {
  if (!lanes)
    return Layout::PCIE;
  switch (*lanes) {
  case 1:
    return Layout::PCIEx1;
  case 2:
    return Layout::PCIEx1 + 1;
  case 4:
    return Layout::PCIEx1 + 2;
  case 8:
    return Layout::PCIEx1 + 3;
  case 16:
    return Layout::PCIEx1 + 4;
  case 32:
    return Layout::PCIEx1 + 5;
  default:
    return Layout::PCIE;
  }
}

/// The lanes a PCI Express slot type code names (DSP0134 7.10.1: 0xA6 to
/// 0xC3 in runs of x1, x2, x4, x8, x16), or 0 for one that names none.
unsigned lanesOfPcieSlotType(unsigned slotType) {
  constexpr unsigned FirstOfRun[] = {0xA6, 0xAC, 0xB2, 0xB9, 0xBF};
  for (unsigned x1 : FirstOfRun)
    if (slotType >= x1 && slotType < x1 + 5)
      return 1u << (slotType - x1);
  return 0;
}

/// PCI Express slot types whose code names no lane count: the plain and
/// per-generation PCI Express codes, and the PCI Express form factors
/// (M.2, U.2, Mini PCIe, OCP NIC, CXL, EDSFF).
bool isLanelessPcieSlotType(unsigned slotType) {
  switch (slotType) {
  // clang-format off
  case 0xA5: case 0xAB: case 0xB1: case 0xB8: case 0xBE: case 0xC4:
  case 0xC5: case 0xC6:
  case 0x14: case 0x15: case 0x16: case 0x17:
  case 0x1F: case 0x20: case 0x21: case 0x22: case 0x23: case 0x24:
  case 0x25: case 0x26: case 0x27: case 0x28: case 0x30:
    // clang-format on
    return true;
  default:
    return false;
  }
}

/// Slots of buses CIM has no layout of its own for: ISA to NuBus, AGP,
/// MXM, PC-98.
bool isOtherBusSlotType(unsigned slotType) {
  return (slotType >= 0x03 && slotType <= 0x0D) ||
         (slotType >= 0x0F && slotType <= 0x11) || slotType == 0x13 ||
         (slotType >= 0x18 && slotType <= 0x1E) ||
         (slotType >= 0xA0 && slotType <= 0xA4);
}

} // namespace

std::optional<std::string_view> chassisTypeName(unsigned type) {
  if (type == 0 || type > std::size(ChassisTypeNames))
    return std::nullopt;
  return ChassisTypeNames[type - 1];
}

unsigned packageTypeOfChassis(unsigned type) {
  switch (type) {
  case Chassis::MainServerChassis:
  case Chassis::Blade:
    return PackageType::Blade;
  case Chassis::ExpansionChassis:
    return PackageType::BladeExpansion;
  default:
    return PackageType::ChassisFrame;
  }
}

std::optional<unsigned> chassisStatus(std::optional<unsigned> bootUpState,
                                      std::optional<unsigned> powerSupplyState,
                                      std::optional<unsigned> thermalState) {
  const unsigned worst =
      std::max({severity(bootUpState), severity(powerSupplyState),
                severity(thermalState)});
  switch (worst) {
  case 1:
    return 1u;
  case 2:
    return 21u;
  case 3:
    return 22u;
  case 4:
    return 23u;
  default:
    return std::nullopt;
  }
}

std::optional<unsigned> laneCountOfBusWidth(unsigned dataBusWidth) {
  switch (dataBusWidth) {
  case 0x08:
    return 1u;
  case 0x09:
    return 2u;
  case 0x0A:
    return 4u;
  case 0x0B:
    return 8u;
  case 0x0C:
    return 12u;
  case 0x0D:
    return 16u;
  case 0x0E:
    return 32u;
  default:
    return std::nullopt;
  }
}

unsigned connectorLayoutOfSlot(unsigned slotType,
                               std::optional<unsigned> laneCount) {
  if (unsigned lanes = lanesOfPcieSlotType(slotType))
    return layoutOfLanes(lanes);
  if (isLanelessPcieSlotType(slotType))
    return layoutOfLanes(laneCount);
  switch (slotType) {
  case 0x01:
    return Layout::Other;
  case 0x06:
  case 0x0E:
    return Layout::PCI;
  case 0x12:
    return Layout::PCIX;
  default:
    return isOtherBusSlotType(slotType) ? Layout::Slot : Layout::Unknown;
  }
}

unsigned connectorLayoutOfBusSpeed(std::string_view speed) {
  if (speed.find("PCIe") != std::string_view::npos)
    return Layout::PCIE;
  if (speed.find("PCI-X") != std::string_view::npos)
    return Layout::PCIX;
  if (speed.find("PCI") != std::string_view::npos)
    return Layout::PCI;
  return Layout::Unknown;
}

} // namespace live
} // namespace detail
} // namespace HX
