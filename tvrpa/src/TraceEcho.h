// --trace: what happened inside a request, on standard error.
//
//   [tvrpa] EnumerateInstances root/cimv2:TVRHX_Chassis properties=NULL
//   [log 3000 Korvane.ChassisProvider] ENTERING: Chassis_EnumInstances() ...
//   [trace 3000 Korvane.ChassisProvider] ENTERING: Chassis_EnumInstances() ...
//   [broker 1 PhysicalAssetProvider] *** Could not get instances, ...
//   [tvrpa] ChassisProvider (TVRHX_Chassis): CMPI_RC_OK
//   [tvrpa] 2 items, returnDone called 1 time
//
// Logger lines (both channels of KVLog, whatever their destinations and
// levels) and the broker's trace calls are written as the provider makes
// them, in the order it makes them.
#pragma once

#include "Request.h"

#include "tvr/broker/Response.h"

#include <functional>
#include <mutex>
#include <ostream>
#include <string>

namespace tvrpa {

class TraceEcho {
public:
  /// When `enabled`, listens to the logger until destroyed; otherwise
  /// every member does nothing.
  TraceEcho(bool enabled, std::ostream& err);
  ~TraceEcho();
  TraceEcho(const TraceEcho&) = delete;
  TraceEcho& operator=(const TraceEcho&) = delete;

  /// Before a request is sent.
  void request(const Request& request);
  /// A line of tvrpa's own, e.g. why no provider is asked.
  void note(const std::string& text);
  /// What to give RequestOptions::traceObserver: writes each broker trace
  /// call as it is made (nothing when tracing is off).
  std::function<void(const tvr::broker::TraceLine&)> brokerTraceObserver();
  /// After it ended: each provider's status, and how many elements came and
  /// whether the answer was completed.
  void finished(const tvr::broker::Response& response, std::size_t items);

private:
  void line(const std::string& text);

  bool enabled_;
  std::ostream& err_;
  std::mutex mutex_;
  int listener_ = -1;
};

} // namespace tvrpa
