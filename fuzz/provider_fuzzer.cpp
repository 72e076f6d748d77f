// Fuzz target: the providers themselves, loaded by the embedded object
// manager as a CIM server loads them. Each input makes up a machine (a
// hardware-tree file) and a few requests on it (see FuzzedMachine.h and
// FuzzedRequest.h). Every request must end in an answer, whatever its status.
// The one exception a request may end in is the one the providers are built
// to let escape: std::out_of_range ("vector::_M_range_check") from
// TVRHX_PackageInSlot, whose handlers take the first chassis of a machine
// that shows none. Anything else, or a crash, is a finding.
#include "FuzzCheck.h"
#include "FuzzedMachine.h"
#include "FuzzedRequest.h"

#include "tvr/broker/Mof.h"

#include <HX/HardwareSource.h>
#include <HX/Instrumentation.h>
#include <KVLog/KVLogConfig.h>

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>

namespace {

using tvr::fuzz::require;

/// Requests per input, and nodes per machine: enough for the associations to
/// find partners, few enough for thousands of inputs a second.
constexpr int kMaxRequests = 6;
constexpr int kMaxNodes = 40;
/// Answers give their paths to later requests; this many are kept.
constexpr std::size_t kMaxRememberedPaths = 64;

struct Setup {
  std::unique_ptr<tvr::broker::ObjectManager> om;
  tvr::fuzz::RequestMaterial material;
  std::string treeDirectory;
};

tvr::broker::RegistrationTable registration(const char* file) {
  std::string error;
  std::optional<tvr::broker::RegistrationTable> table = tvr::broker::RegistrationTable::load(file, &error);
  require(table.has_value(), "the registration loads: " + error);
  return std::move(*table);
}

tvr::broker::MofSchema schema(const char* file) {
  tvr::broker::MofError error;
  std::optional<tvr::broker::MofSchema> loaded = tvr::broker::MofSchema::load(file, &error);
  require(loaded.has_value(), "the schema loads: " + error.str());
  return std::move(*loaded);
}

Setup& setup() {
  static Setup instance = [] {
    Setup s;
    tvr::broker::RegistrationTable table = registration(TVR_FUZZ_REGISTRATION_FILE);
    const tvr::broker::RegistrationTable companion = registration(TVR_FUZZ_COMPANION_REGISTRATION_FILE);
    for (const tvr::broker::ClassRegistration& reg : companion.classes()) table.add(reg);
    tvr::broker::MofSchema classes = schema(TVR_FUZZ_SCHEMA_FILE);
    classes.merge(schema(TVR_FUZZ_COMPANION_SCHEMA_FILE));
    for (const tvr::broker::ClassRegistration& reg : table.classes()) s.material.classes.push_back(reg.className);
    s.material.classKeys = tvr::broker::classKeysOf(classes);
    tvr::broker::ObjectManagerOptions options;
    options.registration = std::move(table);
    options.classKeys = s.material.classKeys;
    options.providerDirectories = {TVR_FUZZ_PROVIDER_DIR, TVR_FUZZ_COMPANION_DIR};
    s.om = std::make_unique<tvr::broker::ObjectManager>(std::move(options));
    const char* base = std::getenv("TMPDIR");
    std::string pattern = std::string(base && *base ? base : "/dev/shm") + "/tvr-fuzz-trees-XXXXXX";
    require(::mkdtemp(pattern.data()) != nullptr, "a directory for the trees can be made");
    s.treeDirectory = pattern;
    return s;
  }();
  return instance;
}

/// Writes the machine to a file of its own and makes the cursors read it. A
/// new file each time: a rewritten one could keep its identity (same inode,
/// size and times) and be taken for the file already read.
void useMachine(const std::string& treeText) {
  static unsigned long counter = 0;
  static std::string previous;
  const std::string path = setup().treeDirectory + "/machine-" + std::to_string(counter++) + ".json";
  std::ofstream(path, std::ios::binary | std::ios::trunc) << treeText;
  HX::useHardwareTree(path);
  if (!previous.empty()) std::remove(previous.c_str());
  previous = path;
}

/// True when a cursor sees no chassis: the tree has none, is refused, or
/// fails the selection of chassis on purpose.
bool noChassisVisible() {
  try {
    HX::Instrumentation cursor;
    cursor.selectNode(HX::NodeLexicon::ChassisNode);
    return !cursor;
  } catch (...) {
    return true;
  }
}

bool isOrderedOutOfRange(const tvr::broker::EscapedException& exception, const std::string& provider) {
  return provider == "PackageInSlotProvider" && exception.type == "std::out_of_range" &&
         exception.what.rfind("vector::_M_range_check", 0) == 0 && noChassisVisible();
}

void checkAnswer(const tvr::broker::Response& answer) {
  for (const tvr::broker::ProviderOutcome& outcome : answer.outcomes)
    if (outcome.exception)
      require(isOrderedOutOfRange(*outcome.exception, outcome.provider),
              "only PackageInSlot's out-of-range escapes, and only without a chassis; " + outcome.provider +
                  " let " + outcome.exception->type + " escape: " + outcome.exception->what);
}

void remember(const tvr::broker::Response& answer, std::vector<tvr::broker::ObjectPath>& paths) {
  for (const tvr::broker::ObjectPath& path : answer.paths()) {
    if (paths.size() == kMaxRememberedPaths) paths.erase(paths.begin());
    paths.push_back(path);
  }
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  // Every line the providers trace is formatted and written, as in a
  // process that traces everything, but to nowhere.
  const KVLog::SinkSettings everything{KVLog::SinkSettings::Destination::File, "/dev/null", 0};
  KVLog::configureSink(KVLog::Channel::Log, everything);
  KVLog::configureSink(KVLog::Channel::Trace, everything);
  setup();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  FuzzedDataProvider input(data, size);
  Setup& s = setup();
  tvr::fuzz::FuzzedMachine machine = tvr::fuzz::fuzzedMachine(input, kMaxNodes);
  useMachine(machine.treeText);
  s.material.texts = std::move(machine.nodeTexts);
  s.material.paths.clear();
  const int requests = input.ConsumeIntegralInRange(1, kMaxRequests);
  for (int i = 0; i < requests; ++i) {
    const tvr::broker::Response answer = tvr::fuzz::send(*s.om, tvr::fuzz::fuzzedRequest(input, s.material));
    checkAnswer(answer);
    remember(answer, s.material.paths);
  }
  return 0;
}
