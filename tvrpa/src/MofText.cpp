#include "MofText.h"

#include "tvr/broker/PathText.h"

#include <cstdio>

namespace tvrpa {

namespace {

using tvr::broker::Value;

std::string escaped(const std::string& text, char quote) {
  std::string out(1, quote);
  for (char c : text) {
    switch (c) {
    case '\\': out += "\\\\"; break;
    case '\n': out += "\\n"; break;
    case '\t': out += "\\t"; break;
    case '\r': out += "\\r"; break;
    case '\b': out += "\\b"; break;
    case '\f': out += "\\f"; break;
    default:
      if (c == quote) {
        out += '\\';
        out += c;
      } else if (static_cast<unsigned char>(c) < 0x20 || c == 0x7f) {
        char hex[8];
        std::snprintf(hex, sizeof hex, "\\x%04X", static_cast<unsigned>(static_cast<unsigned char>(c)));
        out += hex;
      } else {
        out += c;
      }
    }
  }
  return out + quote;
}

std::string scalar(const Value& v) {
  switch (v.type) {
  case CMPI_boolean: return v.scalar.boolean ? "TRUE" : "FALSE";
  case CMPI_char16: return escaped(std::string(1, static_cast<char>(v.scalar.char16)), '\'');
  // As in a key binding: the whole path, host included, so that it names
  // the same object wherever it is read.
  case CMPI_ref: return v.ref ? escaped(tvr::broker::formatObjectPath(*v.ref, {true, true}), '"') : "NULL";
  case CMPI_instance: return v.instance ? escaped(instanceMof(*v.instance), '"') : "NULL";
  default: return tvr::broker::formatValue(v);
  }
}

} // namespace

std::string mofValue(const Value& v) {
  if (v.null) return "NULL";
  if (v.isArray()) {
    std::string out = "{";
    for (std::size_t i = 0; i < v.elements.size(); ++i) out += (i ? ", " : "") + mofValue(v.elements[i]);
    return out + "}";
  }
  if (v.isText()) return escaped(v.text, '"');
  return scalar(v);
}

std::string instanceMof(const tvr::broker::Instance& instance) {
  std::string out = "instance of " + instance.path.className + "\n{\n";
  for (const tvr::broker::Binding& p : instance.properties) out += "    " + p.name + " = " + mofValue(p.value) + ";\n";
  return out + "};\n";
}

} // namespace tvrpa
