// Records the logger's syslog traffic.
//
// The test executable defines openlog() and syslog() itself. The dynamic
// linker binds the logger library's calls to the executable's definitions,
// so every call the logger makes is recorded here instead of being sent.

#ifndef TVR_TESTS_KVLOG_SYSLOGRECORDER_H
#define TVR_TESTS_KVLOG_SYSLOGRECORDER_H

#include <string>
#include <vector>

namespace kvlogtest {

struct SyslogCall {
  int priority; ///< Facility and priority as passed.
  std::string text;
};

struct OpenlogCall {
  std::string ident;
  int option;
  int facility;
};

/// syslog() calls since the last clearSyslogCalls(), in order.
std::vector<SyslogCall> syslogCalls();
void clearSyslogCalls();

/// Every openlog() call since the process started.
std::vector<OpenlogCall> openlogCalls();

} // namespace kvlogtest

#endif // TVR_TESTS_KVLOG_SYSLOGRECORDER_H
