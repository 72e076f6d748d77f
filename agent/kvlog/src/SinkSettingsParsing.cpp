#include "SinkSettingsParsing.h"

#include <charconv>

namespace KVLog::detail {
namespace {

std::string_view trimBlanks(std::string_view text) {
  constexpr std::string_view blanks = " \t\r\n\f\v";
  const auto first = text.find_first_not_of(blanks);
  if (first == std::string_view::npos)
    return {};
  return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

void setError(std::string* error, std::string text) {
  if (error)
    *error = std::move(text);
}

} // namespace

std::optional<ParsedDestination> parseDestination(std::string_view text, std::string* error) {
  using Destination = SinkSettings::Destination;
  const std::string_view value = trimBlanks(text);
  if (value == "syslog")
    return ParsedDestination{Destination::Syslog, {}};
  if (value == "stderr")
    return ParsedDestination{Destination::Stderr, {}};
  if (value == "off")
    return ParsedDestination{Destination::Off, {}};
  if (value.size() > 1 && value.front() == '/')
    return ParsedDestination{Destination::File, std::string(value)};
  setError(error, "invalid destination \"" + std::string(text) +
                      "\" (expected syslog, stderr, off or an absolute file path)");
  return std::nullopt;
}

std::optional<int> parseLevel(std::string_view text, std::string* error) {
  const std::string_view value = trimBlanks(text);
  if (!value.empty()) {
    int level = 0;
    const char* end = value.data() + value.size();
    const auto [stop, problem] = std::from_chars(value.data(), end, level);
    if (problem == std::errc() && stop == end)
      return level;
  }
  setError(error, "invalid level \"" + std::string(text) + "\" (expected a whole number)");
  return std::nullopt;
}

std::string describeDestination(const SinkSettings& settings) {
  switch (settings.destination) {
  case SinkSettings::Destination::Off:
    return "off";
  case SinkSettings::Destination::Syslog:
    return "syslog";
  case SinkSettings::Destination::Stderr:
    return "stderr";
  case SinkSettings::Destination::File:
    return settings.path;
  }
  return "off";
}

} // namespace KVLog::detail

namespace KVLog {

std::optional<SinkSettings> parseSinkSettings(std::string_view destination,
                                              std::string_view level, std::string* error) {
  const auto parsedDestination = detail::parseDestination(destination, error);
  if (!parsedDestination)
    return std::nullopt;
  const auto parsedLevel = detail::parseLevel(level, error);
  if (!parsedLevel)
    return std::nullopt;
  return SinkSettings{parsedDestination->destination, parsedDestination->path, *parsedLevel};
}

} // namespace KVLog
