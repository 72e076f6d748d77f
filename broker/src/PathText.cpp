#include "tvr/broker/PathText.h"

#include <cctype>
#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstdlib>

namespace tvr::broker {

namespace {

std::string quote(std::string_view text) {
  std::string out = "\"";
  for (char c : text) {
    if (c == '"' || c == '\\') out += '\\';
    out += c;
  }
  out += '"';
  return out;
}

// A real with all its digits, written so that it reads back as a real.
std::string realText(double value, int digits) {
  char buffer[64];
  std::snprintf(buffer, sizeof buffer, "%.*g", digits, value);
  std::string text = buffer;
  if (text.find_first_of(".eEn") == std::string::npos) text += ".0";
  return text;
}

std::string formatScalar(const Value& v) {
  switch (v.type) {
  case CMPI_boolean: return v.scalar.boolean ? "TRUE" : "FALSE";
  case CMPI_char16: return quote(std::string(1, static_cast<char>(v.scalar.char16)));
  case CMPI_real32: return realText(v.scalar.real32, 9);
  case CMPI_real64: return realText(v.scalar.real64, 17);
  case CMPI_sint8:
  case CMPI_sint16:
  case CMPI_sint32:
  case CMPI_sint64: return std::to_string(v.asSigned());
  case CMPI_uint8:
  case CMPI_uint16:
  case CMPI_uint32:
  case CMPI_uint64: return std::to_string(v.asUnsigned());
  default: return "?";
  }
}

bool isNameStart(char c) { return std::isalpha(static_cast<unsigned char>(c)) || c == '_'; }
bool isNameChar(char c) { return std::isalnum(static_cast<unsigned char>(c)) || c == '_'; }

class Parser {
public:
  Parser(std::string_view text, std::size_t columnBase) : text_(text), base_(columnBase) {}

  std::optional<ObjectPath> path(PathParseError* error) {
    ObjectPath out;
    if (text_.substr(0, 2) == "//") {
      const std::size_t slash = text_.find('/', 2);
      if (slash == std::string_view::npos) return fail(error, 2, "expected '/' after the host name");
      if (slash == 2) return fail(error, 2, "empty host name after '//'");
      out.host = std::string(text_.substr(2, slash - 2));
      pos_ = slash + 1;
    }
    const std::size_t colon = namespaceColon();
    if (colon != std::string_view::npos) {
      out.nameSpace = std::string(text_.substr(pos_, colon - pos_));
      if (out.nameSpace.empty()) return fail(error, pos_, "empty namespace before ':'");
      // Printed without a host, such a namespace would read as one.
      if (out.nameSpace[0] == '/') return fail(error, pos_, "a namespace cannot start with '/'");
      pos_ = colon + 1;
    }
    if (pos_ >= text_.size() || !isNameStart(text_[pos_]))
      return fail(error, pos_, "expected a class name");
    const std::size_t start = pos_;
    while (pos_ < text_.size() && isNameChar(text_[pos_])) ++pos_;
    out.className = std::string(text_.substr(start, pos_ - start));
    if (pos_ == text_.size()) return out;
    if (text_[pos_] != '.') return fail(error, pos_, "expected '.' before the keys");
    ++pos_;
    for (;;) {
      if (!binding(out, error)) return std::nullopt;
      if (pos_ == text_.size()) return out;
      if (text_[pos_] != ',') return fail(error, pos_, "expected ',' between keys");
      ++pos_;
    }
  }

private:
  // The ':' that ends a namespace stands before the class name, so before any
  // '.', '=' or '"'.
  std::size_t namespaceColon() const {
    for (std::size_t i = pos_; i < text_.size(); ++i) {
      const char c = text_[i];
      if (c == ':') return i;
      if (c == '.' || c == '=' || c == '"') break;
    }
    return std::string_view::npos;
  }

  bool binding(ObjectPath& out, PathParseError* error) {
    if (pos_ >= text_.size() || !isNameStart(text_[pos_]))
      return fail(error, pos_, "expected a key name"), false;
    const std::size_t start = pos_;
    while (pos_ < text_.size() && isNameChar(text_[pos_])) ++pos_;
    const std::string name(text_.substr(start, pos_ - start));
    if (pos_ >= text_.size() || text_[pos_] != '=')
      return fail(error, pos_, "expected '=' after key " + name), false;
    ++pos_;
    std::optional<Value> v = value(error);
    if (!v) return false;
    out.keys.push_back(Binding{name, std::move(*v)});
    return true;
  }

