//===- NetworkPortRecord.h - The network ports of this machine ------------===//
//
/// \file
/// What TVRHX_NetworkPort publishes, read from the hardware: one port for
/// each network card node, named by the card's node name, so that the port
/// a card realises carries the card's Tag as its DeviceID.
//
//===----------------------------------------------------------------------===//
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace tvr::companion {

/// CIM EnabledState values a port can report.
enum EnabledState : std::uint16_t {
  EnabledStateUnknown = 0,
  EnabledStateEnabled = 2,
  EnabledStateDisabled = 3,
};

/// One network port: the port a network card node realises.
struct NetworkPortRecord {
  /// The card node's name (PropNodeName), the card's Tag.
  std::string deviceID;
  /// The operating system's interface name (PropInterfaceName), else the
  /// card node's name.
  std::string elementName;
  /// The card node's description; empty when it has none.
  std::string description;
  /// The MAC address as twelve upper-case hexadecimal digits, as CIM writes
  /// a permanent address; absent when the node gives none or not a MAC.
  std::optional<std::string> permanentAddress;
  /// Bits per second (PropSpeed, PropMaxSpeed), when the node gives them.
  std::optional<std::uint64_t> speed;
  std::optional<std::uint64_t> maxSpeed;
  /// CIM LinkTechnology (PropLinkTechnology), when the node gives it.
  std::optional<std::uint16_t> linkTechnology;
  /// CIM EnabledState: see enabledStateOf.
  std::uint16_t enabledState = EnabledStateUnknown;
};

/// Reads one port for each NetworkCardNode of the hardware, in document
/// order. A card node without a name has no name for its port and is left
/// out.
///
/// \throws HX::InstrumentationError when the hardware cannot be read.
std::vector<NetworkPortRecord> readNetworkPorts();

/// \p text as twelve upper-case hexadecimal digits when it is a MAC address
/// written with ':' or '-' between its six octets, or as the twelve digits
/// alone; otherwise nullopt.
std::optional<std::string> canonicalMacAddress(const std::string& text);

/// The port's EnabledState: the node's own PropEnabledState when it gives
/// one; otherwise from the adapter status (PropAdapterStatus): 1 (up, with
/// a link) and 12 (up, without a link) are Enabled, 16 (administratively
/// down) is Disabled, anything else or nothing is Unknown.
std::uint16_t enabledStateOf(std::optional<unsigned> enabledState, std::optional<unsigned> adapterStatus);

} // namespace tvr::companion
