// Requests on many threads at once through one object manager, with the
// provider library loaded once: every answer must be the answer the same
// request gets alone. Logger lines may mix (the providers share two unguarded
// trace buffers, and the tests make the logger write every line); answers may
// not.
//
// TVR_STRESS_REQUESTS_PER_THREAD (default 10000) sets how many requests each
// of the eight threads sends in the main test; scripts/test-all lowers it for
// the ThreadSanitizer run.
#include "AnswerComparison.h"
#include "ProviderHarness.h"
#include "RecordedMachines.h"
#include "ReliabilityMachines.h"
#include "ReliabilitySupport.h"
#include "RequestCatalogue.h"

#include <HX/HardwareSource.h>

#include <gtest/gtest.h>

#include <atomic>
#include <random>
#include <set>
#include <thread>

namespace tvr::reliability {
namespace {

using broker::Operation;
using broker::Response;

constexpr std::size_t kThreads = 8;

int requestsPerThread() { return countFromEnvironment("TVR_STRESS_REQUESTS_PER_THREAD", 10000); }

struct KnownAnswer {
  Request request;
  Response answer;
};

std::vector<KnownAnswer> answersAlone(broker::ObjectManager& om, const std::vector<Request>& requests) {
  std::vector<KnownAnswer> known;
  for (const Request& request : requests) known.push_back({request, send(om, request)});
  return known;
}

/// What one thread saw that differs from the answers alone.
struct Findings {
  int requests = 0;
  int differing = 0;
  std::string first;

