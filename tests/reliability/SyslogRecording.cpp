// Replacements for the C library's syslog entry points; see SyslogRecording.h.
// <syslog.h> is not included: with _FORTIFY_SOURCE it defines syslog inline.
#include "SyslogRecording.h"

#include <cstdarg>
#include <cstdio>
#include <mutex>

namespace tvr::reliability {
namespace {

struct Recording {
  std::mutex mutex;
  std::vector<std::string> texts;
};

/// Function-local, so that it exists when the logger calls syslog() during
/// the loading of the libraries, before this executable's globals are built.
Recording& recording() {
  static Recording instance;
  return instance;
}

void record(const char* format, va_list arguments) {
  char text[4096];
  std::vsnprintf(text, sizeof text, format, arguments);
  Recording& r = recording();
  const std::lock_guard<std::mutex> lock(r.mutex);
  r.texts.emplace_back(text);
}

} // namespace

std::vector<std::string> syslogTexts() {
  Recording& r = recording();
  const std::lock_guard<std::mutex> lock(r.mutex);
  return r.texts;
}

} // namespace tvr::reliability

extern "C" {

void openlog(const char*, int, int) {}

void syslog(int, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  tvr::reliability::record(format, arguments);
  va_end(arguments);
}

void vsyslog(int, const char* format, va_list arguments) { tvr::reliability::record(format, arguments); }

// What syslog() becomes in a library built with _FORTIFY_SOURCE.
void __syslog_chk(int, int, const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  tvr::reliability::record(format, arguments);
  va_end(arguments);
}

} // extern "C"
