#include "SyslogSink.h"

#include "LineFormat.h"
#include "SyslogConnection.h"

#include <syslog.h>

namespace KVLog::detail {

SyslogSink::SyslogSink() { openSyslogOnce(); }

void SyslogSink::write(int level, const std::string& category, const std::string& message) {
  std::string text;
  text.reserve(16 + category.size() + message.size());
  appendMessageText(text, level, category, message);
  ::syslog(LOG_DAEMON | syslogPriorityForLevel(level), "%s", text.c_str());
}

} // namespace KVLog::detail
