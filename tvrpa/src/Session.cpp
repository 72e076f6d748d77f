#include "Session.h"

#include "BuildPaths.h"

#include "tvr/broker/Mof.h"

#include <HX/HardwareSource.h>

#include <unistd.h>

#include <climits>
#include <map>
#include <vector>

namespace tvrpa {

namespace {

// The physical-asset providers' files, and those of the companion providers
// (TVRHX_ComputerSystem, TVRHX_NetworkPort), which a site may leave out.
const char* const kRegistration = "tvrhx-physical-asset.reg";
const char* const kCompanionRegistration = "tvrhx-companion.reg";
const char* const kSchema = "TVRHX_PhysicalAsset.mof";
const char* const kCompanionSchema = "TVRHX_Companion.mof";

std::string executableDirectory() {
  char buffer[PATH_MAX];
  const ssize_t n = readlink("/proc/self/exe", buffer, sizeof buffer - 1);
  if (n <= 0) return std::string();
  std::string path(buffer, static_cast<std::size_t>(n));
  return path.substr(0, path.find_last_of('/'));
}

bool readable(const std::string& path) { return access(path.c_str(), R_OK) == 0; }

// Where the files of this tvrpa are: beside it when it is installed (its
// registration is there), else in the source and build trees.
struct Layout {
  std::string registrationDirectory;
  std::string schemaDirectory;
  std::vector<std::string> providerDirectories;
};

Layout layout() {
  const std::string prefix = executableDirectory() + "/../";
  if (readable(prefix + TVRPA_INSTALLED_REGISTRATION_DIR + "/" + kRegistration))
    return Layout{
        prefix + TVRPA_INSTALLED_REGISTRATION_DIR, prefix + TVRPA_INSTALLED_SCHEMA_DIR, {TVRPA_INSTALLED_PROVIDER_DIR}};
  return Layout{TVRPA_BUILD_REGISTRATION_DIR, TVRPA_BUILD_SCHEMA_DIR, {TVRPA_BUILD_PROVIDER_DIRS}};
}

// The given files, or else the default file and, when it is there, the
// companion's.
std::vector<std::string> filesToRead(const std::vector<std::string>& given, const std::string& directory,
                                     const char* main, const char* companion) {
  if (!given.empty()) return given;
  std::vector<std::string> files = {directory + "/" + main};
  if (readable(directory + "/" + companion)) files.push_back(directory + "/" + companion);
  return files;
}

// The key properties of the schemas' classes, so that an instance whose
// path has no keys is shown with them, as an object manager that knows the
// class definitions shows it. Without a schema, instances keep the paths
// their providers gave them.
std::map<std::string, std::vector<std::string>> classKeys(const CommandLine& cl, const Layout& where) {
  std::optional<tvr::broker::MofSchema> merged;
  for (const std::string& file : filesToRead(cl.schemas, where.schemaDirectory, kSchema, kCompanionSchema)) {
    // Only a schema the user names must be there.
    if (cl.schemas.empty() && !readable(file)) continue;
    tvr::broker::MofError error;
    const auto schema = tvr::broker::MofSchema::load(file, &error);
    if (!schema) throw UsageError{"cannot read the schema: " + error.str()};
    if (merged)
      merged->merge(*schema);
    else
      merged = *schema;
  }
  if (!merged) return {};
  return tvr::broker::classKeysOf(*merged);
}

// The tree file the agent would read: --tree, else the one its settings
// name (HX_HARDWARE_TREE), else none.
std::optional<std::string> treeFile(const CommandLine& cl) {
  if (cl.tree) return cl.tree;
  const std::string source = HX::describeHardwareSource();
  const std::string prefix = "tree file ";
  if (source.rfind(prefix, 0) == 0) return source.substr(prefix.size());
  return std::nullopt;
}

} // namespace

namespace {

// Each registration file read, in order: the physical-asset providers' (or
// the first one given), then the companion's.
std::vector<tvr::broker::RegistrationTable> registrationFiles(const CommandLine& cl) {
  const Layout where = layout();
  std::vector<tvr::broker::RegistrationTable> tables;
  for (const std::string& file :
       filesToRead(cl.registrations, where.registrationDirectory, kRegistration, kCompanionRegistration)) {
    std::string error;
    auto table = tvr::broker::RegistrationTable::load(file, &error);
    if (!table) throw UsageError{error};
    tables.push_back(std::move(*table));
  }
  return tables;
}

tvr::broker::RegistrationTable merged(const std::vector<tvr::broker::RegistrationTable>& tables) {
  tvr::broker::RegistrationTable table;
  for (const tvr::broker::RegistrationTable& t : tables)
    for (const tvr::broker::ClassRegistration& reg : t.classes()) table.add(reg);
  return table;
}

} // namespace

tvr::broker::RegistrationTable loadRegistration(const CommandLine& cl) { return merged(registrationFiles(cl)); }

Session::Session(const CommandLine& cl) {
  // A refused file would leave the providers without nodes and the user
  // with an empty answer; say why instead.
  if (const std::optional<std::string> tree = treeFile(cl)) {
    if (auto refusal = HX::checkHardwareTree(*tree)) throw UsageError{*refusal};
    HX::useHardwareTree(*tree);
  }
  const Layout where = layout();
  const std::vector<tvr::broker::RegistrationTable> tables = registrationFiles(cl);
  tvr::broker::ObjectManagerOptions options;
  options.registration = merged(tables);
  options.classKeys = classKeys(cl, where);
  options.providerDirectories = where.providerDirectories;
  // Another build of the provider library serves the classes of the first
  // registration; the companion providers stay what they are.
  if (cl.providerLibrary) {
    if (!readable(*cl.providerLibrary)) throw UsageError{"cannot read provider library " + *cl.providerLibrary};
    for (const tvr::broker::ClassRegistration& reg : tables.front().classes())
      options.libraryFiles[reg.location] = *cl.providerLibrary;
  }
  om_ = std::make_unique<tvr::broker::ObjectManager>(std::move(options));
}

std::string Session::hardwareSource() const { return HX::describeHardwareSource(); }

} // namespace tvrpa
