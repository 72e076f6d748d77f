#include "KVLog/KVMessageBuffer.h"

#include <sstream>

namespace KVLog {

struct KVMessageBuffer::State {
  std::ostringstream stream;
  std::string text; ///< What the last str() returned.
};

KVMessageBuffer::KVMessageBuffer() : state_(std::make_unique<State>()) {}

KVMessageBuffer::~KVMessageBuffer() = default;

KVMessageBuffer& KVMessageBuffer::operator<<(const char* text) {
  if (text)
    state_->stream << text;
  else
    state_->stream.setstate(std::ios_base::badbit);
  return *this;
}

KVMessageBuffer::operator std::ostream&() { return state_->stream; }

const std::string& KVMessageBuffer::str(KVMessageBuffer&) {
  std::ostringstream& stream = state_->stream;
  state_->text = stream.str();
  stream.str(std::string());
  stream.clear();
  // Formatting as a new stream has it, so that inserting the same list
  // again gives the same text.
  stream.flags(std::ios_base::skipws | std::ios_base::dec);
  stream.width(0);
  stream.precision(6);
  stream.fill(' ');
  return state_->text;
}

const std::string& KVMessageBuffer::str(std::ostream&) { return str(*this); }

} // namespace KVLog
