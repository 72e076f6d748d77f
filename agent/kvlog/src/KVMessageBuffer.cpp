#include "KVLog/KVMessageBuffer.h"

#include "MessageStream.h"

namespace KVLog {

namespace {

/// Streams of buffers that have been destroyed on this thread, ready for
/// the next buffer. The providers make two buffers for every traced event;
/// making a stream costs far more than the event's formatting (the locale's
/// facets are looked up anew for each), so a thread keeps a few.
class StreamPool {
public:
  ~StreamPool() {
    Closed = true;
    for (int i = 0; i < Count; ++i)
      delete Free[i];
  }

  detail::MessageStream* take() {
    if (Count == 0)
      return new detail::MessageStream;
    detail::MessageStream* stream = Free[--Count];
    stream->followGlobalLocale();
    return stream;
  }

  void give(detail::MessageStream* stream) {
    if (Count == Capacity) {
      delete stream;
      return;
    }
    stream->reset();
    Free[Count++] = stream;
  }

  /// True once the thread's pool is gone: buffers destroyed later in the
  /// thread's exit (or the process's) free their stream themselves. A
  /// trivially destructible flag stays readable to the end of the thread.
  static thread_local bool Closed;

private:
  static constexpr int Capacity = 8;
  detail::MessageStream* Free[Capacity] = {};
  int Count = 0;
};

thread_local bool StreamPool::Closed = false;
thread_local StreamPool Pool;

detail::MessageStream* takeStream() {
  if (StreamPool::Closed)
    return new detail::MessageStream;
  return Pool.take();
}

void giveBack(detail::MessageStream* stream) {
  if (StreamPool::Closed) {
    delete stream;
    return;
  }
  Pool.give(stream);
}

} // namespace

KVMessageBuffer::KVMessageBuffer() : stream_(takeStream()) {}

KVMessageBuffer::~KVMessageBuffer() { giveBack(stream_); }

KVMessageBuffer& KVMessageBuffer::operator<<(const char* text) {
  if (text)
    stream_->stream << text;
  else
    stream_->stream.setstate(std::ios_base::badbit);
  return *this;
}

KVMessageBuffer::operator std::ostream&() { return stream_->stream; }

const std::string& KVMessageBuffer::str(KVMessageBuffer&) { return stream_->take(); }

const std::string& KVMessageBuffer::str(std::ostream&) { return str(*this); }

} // namespace KVLog
