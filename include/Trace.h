// Tracing of the physical-asset providers.
//
// Every ENTERING and EXITING event of a handler or factory function goes to
// the agent's logger twice: first to the log channel (logLevelMessage), then
// to the trace channel (traceLevelMessage), each with a formatting of its
// own. The lines are formatted into two process-wide 512-byte buffers, one
// for lines with a parameter list (tracepara) and one for lines without
// (trace). The buffers are function-local statics of inline functions, so
// the whole library shares one of each; they are not guarded, so two
// threads tracing at once may mix each other's line.
//
// Beside the logger, progress and failure texts go to the object manager
// through the broker's trace function (brokerTrace).
#pragma once

#include <KVLog/KVLogger.h>
#include <KVLog/KVMessageBuffer.h>
#include <cmpift.h>
#include <cmpimacs.h>

#include <cstdio>
#include <cstring>
#include <ostream>
#include <string>
#include <type_traits>

namespace HX {

enum MessageType { MsgEnter = 0, MsgExit = 1, MsgMethod = 2, MsgMessage = 3 };

/// Logger levels of the events the providers write.
constexpr int kLevelEnterExit = 3000;
constexpr int kLevelProviderExit = 4000;
constexpr int kLevelFailure = 6000;

/// Formats a line with a parameter list into the shared buffer and returns
/// the buffer. `message` is the function's name, or for MsgMessage the text.
/// A line that does not fit is cut at 511 bytes.
inline char* tracepara(const char* message, const char* file, unsigned line, const char* parameters,
                       MessageType type) {
  static char messageBuffer[512];
  std::memset(messageBuffer, 0, sizeof messageBuffer);
  const char* m = message ? message : "(null)";
  const char* f = file ? file : "(null)";
  const char* p = parameters ? parameters : "(null)";
  const int l = static_cast<int>(line);
  switch (type) {
  case MsgMethod:
    std::snprintf(messageBuffer, sizeof messageBuffer,
                  "METHOD: %s() was invoked in %s [Line: %d],Parameters List: %s", m, f, l, p);
    break;
  case MsgMessage:
    std::snprintf(messageBuffer, sizeof messageBuffer, "MESSAGE [File: %s, Line: %d]: %s,Parameters List: %s",
                  f, l, m, p);
    break;
  case MsgExit:
    std::snprintf(messageBuffer, sizeof messageBuffer, "EXITING: %s() in %s [Line: %d],Parameters List: %s", m,
                  f, l, p);
    break;
  default:
    std::snprintf(messageBuffer, sizeof messageBuffer, "ENTERING: %s() in %s [Line: %d],Parameters List: %s",
                  m, f, l, p);
    break;
  }
  return messageBuffer;
}

/// Formats a line without parameter list into the other shared buffer.
inline char* trace(const char* message, const char* file, unsigned line, MessageType type) {
  static char messageBuffer[512];
  std::memset(messageBuffer, 0, sizeof messageBuffer);
  const char* m = message ? message : "(null)";
  const char* f = file ? file : "(null)";
  const int l = static_cast<int>(line);
  switch (type) {
  case MsgMethod:
    std::snprintf(messageBuffer, sizeof messageBuffer, "METHOD: %s() was invoked in %s [Line: %d]", m, f, l);
    break;
  case MsgMessage:
    std::snprintf(messageBuffer, sizeof messageBuffer, "MESSAGE [File: %s, Line: %d]: %s", f, l, m);
    break;
  case MsgExit:
    std::snprintf(messageBuffer, sizeof messageBuffer, "EXITING: %s() in %s [Line: %d]", m, f, l);
    break;
  default:
    std::snprintf(messageBuffer, sizeof messageBuffer, "ENTERING: %s() in %s [Line: %d]", m, f, l);
    break;
  }
  return messageBuffer;
}

/// Writes the closing lines of a handler: its EXITING line and a separator,
/// each to both channels at level 4000. The lines name this function and
/// this header as their origin; the EXITING text names the caller.
inline void markProviderExit(const std::string& category, const char* function, const char* file,
                             unsigned line) {
  static const char* const kSelf = "markProviderExit";
  {
    KVLog::KVMessageBuffer message;
    KVLog::KVLogger::logLevelMessage(kSelf, __FILE__, __LINE__, category, kLevelProviderExit, nullptr, 0, 0,
                                     message.str(message << trace(function, file, line, MsgExit)));
    KVLog::KVLogger::traceLevelMessage(kSelf, __FILE__, __LINE__, category, kLevelProviderExit, nullptr, 0, 0,
                                       message.str(message << trace(function, file, line, MsgExit)));
  }
  {
    const std::string separator(78, '=');
    KVLog::KVMessageBuffer message;
    KVLog::KVLogger::logLevelMessage(kSelf, __FILE__, __LINE__, category, kLevelProviderExit, nullptr, 0, 0,
                                     message.str(message << separator.c_str()));
    KVLog::KVLogger::traceLevelMessage(kSelf, __FILE__, __LINE__, category, kLevelProviderExit, nullptr, 0, 0,
                                       message.str(message << separator.c_str()));
  }
}

/// A text argument of a parameter list. A null text puts the stream in its
/// failed state, so the rest of that list is left out of the line, as a
/// failed insertion does; it is never dereferenced.
struct TraceText {
  const char* text;
};

inline TraceText traceText(const char* text) { return TraceText{text}; }

inline std::ostream& operator<<(std::ostream& out, TraceText t) {
  if (t.text) out << t.text;
  else out.setstate(std::ios::badbit);
  return out;
}

/// Sends a text to the object manager's trace function at level 1. With no
/// broker there is nobody to tell, and nothing is sent.
inline void brokerTrace(const CMPIBroker* broker, const char* component, const char* text) {
  if (broker) CMTraceMessage(broker, 1, component, text, nullptr);
}

} // namespace HX

