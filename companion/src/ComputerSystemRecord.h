//===- ComputerSystemRecord.h - This machine as a computer system ---------===//
//
/// \file
/// What TVRHX_ComputerSystem publishes, read from the hardware: the machine
/// is the first system node of the hardware tree, named as every object
/// path of the providers names it.
//
//===----------------------------------------------------------------------===//
#pragma once

#include <optional>
#include <string>

namespace tvr::companion {

/// The computer system the hardware describes.
struct ComputerSystemRecord {
  /// HX::getSystemName(): the Name key, the same text the providers' paths
  /// carry as host name and SystemName.
  std::string name;
  /// The system node's description; empty when it has none.
  std::string description;
  /// The system node's UUID (PropUUID), when the hardware reports one.
  std::optional<std::string> uuid;
};

/// Reads the computer system from the first SystemNode of the hardware.
///
/// \returns nullopt when the hardware has no system node (a hardware tree
///   that describes loose parts); the live machine always has one.
/// \throws HX::InstrumentationError when the hardware cannot be read.
std::optional<ComputerSystemRecord> readComputerSystem();

} // namespace tvr::companion