  void note(const Request& request, const std::string& difference) {
    if (difference.empty()) return;
    if (differing++ == 0) first = request.label() + ": " + difference;
  }
};

/// Sends \p count requests picked at random from \p known once \p go is set,
/// comparing each answer with the answer alone.
void sendAtRandom(broker::ObjectManager& om, const std::vector<KnownAnswer>& known, unsigned seed, int count,
                  const std::atomic<bool>& go, Findings& findings) {
  std::mt19937 pick(seed);
  std::uniform_int_distribution<std::size_t> index(0, known.size() - 1);
  while (!go.load()) std::this_thread::yield();
  for (int i = 0; i < count; ++i) {
    const KnownAnswer& k = known[index(pick)];
    findings.note(k.request, answerDifference(k.answer, send(om, k.request)));
    ++findings.requests;
  }
}

/// Runs sendAtRandom on \p threads threads at once and reports every thread
/// whose answers differed.
void expectSameAnswersOnThreads(broker::ObjectManager& om, const std::vector<KnownAnswer>& known,
                                std::size_t threads, int perThread) {
  std::atomic<bool> go{false};
  std::vector<Findings> findings(threads);
  std::vector<std::thread> running;
  for (std::size_t t = 0; t < threads; ++t)
    running.emplace_back(sendAtRandom, std::ref(om), std::cref(known), static_cast<unsigned>(1000 + t), perThread, std::cref(go),
                         std::ref(findings[t]));
  go = true;
  for (std::thread& thread : running) thread.join();
  for (std::size_t t = 0; t < threads; ++t) {
    EXPECT_EQ(findings[t].requests, perThread) << "thread " << t;
    EXPECT_EQ(findings[t].differing, 0) << "thread " << t << ": first difference: " << findings[t].first;
  }
}

class ConcurrentRequests : public ::testing::Test {
protected:
  test::ProviderHarness harness;
  LoggingEverythingTo logging{"/dev/null"};
};

TEST_F(ConcurrentRequests, BladeHasInstancesOfEveryRegisteredClass) {
  harness.useTree(kBladeMachine);
  for (const broker::ClassRegistration& reg : harness.om().registration().classes()) {
    const Response answer = harness.enumerateInstances(reg.className);
    EXPECT_TRUE(answer.ok()) << reg.className;
    EXPECT_FALSE(answer.instances().empty()) << reg.className;
  }
}

TEST_F(ConcurrentRequests, AnswersAloneDoNotChangeWhenAskedAgain) {
  harness.useTree(kBladeMachine);
  const std::vector<KnownAnswer> known = answersAlone(harness.om(), requestsOverEveryClass(harness.om()));
  for (const KnownAnswer& k : known)
    EXPECT_EQ(answerDifference(k.answer, send(harness.om(), k.request)), "") << k.request.label();
}

TEST_F(ConcurrentRequests, EightThreadsGetTheAnswerEachRequestGetsAlone) {
  harness.useTree(kBladeMachine);
  const std::vector<KnownAnswer> known = answersAlone(harness.om(), requestsOverEveryClass(harness.om()));
  expectSameAnswersOnThreads(harness.om(), known, kThreads, requestsPerThread());
  EXPECT_EQ(harness.om().longLivedObjects(), 0u);
}

TEST_F(ConcurrentRequests, LiveMachineAnswersOnEightThreadsEqualTheAnswersAlone) {
  hxlive::RecordedMachine machine;
  hxlive::recordRackServer(machine);
  HX::useLiveMachine(machine.root());
  const std::vector<KnownAnswer> known = answersAlone(harness.om(), requestsOverEveryClass(harness.om()));
  expectSameAnswersOnThreads(harness.om(), known, kThreads, std::max(1, requestsPerThread() / 10));
}

// The object manager makes each provider's MIs at the first request that
// needs them, so the first requests on many threads load the providers while
// others are already served by them (and write the broker variables the
// handlers read).
TEST(ConcurrentFirstRequests, RacingToLoadTheProvidersGetTheAnswersAlone) {
  LoggingEverythingTo logging("/dev/null");
  test::TreeFile tree(kBladeMachine);
  std::vector<Request> requests;
  {
    test::ProviderHarness scout;
    scout.useTreeFile(tree.path());
    requests = requestsOverEveryClass(scout.om());
  }
  test::ProviderHarness harness;
  harness.useTreeFile(tree.path());

  std::atomic<bool> go{false};
  std::vector<Response> racing(requests.size());
  std::vector<std::thread> running;
  for (std::size_t t = 0; t < kThreads; ++t)
    running.emplace_back([&, t] {
      while (!go.load()) std::this_thread::yield();
      for (std::size_t i = t; i < requests.size(); i += kThreads) racing[i] = send(harness.om(), requests[i]);
    });
  go = true;
  for (std::thread& thread : running) thread.join();

  for (std::size_t i = 0; i < requests.size(); ++i)
    EXPECT_EQ(answerDifference(send(harness.om(), requests[i]), racing[i]), "") << requests[i].label();
}

// An association provider serves instance requests through the MI of its
// Create_InstanceMI; the first association request makes its other MI, whose
// entry point writes the broker variable again while the instance handlers
// run.
TEST(ConcurrentFirstRequests, AssociationMIsMadeWhileInstanceHandlersRunLeaveTheirAnswersAlone) {
  LoggingEverythingTo logging("/dev/null");
  test::ProviderHarness harness;
  harness.useTree(kBladeMachine);
  std::vector<KnownAnswer> instanceRequests;
  for (const broker::ClassRegistration* reg : harness.om().registration().associationClasses()) {
    Request request;
    request.target = broker::ObjectPath("root/cimv2", reg->className);
    instanceRequests.push_back({request, send(harness.om(), request)});
  }

  std::atomic<bool> associationsAsked{false};
  std::atomic<int> served{0};
  Findings findings;
  std::thread serving([&] {
    for (int after = 0; after < 200; after += associationsAsked.load() ? 1 : 0)
      for (const KnownAnswer& k : instanceRequests) {
        findings.note(k.request, answerDifference(k.answer, send(harness.om(), k.request)));
        ++served;
      }
  });
  while (served.load() < 50) std::this_thread::yield();
  Request everyAssociation;
  everyAssociation.operation = Operation::AssociatorNames;
  everyAssociation.target = harness.enumerateInstanceNames("TVRHX_Chassis").paths().at(0);
  const Response racing = send(harness.om(), everyAssociation);
  associationsAsked = true;
  serving.join();

  EXPECT_EQ(findings.differing, 0) << findings.first;
  EXPECT_EQ(answerDifference(send(harness.om(), everyAssociation), racing), "");
}

/// The element classes whose answers come from a single walk over one
/// reading of the hardware, so that each answer is one reading or the other
/// when the machine changes during the request.
bool answeredFromOneReading(const Request& request) {
  static const std::set<std::string> singleWalk = {"TVRHX_Slot", "TVRHX_Connector", "TVRHX_NetworkCard"};
  return (request.operation == Operation::EnumerateInstanceNames ||
          request.operation == Operation::EnumerateInstances) &&
         singleWalk.count(request.target.className) != 0;
}

TEST_F(ConcurrentRequests, AnswersStayWholeWhileTheTreeFileIsReplaced) {
  test::TreeFile tree(kBladeMachine);
  harness.useTreeFile(tree.path());
  const std::vector<Request> requests = requestsOverEveryClass(harness.om());
  const std::vector<KnownAnswer> onBlade = answersAlone(harness.om(), requests);
  tree.rewrite(kBladeMachineAfterSwap);
  const std::vector<KnownAnswer> afterSwap = answersAlone(harness.om(), requests);

  std::atomic<bool> stop{false};
  std::thread swapper([&] {
    for (bool swapped = false; !stop.load(); swapped = !swapped) {
      tree.rewrite(swapped ? kBladeMachineAfterSwap : kBladeMachine);
      std::this_thread::sleep_for(std::chrono::microseconds(200));
    }
  });
  constexpr int kRequestThreads = 4;
  const int perThread = std::max(1, requestsPerThread() / 20);
  std::vector<Findings> findings(kRequestThreads);
  std::vector<std::thread> running;
  for (int t = 0; t < kRequestThreads; ++t)
    running.emplace_back([&, t] {
      std::mt19937 pick(2000u + t);
      std::uniform_int_distribution<std::size_t> index(0, requests.size() - 1);
      for (int i = 0; i < perThread; ++i) {
        const std::size_t at = index(pick);
        const Response answer = send(harness.om(), requests[at]);
        ++findings[t].requests;
        if (answeredFromOneReading(requests[at])) {
          const std::string fromBlade = answerDifference(onBlade[at].answer, answer);
          if (!fromBlade.empty() && !answerDifference(afterSwap[at].answer, answer).empty())
            findings[t].note(requests[at], "neither reading: " + fromBlade);
        } else if (answer.exception) {
          findings[t].note(requests[at], "escaped " + answer.exception->type + ": " + answer.exception->what);
        }
      }
    });
  for (std::thread& thread : running) thread.join();
  stop = true;
  swapper.join();
  for (int t = 0; t < kRequestThreads; ++t)
    EXPECT_EQ(findings[t].differing, 0) << "thread " << t << ": first: " << findings[t].first;
}

} // namespace
} // namespace tvr::reliability