namespace KVLog {

// The first value of a parameter list moves the insertion from the message
// buffer to its stream, so that the rest of the list goes straight into the
// stream. Pointers are inserted as addresses.
// Texts are not among them: they keep the buffer's own inserter.
template <class T>
constexpr bool isAddress =
    std::is_pointer<T>::value && !std::is_same<std::remove_cv_t<std::remove_pointer_t<T>>, char>::value;

template <class T, std::enable_if_t<isAddress<T>, int> = 0>
std::ostream& operator<<(KVMessageBuffer& buffer, const T& value) {
  std::ostream& out = buffer;
  out << static_cast<const void*>(value);
  return out;
}

template <class T, std::enable_if_t<isAddress<const T*>, int> = 0>
std::ostream& operator<<(KVMessageBuffer& buffer, const T* value) {
  std::ostream& out = buffer;
  out << static_cast<const void*>(value);
  return out;
}

} // namespace KVLog

namespace HX {

/// Where a traced event comes from: function, source file and line.
struct TraceOrigin {
  const char* function;
  const char* file;
  unsigned line;
};

/// Writes one ENTERING or EXITING event to both logger channels at level
/// 3000: the parameter list is inserted into a buffer and the line formatted
/// once for the log channel, then inserted and formatted anew, with the same
/// two buffers, for the trace channel. `insertParams(buffer)` inserts the
/// list and returns the buffer's text.
template <class InsertParams>
void traceEvent(const std::string& category, MessageType type, const TraceOrigin& at, InsertParams insertParams) {
  KVLog::KVMessageBuffer params;
  KVLog::KVMessageBuffer message;
  {
    const std::string& list = insertParams(params);
    const char* line = tracepara(at.function, at.file, at.line, list.c_str(), type);
    KVLog::KVLogger::logLevelMessage(at.function, at.file, static_cast<int>(at.line), category, kLevelEnterExit,
                                     nullptr, 0, 0, message.str(message << line));
  }
  {
    const std::string& list = insertParams(params);
    const char* line = tracepara(at.function, at.file, at.line, list.c_str(), type);
    KVLog::KVLogger::traceLevelMessage(at.function, at.file, static_cast<int>(at.line), category,
                                       kLevelEnterExit, nullptr, 0, 0, message.str(message << line));
  }
}

/// Writes a message line without parameter list to both logger channels.
inline void traceMessage(const std::string& category, int level, const TraceOrigin& at, const char* text) {
  KVLog::KVMessageBuffer message;
  KVLog::KVLogger::logLevelMessage(at.function, at.file, static_cast<int>(at.line), category, level, nullptr, 0, 0,
                                   message.str(message << trace(text, at.file, at.line, MsgMessage)));
  KVLog::KVLogger::traceLevelMessage(at.function, at.file, static_cast<int>(at.line), category, level, nullptr, 0,
                                     0, message.str(message << trace(text, at.file, at.line, MsgMessage)));
}
} // namespace HX

/// The current function, file and line, as a TraceOrigin.
#define HX_HERE (HX::TraceOrigin{__func__, __FILE__, __LINE__})

/// Writes an ENTERING or EXITING event of the enclosing function. `PARAMS`
/// is the parameter list as a chain of insertions, e.g.
/// `<< " mi=" << mi << " ctx=" << ctx`.
#define HX_TRACE_EVENT(category, type, PARAMS)                                                                \
  HX::traceEvent(category, type, HX_HERE,                                                                      \
                 [&](KVLog::KVMessageBuffer& hxParams_) -> const std::string& {                                 \
                   return hxParams_.str(hxParams_ PARAMS);                                                      \
                 })

#define HX_TRACE_ENTER(category, PARAMS) HX_TRACE_EVENT(category, HX::MsgEnter, PARAMS)
#define HX_TRACE_EXIT(category, PARAMS) HX_TRACE_EVENT(category, HX::MsgExit, PARAMS)

/// Writes a message line of the enclosing function at `level`.
#define HX_TRACE_MESSAGE(category, level, text) HX::traceMessage(category, level, HX_HERE, text)

/// Writes the closing lines of the enclosing handler (see markProviderExit).
#define HX_MARK_PROVIDER_EXIT(category) HX::markProviderExit(category, __func__, __FILE__, __LINE__)
