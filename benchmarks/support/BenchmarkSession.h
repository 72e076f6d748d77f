//===- BenchmarkSession.h - The object manager the benchmarks use -*- C++ -*-===//
//
/// \file
/// One embedded object manager per benchmark process, loaded as tvrpa loads
/// it (the project's registration, the companion providers and the class
/// keys of the schemas), plus the baseline provider: a provider that reads
/// no hardware and traces nothing, but builds, through the same broker, the
/// very object paths and instances a real provider answered. What a real
/// provider costs beyond that baseline is its own work.
//
//===----------------------------------------------------------------------===//

#ifndef TVR_BENCHMARKS_BENCHMARKSESSION_H
#define TVR_BENCHMARKS_BENCHMARKSESSION_H

#include "HardwareTreeGenerator.h"

#include "tvr/broker/ObjectManager.h"

#include <string>
#include <vector>

namespace tvr::bench {

/// The namespace every benchmark request is sent to.
extern const char *const kNameSpace;

/// The class the baseline provider answers for.
extern const char *const kBaselineClass;

/// The object manager of this process, made on first use. The environment
/// variable TVR_BENCH_PROVIDER_LIBRARY, when set, names another build of the
/// provider library to load instead of the build's own.
broker::ObjectManager &objectManager();

/// Makes cursors read the machine \p plan describes. Its tree file is written
/// on first use (removed when the process ends) and read once here, so that
/// timings start on a parsed tree, as they do on a long-running object
/// manager.
void useMachine(const MachinePlan &plan);

/// A path of \p className in kNameSpace without keys.
broker::ObjectPath classPath(const std::string &className);

/// What the baseline provider answers from now on: for EnumerateInstances
/// of kBaselineClass it builds exactly these instances (each path with its
/// host and keys, each property in order with its CMPI type) through the
/// broker, returns them and completes the answer; for
/// EnumerateInstanceNames it builds and returns their paths.
void setBaselineAnswer(std::vector<broker::Instance> instances);

/// The instances of a response, with their paths, in order. Throws
/// std::runtime_error when the request failed.
std::vector<broker::Instance> instancesOf(const broker::Response &response);

/// Logger configurations the requests are timed under.
enum class LoggerSetup {
  /// Both channels off: a traced event costs its formatting and two level
  /// compares.
  SinksOff,
  /// The settings a fresh installation has: log channel to syslog at 6000,
  /// trace channel off. Nothing at the providers' levels is written.
  DefaultLevels,
  /// As DefaultLevels, with the trace channel writing every level to a file.
  TraceToFile,
};

/// Configures both channels of the logger as \p setup says.
void configureLogger(LoggerSetup setup);

/// The file TraceToFile writes to.
const std::string &traceFilePath();

/// Empties the trace file, so that long runs do not fill the disk.
void truncateTraceFile();

} // namespace tvr::bench

#endif // TVR_BENCHMARKS_BENCHMARKSESSION_H
