// The logger's entry points: listeners, level filter, sink.

#include "KVLog/KVLogger.h"

#include "Channels.h"
#include "Listeners.h"

namespace KVLog {
namespace {

/// Everything up to the level compare is what a filtered message costs, so
/// nothing here may format, allocate, lock or read a clock before it.
int dispatch(Channel channel, const char* function, const char* file, int line,
             const std::string& category, int level, const std::string& message) {
  if (detail::listenersRegistered())
    detail::notifyListeners(Message{channel, function, file, line, category, level, message});

  detail::ChannelState& state = detail::channelState(channel);
  if (level < state.threshold.load(std::memory_order_relaxed))
    return 0;
  detail::Sink* sink = state.sink.load(std::memory_order_acquire);
  if (!sink)
    return 0;
  try {
    sink->write(level, category, message);
  } catch (...) {
    // Out of memory while formatting: the message is dropped, the caller
    // carries on.
  }
  return 0;
}

} // namespace

int KVLogger::logLevelMessage(const char* function, const char* file, int line,
                              const std::string& category, int level, char* /*reserved*/,
                              int /*reserved1*/, int /*reserved2*/, const std::string& message) {
  return dispatch(Channel::Log, function, file, line, category, level, message);
}

int KVLogger::traceLevelMessage(const char* function, const char* file, int line,
                                const std::string& category, int level, char* /*reserved*/,
                                int /*reserved1*/, int /*reserved2*/, const std::string& message) {
  return dispatch(Channel::Trace, function, file, line, category, level, message);
}

} // namespace KVLog
