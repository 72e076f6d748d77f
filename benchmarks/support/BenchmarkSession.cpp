//===- BenchmarkSession.cpp - The object manager the benchmarks use -------===//

#include "BenchmarkSession.h"

#include "BaselineAnswer.h"

#include "tvr/broker/Mof.h"

#include <HX/HardwareSource.h>
#include <HX/Instrumentation.h>
#include <KVLog/KVLogConfig.h>

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <map>
#include <memory>
#include <stdexcept>
#include <tuple>

namespace tvr::bench {

const char *const kNameSpace = "root/cimv2";
const char *const kBaselineClass = "TVRBENCH_Baseline";

namespace {

const char *const kBaselineProvider = "BaselineProvider";

broker::RegistrationTable loadRegistration(const std::string &path) {
  std::string error;
  std::optional<broker::RegistrationTable> table = broker::RegistrationTable::load(path, &error);
  if (!table)
    throw std::runtime_error(error);
  return std::move(*table);
}

broker::MofSchema loadSchema(const std::string &path) {
  broker::MofError error;
  std::optional<broker::MofSchema> schema = broker::MofSchema::load(path, &error);
  if (!schema)
    throw std::runtime_error(error.str());
  return std::move(*schema);
}

std::unique_ptr<broker::ObjectManager> makeObjectManager() {
  const std::string source = TVR_SOURCE_DIR;
  broker::RegistrationTable table = loadRegistration(source + "/registration/sfcb/tvrhx-physical-asset.reg");
  const broker::RegistrationTable companion = loadRegistration(source + "/registration/sfcb/tvrhx-companion.reg");
  for (const broker::ClassRegistration &reg : companion.classes())
    table.add(reg);
  broker::ClassRegistration baseline;
  baseline.className = kBaselineClass;
  baseline.provider = kBaselineProvider;
  baseline.location = TVR_BASELINE_PROVIDER_LOCATION;
  baseline.instance = true;
  baseline.namespaces = {kNameSpace};
  table.add(baseline);

  broker::MofSchema schema = loadSchema(source + "/schema/TVRHX_PhysicalAsset.mof");
  schema.merge(loadSchema(source + "/schema/TVRHX_Companion.mof"));

  broker::ObjectManagerOptions options;
  options.registration = std::move(table);
  options.classKeys = broker::classKeysOf(schema);
  options.providerDirectories = {TVR_PROVIDER_DIR, TVR_COMPANION_DIR, TVR_BASELINE_PROVIDER_DIR};
  // Another build of the provider library, for comparing two builds with
  // the same benchmarks.
  if (const char *library = std::getenv("TVR_BENCH_PROVIDER_LIBRARY"); library && *library)
    options.libraryFiles[TVR_PROVIDER_LOCATION] = library;
  return std::make_unique<broker::ObjectManager>(std::move(options));
}

std::string temporaryDirectory() {
  const char *dir = std::getenv("TMPDIR");
  return dir && *dir ? dir : "/tmp";
}

/// The tree files written by this process, removed when it ends.
class TreeFiles {
public:
  ~TreeFiles() {
    for (const auto &entry : Paths)
      std::remove(entry.second.c_str());
  }

  const std::string &pathOf(const MachinePlan &plan) {
    const auto key = std::make_tuple(plan.extraChassis, plan.expansionChassis, plan.slots, plan.connectors,
                                     plan.networkCards, plan.storageControllers, plan.structural);
    auto found = Paths.find(key);
    if (found != Paths.end())
      return found->second;
    const std::string path = temporaryDirectory() + "/tvr-bench-" + std::to_string(getpid()) + "-" +
                             std::to_string(Paths.size()) + ".json";
    writeHardwareTree(plan, path);
    return Paths.emplace(key, path).first->second;
  }

private:
  using Key = std::tuple<std::size_t, std::size_t, std::size_t, std::size_t, std::size_t, std::size_t,
                         std::size_t>;
  std::map<Key, std::string> Paths;
};

TreeFiles &treeFiles() {
  static TreeFiles files;
  return files;
}

} // namespace

broker::ObjectManager &objectManager() {
  static const std::unique_ptr<broker::ObjectManager> om = makeObjectManager();
  return *om;
}

void useMachine(const MachinePlan &plan) {
  HX::useHardwareTree(treeFiles().pathOf(plan));
  HX::Instrumentation reading;
  reading.selectNode(HX::NodeLexicon::SystemNode);
}

broker::ObjectPath classPath(const std::string &className) { return broker::ObjectPath(kNameSpace, className); }

void setBaselineAnswer(std::vector<broker::Instance> instances) {
  static std::vector<broker::Instance> answer;
  answer = std::move(instances);
  std::string error;
  void *symbol = objectManager().providerSymbol(kBaselineProvider, kSetBaselineAnswerSymbol, &error);
  if (!symbol)
    throw std::runtime_error(error);
  reinterpret_cast<SetBaselineAnswer>(symbol)(&answer);
}

std::vector<broker::Instance> instancesOf(const broker::Response &response) {
  if (!response.ok())
    throw std::runtime_error("the request failed: " + broker::statusName(response.rc) + " " +
                             response.message.value_or("") +
                             (response.exception ? " " + response.exception->what : std::string()));
  return response.instances();
}

namespace {
/// Removes the trace file when the process ends.
struct TraceFile {
  TraceFile() : path(temporaryDirectory() + "/tvr-bench-trace-" + std::to_string(getpid()) + ".log") {}
  ~TraceFile() { std::remove(path.c_str()); }
  const std::string path;
};
} // namespace

const std::string &traceFilePath() {
  static const TraceFile file;
  return file.path;
}

void truncateTraceFile() {
  if (::truncate(traceFilePath().c_str(), 0) != 0) {
    // Not written yet: nothing to empty.
  }
}

void configureLogger(LoggerSetup setup) {
  using Destination = KVLog::SinkSettings::Destination;
  const KVLog::SinkSettings off{Destination::Off, {}, 0};
  const KVLog::SinkSettings defaultLog{Destination::Syslog, {}, 6000};
  switch (setup) {
  case LoggerSetup::SinksOff:
    KVLog::configureSink(KVLog::Channel::Log, off);
    KVLog::configureSink(KVLog::Channel::Trace, off);
    break;
  case LoggerSetup::DefaultLevels:
    KVLog::configureSink(KVLog::Channel::Log, defaultLog);
    KVLog::configureSink(KVLog::Channel::Trace, off);
    break;
  case LoggerSetup::TraceToFile:
    KVLog::configureSink(KVLog::Channel::Log, defaultLog);
    KVLog::configureSink(KVLog::Channel::Trace, KVLog::SinkSettings{Destination::File, traceFilePath(), 0});
    break;
  }
}

} // namespace tvr::bench
