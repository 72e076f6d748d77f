//===- logging_benchmark.cpp - What tracing costs a request ---------------===//
//
// Every traced event of a provider is formatted twice, once for each logger
// channel, whatever the channels' levels; the channels then drop or write
// it. Timed here:
//
//   <class>/EnumerateInstances_sinks_off/1000       both channels off
//   <class>/EnumerateInstances_default_levels/1000  log to syslog at 6000,
//                                                   trace off (a fresh install)
//   <class>/EnumerateInstances_trace_to_file/1000   as the default, with the
//                                                   trace channel writing
//                                                   every level to a file
//
// each with the counter `logger_calls`, the logger calls one request makes,
// and the parts of one event on their own:
//
//   traced_event/format_both_channels   one ENTERING event with a parameter
//                                       list as the handlers write it, both
//                                       channels off: the double formatting
//                                       (200,000 events per run)
//   logger_call/filtered                one call below its channel's level
//   logger_call/written_to_file         one line written to the trace file
//
//===----------------------------------------------------------------------===//

#include "BenchmarkSession.h"
#include "RequestTiming.h"

#include "Trace.h"

#include <KVLog/KVLogConfig.h>
#include <KVLog/KVLogger.h>

#include <benchmark/benchmark.h>

#include <atomic>
#include <string>

namespace {

using namespace tvr::bench;
using tvr::broker::RequestOptions;

struct ElementClass {
  const char *name;
  MachinePlan plan;
};

MachinePlan withSlots() {
  MachinePlan plan;
  plan.slots = 1000;
  return plan;
}
MachinePlan withChassis() {
  MachinePlan plan;
  plan.extraChassis = 999;
  return plan;
}
MachinePlan withNetworkCards() {
  MachinePlan plan;
  plan.networkCards = 1000;
  return plan;
}
MachinePlan withStorageControllers() {
  MachinePlan plan;
  plan.storageControllers = 1000;
  return plan;
}

const ElementClass kClasses[] = {
    {"TVRHX_Chassis", withChassis()},
    {"TVRHX_Slot", withSlots()},
    {"TVRHX_NetworkCard", withNetworkCards()},
    {"TVRHX_DiskController", withStorageControllers()},
};

const char *label(LoggerSetup setup) {
  switch (setup) {
  case LoggerSetup::SinksOff: return "sinks_off";
  case LoggerSetup::DefaultLevels: return "default_levels";
  case LoggerSetup::TraceToFile: return "trace_to_file";
  }
  return "";
}

/// The logger calls one request makes, counted by a listener outside the
/// timing (a listener costs the logger a call per message).
std::size_t loggerCallsOf(const ElementClass &element) {
  std::atomic<std::size_t> calls{0};
  const int id = KVLog::addListener([&calls](const KVLog::Message &) { ++calls; });
  objectManager().enumerateInstances(classPath(element.name));
  KVLog::removeListener(id);
  return calls.load();
}

void enumerateUnder(benchmark::State &state, const ElementClass &element, LoggerSetup setup) {
  useMachine(element.plan);
  const std::size_t calls = loggerCallsOf(element);
  configureLogger(setup);
  truncateTraceFile();
  tvr::broker::ObjectManager &om = objectManager();
  const bool emptyTheFile = setup == LoggerSetup::TraceToFile;
  bool timing = false; // the first request is timeRequest's warm-up
  timeRequest(state, [&](const RequestOptions &o) {
    if (emptyTheFile && timing) {
      // Keeps a long run from filling the disk; not part of the request.
      state.PauseTiming();
      truncateTraceFile();
      state.ResumeTiming();
    }
    timing = true;
    return om.enumerateInstances(classPath(element.name), std::nullopt, o);
  });
  state.counters["logger_calls"] = static_cast<double>(calls);
  configureLogger(LoggerSetup::SinksOff);
  truncateTraceFile();
}

/// One ENTERING event as an instance handler writes it: its MI, context,
/// result and reference path as addresses, and its class name.
void formatBothChannels(benchmark::State &state) {
  configureLogger(LoggerSetup::SinksOff);
  const std::string category = "Korvane.SlotProvider";
  int mi = 0, ctx = 0, result = 0, ref = 0;
  const char *className = "TVRHX_Slot";
  for (auto _ : state) {
    HX_TRACE_ENTER(category, << " mi=" << &mi << " ctx=" << &ctx << " rslt=" << &result << " ref=" << &ref
                                << " className=" << HX::traceText(className));
  }
}

void filteredCall(benchmark::State &state) {
  configureLogger(LoggerSetup::DefaultLevels);
  const std::string category = "Korvane.SlotProvider";
  const std::string message = "ENTERING: Slot_EnumInstances() in src/providers/SlotProvider.cpp [Line: 30]";
  for (auto _ : state)
    KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, category, 3000, nullptr, 0, 0, message);
  configureLogger(LoggerSetup::SinksOff);
}

void writtenToFile(benchmark::State &state) {
  configureLogger(LoggerSetup::TraceToFile);
  truncateTraceFile();
  const std::string category = "Korvane.SlotProvider";
  const std::string message = "ENTERING: Slot_EnumInstances() in src/providers/SlotProvider.cpp [Line: 30]";
  std::size_t written = 0;
  for (auto _ : state) {
    KVLog::KVLogger::traceLevelMessage(__func__, __FILE__, __LINE__, category, 3000, nullptr, 0, 0, message);
    if (++written % 100000 == 0) {
      state.PauseTiming();
      truncateTraceFile();
      state.ResumeTiming();
    }
  }
  configureLogger(LoggerSetup::SinksOff);
  truncateTraceFile();
}

const bool registered = [] {
  const LoggerSetup setups[] = {LoggerSetup::SinksOff, LoggerSetup::DefaultLevels, LoggerSetup::TraceToFile};
  for (const ElementClass &element : kClasses)
    for (LoggerSetup setup : setups)
      benchmark::RegisterBenchmark(
          (std::string(element.name) + "/EnumerateInstances_" + label(setup) + "/1000").c_str(),
          [&element, setup](benchmark::State &state) { enumerateUnder(state, element, setup); })
          ->Unit(benchmark::kMicrosecond);
  // A fixed count, so that a profiler's total divides into a cost per event.
  benchmark::RegisterBenchmark("traced_event/format_both_channels", formatBothChannels)->Iterations(200000);
  benchmark::RegisterBenchmark("logger_call/filtered", filteredCall);
  benchmark::RegisterBenchmark("logger_call/written_to_file", writtenToFile);
  return true;
}();

} // namespace
