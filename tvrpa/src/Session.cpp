#include "Session.h"

#include "BuildPaths.h"

#include "tvr/broker/PathText.h"

#include <HX/HardwareSource.h>

#include <unistd.h>

#include <climits>

namespace tvrpa {

namespace {

std::string executableDirectory() {
  char buffer[PATH_MAX];
  const ssize_t n = readlink("/proc/self/exe", buffer, sizeof buffer - 1);
  if (n <= 0) return std::string();
  std::string path(buffer, static_cast<std::size_t>(n));
  return path.substr(0, path.find_last_of('/'));
}

bool readable(const std::string& path) { return access(path.c_str(), R_OK) == 0; }

// An installed tvrpa finds the registration beside itself; one in the build
// tree uses the source tree's.
bool installed(std::string* registration) {
  const std::string candidate = executableDirectory() + "/../" + TVRPA_INSTALLED_REGISTRATION_FILE;
  if (!readable(candidate)) return false;
  *registration = candidate;
  return true;
}

tvr::broker::ObjectManagerOptions objectManagerOptions(const CommandLine& cl) {
  std::string registrationFile;
  const bool isInstalled = installed(&registrationFile);
  if (!isInstalled) registrationFile = TVRPA_BUILD_REGISTRATION_FILE;
  if (cl.registration) registrationFile = *cl.registration;

  std::string error;
  auto table = tvr::broker::RegistrationTable::load(registrationFile, &error);
  if (!table) throw UsageError{error};

  tvr::broker::ObjectManagerOptions options;
  options.providerDirectories.push_back(isInstalled ? TVRPA_INSTALLED_PROVIDER_DIR : TVRPA_BUILD_PROVIDER_DIR);
  if (cl.providerLibrary) {
    if (!readable(*cl.providerLibrary)) throw UsageError{"cannot read provider library " + *cl.providerLibrary};
    for (const tvr::broker::ClassRegistration& reg : table->classes())
      options.libraryFiles[reg.location] = *cl.providerLibrary;
  }
  options.registration = std::move(*table);
  return options;
}

// The path `gi` names: a path text, then any KEY=VALUE words as string keys.
tvr::broker::ObjectPath requestedPath(const CommandLine& cl) {
  tvr::broker::PathParseError error;
  auto path = tvr::broker::parseObjectPath(cl.arguments.front(), &error);
  if (!path)
    throw UsageError{"bad object path at column " + std::to_string(error.column) + ": " + error.message +
                     "\n  " + cl.arguments.front() + "\n  " + std::string(error.column - 1, ' ') + "^"};
  for (std::size_t i = 1; i < cl.arguments.size(); ++i) {
    const std::string& word = cl.arguments[i];
    const std::size_t equals = word.find('=');
    if (equals == std::string::npos || equals == 0)
      throw UsageError{"expected KEY=VALUE after the path, got '" + word + "'"};
    path->setKey(word.substr(0, equals), tvr::broker::Value::chars(word.substr(equals + 1)));
  }
  if (path->nameSpace.empty()) path->nameSpace = cl.nameSpace;
  return *path;
}

} // namespace

Session::Session(const CommandLine& commandLine) : commandLine_(commandLine) {
  if (commandLine.tree) {
    if (auto refusal = HX::checkHardwareTree(*commandLine.tree)) throw UsageError{*refusal};
    HX::useHardwareTree(*commandLine.tree);
  }
  om_ = std::make_unique<tvr::broker::ObjectManager>(objectManagerOptions(commandLine));
}

tvr::broker::Response Session::run() {
  const CommandLine& cl = commandLine_;
  if (cl.operation == "gi") return om_->getInstance(requestedPath(cl), cl.properties);
  const tvr::broker::ObjectPath classPath(cl.nameSpace, cl.arguments.front());
  if (cl.operation == "ein") return om_->enumerateInstanceNames(classPath);
  return om_->enumerateInstances(classPath, cl.properties);
}

} // namespace tvrpa
