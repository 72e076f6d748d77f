// Dispatch of logger calls to the registered listeners.

#ifndef KVLOG_SRC_LISTENERS_H
#define KVLOG_SRC_LISTENERS_H

#include "KVLog/KVLogConfig.h"

#include <atomic>

namespace KVLog::detail {

/// Number of registered listeners; constant-initialised.
extern std::atomic<int> gListenerCount;

inline bool listenersRegistered() {
  return gListenerCount.load(std::memory_order_relaxed) != 0;
}

/// Calls every registered listener with \p message; swallows their exceptions.
void notifyListeners(const Message& message);

} // namespace KVLog::detail

#endif // KVLOG_SRC_LISTENERS_H
