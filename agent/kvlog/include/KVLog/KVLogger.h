//===- KVLog/KVLogger.h - Entry points of the logger ------------*- C++ -*-===//
//
// The logger has two channels, Log and Trace. Each has a destination and a
// minimum level, taken from the settings when the library is loaded (see
// KVLog/KVLogConfig.h and TVR/Settings.h):
//
//   KVLOG_LOG          syslog (default), stderr, off, or an absolute file path
//   KVLOG_LOG_LEVEL    default 6000
//   KVLOG_TRACE        off (default), syslog, stderr, or an absolute file path
//   KVLOG_TRACE_LEVEL  default 0
//
// A message below its channel's level, or sent to a channel that is off, is
// dropped before anything else happens: no formatting, allocation, lock or
// clock read.
//
// File and stderr destinations get one line per message:
//
//   <UTC time, e.g. 2026-11-21T06:16:00.123456Z> <level> <category> <message>
//
// The category and the message are written verbatim, except that a line feed
// is written as the two characters "\n" and a carriage return as "\r", so a
// message is always exactly one line. Each line is written with one write(2)
// on a descriptor opened with O_APPEND, so lines from several threads or
// processes sharing a file never interleave.
//
// The syslog destination makes one syslog() call per message, with ident
// "tvr", facility LOG_DAEMON and the text "<level> <category> <message>"
// (line breaks escaped as above). The priority follows the level:
//
//   level >= 6000          LOG_ERR
//   5000 <= level < 6000   LOG_WARNING
//   4000 <= level < 5000   LOG_INFO
//   level < 4000           LOG_DEBUG
//
// Note that syslog's ident is per process: the first syslog destination sets
// it to "tvr" for the whole process.
//
// Failures of a destination never reach the caller: the logger does not
// throw, and a message that cannot be written is dropped. Each kind of
// failure (for example "cannot open: No such file or directory" or "cannot
// write: No space left on device") is reported once per destination to
// syslog, and the destination keeps trying:
//  - a file that cannot be opened is tried again at most once per second, so
//    a directory created later or a freed disk recovers without a restart;
//  - at most once per second a file destination checks whether its path
//    still names the file it writes to; when the file was renamed or removed
//    (log rotation), the next message creates a new file at the path. Lines
//    written in that second still go to the old file.
// Writing to a full pipe (stderr) blocks as any write to it does, and writing
// to a pipe without reader raises SIGPIPE unless the host ignores it.
//
//===----------------------------------------------------------------------===//

#ifndef KVLOG_KVLOGGER_H
#define KVLOG_KVLOGGER_H

#include <string>

namespace KVLog {

class KVLogger {
public:
  /// Sends \p message to the Log channel.
  ///
  /// \p function, \p file and \p line name the calling code; they are passed
  /// to listeners (KVLog/KVLogConfig.h) and not written to the destination.
  /// \p category names the calling component. \p level orders messages by
  /// importance (higher is more important). \p reserved, \p reserved1 and
  /// \p reserved2 are reserved: pass nullptr, 0, 0.
  ///
  /// \returns 0. Never throws. Thread-safe.
  static int logLevelMessage(const char* function, const char* file, int line,
                             const std::string& category, int level, char* reserved,
                             int reserved1, int reserved2, const std::string& message);

  /// Sends \p message to the Trace channel. Arguments and result as for
  /// logLevelMessage.
  static int traceLevelMessage(const char* function, const char* file, int line,
                               const std::string& category, int level, char* reserved,
                               int reserved1, int reserved2, const std::string& message);
};

} // namespace KVLog

#endif // KVLOG_KVLOGGER_H
