#include "ReliabilitySupport.h"

#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <stdexcept>

namespace tvr::reliability {

int countFromEnvironment(const char* name, int fallback) {
  const char* text = std::getenv(name);
  if (!text || !*text) return fallback;
  char* end = nullptr;
  const long value = std::strtol(text, &end, 10);
  if (*end != '\0' || value <= 0 || value > 100'000'000)
    throw std::invalid_argument(std::string(name) + " must be a positive number, not '" + text + "'");
  return static_cast<int>(value);
}

LoggingEverythingTo::LoggingEverythingTo(const std::string& path)
    : savedLog_(KVLog::sinkSettings(KVLog::Channel::Log)), savedTrace_(KVLog::sinkSettings(KVLog::Channel::Trace)) {
  const KVLog::SinkSettings everything{KVLog::SinkSettings::Destination::File, path, 0};
  KVLog::configureSink(KVLog::Channel::Log, everything);
  KVLog::configureSink(KVLog::Channel::Trace, everything);
}

LoggingEverythingTo::~LoggingEverythingTo() {
  KVLog::configureSink(KVLog::Channel::Log, savedLog_);
  KVLog::configureSink(KVLog::Channel::Trace, savedTrace_);
}

std::size_t residentBytes() {
  std::ifstream statm("/proc/self/statm");
  std::size_t totalPages = 0;
  std::size_t residentPages = 0;
  if (!(statm >> totalPages >> residentPages)) throw std::runtime_error("cannot read /proc/self/statm");
  return residentPages * static_cast<std::size_t>(::sysconf(_SC_PAGESIZE));
}

} // namespace tvr::reliability
