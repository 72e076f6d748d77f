//===- KVLog/KVLogConfig.h - Logger settings and listeners ------*- C++ -*-===//
//
// Run-time control of the logger for tools and tests: the destinations and
// levels of the two channels, and listeners that see every logger call.
//
// At load the library reads KVLOG_LOG, KVLOG_LOG_LEVEL, KVLOG_TRACE and
// KVLOG_TRACE_LEVEL through tvr::settings (environment first, then the
// configuration file). An empty or missing value means the default; an
// invalid one is reported once on stderr and the default is used instead.
//
//===----------------------------------------------------------------------===//

#ifndef KVLOG_KVLOGCONFIG_H
#define KVLOG_KVLOGCONFIG_H

#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace KVLog {

/// The two channels: Log is fed by KVLogger::logLevelMessage, Trace by
/// KVLogger::traceLevelMessage.
enum class Channel { Log, Trace };

/// Where a channel writes and from which level on.
struct SinkSettings {
  enum class Destination { Off, Syslog, Stderr, File } destination;
  /// The file of a File destination; empty for the others.
  std::string path;
  /// Messages with a level below this are dropped.
  int minimumLevel;
};

/// Returns the current settings of \p channel. Thread-safe.
SinkSettings sinkSettings(Channel channel);

/// Replaces the settings of \p channel; messages sent after the call returns
/// use them. A File destination's path should be absolute: it is opened when
/// the first message is written, relative to the working directory of that
/// moment. Thread-safe, also against concurrent logging.
///
/// File descriptors are kept for the life of the process and shared by all
/// channels that write to the same path, so switching between a few files
/// costs one descriptor per file, not per call.
void configureSink(Channel channel, const SinkSettings& settings);

/// Parses a destination ("syslog", "stderr", "off" or an absolute file path)
/// and a minimum level (a decimal integer); surrounding blanks are ignored.
/// \returns the settings, or std::nullopt with a description of what is wrong
/// in \p *error (if \p error is not null).
std::optional<SinkSettings> parseSinkSettings(std::string_view destination,
                                              std::string_view level, std::string* error);

/// One call of the logger as it was made, before any level filtering. The
/// references are valid only during the listener call.
struct Message {
  Channel channel;
  const char* function;
  const char* file;
  int line;
  const std::string& category;
  int level;
  const std::string& text;
};

using Listener = std::function<void(const Message&)>;

/// Registers \p listener. Listeners see every call of logLevelMessage and
/// traceLevelMessage, whatever the destinations and levels say, on the calling
/// thread before the message is written, in call order. An exception thrown
/// by a listener is swallowed.
///
/// \returns an id for removeListener. Thread-safe. While no listener is
/// registered, the logger pays one relaxed atomic load for this facility.
int addListener(Listener listener);

/// Unregisters the listener with \p id; unknown ids are ignored. After the
/// call returns the listener is not called for calls made later on any thread
/// (a call already under way on another thread may still reach it).
void removeListener(int id);

} // namespace KVLog

#endif // KVLOG_KVLOGCONFIG_H
