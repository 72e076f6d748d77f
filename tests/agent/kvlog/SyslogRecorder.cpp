// Replacements for the C library's syslog entry points; see SyslogRecorder.h.
// <syslog.h> is not included: with _FORTIFY_SOURCE it defines syslog inline.

#include "SyslogRecorder.h"

#include <cstdarg>
#include <cstdio>
#include <mutex>

namespace kvlogtest {
namespace {

struct Recording {
  std::mutex mutex;
  std::vector<SyslogCall> syslogCalls;
  std::vector<OpenlogCall> openlogCalls;
};

/// Function-local, so it exists when the logger library calls openlog()
/// while it is loaded, before this executable's own globals are built.
Recording& recording() {
  static Recording instance;
  return instance;
}

void recordMessage(int priority, const char* format, va_list arguments) {
  char text[4096];
  std::vsnprintf(text, sizeof text, format, arguments);
  Recording& r = recording();
  const std::lock_guard<std::mutex> lock(r.mutex);
  r.syslogCalls.push_back({priority, text});
}

} // namespace

std::vector<SyslogCall> syslogCalls() {
  const std::lock_guard<std::mutex> lock(recording().mutex);
  return recording().syslogCalls;
}

void clearSyslogCalls() {
  const std::lock_guard<std::mutex> lock(recording().mutex);
  recording().syslogCalls.clear();
}

std::vector<OpenlogCall> openlogCalls() {
  const std::lock_guard<std::mutex> lock(recording().mutex);
  return recording().openlogCalls;
}

} // namespace kvlogtest

extern "C" {

void openlog(const char* ident, int option, int facility) {
  kvlogtest::Recording& r = kvlogtest::recording();
  const std::lock_guard<std::mutex> lock(r.mutex);
  r.openlogCalls.push_back({ident ? ident : "", option, facility});
}

void syslog(int priority, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  kvlogtest::recordMessage(priority, format, arguments);
  va_end(arguments);
}

void vsyslog(int priority, const char* format, va_list arguments) {
  kvlogtest::recordMessage(priority, format, arguments);
}

// What syslog() becomes when the logger is built with _FORTIFY_SOURCE.
void __syslog_chk(int priority, int /*flag*/, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  kvlogtest::recordMessage(priority, format, arguments);
  va_end(arguments);
}

} // extern "C"
