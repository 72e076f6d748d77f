// The syslog destination.

#ifndef KVLOG_SRC_SYSLOGSINK_H
#define KVLOG_SRC_SYSLOGSINK_H

#include "Sink.h"

namespace KVLog::detail {

/// Sends each message with one syslog() call; see KVLog/KVLogger.h for the
/// text and the priority. syslog() reports no failure, so neither does this.
class SyslogSink final : public Sink {
public:
  SyslogSink();
  void write(int level, const std::string& category, const std::string& message) override;
};

} // namespace KVLog::detail

#endif // KVLOG_SRC_SYSLOGSINK_H
