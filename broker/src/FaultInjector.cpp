#include "tvr/broker/FaultInjector.h"

namespace tvr::broker {

void FaultInjector::failNext(Fault what, std::uint32_t count, FailureShape shape, std::uint32_t skip) {
  const int i = static_cast<int>(what);
  shape_[i].store(static_cast<int>(shape));
  skip_[i].store(skip);
  pending_[i].store(count);
}

void FaultInjector::reset() {
  for (auto& p : pending_) p.store(0);
  for (auto& s : skip_) s.store(0);
}

std::uint32_t FaultInjector::pending(Fault what) const {
  return pending_[static_cast<int>(what)].load();
}

std::uint64_t FaultInjector::calls(Fault what) const {
  return calls_[static_cast<int>(what)].load();
}

bool FaultInjector::shouldFail(Fault what, FailureShape* shape) {
  const int i = static_cast<int>(what);
  calls_[i].fetch_add(1, std::memory_order_relaxed);
  std::uint32_t skipping = skip_[i].load();
  while (skipping > 0) {
    if (skip_[i].compare_exchange_weak(skipping, skipping - 1)) return false;
  }
  std::uint32_t left = pending_[i].load();
  while (left > 0) {
    if (pending_[i].compare_exchange_weak(left, left - 1)) {
      if (shape) *shape = static_cast<FailureShape>(shape_[i].load());
      return true;
    }
  }
  return false;
}

} // namespace tvr::broker
