//===- ProblemLog.h - Logging each problem of the live machine once -------===//
//
/// \file
/// The providers select nodes many times per request, and a broken SMBIOS
/// table or a device that is going away would otherwise be reported by every
/// selection. Each distinct problem is logged the first time it is met
/// (category "TVR.HX.Instrumentation", level 6000) and then kept quiet for as
/// long as the source that met it is in use.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_PROBLEMLOG_H
#define HX_SRC_LIVE_PROBLEMLOG_H

#include <mutex>
#include <string>
#include <unordered_set>

namespace HX {
namespace detail {
namespace live {

class ProblemLog {
public:
  /// Logs \p problem unless this log has logged the same text before.
  /// Thread-safe.
  void report(const std::string &problem);

private:
  std::mutex Lock;
  std::unordered_set<std::string> Reported;
};

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_PROBLEMLOG_H
