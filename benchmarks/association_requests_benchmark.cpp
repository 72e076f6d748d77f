//===- association_requests_benchmark.cpp - Requests of the associations --===//
//
// For each association class, on generated machines with 10, 1,000 and
// 10,000 nodes of the type the association walks, with both logger channels
// off:
//
//   <class>/EnumerateInstances/<n>
//   <class>/Associators/<n>            from the source element named below
//   <class>/References/<n>             from the same source element
//   <class>/baseline_EnumerateInstances/<n>   the same associations built
//                                             by the baseline provider
//
// Some associations pair every element of one side with every element of
// the other, or read a list anew for every element; their requests grow
// with the square of the size. They are timed up to the largest size at
// which one request still takes seconds, not hours (kLargestSize below);
// PERFORMANCE.md gives the growth they show.
//
//===----------------------------------------------------------------------===//

#include "BenchmarkSession.h"
#include "RequestTiming.h"

#include <benchmark/benchmark.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace {

using namespace tvr::bench;
using tvr::broker::AssociationArgs;
using tvr::broker::ObjectPath;
using tvr::broker::RequestOptions;

enum class Walked { Slots, Connectors, Chassis, NetworkCards, StorageControllers };

MachinePlan planFor(Walked walked, std::size_t n) {
  MachinePlan plan;
  switch (walked) {
  case Walked::Slots:
    plan.slots = n;
    plan.expansionChassis = 1; // so that slots and chassis pair by their markers
    break;
  case Walked::Connectors: plan.connectors = n; break;
  case Walked::Chassis: plan.extraChassis = n - 1; break;
  case Walked::NetworkCards: plan.networkCards = n; break;
  case Walked::StorageControllers: plan.storageControllers = n; break;
  }
  return plan;
}

struct AssociationClass {
  const char *name;
  Walked walked;
  /// The class of the element the association requests start from; the
  /// first element of its enumeration is the source.
  const char *sourceClass;
  /// The largest size timed.
  std::size_t largestSize;
};

const AssociationClass kAssociationClasses[] = {
    {"TVRHX_PackageInSlot", Walked::Slots, "TVRHX_Chassis", 10000},
    {"TVRHX_SlotOnChassis", Walked::Slots, "TVRHX_Chassis", 10000},
    {"TVRHX_ConnectorOnPackage", Walked::Connectors, "TVRHX_Chassis", 10000},
    {"TVRHX_ConnectedTo", Walked::Connectors, "TVRHX_Connector", 10000},
    {"TVRHX_UnitaryComputerSystemPackage", Walked::Chassis, "TVRHX_ComputerSystem", 10000},
    {"TVRHX_CardCSPackage", Walked::NetworkCards, "TVRHX_ComputerSystem", 10000},
    {"TVRHX_NPRealizesNC", Walked::NetworkCards, "TVRHX_NetworkCard", 1000},
    {"TVRHX_DiskControllerCSPackage", Walked::StorageControllers, "TVRHX_ComputerSystem", 10000},
    {"TVRHX_ChipSystemPackaging", Walked::StorageControllers, "TVRHX_ComputerSystem", 10000},
    {"TVRHX_SASPortRealizesDisk", Walked::StorageControllers, "TVRHX_SASPortController", 10000},
    {"TVRHX_ICRealizesChip", Walked::StorageControllers, "TVRHX_IDEController", 10000},
};

const std::size_t kSizes[] = {10, 1000, 10000};

enum class Operation { Instances, Associators, References, BaselineInstances };

const char *label(Operation op) {
  switch (op) {
  case Operation::Instances: return "EnumerateInstances";
  case Operation::Associators: return "Associators";
  case Operation::References: return "References";
  case Operation::BaselineInstances: return "baseline_EnumerateInstances";
  }
  return "";
}

/// The first element of \p className (its instances' paths where it
/// enumerates no names).
ObjectPath firstElementOf(const std::string &className) {
  std::vector<ObjectPath> paths = objectManager().enumerateInstanceNames(classPath(className)).paths();
  if (paths.empty())
    paths = objectManager().enumerateInstances(classPath(className)).paths();
  if (paths.empty())
    throw std::runtime_error(className + " has no element to start from");
  return paths.front();
}

void associationRequest(benchmark::State &state, const AssociationClass &association, Operation op,
                        std::size_t n) {
  configureLogger(LoggerSetup::SinksOff);
  useMachine(planFor(association.walked, n));
  tvr::broker::ObjectManager &om = objectManager();
  const std::string className = association.name;
  switch (op) {
  case Operation::Instances:
    // Some providers answer an empty enumeration with an error; it is timed
    // all the same.
    timeRequest(
        state, [&](const RequestOptions &o) { return om.enumerateInstances(classPath(className), std::nullopt, o); },
        false);
    break;
  case Operation::Associators:
  case Operation::References: {
    const ObjectPath source = firstElementOf(association.sourceClass);
    AssociationArgs args;
    // Associators route by the association class, References by the
    // result class (which for References is the association class).
    (op == Operation::Associators ? args.assocClass : args.resultClass) = className;
    timeRequest(
        state,
        [&](const RequestOptions &o) {
          RequestOptions options = o;
          options.routeTo = className;
          return op == Operation::Associators ? om.associators(source, args, options)
                                              : om.references(source, args, options);
        },
        false);
    break;
  }
  case Operation::BaselineInstances:
    setBaselineAnswer(om.enumerateInstances(classPath(className)).instances());
    timeRequest(state, [&](const RequestOptions &o) {
      return om.enumerateInstances(classPath(kBaselineClass), std::nullopt, o);
    });
    break;
  }
}

const bool registered = [] {
  const Operation operations[] = {Operation::Instances, Operation::Associators, Operation::References,
                                  Operation::BaselineInstances};
  for (const AssociationClass &association : kAssociationClasses)
    for (Operation op : operations)
      for (std::size_t n : kSizes) {
        if (n > association.largestSize)
          continue;
        benchmark::RegisterBenchmark(
            (std::string(association.name) + "/" + label(op) + "/" + std::to_string(n)).c_str(),
            [&association, op, n](benchmark::State &state) { associationRequest(state, association, op, n); })
            ->Unit(benchmark::kMicrosecond);
      }
  return true;
}();

} // namespace
