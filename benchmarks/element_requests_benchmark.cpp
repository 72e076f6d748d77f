//===- element_requests_benchmark.cpp - Requests of the element classes ---===//
//
// For each element class, on generated machines with 10, 1,000 and 10,000
// nodes of the class's node type, with both logger channels off:
//
//   <class>/EnumerateInstanceNames/<n>
//   <class>/EnumerateInstances/<n>
//   <class>/GetInstance_first|_middle|_last/<n>   the first, middle and last
//                                                 element of the enumeration
//   <class>/baseline_EnumerateInstances/<n>       the same instances built by
//   <class>/baseline_EnumerateInstanceNames/<n>   the baseline provider
//
// and the chassis on machines whose chassis are half expansion units (type
// 18), each of which costs a second walk over all chassis:
//
//   TVRHX_Chassis_half_expansion/EnumerateInstances/<n>
//
// The provider's own cost is the ratio of EnumerateInstances to its
// baseline; scripts/benchmark prints it.
//
//===----------------------------------------------------------------------===//

#include "BenchmarkSession.h"
#include "RequestTiming.h"

#include <benchmark/benchmark.h>

#include <string>
#include <vector>

namespace {

using namespace tvr::bench;
using tvr::broker::ObjectPath;
using tvr::broker::RequestOptions;
using tvr::broker::Response;

/// A machine with \p n nodes of the node type behind \p className.
using PlanFor = MachinePlan (*)(std::size_t n);

MachinePlan chassisPlan(std::size_t n) {
  MachinePlan plan;
  plan.extraChassis = n - 1; // the main chassis is the first
  return plan;
}
MachinePlan halfExpansionPlan(std::size_t n) {
  MachinePlan plan;
  plan.extraChassis = n / 2 - 1;
  plan.expansionChassis = n - n / 2;
  return plan;
}
MachinePlan slotPlan(std::size_t n) {
  MachinePlan plan;
  plan.slots = n;
  return plan;
}
MachinePlan connectorPlan(std::size_t n) {
  MachinePlan plan;
  plan.connectors = n;
  return plan;
}
MachinePlan networkCardPlan(std::size_t n) {
  MachinePlan plan;
  plan.networkCards = n;
  return plan;
}
MachinePlan storagePlan(std::size_t n) {
  MachinePlan plan;
  plan.storageControllers = n;
  return plan;
}

struct ElementClass {
  const char *name;
  PlanFor plan;
};

const ElementClass kElementClasses[] = {
    {"TVRHX_Chassis", chassisPlan},
    {"TVRHX_Slot", slotPlan},
    {"TVRHX_Connector", connectorPlan},
    {"TVRHX_NetworkCard", networkCardPlan},
    {"TVRHX_DiskController", storagePlan},
    {"TVRHX_IDEController", storagePlan},
    {"TVRHX_ChipIDECont", storagePlan},
    {"TVRHX_SASPortController", storagePlan},
};

const std::size_t kSizes[] = {10, 1000, 10000};

enum class Operation { Names, Instances, GetFirst, GetMiddle, GetLast, BaselineInstances, BaselineNames };

const char *label(Operation op) {
  switch (op) {
  case Operation::Names: return "EnumerateInstanceNames";
  case Operation::Instances: return "EnumerateInstances";
  case Operation::GetFirst: return "GetInstance_first";
  case Operation::GetMiddle: return "GetInstance_middle";
  case Operation::GetLast: return "GetInstance_last";
  case Operation::BaselineInstances: return "baseline_EnumerateInstances";
  case Operation::BaselineNames: return "baseline_EnumerateInstanceNames";
  }
  return "";
}

/// The path GetInstance asks for: an element of the class's own
/// enumeration, so that the provider finds it. (The provider of the IDE
/// classes enumerates no names for them: their instances' paths serve.)
ObjectPath pathToGet(const std::string &className, Operation op) {
  std::vector<ObjectPath> paths = objectManager().enumerateInstanceNames(classPath(className)).paths();
  if (paths.empty())
    paths = objectManager().enumerateInstances(classPath(className)).paths();
  if (paths.empty())
    throw std::runtime_error(className + " has no elements to get");
  if (op == Operation::GetFirst)
    return paths.front();
  if (op == Operation::GetMiddle)
    return paths[paths.size() / 2];
  return paths.back();
}

void elementRequest(benchmark::State &state, const ElementClass &element, Operation op, std::size_t n) {
  configureLogger(LoggerSetup::SinksOff);
  useMachine(element.plan(n));
  tvr::broker::ObjectManager &om = objectManager();
  const std::string className = element.name;
  switch (op) {
  case Operation::Names:
    timeRequest(state, [&](const RequestOptions &o) { return om.enumerateInstanceNames(classPath(className), o); });
    break;
  case Operation::Instances:
    timeRequest(state, [&](const RequestOptions &o) {
      return om.enumerateInstances(classPath(className), std::nullopt, o);
    });
    break;
  case Operation::GetFirst:
  case Operation::GetMiddle:
  case Operation::GetLast: {
    const ObjectPath path = pathToGet(className, op);
    timeRequest(state, [&](const RequestOptions &o) { return om.getInstance(path, std::nullopt, o); });
    break;
  }
  case Operation::BaselineInstances:
  case Operation::BaselineNames:
    setBaselineAnswer(instancesOf(om.enumerateInstances(classPath(className))));
    if (op == Operation::BaselineInstances)
      timeRequest(state, [&](const RequestOptions &o) {
        return om.enumerateInstances(classPath(kBaselineClass), std::nullopt, o);
      });
    else
      timeRequest(state,
                  [&](const RequestOptions &o) { return om.enumerateInstanceNames(classPath(kBaselineClass), o); });
    break;
  }
}

const bool registered = [] {
  const Operation operations[] = {Operation::Names,     Operation::Instances,         Operation::GetFirst,
                                  Operation::GetMiddle, Operation::GetLast,           Operation::BaselineInstances,
                                  Operation::BaselineNames};
  for (const ElementClass &element : kElementClasses)
    for (Operation op : operations)
      for (std::size_t n : kSizes)
        benchmark::RegisterBenchmark(
            (std::string(element.name) + "/" + label(op) + "/" + std::to_string(n)).c_str(),
            [&element, op, n](benchmark::State &state) { elementRequest(state, element, op, n); })
            ->Unit(benchmark::kMicrosecond);
  static const ElementClass halfExpansion = {"TVRHX_Chassis", halfExpansionPlan};
  for (std::size_t n : kSizes)
    benchmark::RegisterBenchmark(
        ("TVRHX_Chassis_half_expansion/EnumerateInstances/" + std::to_string(n)).c_str(),
        [n](benchmark::State &state) { elementRequest(state, halfExpansion, Operation::Instances, n); })
        ->Unit(benchmark::kMicrosecond);
  return true;
}();

} // namespace
