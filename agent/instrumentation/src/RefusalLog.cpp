//===- RefusalLog.cpp - Logging a refused hardware source once ------------===//

#include "RefusalLog.h"

#include "KVLog/KVLogger.h"

#include <atomic>
#include <mutex>

namespace HX {
namespace detail {
namespace {

constexpr int RefusalLevel = 6000;
const char *const Category = "TVR.HX.Instrumentation";

struct LastRefusal {
  std::mutex Lock;
  std::string Message;
  /// Lets the many successful selections skip the lock.
  std::atomic<bool> Present{false};
};

LastRefusal &lastRefusal() {
  static LastRefusal Last;
  return Last;
}

} // namespace

void reportRefusal(const std::string &message) {
  LastRefusal &last = lastRefusal();
  {
    std::lock_guard<std::mutex> guard(last.Lock);
    if (last.Present.load() && last.Message == message)
      return;
    last.Message = message;
    last.Present.store(true);
  }
  KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, Category,
                                   RefusalLevel, nullptr, 0, 0, message);
}

void clearRefusal() {
  LastRefusal &last = lastRefusal();
  if (!last.Present.load(std::memory_order_relaxed))
    return;
  std::lock_guard<std::mutex> guard(last.Lock);
  last.Message.clear();
  last.Present.store(false);
}

} // namespace detail
} // namespace HX
