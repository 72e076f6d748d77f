#include "ProblemReports.h"

#include "SyslogConnection.h"

#include <cstring>

namespace KVLog::detail {
namespace {

/// strerror is not thread-safe; the GNU strerror_r is.
std::string errorText(int error) {
  char buffer[128];
  return ::strerror_r(error, buffer, sizeof buffer);
}

} // namespace

ProblemReports::ProblemReports() {
  for (auto& operation : reported_)
    for (auto& word : operation)
      word.store(0, std::memory_order_relaxed);
}

void ProblemReports::reportOnce(FailedOperation operation, int error, const std::string& what) {
  const int slot = error >= 0 && error < kTrackedErrors ? error : kTrackedErrors - 1;
  const std::uint64_t bit = std::uint64_t{1} << (slot % kBitsPerWord);
  auto& word = reported_[static_cast<int>(operation)][slot / kBitsPerWord];
  if (word.fetch_or(bit, std::memory_order_relaxed) & bit)
    return;
  reportProblemToSyslog("kvlog: " + what + ": " + errorText(error));
}

} // namespace KVLog::detail
