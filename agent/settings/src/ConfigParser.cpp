// Parser of the configuration file format described in TVR/Settings.h.

#include "TVR/Settings.h"

#include <cctype>

namespace tvr::settings {
namespace {

constexpr std::string_view kBlanks = " \t\r\f\v";

std::string_view trimBlanks(std::string_view text) {
  const auto first = text.find_first_not_of(kBlanks);
  if (first == std::string_view::npos)
    return {};
  const auto last = text.find_last_not_of(kBlanks);
  return text.substr(first, last - first + 1);
}

bool isKeyStart(char c) {
  return std::isalpha(static_cast<unsigned char>(c)) || c == '_';
}

bool isKeyCharacter(char c) {
  return std::isalnum(static_cast<unsigned char>(c)) || c == '_';
}

bool isValidKey(std::string_view key) {
  if (key.empty() || !isKeyStart(key.front()))
    return false;
  for (char c : key)
    if (!isKeyCharacter(c))
      return false;
  return true;
}

std::string lineError(int line, std::string_view what) {
  return "line " + std::to_string(line) + ": " + std::string(what);
}

/// Parses one line that is neither blank nor a comment. Returns an error
/// description, or an empty string and fills \p entry.
std::string parseEntry(std::string_view line, ConfigEntry& entry) {
  const auto equals = line.find('=');
  if (equals == std::string_view::npos)
    return "expected KEY = value";
  const std::string_view key = trimBlanks(line.substr(0, equals));
  if (key.empty())
    return "missing key before '='";
  if (!isValidKey(key))
    return "invalid key \"" + std::string(key) +
           "\" (letters, digits and '_', not starting with a digit)";
  std::string_view value = trimBlanks(line.substr(equals + 1));
  if (!value.empty() && value.front() == '"') {
    const auto closing = value.find('"', 1);
    if (closing == std::string_view::npos)
      return "missing closing '\"' in value of " + std::string(key);
    if (closing != value.size() - 1)
      return "text after the closing '\"' in value of " + std::string(key);
    value = value.substr(1, closing - 1);
  }
  entry.key = std::string(key);
  entry.value = std::string(value);
  return {};
}

} // namespace

ParseResult parseConfig(std::string_view text) {
  ParseResult result;
  int lineNumber = 0;
  std::size_t position = 0;
  while (position < text.size()) {
    auto end = text.find('\n', position);
    if (end == std::string_view::npos)
      end = text.size();
    const std::string_view line = trimBlanks(text.substr(position, end - position));
    position = end + 1;
    ++lineNumber;

    if (line.empty() || line.front() == '#')
      continue;
    ConfigEntry entry;
    entry.line = lineNumber;
    if (std::string problem = parseEntry(line, entry); !problem.empty())
      result.errors.push_back({lineNumber, lineError(lineNumber, problem)});
    else
      result.entries.push_back(std::move(entry));
  }
  return result;
}

} // namespace tvr::settings
