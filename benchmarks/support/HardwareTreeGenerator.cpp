//===- HardwareTreeGenerator.cpp - Large hardware trees for benchmarks ----===//

#include "HardwareTreeGenerator.h"

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <stdexcept>

namespace tvr::bench {

namespace {

/// Appends the nodes of one JSON array, separating them with commas.
class NodeList {
public:
  explicit NodeList(std::string &out) : Out(out) {}

  /// Starts a node; the caller appends its members after the opening brace
  /// (the first without a leading comma) and closes it with '}'.
  std::string &next() {
    Out += First ? "\n" : ",\n";
    First = false;
    return Out;
  }

private:
  std::string &Out;
  bool First = true;
};

// Generated names are plain ASCII without quotes or backslashes, so they
// need no escaping.
void named(std::string &out, const char *type, const std::string &name) {
  out += "{\"type\":\"";
  out += type;
  out += "\",\"name\":\"";
  out += name;
  out += "\",\"status\":1";
}

void chassis(std::string &out, const std::string &name, unsigned chassisType, unsigned packageType) {
  named(out, "ChassisNode", name);
  out += ",\"properties\":{\"PropChassisType\":" + std::to_string(chassisType) +
         ",\"PropPackageType\":" + std::to_string(packageType) +
         ",\"PropManufacturer\":\"Northwind Systems\",\"PropModel\":\"BX-920\""
         ",\"PropSerialNumber\":\"NW" +
         std::to_string(1000000 + packageType) + "\",\"PropPartNumber\":\"920-0042-01\"}";
}

void slot(std::string &out, const std::string &name, std::size_t number) {
  named(out, "SlotNode", name);
  out += ",\"properties\":{\"PropSlotNumber\":" + std::to_string(number) + ",\"PropType\":73}}";
}

void connector(std::string &out, const std::string &name) {
  named(out, "ConnectorNode", name);
  out += "}";
}

std::string hex(std::size_t value, int digits) {
  char text[32];
  std::snprintf(text, sizeof text, "%0*zx", digits, value);
  return text;
}

void networkCard(std::string &out, std::size_t n) {
  named(out, "NetworkCardNode", "eth" + std::to_string(n));
  const std::string serial = hex(n, 12);
  out += ",\"description\":\"Northwind NW-X710 10GbE Adapter\",\"properties\":{\"PropAdapterSerial\":\"";
  for (std::size_t i = 0; i < serial.size(); i += 2) {
    if (i) out += ':';
    out.append(serial, i, 2);
  }
  out += "\",\"PropAdapterStatus\":1}}";
}

void storageController(std::string &out, std::size_t n) {
  named(out, "StorageControllerNode", "0000:" + hex(n, 4) + ":00.0");
  out += ",\"description\":\"Chipset SATA controller in IDE mode\",\"properties\":{"
         "\"PropManufacturer\":\"Northwind Semiconductor\",\"PropModel\":\"C620 Series SATA Controller\","
         "\"PropType\":\"IDE interface\",\"PropOtherIdentifyingInfo\":\"IDE mode\","
         "\"PropNumControlled\":2,\"PropPortType\":36,\"PropFormFactor\":0}}";
}

void structural(std::string &out, std::size_t n) {
  static const char *const Kinds[] = {"ProcessorNode", "MemoryNode", "FanNode", "DiskNode"};
  const char *kind = Kinds[n % 4];
  named(out, kind, "Part " + std::to_string(n));
  out += "}";
}

} // namespace

std::size_t MachinePlan::nodeCount() const {
  // System and main chassis, plus one slot in every expansion chassis.
  return 2 + extraChassis + 2 * expansionChassis + slots + connectors + networkCards + storageControllers +
         structural;
}

std::string hardwareTreeJson(const MachinePlan &plan) {
  std::string out;
  out.reserve(160 * plan.nodeCount() + 1024);
  out += "{\"systemName\":\"bench.example.com\",\"nodes\":[{\"type\":\"SystemNode\",\"name\":\"System\","
         "\"status\":1,\"properties\":{\"PropUUID\":\"4c4c4544-0042-3510-8051-b7c04f4e3132\","
         "\"PropManufacturer\":\"Northwind Systems\",\"PropModel\":\"BX-920 Blade\"},\"children\":[";
  NodeList systemChildren(out);

  chassis(systemChildren.next(), "Main Chassis", 17, 16);
  out += ",\"children\":[";
  NodeList mainChildren(out);
  for (std::size_t n = 0; n < plan.slots; ++n)
    slot(mainChildren.next(), "Slot " + std::to_string(n), n + 1);
  for (std::size_t n = 0; n < plan.connectors; ++n)
    connector(mainChildren.next(), n + 1 == plan.connectors && n > 0 ? "PXU Uplink Connector"
                                                                     : "Compute Connector " + std::to_string(n));
  for (std::size_t n = 0; n < plan.networkCards; ++n)
    networkCard(mainChildren.next(), n);
  for (std::size_t n = 0; n < plan.storageControllers; ++n)
    storageController(mainChildren.next(), n);
  for (std::size_t n = 0; n < plan.structural; ++n)
    structural(mainChildren.next(), n);
  out += "\n]}";

  for (std::size_t n = 0; n < plan.extraChassis; ++n) {
    chassis(systemChildren.next(), "Chassis " + std::to_string(n + 1), 17, 16);
    out += "}";
  }
  for (std::size_t n = 0; n < plan.expansionChassis; ++n) {
    chassis(systemChildren.next(), "PXU Expansion Unit " + std::to_string(n), 18, 17);
    out += ",\"children\":[";
    slot(out, "PXU Slot " + std::to_string(n), 1);
    out += "]}";
  }
  out += "\n]}]}\n";
  return out;
}

void writeHardwareTree(const MachinePlan &plan, const std::string &path) {
  const std::string temporary = path + ".new";
  {
    std::ofstream out(temporary, std::ios::binary | std::ios::trunc);
    out << hardwareTreeJson(plan);
    if (!out)
      throw std::runtime_error("cannot write " + temporary);
  }
  if (std::rename(temporary.c_str(), path.c_str()) != 0)
    throw std::runtime_error("cannot rename " + temporary + " to " + path);
}

MachinePlan largeMachine(std::size_t nodes) {
  MachinePlan plan;
  if (nodes <= 2)
    return plan;
  std::size_t left = nodes - 2;
  auto take = [&left](std::size_t wanted) {
    const std::size_t taken = wanted < left ? wanted : left;
    left -= taken;
    return taken;
  };
  // Shares of a large machine, each capped so that the cross products some
  // associations build stay within a few seconds.
  plan.networkCards = take(std::min<std::size_t>(nodes / 256, 256));
  plan.storageControllers = take(std::min<std::size_t>(nodes / 256, 256));
  plan.extraChassis = take(std::min<std::size_t>(nodes / 4096, 15));
  plan.connectors = take(nodes / 16);
  plan.slots = take(nodes / 8);
  plan.structural = left;
  return plan;
}

} // namespace tvr::bench
