//===- ProblemLog.cpp - Logging each problem of the live machine once -----===//

#include "live/ProblemLog.h"

#include "KVLog/KVLogger.h"

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr int ProblemLevel = 6000;
const char *const Category = "TVR.HX.Instrumentation";

/// Remembering is bounded so that a machine whose devices keep coming and
/// going under new names cannot grow the set without end; past the bound the
/// set starts afresh, and a problem may then be logged a second time.
constexpr std::size_t MaxRemembered = 4096;

} // namespace

void ProblemLog::report(const std::string &problem) {
  {
    std::lock_guard<std::mutex> guard(Lock);
    if (Reported.count(problem) != 0)
      return;
    if (Reported.size() >= MaxRemembered)
      Reported.clear();
    Reported.insert(problem);
  }
  KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, Category,
                                   ProblemLevel, nullptr, 0, 0, problem);
}

} // namespace live
} // namespace detail
} // namespace HX
