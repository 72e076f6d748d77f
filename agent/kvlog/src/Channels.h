// The state the logger's entry points read on every call.

#ifndef KVLOG_SRC_CHANNELS_H
#define KVLOG_SRC_CHANNELS_H

#include "KVLog/KVLogConfig.h"
#include "Sink.h"

#include <atomic>
#include <climits>

namespace KVLog::detail {

/// Threshold of a channel that is off: above every int level, so an off
/// channel costs the same single compare as a level filter.
constexpr long long kChannelOff = LLONG_MAX;

/// What one channel's entry point needs. Both fields are constant-initialised
/// (the channel is off until the settings are applied at load) and read
/// without a lock.
struct ChannelState {
  std::atomic<long long> threshold{kChannelOff};
  std::atomic<Sink*> sink{nullptr};
};

extern ChannelState gChannelStates[2];

inline ChannelState& channelState(Channel channel) {
  return gChannelStates[static_cast<int>(channel)];
}

} // namespace KVLog::detail

#endif // KVLOG_SRC_CHANNELS_H
