#include "Listeners.h"

#include <algorithm>
#include <memory>
#include <mutex>
#include <utility>
#include <vector>

namespace KVLog::detail {

std::atomic<int> gListenerCount{0};

namespace {

using ListenerList = std::vector<std::pair<int, Listener>>;

/// Registered listeners as an immutable list that is replaced on every
/// change: a call takes the current list and runs it without holding the
/// lock, so a listener may log, add or remove listeners.
class ListenerRegistry {
public:
  int add(Listener listener) {
    const std::lock_guard<std::mutex> lock(mutex_);
    auto changed = std::make_shared<ListenerList>(*current_);
    const int id = ++lastId_;
    changed->emplace_back(id, std::move(listener));
    publish(std::move(changed));
    return id;
  }

  void remove(int id) {
    const std::lock_guard<std::mutex> lock(mutex_);
    auto changed = std::make_shared<ListenerList>(*current_);
    const auto kept = std::remove_if(changed->begin(), changed->end(),
                                     [id](const auto& entry) { return entry.first == id; });
    if (kept == changed->end())
      return;
    changed->erase(kept, changed->end());
    publish(std::move(changed));
  }

  std::shared_ptr<const ListenerList> current() {
    const std::lock_guard<std::mutex> lock(mutex_);
    return current_;
  }

private:
  void publish(std::shared_ptr<ListenerList> changed) {
    gListenerCount.store(static_cast<int>(changed->size()), std::memory_order_relaxed);
    current_ = std::move(changed);
  }

  std::mutex mutex_;
  std::shared_ptr<const ListenerList> current_ = std::make_shared<ListenerList>();
  int lastId_ = 0;
};

/// Never destroyed, so that logging from static destructors stays safe.
ListenerRegistry& registry() {
  static ListenerRegistry* const instance = new ListenerRegistry;
  return *instance;
}

} // namespace

void notifyListeners(const Message& message) {
  const auto listeners = registry().current();
  for (const auto& entry : *listeners) {
    try {
      entry.second(message);
    } catch (...) {
      // A listener's failure must not reach the code that logged.
    }
  }
}

} // namespace KVLog::detail

namespace KVLog {

int addListener(Listener listener) { return detail::registry().add(std::move(listener)); }

void removeListener(int id) { detail::registry().remove(id); }

} // namespace KVLog
