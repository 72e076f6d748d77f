//===- PciNodes.cpp - Network card and storage controller nodes -----------===//

#include "live/PciNodes.h"

#include <cstdio>

namespace HX {
namespace detail {
namespace live {
namespace {

using namespace NodeLexicon;

/// Node status of a working device the kernel lists.
constexpr unsigned StatusOk = 1;

/// Adapter status codes.
namespace Adapter {
constexpr unsigned UpWithLink = 1;
constexpr unsigned UpWithoutLink = 12;
constexpr unsigned AdministrativelyDown = 16;
} // namespace Adapter

/// PCI subclass of IDE interfaces within base class 01.
constexpr unsigned IdeSubclass = 0x01;

void add(std::vector<NodeProperty> &properties, Properties id,
         const std::optional<std::string> &text) {
  if (text)
    properties.push_back({id, *text});
}

void add(std::vector<NodeProperty> &properties, Properties id,
         std::optional<unsigned> number) {
  if (number)
    properties.push_back({id, *number});
}

/// What cards and controllers share: names, ids, address, driver.
NodeDescription functionNode(NodeType type, const PciFunction &function,
                             const std::optional<std::string> &driver) {
  NodeDescription node;
  node.type = type;
  node.segment = function.address;
  node.status = StatusOk;
  if (function.vendorName)
    node.description = *function.vendorName;
  if (function.deviceName)
    node.description +=
        (node.description.empty() ? "" : " ") + *function.deviceName;
  add(node.properties, PropManufacturer, function.vendorName);
  add(node.properties, PropModel, function.deviceName);
  add(node.properties, PropPCIAddress, function.address);
  add(node.properties, PropVendorID, function.vendor);
  add(node.properties, PropDeviceID, function.device);
  add(node.properties, PropSubsystemVendorID, function.subsystemVendor);
  add(node.properties, PropSubsystemID, function.subsystemDevice);
  add(node.properties, PropDriver, driver);
  return node;
}

/// Up with a link on any interface makes the card up with a link.
std::optional<unsigned>
adapterStatus(const std::vector<InterfaceState> &interfaces) {
  if (interfaces.empty())
    return std::nullopt;
  unsigned status = Adapter::AdministrativelyDown;
  for (const InterfaceState &interface : interfaces) {
    if (interface.up && interface.hasLink)
      return Adapter::UpWithLink;
    if (interface.up)
      status = Adapter::UpWithoutLink;
  }
  return status;
}

} // namespace

NodeDescription networkCardNode(const NetworkCardFacts &card) {
  NodeDescription node =
      functionNode(NetworkCardNode, card.function, card.driver);
  std::optional<std::string> permanentAddress;
  if (card.interfaces.empty()) {
    node.name = card.function.address;
  } else {
    node.name = card.interfaces.front().name;
    add(node.properties, PropInterfaceName, card.interfaces.front().name);
    permanentAddress = card.interfaces.front().permanentAddress;
  }
  add(node.properties, PropPermanentAddress, permanentAddress);
  add(node.properties, PropAdapterSerial,
      card.cardSerial ? card.cardSerial : permanentAddress);
  add(node.properties, PropAdapterStatus, adapterStatus(card.interfaces));
  return node;
}

NodeDescription
storageControllerNode(const StorageControllerFacts &controller) {
  const PciFunction &function = controller.function;
  NodeDescription node =
      functionNode(StorageControllerNode, function, controller.driver);
  node.name = function.address;
  add(node.properties, PropType, function.subclassName);
  add(node.properties, PropNumControlled, controller.blockDevices);
  // Only true IDE interfaces carry this, so that only they are presented as
  // IDE controllers.
  if (function.subclass() == IdeSubclass && function.vendor &&
      function.device) {
    char ids[16];
    std::snprintf(ids, sizeof ids, "%04x:%04x", *function.vendor,
                  *function.device);
    add(node.properties, PropOtherIdentifyingInfo, std::string(ids));
  }
  return node;
}

} // namespace live
} // namespace detail
} // namespace HX
