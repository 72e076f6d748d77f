#include "LineFormat.h"

#include <cstdio>

namespace KVLog::detail {

void appendEscaped(std::string& out, std::string_view text) {
  std::size_t start = 0;
  for (std::size_t i = 0; i < text.size(); ++i) {
    const char c = text[i];
    if (c != '\n' && c != '\r')
      continue;
    out.append(text, start, i - start);
    out += c == '\n' ? "\\n" : "\\r";
    start = i + 1;
  }
  out.append(text, start, std::string_view::npos);
}

void appendMessageText(std::string& out, int level, std::string_view category,
                       std::string_view message) {
  out += std::to_string(level);
  out += ' ';
  appendEscaped(out, category);
  out += ' ';
  appendEscaped(out, message);
}

void appendUtcTimestamp(std::string& out, const std::timespec& time) {
  std::tm utc{};
  ::gmtime_r(&time.tv_sec, &utc);
  char text[64];
  const int length = std::snprintf(text, sizeof text, "%04d-%02d-%02dT%02d:%02d:%02d.%06ldZ",
                                   utc.tm_year + 1900, utc.tm_mon + 1, utc.tm_mday, utc.tm_hour,
                                   utc.tm_min, utc.tm_sec, time.tv_nsec / 1000);
  if (length > 0)
    out.append(text, static_cast<std::size_t>(length));
}

std::string formatLine(int level, std::string_view category, std::string_view message) {
  std::timespec now{};
  ::clock_gettime(CLOCK_REALTIME, &now);
  std::string line;
  // Room for the timestamp, the level and a few escapes.
  line.reserve(48 + category.size() + message.size());
  appendUtcTimestamp(line, now);
  line += ' ';
  appendMessageText(line, level, category, message);
  line += '\n';
  return line;
}

} // namespace KVLog::detail
