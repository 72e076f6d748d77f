// Several threads issuing requests through one object manager at once.
#include "BrokerTestSupport.h"

#include <pthread.h>

#include <atomic>
#include <thread>

namespace tvr::broker::test {
namespace {

constexpr int kThreads = 4;
constexpr int kRequestsPerThread = 50;

/// What one thread found wrong, for the main thread to report.
struct ThreadFindings {
  int requests = 0;
  std::vector<std::string> problems;
  void check(bool ok, const std::string& what) {
    if (!ok) problems.push_back(what);
  }
};

void issueRequests(ObjectManager& om, int thread, std::atomic<bool>& go, ThreadFindings& findings) {
  while (!go.load()) std::this_thread::yield();
  const CMPIUint64 self = static_cast<CMPIUint64>(pthread_self());
  for (int i = 0; i < kRequestsPerThread; ++i) {
    const std::string id = "t" + std::to_string(thread) + "-" + std::to_string(i);
    const Response r = om.getInstance(keyedPath("TVR_Echo", {{"Id", id}}));
    ++findings.requests;
    findings.check(r.ok(), id + ": status " + statusName(r.rc));
    const std::vector<Instance> instances = r.instances();
    findings.check(instances.size() == 1, id + ": " + std::to_string(instances.size()) + " instances");
    if (instances.size() == 1) {
      const Value* echoed = instances[0].property("Id");
      findings.check(echoed && *echoed == Value::chars(id), id + ": wrong instance");
      const Value* servedOn = instances[0].property("Thread");
      findings.check(servedOn && servedOn->scalar.uint64 == self, id + ": served on another thread");
    }
    findings.check(r.traces.size() == 1, id + ": " + std::to_string(r.traces.size()) + " trace lines");
    if (r.traces.size() == 1) findings.check(r.traces[0].text == "echo " + id, id + ": trace " + r.traces[0].str());
    // Another class in between, with an up-call, so answers of different
    // shapes interleave.
    if (i % 5 == 0) {
      const Response up =
          om.getInstance(keyedPath("TVR_UpCaller", {{"Call", "enumerateInstanceNames"}, {"Target", "TVR_AllTypes"}}));
      findings.check(up.ok() && up.paths().size() == 2 && up.traces.empty(), id + ": up-call answer mixed up");
    }
  }
}

TEST(Concurrency, ThreadsGetSeparateCorrectAnswersWithTheirOwnTraces) {
  ObjectManager om(testProviderOptions());
  std::atomic<bool> go{false};
  std::vector<ThreadFindings> findings(kThreads);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t)
    threads.emplace_back(issueRequests, std::ref(om), t, std::ref(go), std::ref(findings[t]));
  go = true;
  for (std::thread& thread : threads) thread.join();
  for (int t = 0; t < kThreads; ++t) {
    EXPECT_EQ(findings[t].requests, kRequestsPerThread) << "thread " << t;
    EXPECT_TRUE(findings[t].problems.empty()) << "thread " << t << ": " << findings[t].problems.size()
                                              << " problems, first: " << findings[t].problems.front();
  }
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST(Concurrency, FirstRequestsRacingToLoadTheProviderAllSucceed) {
  ObjectManager om(testProviderOptions());
  std::atomic<bool> go{false};
  std::atomic<int> succeeded{0};
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([&] {
      while (!go.load()) std::this_thread::yield();
      if (om.enumerateInstanceNames(classPath("TVR_AllTypes")).ok()) ++succeeded;
    });
  }
  go = true;
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(succeeded.load(), kThreads);
}

TEST(Concurrency, InjectedFailuresCountDownAcrossThreads) {
  ObjectManager om(testProviderOptions());
  om.faults().failNext(Fault::NewInstance, 1000);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t)
    threads.emplace_back([&] {
      for (int i = 0; i < 25; ++i) om.enumerateInstances(classPath("TVR_Factories"));
    });
  for (std::thread& thread : threads) thread.join();
  // Every request called newInstance three times, each taking one failure.
  EXPECT_EQ(om.faults().pending(Fault::NewInstance), 1000u - kThreads * 25 * 3);
}

} // namespace
} // namespace tvr::broker::test
