// What the logger tests share: a fixture that starts every test with both
// channels off and restores them afterwards, shorthands for logging, and a
// parser of written lines.

#ifndef TVR_TESTS_KVLOG_LOGGERFIXTURE_H
#define TVR_TESTS_KVLOG_LOGGERFIXTURE_H

#include "KVLog/KVLogConfig.h"
#include "KVLog/KVLogger.h"
#include "TestFiles.h"

#include <optional>
#include <string>

#include <gtest/gtest.h>

namespace kvlogtest {

using Destination = KVLog::SinkSettings::Destination;

class LoggerTest : public ::testing::Test {
protected:
  LoggerTest() {
    KVLog::configureSink(KVLog::Channel::Log, {Destination::Off, {}, 0});
    KVLog::configureSink(KVLog::Channel::Trace, {Destination::Off, {}, 0});
  }
  ~LoggerTest() override {
    KVLog::configureSink(KVLog::Channel::Log, savedLog_);
    KVLog::configureSink(KVLog::Channel::Trace, savedTrace_);
  }

  tvr::testing::TemporaryDirectory directory;

private:
  const KVLog::SinkSettings savedLog_ = KVLog::sinkSettings(KVLog::Channel::Log);
  const KVLog::SinkSettings savedTrace_ = KVLog::sinkSettings(KVLog::Channel::Trace);
};

inline KVLog::SinkSettings fileSink(const std::string& path, int minimumLevel = 0) {
  return {Destination::File, path, minimumLevel};
}

inline void logMessage(int level, const std::string& text, const std::string& category = "Test") {
  KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, category, level, nullptr, 0, 0,
                                   text);
}

inline void traceMessage(int level, const std::string& text,
                         const std::string& category = "Test") {
  KVLog::KVLogger::traceLevelMessage(__func__, __FILE__, __LINE__, category, level, nullptr, 0, 0,
                                     text);
}

/// A line of a file or stderr destination, split into its fields.
struct WrittenLine {
  std::string timestamp;
  int level;
  std::string category; ///< Must not contain blanks to be parsed.
  std::string message;
};

/// Splits \p line (without line feed); std::nullopt if it is not
/// "<timestamp> <level> <category> <message>" with the timestamp as
/// 2026-11-21T06:16:00.123456Z.
inline std::optional<WrittenLine> parseWrittenLine(const std::string& line) {
  // 'd' stands for a digit, every other character for itself.
  static const std::string timestampShape = "dddd-dd-ddTdd:dd:dd.ddddddZ ";
  if (line.size() < timestampShape.size())
    return std::nullopt;
  for (size_t i = 0; i < timestampShape.size(); ++i) {
    const bool isDigit = line[i] >= '0' && line[i] <= '9';
    if (timestampShape[i] == 'd' ? !isDigit : line[i] != timestampShape[i])
      return std::nullopt;
  }
  const size_t levelStart = timestampShape.size();
  const size_t levelEnd = line.find(' ', levelStart);
  if (levelEnd == std::string::npos)
    return std::nullopt;
  const std::string level = line.substr(levelStart, levelEnd - levelStart);
  const size_t firstDigit = level.rfind('-', 0) == 0 ? 1 : 0;
  if (level.size() == firstDigit ||
      level.find_first_not_of("0123456789", firstDigit) != std::string::npos)
    return std::nullopt;
  const size_t categoryEnd = line.find(' ', levelEnd + 1);
  if (categoryEnd == std::string::npos)
    return std::nullopt;
  return WrittenLine{line.substr(0, levelStart - 1), std::stoi(level),
                     line.substr(levelEnd + 1, categoryEnd - levelEnd - 1),
                     line.substr(categoryEnd + 1)};
}

/// The messages of the lines of \p path, in order; a line that does not parse
/// gives "<unparsable: line>".
inline std::vector<std::string> writtenMessages(const std::string& path) {
  std::vector<std::string> messages;
  for (const std::string& line : tvr::testing::splitLines(tvr::testing::readFile(path))) {
    const auto parsed = parseWrittenLine(line);
    messages.push_back(parsed ? parsed->message : "<unparsable: " + line + ">");
  }
  return messages;
}

} // namespace kvlogtest

#endif // TVR_TESTS_KVLOG_LOGGERFIXTURE_H
