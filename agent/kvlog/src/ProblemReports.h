// Reporting a destination's failures once per kind of failure.

#ifndef KVLOG_SRC_PROBLEMREPORTS_H
#define KVLOG_SRC_PROBLEMREPORTS_H

#include <atomic>
#include <cstdint>
#include <string>

namespace KVLog::detail {

/// What a destination was doing when it failed.
enum class FailedOperation { Open, Write };

/// Remembers which failures of one destination were reported. A destination
/// that keeps failing the same way (a full disk) would otherwise report on
/// every message. Lock-free, so a failing destination never makes its
/// callers wait for each other.
class ProblemReports {
public:
  ProblemReports();

  /// Reports "kvlog: <what>: <strerror(error)>" to syslog the first time
  /// \p operation fails with \p error on this destination; later calls with
  /// the same pair do nothing.
  void reportOnce(FailedOperation operation, int error, const std::string& what);

private:
  static constexpr int kTrackedErrors = 256; ///< Larger errno values share the last slot.
  static constexpr int kBitsPerWord = 64;
  std::atomic<std::uint64_t> reported_[2][kTrackedErrors / kBitsPerWord];
};

} // namespace KVLog::detail

#endif // KVLOG_SRC_PROBLEMREPORTS_H
