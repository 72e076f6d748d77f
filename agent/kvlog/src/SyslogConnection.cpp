#include "SyslogConnection.h"

#include <mutex>
#include <syslog.h>

namespace KVLog::detail {

void openSyslogOnce() {
  static std::once_flag opened;
  // syslog keeps the ident pointer, so it must be a string that never dies.
  std::call_once(opened, [] { ::openlog("tvr", LOG_PID, LOG_DAEMON); });
}

int syslogPriorityForLevel(int level) {
  if (level >= 6000)
    return LOG_ERR;
  if (level >= 5000)
    return LOG_WARNING;
  if (level >= 4000)
    return LOG_INFO;
  return LOG_DEBUG;
}

void reportProblemToSyslog(const std::string& text) {
  openSyslogOnce();
  ::syslog(LOG_DAEMON | LOG_ERR, "%s", text.c_str());
}

} // namespace KVLog::detail
