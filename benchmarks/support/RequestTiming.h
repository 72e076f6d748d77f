//===- RequestTiming.h - Timing one CIM request per iteration -*- C++ -*-===//
//
/// \file
/// The loop every request benchmark runs: one request per iteration through
/// the embedded object manager, its answer and the broker trace calls
/// streamed as tvrpa streams them (nothing of either is kept), and counters
/// that make the growth with size visible:
///
///  - `returned`: the elements one request answered;
///  - `per_returned`: CPU time per returned element (a request that returns
///    nothing reports its whole time here).
//
//===----------------------------------------------------------------------===//

#ifndef TVR_BENCHMARKS_REQUESTTIMING_H
#define TVR_BENCHMARKS_REQUESTTIMING_H

#include "tvr/broker/ObjectManager.h"

#include <benchmark/benchmark.h>

#include <functional>
#include <stdexcept>
#include <string>

namespace tvr::bench {

/// Sends one request with the options it is given and returns the answer.
using Request = std::function<broker::Response(const broker::RequestOptions &)>;

/// Counts the elements of an answer as they come, keeping none of them.
class CountingObserver : public broker::ResultObserver {
public:
  void onItem(const broker::ResultItem &) override { ++Count; }
  std::size_t Count = 0;
};

/// Sends \p request from inside the timed loop. Kept out of line so that a
/// profiler can count exactly the timed requests: callgrind with
/// `--toggle-collect='tvr::bench::timedRequest*'` sees nothing else.
[[gnu::noinline]] inline broker::Response timedRequest(const Request &request,
                                                      const broker::RequestOptions &options) {
  return request(options);
}

/// Times \p request, one per iteration. When \p mustSucceed, a failed
/// answer (status or escaped exception) stops the benchmark with an error,
/// so a broken fixture never passes for a fast request; otherwise the
/// failure is named in the benchmark's label.
inline void timeRequest(benchmark::State &state, const Request &request, bool mustSucceed = true) {
  CountingObserver counter;
  broker::RequestOptions options;
  options.observer = &counter;
  options.keepItems = false;
  options.keepTraces = false;
  // One request first, outside the timing: it loads the provider library
  // and makes the provider's MI, which a long-running object manager has
  // long done.
  broker::Response last = request(options);
  for (auto _ : state) {
    counter.Count = 0;
    last = timedRequest(request, options);
    benchmark::DoNotOptimize(last);
  }
  if (mustSucceed && !last.ok()) {
    state.SkipWithError(("the request failed: " + broker::statusName(last.rc) + " " + last.message.value_or("") +
                         (last.exception ? " " + last.exception->what : std::string()))
                            .c_str());
    return;
  }
  // A failure that is the provider's required answer is timed like any
  // answer, and named beside the figures.
  if (last.exception)
    state.SetLabel("escaped " + last.exception->type);
  else if (last.rc != CMPI_RC_OK)
    state.SetLabel("answered " + broker::statusName(last.rc));
  const double returned = static_cast<double>(counter.Count);
  state.counters["returned"] = returned;
  state.counters["per_returned"] =
      benchmark::Counter(returned > 0 ? returned : 1.0,
                         benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

} // namespace tvr::bench

#endif // TVR_BENCHMARKS_REQUESTTIMING_H
