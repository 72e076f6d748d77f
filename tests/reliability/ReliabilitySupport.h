// Small helpers the reliability tests share: counts that a longer run may
// raise through the environment, the logger writing every line somewhere,
// and the process's resident memory.
#pragma once

#include <KVLog/KVLogConfig.h>

#include <cstddef>
#include <string>

namespace tvr::reliability {

/// The positive number in the environment variable \p name, else \p fallback.
int countFromEnvironment(const char* name, int fallback);

/// Makes both logger channels write every line, whatever its level, to
/// \p path while it lives, so that tests pay for and exercise the whole
/// logging path; puts the settings before back when it goes.
class LoggingEverythingTo {
public:
  explicit LoggingEverythingTo(const std::string& path);
  ~LoggingEverythingTo();
  LoggingEverythingTo(const LoggingEverythingTo&) = delete;
  LoggingEverythingTo& operator=(const LoggingEverythingTo&) = delete;

private:
  KVLog::SinkSettings savedLog_;
  KVLog::SinkSettings savedTrace_;
};

/// The resident set size of this process in bytes.
std::size_t residentBytes();

} // namespace tvr::reliability
