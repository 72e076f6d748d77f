// The text of a written message.

#ifndef KVLOG_SRC_LINEFORMAT_H
#define KVLOG_SRC_LINEFORMAT_H

#include <ctime>
#include <string>
#include <string_view>

namespace KVLog::detail {

/// Appends \p text, writing a line feed as "\n" and a carriage return as
/// "\r" so that the text stays on one line.
void appendEscaped(std::string& out, std::string_view text);

/// Appends "<level> <category> <message>", escaped as by appendEscaped.
void appendMessageText(std::string& out, int level, std::string_view category,
                       std::string_view message);

/// Appends \p time as UTC in ISO 8601 with microseconds, e.g.
/// "2026-11-21T06:16:00.123456Z".
void appendUtcTimestamp(std::string& out, const std::timespec& time);

/// Returns the whole line of a file or stderr destination, stamped with the
/// current time and ending in a line feed.
std::string formatLine(int level, std::string_view category, std::string_view message);

} // namespace KVLog::detail

#endif // KVLOG_SRC_LINEFORMAT_H
