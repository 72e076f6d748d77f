// The interface every destination of a channel implements.

#ifndef KVLOG_SRC_SINK_H
#define KVLOG_SRC_SINK_H

#include <string>

namespace KVLog::detail {

/// A destination messages are written to. Sinks live until the process ends,
/// so a message being written while a channel is reconfigured never reaches
/// a destroyed sink.
class Sink {
public:
  virtual ~Sink() = default;
  /// Writes one message that passed the channel's level. Reports its own
  /// failures; may throw only std::bad_alloc.
  virtual void write(int level, const std::string& category, const std::string& message) = 0;
};

} // namespace KVLog::detail

#endif // KVLOG_SRC_SINK_H
