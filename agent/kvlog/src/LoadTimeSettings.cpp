// Applies the logger's settings when the library is loaded.

#include "SinkSettingsParsing.h"

#include "TVR/Settings.h"

#include <cerrno>
#include <unistd.h>

namespace KVLog::detail {
namespace {

using Destination = SinkSettings::Destination;

/// The logger cannot log its own settings problems, so they go to stderr.
void reportToStderr(const std::string& text) {
  const std::string line = "tvr kvlog: " + text + "\n";
  std::string_view rest = line;
  while (!rest.empty()) {
    const ssize_t written = ::write(STDERR_FILENO, rest.data(), rest.size());
    if (written < 0 && errno == EINTR)
      continue;
    if (written <= 0)
      return;
    rest.remove_prefix(static_cast<std::size_t>(written));
  }
}

/// The settings of one channel from its two keys. A key that is missing or
/// empty gives the default; an invalid one is reported and gives the default,
/// without affecting the other key.
SinkSettings settingsFromKeys(const char* destinationKey, const char* levelKey,
                              const SinkSettings& defaults) {
  SinkSettings settings = defaults;
  std::string error;
  if (const auto value = tvr::settings::lookup(destinationKey); value && !value->empty()) {
    if (const auto destination = parseDestination(*value, &error)) {
      settings.destination = destination->destination;
      settings.path = destination->path;
    } else {
      reportToStderr(std::string(destinationKey) + ": " + error + "; using " +
                     describeDestination(defaults));
    }
  }
  if (const auto value = tvr::settings::lookup(levelKey); value && !value->empty()) {
    if (const auto level = parseLevel(*value, &error))
      settings.minimumLevel = *level;
    else
      reportToStderr(std::string(levelKey) + ": " + error + "; using " +
                     std::to_string(defaults.minimumLevel));
  }
  return settings;
}

struct ApplySettingsAtLoad {
  ApplySettingsAtLoad() {
    configureSink(Channel::Log, settingsFromKeys("KVLOG_LOG", "KVLOG_LOG_LEVEL",
                                                 {Destination::Syslog, {}, 6000}));
    configureSink(Channel::Trace, settingsFromKeys("KVLOG_TRACE", "KVLOG_TRACE_LEVEL",
                                                   {Destination::Off, {}, 0}));
  }
};

const ApplySettingsAtLoad appliedAtLoad;

} // namespace
} // namespace KVLog::detail
