// Many requests in one process, as an object manager serves them for weeks:
// over every class, on a machine that changes now and then, through a broker
// that now and then fails a service. Nothing may pile up: the object manager
// holds nothing between requests, and the resident memory after warm-up grows
// by at most kResidentGrowthBound.
//
// Leaks themselves are found by the tool the test runs under: the
// AddressSanitizer build (ctest), LeakSanitizer (scripts/test-all) and
// valgrind's memcheck (scripts/soak). TVR_SOAK_REQUESTS (default 10000) sets
// the number of requests; scripts/soak sends 100000.
#include "ProviderHarness.h"
#include "ReliabilityMachines.h"
#include "ReliabilitySupport.h"
#include "RequestCatalogue.h"

#include <gtest/gtest.h>

#include <cstdio>

#if __has_include(<valgrind/valgrind.h>)
#include <valgrind/valgrind.h>
#else
#define RUNNING_ON_VALGRIND 0
#endif

namespace tvr::reliability {
namespace {

using broker::Fault;
using broker::FailureShape;
using broker::Response;

/// How much the resident memory may grow from the end of the warm-up to the
/// end of the run. Far above what a run of 100000 requests needs (well under
/// 1 MiB), far below what a leak of one small object per request would take
/// (a few MiB per 10000 requests).
constexpr std::size_t kResidentGrowthBound = 4u << 20;

/// How often the machine changes, and how often the broker fails a service.
constexpr int kRequestsPerMachine = 500;
constexpr int kRequestsPerBrokerFault = 97;

int soakRequests() { return countFromEnvironment("TVR_SOAK_REQUESTS", 10000); }

/// Resident memory says nothing where a sanitizer or valgrind keeps freed
/// memory aside on purpose.
std::string whyResidentMemoryIsNoMeasure() {
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
  return "the sanitizer's quarantine holds freed memory";
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
  return "the sanitizer's quarantine holds freed memory";
#endif
#endif
  if (RUNNING_ON_VALGRIND) return "valgrind holds freed memory";
  return std::string();
}

/// Fails one call of a broker service, taking turns over the services and
/// how they fail, a few calls into the next request.
void failOneBrokerCall(broker::FaultInjector& faults, int turn) {
  static const Fault kFaults[] = {Fault::NewObjectPath, Fault::NewInstance, Fault::NewArray, Fault::UpCall};
  const Fault fault = kFaults[turn % 4];
  const FailureShape shape = (turn / 4) % 2 ? FailureShape::Hollow : FailureShape::Null;
  faults.failNext(fault, 1, shape, static_cast<std::uint32_t>(turn % 7));
}

TEST(Soak, ResidentMemoryStaysWithinItsBoundAndNothingOutlivesARequest) {
  test::ProviderHarness harness;
  LoggingEverythingTo logging("/dev/null");
  test::TreeFile tree(kBladeMachine);
  harness.useTreeFile(tree.path());
  const std::vector<Request> requests = requestsOverEveryClass(harness.om());
  ASSERT_FALSE(requests.empty());

  const int total = soakRequests();
  const int warmUp = std::min(total / 2, std::max(total / 10, static_cast<int>(requests.size())));
  std::size_t residentAfterWarmUp = 0;
  int escaped = 0;
  std::string firstEscape;
  for (int i = 0; i < total; ++i) {
    if (i == warmUp) residentAfterWarmUp = residentBytes();
    if (i % kRequestsPerMachine == 0)
      tree.rewrite((i / kRequestsPerMachine) % 2 ? kBladeMachineAfterSwap : kBladeMachine);
    if (i % kRequestsPerBrokerFault == 0) failOneBrokerCall(harness.om().faults(), i / kRequestsPerBrokerFault);
    const Request& request = requests[static_cast<std::size_t>(i) % requests.size()];
    const Response answer = send(harness.om(), request);
    harness.om().faults().reset();
    if (answer.exception && escaped++ == 0)
      firstEscape = request.label() + ": " + answer.exception->type + ": " + answer.exception->what;
  }

  EXPECT_EQ(escaped, 0) << "first: " << firstEscape;
  EXPECT_EQ(harness.om().longLivedObjects(), 0u);
  const std::string noMeasure = whyResidentMemoryIsNoMeasure();
  if (!noMeasure.empty()) {
    std::printf("resident memory not checked: %s\n", noMeasure.c_str());
    return;
  }
  const std::size_t residentAtEnd = residentBytes();
  const std::size_t growth = residentAtEnd > residentAfterWarmUp ? residentAtEnd - residentAfterWarmUp : 0;
  RecordProperty("resident_growth_bytes", std::to_string(growth));
  std::printf("%d requests; resident memory after warm-up %zu KiB, at the end %zu KiB\n", total,
              residentAfterWarmUp >> 10, residentAtEnd >> 10);
  EXPECT_LE(growth, kResidentGrowthBound) << "from " << residentAfterWarmUp << " to " << residentAtEnd
                                          << " bytes over " << total - warmUp << " requests";
}

} // namespace
} // namespace tvr::reliability
