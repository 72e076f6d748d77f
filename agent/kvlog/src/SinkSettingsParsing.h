// Parsing and describing the values of the logger's settings.

#ifndef KVLOG_SRC_SINKSETTINGSPARSING_H
#define KVLOG_SRC_SINKSETTINGSPARSING_H

#include "KVLog/KVLogConfig.h"

#include <optional>
#include <string>
#include <string_view>

namespace KVLog::detail {

/// A destination without its level.
struct ParsedDestination {
  SinkSettings::Destination destination;
  std::string path;
};

/// Parses "syslog", "stderr", "off" or an absolute path; blanks around the
/// value are ignored. On failure sets \p error (if not null).
std::optional<ParsedDestination> parseDestination(std::string_view text, std::string* error);

/// Parses a decimal int; blanks around it are ignored. On failure sets
/// \p error (if not null).
std::optional<int> parseLevel(std::string_view text, std::string* error);

/// The destination as it is written in the settings: "syslog", "/var/x.log".
std::string describeDestination(const SinkSettings& settings);

} // namespace KVLog::detail

#endif // KVLOG_SRC_SINKSETTINGSPARSING_H
