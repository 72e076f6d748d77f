// The process-wide snapshot of the environment and the configuration file.

#include "TVR/Settings.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <map>
#include <unistd.h>

extern char** environ;

namespace tvr::settings {
namespace {

constexpr const char* kDefaultConfigFile = "/etc/opt/tvr/platform.conf";
constexpr const char* kConfigFileVariable = "TVR_CONFIG_FILE";

using Values = std::map<std::string, std::string, std::less<>>;

struct Snapshot {
  Values environment;
  Values file;
  std::string configPath;
};

/// The logger is not up while the settings are read, so problems go straight
/// to stderr, each as one write.
void reportToStderr(const std::string& text) {
  const std::string line = "tvr settings: " + text + "\n";
  const char* data = line.data();
  std::size_t remaining = line.size();
  while (remaining > 0) {
    const ssize_t written = ::write(STDERR_FILENO, data, remaining);
    if (written < 0 && errno == EINTR)
      continue;
    if (written <= 0)
      return;
    data += written;
    remaining -= static_cast<std::size_t>(written);
  }
}

Values copyEnvironment() {
  Values values;
  for (char** entry = environ; entry && *entry; ++entry) {
    const std::string_view text(*entry);
    const auto equals = text.find('=');
    if (equals == std::string_view::npos)
      continue;
    values.emplace(std::string(text.substr(0, equals)),
                   std::string(text.substr(equals + 1)));
  }
  return values;
}

struct FileText {
  std::string text;
  int error = 0; ///< errno of the failed open or read; 0 when all was read.
};

FileText readWholeFile(const std::string& path) {
  FileText result;
  const int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) {
    result.error = errno;
    return result;
  }
  char chunk[4096];
  for (;;) {
    const ssize_t got = ::read(fd, chunk, sizeof chunk);
    if (got < 0 && errno == EINTR)
      continue;
    if (got < 0) {
      result.error = errno;
      break;
    }
    if (got == 0)
      break;
    result.text.append(chunk, static_cast<std::size_t>(got));
  }
  ::close(fd);
  return result;
}

/// strerror is not thread-safe and the first lookup may come from any
/// thread; the GNU strerror_r is.
std::string errorText(int error) {
  char buffer[128];
  return ::strerror_r(error, buffer, sizeof buffer);
}

bool isMissingFile(int error) { return error == ENOENT || error == ENOTDIR; }

Values readConfigFile(const std::string& path) {
  Values values;
  if (path.empty())
    return values;
  const FileText file = readWholeFile(path);
  if (file.error != 0 && !isMissingFile(file.error))
    reportToStderr("cannot read configuration file " + path + ": " +
                   errorText(file.error));
  const ParseResult parsed = parseConfig(file.text);
  for (const ConfigError& error : parsed.errors)
    reportToStderr(path + ": " + error.message);
  for (const ConfigEntry& entry : parsed.entries)
    values[entry.key] = entry.value;
  return values;
}

Snapshot takeSnapshot() {
  Snapshot snapshot;
  snapshot.environment = copyEnvironment();
  const auto configured = snapshot.environment.find(kConfigFileVariable);
  snapshot.configPath = configured != snapshot.environment.end()
                            ? configured->second
                            : std::string(kDefaultConfigFile);
  snapshot.file = readConfigFile(snapshot.configPath);
  return snapshot;
}

const Snapshot& snapshot() {
  static const Snapshot taken = takeSnapshot();
  return taken;
}

/// Takes the snapshot while the library is being loaded, before the host
/// process has had a chance to overwrite its environment.
[[maybe_unused]] const bool kSnapshotTakenAtLoad = (snapshot(), true);

} // namespace

std::optional<std::string> lookup(std::string_view key) {
  const Snapshot& values = snapshot();
  if (const auto found = values.environment.find(key); found != values.environment.end())
    return found->second;
  if (const auto found = values.file.find(key); found != values.file.end())
    return found->second;
  return std::nullopt;
}

std::string configFilePath() { return snapshot().configPath; }

} // namespace tvr::settings
