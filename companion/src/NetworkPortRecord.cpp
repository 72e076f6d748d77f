#include "NetworkPortRecord.h"

#include <HX/Instrumentation.h>

#include <cctype>

namespace tvr::companion {

namespace {

using HX::NodeLexicon::Properties;

std::optional<unsigned> numberOf(const HX::Instrumentation& node, Properties property) {
  unsigned value = 0;
  if (!node.getProperty(property, value)) return std::nullopt;
  return value;
}

std::optional<std::string> textOf(const HX::Instrumentation& node, Properties property) {
  std::string value;
  if (!node.getProperty(property, value)) return std::nullopt;
  return value;
}

NetworkPortRecord portOf(const HX::Instrumentation& card, const std::string& name) {
  NetworkPortRecord port;
  port.deviceID = name;
  const std::optional<std::string> interfaceName = textOf(card, HX::NodeLexicon::PropInterfaceName);
  port.elementName = interfaceName && !interfaceName->empty() ? *interfaceName : name;
  port.description = card.getNodeDescription();
  if (const std::optional<std::string> address = textOf(card, HX::NodeLexicon::PropPermanentAddress))
    port.permanentAddress = canonicalMacAddress(*address);
  if (const std::optional<unsigned> speed = numberOf(card, HX::NodeLexicon::PropSpeed)) port.speed = *speed;
  if (const std::optional<unsigned> speed = numberOf(card, HX::NodeLexicon::PropMaxSpeed)) port.maxSpeed = *speed;
  const std::optional<unsigned> technology = numberOf(card, HX::NodeLexicon::PropLinkTechnology);
  if (technology && *technology <= 0xFFFF) port.linkTechnology = static_cast<std::uint16_t>(*technology);
  port.enabledState = enabledStateOf(numberOf(card, HX::NodeLexicon::PropEnabledState),
                                     numberOf(card, HX::NodeLexicon::PropAdapterStatus));
  return port;
}

} // namespace

std::vector<NetworkPortRecord> readNetworkPorts() {
  std::vector<NetworkPortRecord> ports;
  HX::Instrumentation card;
  for (card.selectNode(HX::NodeLexicon::NetworkCardNode); card; ++card) {
    std::string name;
    if (!card.getProperty(HX::NodeLexicon::PropNodeName, name) || name.empty()) continue;
    ports.push_back(portOf(card, name));
  }
  return ports;
}

std::optional<std::string> canonicalMacAddress(const std::string& text) {
  // Either twelve digits, or six pairs with one separator between each.
  const bool separated = text.size() == 17;
  if (!separated && text.size() != 12) return std::nullopt;
  const char separator = separated ? text[2] : '\0';
  if (separated && separator != ':' && separator != '-') return std::nullopt;
  std::string digits;
  for (std::size_t i = 0; i < text.size(); ++i) {
    const unsigned char c = static_cast<unsigned char>(text[i]);
    if (separated && i % 3 == 2) {
      if (c != static_cast<unsigned char>(separator)) return std::nullopt;
      continue;
    }
    if (!std::isxdigit(c)) return std::nullopt;
    digits += static_cast<char>(std::toupper(c));
  }
  return digits;
}

std::uint16_t enabledStateOf(std::optional<unsigned> enabledState, std::optional<unsigned> adapterStatus) {
  if (enabledState && *enabledState <= 0xFFFF) return static_cast<std::uint16_t>(*enabledState);
  if (!adapterStatus) return EnabledStateUnknown;
  switch (*adapterStatus) {
  case 1:
  case 12:
    return EnabledStateEnabled;
  case 16:
    return EnabledStateDisabled;
  default:
    return EnabledStateUnknown;
  }
}

} // namespace tvr::companion
