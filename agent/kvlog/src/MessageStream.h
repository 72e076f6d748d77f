// The stream behind a KVMessageBuffer.

#ifndef KVLOG_SRC_MESSAGESTREAM_H
#define KVLOG_SRC_MESSAGESTREAM_H

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <locale>
#include <ostream>
#include <streambuf>
#include <string>

namespace KVLog::detail {

/// A stream buffer that collects into a string through a small put area, so
/// that characters go in without a call per character and the collected
/// text is handed over by swapping strings instead of copying them.
class TextCollector : public std::streambuf {
public:
  TextCollector() { setp(Area, Area + sizeof Area); }
  TextCollector(const TextCollector&) = delete;
  TextCollector& operator=(const TextCollector&) = delete;

  /// Moves everything inserted so far into \p out (replacing its content)
  /// and starts collecting anew.
  void takeInto(std::string& out) {
    flushArea();
    out.swap(Text);
    Text.clear();
  }

  /// Drops everything inserted so far.
  void discard() {
    setp(Area, Area + sizeof Area);
    Text.clear();
  }

protected:
  int_type overflow(int_type c) override {
    flushArea();
    if (!traits_type::eq_int_type(c, traits_type::eof()))
      Text.push_back(traits_type::to_char_type(c));
    return traits_type::not_eof(c);
  }

  std::streamsize xsputn(const char* s, std::streamsize n) override {
    if (n <= epptr() - pptr()) {
      std::memcpy(pptr(), s, static_cast<std::size_t>(n));
      pbump(static_cast<int>(n));
      return n;
    }
    flushArea();
    Text.append(s, static_cast<std::size_t>(n));
    return n;
  }

private:
  void flushArea() {
    Text.append(pbase(), static_cast<std::size_t>(pptr() - pbase()));
    setp(Area, Area + sizeof Area);
  }

  char Area[256];
  std::string Text;
};

/// Writes addresses as the standard facet writes them in a locale without
/// digit grouping — "0x" and lowercase hexadecimal digits, "0" for a null
/// pointer — without the general number formatting the standard facet runs
/// for them. Parameter lists of traced events are mostly addresses, and that
/// machinery was a tenth of a traced request. A field width, which needs
/// padding, is left to the standard facet.
class AddressPut : public std::num_put<char> {
protected:
  using std::num_put<char>::do_put;

  iter_type do_put(iter_type out, std::ios_base& io, char fill, const void* value) const override {
    if (io.width() != 0)
      return std::num_put<char>::do_put(out, io, fill, value);
    static const char Zero[] = "0";
    // One copy each: the library hands a character range to the stream
    // buffer in one call.
    if (!value)
      return std::copy(Zero, Zero + 1, out);
    const auto bits = static_cast<unsigned long long>(reinterpret_cast<std::uintptr_t>(value));
    char text[2 + 2 * sizeof bits] = {'0', 'x'};
    char* end = text + 2;
    // The significant hexadecimal digits, most significant first.
    for (int shift = (63 - __builtin_clzll(bits)) & ~3; shift >= 0; shift -= 4)
      *end++ = "0123456789abcdef"[(bits >> shift) & 0xf];
    return std::copy(static_cast<const char*>(text), static_cast<const char*>(end), out);
  }
};

/// The locale message streams are made with: the global locale, with
/// AddressPut in place of its number formatting when the global locale does
/// not group digits (as the "C" locale does not). With grouping, the global
/// locale alone, so that addresses come out grouped exactly as it has them.
inline std::locale messageLocale(const std::locale& global) {
  if (!std::use_facet<std::numpunct<char>>(global).grouping().empty())
    return global;
  return std::locale(global, new AddressPut);
}

/// A stream with its collector, and the text the last take() handed out.
class MessageStream {
public:
  MessageStream() : stream(&collector), global(), configured(messageLocale(global)) {
    stream.imbue(configured);
  }
  MessageStream(const MessageStream&) = delete;
  MessageStream& operator=(const MessageStream&) = delete;

  /// The text inserted since the previous take(); the stream is then back
  /// to a new stream's state and formatting, ready for the same insertions.
  const std::string& take() {
    collector.takeInto(text);
    restoreFormatting();
    return text;
  }

  /// Makes this stream as a newly made one is, but for the locale: nothing
  /// collected, a good state, a new stream's formatting.
  void reset() {
    collector.discard();
    text.clear();
    restoreFormatting();
    stream.exceptions(std::ios_base::goodbit);
    stream.tie(nullptr);
  }

  /// Gives the stream the global locale of now, as a stream made now would
  /// have, and undoes any imbue() of the buffer that used it before.
  void followGlobalLocale() {
    const std::locale current;
    if (current != global) {
      global = current;
      configured = messageLocale(global);
      stream.imbue(configured);
    } else if (stream.getloc() != configured) {
      stream.imbue(configured);
    }
  }

  TextCollector collector;
  std::ostream stream;
  std::string text;

private:
  /// The global locale when the stream was last configured, and the locale
  /// made from it.
  std::locale global;
  std::locale configured;

  void restoreFormatting() {
    stream.clear();
    stream.flags(std::ios_base::skipws | std::ios_base::dec);
    stream.width(0);
    stream.precision(6);
    stream.fill(' ');
  }
};

} // namespace KVLog::detail

#endif // KVLOG_SRC_MESSAGESTREAM_H
