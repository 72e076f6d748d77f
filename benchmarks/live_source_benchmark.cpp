//===- live_source_benchmark.cpp - The cost of one live selection ---------===//
//
// One selectNode per node type, on the recorded two-socket rack server (the
// tree the tests use, written to a temporary directory) and on the machine
// the benchmark runs on. The providers make many cursors per request, so
// these numbers times the selections of a request are what the live source
// adds to it.
//
// The first selection of a source also loads the PCI ID database and learns
// the PCI functions; the "first selection" cases show that one-time cost,
// the others the steady state.
//
//===----------------------------------------------------------------------===//

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"

#include "../tests/agent/live/RecordedMachines.h"

#include <benchmark/benchmark.h>

#include <string>

namespace {

using namespace HX::NodeLexicon;

enum class Machine { RackServer, ThisMachine };

const std::string &rootOf(Machine machine) {
  static const std::string ThisMachineRoot = "/";
  if (machine == Machine::ThisMachine)
    return ThisMachineRoot;
  static const hxlive::RecordedMachine &rackServer = []() -> auto & {
    static hxlive::RecordedMachine recorded;
    hxlive::recordRackServer(recorded);
    return recorded;
  }
  ();
  return rackServer.root();
}

void selectNode(benchmark::State &state, Machine machine, NodeType type) {
  HX::useLiveMachine(rootOf(machine));
  HX::Instrumentation cursor;
  cursor.selectNode(type);
  std::size_t nodes = 0;
  for (HX::Instrumentation walk = cursor; walk; ++walk)
    ++nodes;
  for (auto _ : state) {
    cursor.selectNode(type);
    benchmark::DoNotOptimize(cursor);
  }
  state.counters["nodes"] = static_cast<double>(nodes);
}

/// Every node type once, in a row: the reading side of a small inventory.
void selectEveryType(benchmark::State &state, Machine machine) {
  HX::useLiveMachine(rootOf(machine));
  const NodeType types[] = {SystemNode,      ChassisNode,
                            SlotNode,        ConnectorNode,
                            NetworkCardNode, StorageControllerNode};
  for (NodeType type : types) {
    HX::Instrumentation warm;
    warm.selectNode(type);
  }
  for (auto _ : state)
    for (NodeType type : types) {
      HX::Instrumentation cursor;
      cursor.selectNode(type);
      benchmark::DoNotOptimize(cursor);
    }
}

/// A fresh source's first selection: PCI ID database and PCI functions read.
void firstSelection(benchmark::State &state, Machine machine, NodeType type) {
  for (auto _ : state) {
    HX::useLiveMachine(rootOf(machine));
    HX::Instrumentation cursor;
    cursor.selectNode(type);
    benchmark::DoNotOptimize(cursor);
  }
}

#define HX_SELECT_BENCHMARKS(machine, label)                                   \
  BENCHMARK_CAPTURE(selectNode, label##_SystemNode, machine, SystemNode);      \
  BENCHMARK_CAPTURE(selectNode, label##_ChassisNode, machine, ChassisNode);    \
  BENCHMARK_CAPTURE(selectNode, label##_SlotNode, machine, SlotNode);          \
  BENCHMARK_CAPTURE(selectNode, label##_ConnectorNode, machine,                \
                    ConnectorNode);                                            \
  BENCHMARK_CAPTURE(selectNode, label##_NetworkCardNode, machine,              \
                    NetworkCardNode);                                          \
  BENCHMARK_CAPTURE(selectNode, label##_StorageControllerNode, machine,        \
                    StorageControllerNode);                                    \
  BENCHMARK_CAPTURE(selectEveryType, label##_all_six_types, machine);          \
  BENCHMARK_CAPTURE(firstSelection, label##_NetworkCardNode, machine,          \
                    NetworkCardNode)                                           \
      ->Unit(benchmark::kMillisecond)

HX_SELECT_BENCHMARKS(Machine::RackServer, rack_server);
HX_SELECT_BENCHMARKS(Machine::ThisMachine, this_machine);

} // namespace
