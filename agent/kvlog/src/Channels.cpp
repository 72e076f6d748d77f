// Channel configuration: which sink and level each channel uses.

#include "Channels.h"

#include "StreamSinks.h"
#include "SyslogSink.h"

#include <map>
#include <memory>
#include <mutex>

namespace KVLog::detail {

ChannelState gChannelStates[2];

namespace {

using Destination = SinkSettings::Destination;

/// The settings as configured, and every sink ever created. Sinks are shared
/// between channels and configurations (one descriptor per file) and are
/// never destroyed: a thread may still be writing through a sink that was
/// just replaced, and messages logged from static destructors or late
/// threads must still find their sink.
class SinkRegistry {
public:
  SinkSettings settings(Channel channel) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return settings_[index(channel)];
  }

  void configure(Channel channel, const SinkSettings& settings) {
    const std::lock_guard<std::mutex> lock(mutex_);
    SinkSettings& current = settings_[index(channel)];
    current = settings;
    if (current.destination != Destination::File)
      current.path.clear();

    ChannelState& state = channelState(channel);
    Sink* sink = sinkFor(current);
    // Sink first: a writer that passes the new threshold then finds either
    // sink, never a half-made one.
    state.sink.store(sink, std::memory_order_release);
    state.threshold.store(sink ? current.minimumLevel : kChannelOff, std::memory_order_relaxed);
  }

private:
  static int index(Channel channel) { return static_cast<int>(channel); }

  Sink* sinkFor(const SinkSettings& settings) {
    switch (settings.destination) {
    case Destination::Off:
      return nullptr;
    case Destination::Syslog:
      if (!syslog_)
        syslog_ = std::make_unique<SyslogSink>();
      return syslog_.get();
    case Destination::Stderr:
      if (!stderr_)
        stderr_ = std::make_unique<StderrSink>();
      return stderr_.get();
    case Destination::File: {
      auto& file = files_[settings.path];
      if (!file)
        file = std::make_unique<FileSink>(settings.path);
      return file.get();
    }
    }
    return nullptr;
  }

  std::mutex mutex_;
  SinkSettings settings_[2] = {{Destination::Off, {}, 0}, {Destination::Off, {}, 0}};
  std::unique_ptr<SyslogSink> syslog_;
  std::unique_ptr<StderrSink> stderr_;
  std::map<std::string, std::unique_ptr<FileSink>> files_;
};

SinkRegistry& registry() {
  static SinkRegistry* const instance = new SinkRegistry;
  return *instance;
}

} // namespace
} // namespace KVLog::detail

namespace KVLog {

SinkSettings sinkSettings(Channel channel) { return detail::registry().settings(channel); }

void configureSink(Channel channel, const SinkSettings& settings) {
  detail::registry().configure(channel, settings);
}

} // namespace KVLog
