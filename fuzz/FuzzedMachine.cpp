#include "FuzzedMachine.h"

#include <nlohmann/json.hpp>

#include <map>

namespace tvr::fuzz {

namespace {

using Json = nlohmann::json;

const char* const kNodeTypes[] = {"ChassisNode",     "SlotNode",   "ConnectorNode",      "NetworkCardNode",
                                  "StorageControllerNode", "SystemNode", "BaseboardNode", "NetworkPortNode"};

/// Words the providers look for in node texts, and texts shaped like the
/// machines they serve.
const char* const kNameWords[] = {"Blade Chassis", "PME",  "PXU Slot 1", "PEN Slot 2", "Compute Module Connector",
                                  "PXU",           "eth0", "0000:00:1f.2", "IDE", "SAS", "System", "Slot",
                                  "PCIe Expansion Unit", "compute", "pme"};

const char* const kStringProperties[] = {"PropManufacturer", "PropModel",         "PropOtherIdentifyingInfo",
                                         "PropSerialNumber", "PropUUID",          "PropPartNumber",
                                         "PropAdapterSerial", "PropType",         "PropPCIAddress"};

const char* const kNumberProperties[] = {"PropChassisType", "PropNumControlled", "PropFormFactor",
                                         "PropAdapterStatus", "PropType",       "PropPortType",
                                         "PropPackageType", "PropSlotNumber"};

/// Status codes with a meaning to the providers, and their neighbours.
const unsigned kStatuses[] = {0, 1, 2, 19, 20, 21, 26, 27};

template <class T, std::size_t N> const T& pick(FuzzedDataProvider& input, const T (&choices)[N]) {
  return choices[input.ConsumeIntegralInRange<std::size_t>(0, N - 1)];
}

class MachineBuilder {
public:
  MachineBuilder(FuzzedDataProvider& input, int maxNodes) : input_(input), nodesLeft_(maxNodes) {}

  FuzzedMachine build() {
    FuzzedMachine machine;
    if (input_.ConsumeIntegralInRange(0, 15) == 0) {
      // Bytes that are no tree at all: the reader refuses them.
      machine.treeText = input_.ConsumeRandomLengthString(256);
      return machine;
    }
    Json document = Json::object();
    if (input_.ConsumeBool()) document["systemName"] = text(32);
    if (input_.ConsumeIntegralInRange(0, 7) == 0) {
      Json failing = Json::array();
      const int count = input_.ConsumeIntegralInRange(1, 3);
      for (int i = 0; i < count; ++i) failing.push_back(pick(input_, kNodeTypes));
      document["faults"] = {{"throwOnSelect", failing}};
    }
    document["nodes"] = children("", 0);
    machine.treeText = document.dump(-1, ' ', false, Json::error_handler_t::replace);
    machine.nodeTexts = std::move(texts_);
    return machine;
  }

private:
  std::string text(std::size_t maxLength) {
    switch (input_.ConsumeIntegralInRange(0, 3)) {
    case 0: return input_.ConsumeRandomLengthString(maxLength);
    case 1: return std::string(pick(input_, kNameWords)) + " " + input_.ConsumeRandomLengthString(maxLength);
    default: return pick(input_, kNameWords);
    }
  }

  Json children(const std::string& parentPath, int depth) {
    Json nodes = Json::array();
    std::map<std::string, int> unnamedSegmentsPerType;
    const int count = depth < 4 ? input_.ConsumeIntegralInRange(0, 4) : 0;
    for (int i = 0; i < count && nodesLeft_ > 0; ++i) nodes.push_back(node(parentPath, depth, unnamedSegmentsPerType));
    return nodes;
  }

  /// \p siblingsPerType counts the nodes of each type among the siblings so
  /// far, which an unnamed node's segment numbers it by.
  Json node(const std::string& parentPath, int depth, std::map<std::string, int>& siblingsPerType) {
    --nodesLeft_;
    const std::string type = pick(input_, kNodeTypes);
    Json node = {{"type", type}};
    std::string segment = type + "#" + std::to_string(siblingsPerType[type]++);
    if (input_.ConsumeIntegralInRange(0, 5) != 0) {
      segment = text(24);
      node["name"] = segment;
      texts_.push_back(segment);
    }
    if (input_.ConsumeBool())
      node["status"] = input_.ConsumeBool() ? Json(pick(input_, kStatuses)) : Json(input_.ConsumeIntegral<std::int64_t>());
    if (input_.ConsumeIntegralInRange(0, 3) == 0) node["description"] = text(40);
    Json properties = Json::object();
    const int count = input_.ConsumeIntegralInRange(0, 4);
    for (int i = 0; i < count; ++i) {
      if (input_.ConsumeBool())
        properties[pick(input_, kStringProperties)] = text(32);
      else
        properties[pick(input_, kNumberProperties)] =
            input_.ConsumeBool() ? input_.ConsumeIntegralInRange<std::uint32_t>(0, 130)
                                 : input_.ConsumeIntegral<std::uint32_t>();
    }
    if (!properties.empty()) node["properties"] = properties;
    const std::string path = parentPath + "/" + segment;
    texts_.push_back(path);
    Json below = children(path, depth + 1);
    if (!below.empty()) node["children"] = below;
    return node;
  }

  FuzzedDataProvider& input_;
  int nodesLeft_;
  std::vector<std::string> texts_;
};

} // namespace

FuzzedMachine fuzzedMachine(FuzzedDataProvider& input, int maxNodes) {
  return MachineBuilder(input, maxNodes).build();
}

} // namespace tvr::fuzz
