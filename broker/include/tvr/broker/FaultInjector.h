// Makes chosen broker services fail on purpose, so tests can drive providers
// down the paths an exhausted or failing object manager would send them.
#pragma once

#include <atomic>
#include <cstdint>

namespace tvr::broker {

/// The broker services whose failure can be injected.
enum class Fault {
  NewObjectPath, ///< eft->newObjectPath
  NewInstance,   ///< eft->newInstance
  NewArray,      ///< eft->newArray
  UpCall,        ///< every bft up-call (enumerateInstanceNames, enumerateInstances, ...)
};

/// How an injected failure looks to the provider.
enum class FailureShape {
  Null,   ///< the service returns a null pointer and CMPI_RC_ERR_FAILED
  Hollow, ///< the service returns an object whose handle is null
};

/// Counts down injected failures per service. Thread-safe.
class FaultInjector {
public:
  /// After `skip` more calls of `what` succeed, the `count` calls that follow
  /// fail with `shape`; later calls succeed again.
  void failNext(Fault what, std::uint32_t count, FailureShape shape = FailureShape::Null, std::uint32_t skip = 0);
  /// Removes every pending failure.
  void reset();
  /// How many failures of `what` are still pending.
  std::uint32_t pending(Fault what) const;
  /// How often `what` has been called since construction (failed or not).
  std::uint64_t calls(Fault what) const;

  /// Called by the broker on each service call: counts it and says whether
  /// this call must fail, and how.
  bool shouldFail(Fault what, FailureShape* shape);

private:
  static constexpr int kFaults = 4;
  std::atomic<std::uint32_t> pending_[kFaults] = {};
  std::atomic<std::uint32_t> skip_[kFaults] = {};
  std::atomic<int> shape_[kFaults] = {};
  std::atomic<std::uint64_t> calls_[kFaults] = {};
};

} // namespace tvr::broker
