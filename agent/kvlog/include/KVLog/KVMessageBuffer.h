//===- KVLog/KVMessageBuffer.h - Text accumulator for messages --*- C++ -*-===//
//
// Builds the text of logger messages and parameter lists. A caller inserts a
// list, takes the text with str(), then may insert the same list again for
// the second channel and take it again:
//
//   KVMessageBuffer buffer;
//   std::ostream& out = buffer;
//   const std::string& forLog = buffer.str(out << "count=" << count);
//
// Only C strings have an inserter of their own; values of other types go
// through the underlying stream (`std::ostream& out = buffer`).
//
//===----------------------------------------------------------------------===//

#ifndef KVLOG_KVMESSAGEBUFFER_H
#define KVLOG_KVMESSAGEBUFFER_H

#include <iosfwd>
#include <memory> // kept for the code that relies on it coming from here
#include <string>

namespace KVLog {

namespace detail {
class MessageStream;
} // namespace detail

class KVMessageBuffer {
public:
  KVMessageBuffer();
  ~KVMessageBuffer();
  KVMessageBuffer(const KVMessageBuffer&) = delete;
  KVMessageBuffer& operator=(const KVMessageBuffer&) = delete;

  /// Appends \p text. A null \p text puts the stream in its failed state
  /// (badbit) as a stream does with a failed insertion: nothing more is
  /// appended until the next str() call.
  KVMessageBuffer& operator<<(const char* text);

  /// The underlying stream, for inserting values of any type.
  operator std::ostream&();

  /// Returns the text inserted since the previous str() call on this buffer
  /// (for the first call: since construction) and starts a new, empty
  /// accumulation: the stream state is cleared and the formatting (flags,
  /// width, precision, fill) is back to a new stream's, so the same insertions
  /// give the same text again.
  ///
  /// The argument is not used. It lets the insertions of the same full
  /// expression run first: `buffer.str(buffer << "a" << "b")`.
  ///
  /// The returned reference stays valid until the next str() call or the
  /// destruction of the buffer.
  const std::string& str(KVMessageBuffer&);

  /// As str(KVMessageBuffer&), for an expression that ends in the stream:
  /// `buffer.str(out << value)`.
  const std::string& str(std::ostream&);

private:
  /// The stream and the text of the last str(), owned by this buffer. Taken
  /// from, and handed back to, a small pool of the thread's, so that making
  /// a buffer costs no stream construction.
  detail::MessageStream* stream_;
};

} // namespace KVLog

#endif // KVLOG_KVMESSAGEBUFFER_H
