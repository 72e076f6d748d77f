// The process's syslog identity as the logger uses it.

#ifndef KVLOG_SRC_SYSLOGCONNECTION_H
#define KVLOG_SRC_SYSLOGCONNECTION_H

#include <string>

namespace KVLog::detail {

/// Sets syslog's ident to "tvr" and its facility to LOG_DAEMON, once per
/// process. Called before the first message or problem report goes to syslog.
void openSyslogOnce();

/// The syslog priority of a message of \p level, without facility:
/// >= 6000 LOG_ERR, >= 5000 LOG_WARNING, >= 4000 LOG_INFO, else LOG_DEBUG.
int syslogPriorityForLevel(int level);

/// Sends a problem of the logger itself to syslog with priority LOG_ERR.
void reportProblemToSyslog(const std::string& text);

} // namespace KVLog::detail

#endif // KVLOG_SRC_SYSLOGCONNECTION_H