  std::optional<Value> value(PathParseError* error) {
    if (pos_ >= text_.size()) return failValue(error, pos_, "expected a key value");
    if (text_[pos_] == '"') return quoted(error);
    const std::size_t start = pos_;
    while (pos_ < text_.size() && text_[pos_] != ',') ++pos_;
    const std::string word(text_.substr(start, pos_ - start));
    if (word == "TRUE" || word == "true") return Value::boolean(true);
    if (word == "FALSE" || word == "false") return Value::boolean(false);
    if (word.empty()) return failValue(error, start, "expected a key value");
    // The whole word must be the number: a NUL byte inside it ends what the
    // C library reads. Only finite reals print as text that reads back.
    errno = 0;
    char* end = nullptr;
    const char* const wordEnd = word.c_str() + word.size();
    if (word.find_first_of(".eE") != std::string::npos) {
      const double d = std::strtod(word.c_str(), &end);
      if (end == wordEnd && errno == 0 && std::isfinite(d)) return Value::real64(d);
    } else if (word[0] == '-') {
      const long long n = std::strtoll(word.c_str(), &end, 10);
      // "-0" is no negative number, and is written back as "0".
      if (end == wordEnd && errno == 0) return n < 0 ? Value::sint64(n) : Value::uint64(0);
    } else {
      const unsigned long long n = std::strtoull(word.c_str(), &end, 10);
      if (end == wordEnd && errno == 0 && word[0] != '+') return Value::uint64(n);
    }
    return failValue(error, start, "expected a quoted string, a number, TRUE or FALSE");
  }

  std::optional<Value> quoted(PathParseError* error) {
    const std::size_t open = pos_++;
    std::string text;
    const std::size_t contentColumn = pos_;
    for (;;) {
      if (pos_ >= text_.size()) return failValue(error, open, "unterminated quoted value");
      const char c = text_[pos_++];
      if (c == '"') break;
      if (c == '\\') {
        if (pos_ >= text_.size()) return failValue(error, open, "unterminated quoted value");
        text += text_[pos_++];
        continue;
      }
      text += c;
    }
    Parser nested(text, base_ + contentColumn);
    PathParseError ignored;
    if (auto ref = nested.path(&ignored); ref && !ref->keys.empty())
      return Value::reference(std::move(*ref));
    return Value::chars(text);
  }

  std::nullopt_t fail(PathParseError* error, std::size_t at, std::string message) {
    if (error) {
      error->column = base_ + at + 1;
      error->message = std::move(message);
    }
    return std::nullopt;
  }
  std::optional<Value> failValue(PathParseError* error, std::size_t at, std::string message) {
    fail(error, at, std::move(message));
    return std::nullopt;
  }

  std::string_view text_;
  std::size_t base_;
  std::size_t pos_ = 0;
};

} // namespace

std::string formatValue(const Value& v) {
  if (v.null) return "NULL";
  if (v.isArray()) {
    std::string out = "{";
    for (std::size_t i = 0; i < v.elements.size(); ++i) {
      if (i) out += ",";
      out += formatValue(v.elements[i]);
    }
    return out + "}";
  }
  if (v.isText()) return quote(v.text);
  if (v.type == CMPI_ref) return v.ref ? quote(formatObjectPath(*v.ref, PathFormat{true, true})) : "NULL";
  if (v.type == CMPI_instance) return "instance";
  return formatScalar(v);
}

std::string formatObjectPath(const ObjectPath& path, PathFormat format) {
  std::string out;
  if (format.withHost && !path.host.empty()) out += "//" + path.host + "/";
  if (format.withNamespace && !path.nameSpace.empty()) out += path.nameSpace + ":";
  out += path.className;
  for (std::size_t i = 0; i < path.keys.size(); ++i) {
    out += i ? "," : ".";
    out += path.keys[i].name;
    out += "=";
    out += formatValue(path.keys[i].value);
  }
  return out;
}

std::optional<ObjectPath> parseObjectPath(std::string_view text, PathParseError* error) {
  return Parser(text, 0).path(error);
}

} // namespace tvr::broker
