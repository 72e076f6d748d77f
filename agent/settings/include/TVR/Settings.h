//===- TVR/Settings.h - Agent settings from environment and file -*- C++ -*-===//
//
// The agent libraries take their settings from two sources: the process
// environment and the configuration file. A variable in the environment wins
// over the same key in the file.
//
// Both sources are captured once, when the library that contains this code is
// loaded (and at the latest on the first lookup), and never read again. Some
// object managers fork their provider processes and then rewrite the command
// line in place, which overwrites the first environment strings; a setting
// read after that would be lost.
//
// Keys read by the agent libraries:
//   TVR_CONFIG_FILE    Path of the configuration file itself; environment only.
//                      Default "/etc/opt/tvr/platform.conf". An empty value
//                      means "no configuration file".
//   HX_HARDWARE_TREE   Hardware-tree file the hardware cursors read instead of
//                      the live machine (unset or empty: the live machine).
//   HX_FS_ROOT         File-system root under which the live machine's
//                      hardware is read. Default "/".
//   KVLOG_LOG          Destination of the logger's Log channel: syslog
//                      (default), stderr, off, or an absolute file path.
//   KVLOG_LOG_LEVEL    Lowest level the Log channel writes. Default 6000.
//   KVLOG_TRACE        Destination of the logger's Trace channel: off
//                      (default), syslog, stderr, or an absolute file path.
//   KVLOG_TRACE_LEVEL  Lowest level the Trace channel writes. Default 0.
//
//===----------------------------------------------------------------------===//

#ifndef TVR_SETTINGS_H
#define TVR_SETTINGS_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tvr::settings {

/// One `KEY = value` line of a configuration text.
struct ConfigEntry {
  std::string key;
  /// The value with surrounding blanks removed, or the text between the
  /// double quotes of a quoted value.
  std::string value;
  /// 1-based number of the line the entry came from.
  int line = 0;
};

/// A line of a configuration text that is not blank, a comment or an entry.
struct ConfigError {
  /// 1-based number of the offending line.
  int line = 0;
  /// Human-readable description that starts with "line <n>: ".
  std::string message;
};

/// Everything read from a configuration text. Malformed lines do not stop the
/// parse: the well-formed lines are in `entries` either way.
struct ParseResult {
  /// The entries in file order. A key may repeat; the last one counts.
  std::vector<ConfigEntry> entries;
  /// One error per malformed line, in file order.
  std::vector<ConfigError> errors;
};

/// Returns the value of setting \p key: the environment variable of that name
/// if it was set (even to an empty string), else the configuration file's
/// value, else std::nullopt.
///
/// Both sources are read once per process: when the library is loaded, or on
/// the first call if that comes earlier. Later changes of the environment or
/// of the file are not seen. A missing configuration file is normal. Problems
/// with the file (unreadable, malformed lines) are written to stderr once, at
/// that first read, and the entries that could be read are used.
///
/// Thread-safe.
std::optional<std::string> lookup(std::string_view key);

/// Returns the path of the configuration file: $TVR_CONFIG_FILE as it was
/// when the settings were read, if set, else "/etc/opt/tvr/platform.conf".
std::string configFilePath();

/// Parses configuration text.
///
/// The format is line based:
///  - blank lines and lines whose first non-blank character is '#' are
///    ignored (a '#' elsewhere is part of the value);
///  - every other line is `KEY = value`: the key is a letter or '_' followed
///    by letters, digits and '_'; blanks around key and value are dropped;
///  - a value wrapped in double quotes is taken verbatim between the quotes,
///    so it may keep surrounding blanks; there are no escape sequences.
/// Lines may end in "\n" or "\r\n".
ParseResult parseConfig(std::string_view text);

} // namespace tvr::settings

#endif // TVR_SETTINGS_H
