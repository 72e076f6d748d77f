// How GoogleTest prints the broker's values in failure messages: in the
// text form of paths and values instead of as raw bytes.
#pragma once

#include "tvr/broker/PathText.h"
#include "tvr/broker/Response.h"
#include "tvr/broker/Value.h"

#include <ostream>

namespace tvr::broker {

inline void PrintTo(const Value& value, std::ostream* os) {
  *os << typeName(value.type) << " " << formatValue(value);
}

inline void PrintTo(const ObjectPath& path, std::ostream* os) {
  *os << formatObjectPath(path, PathFormat{true, true});
}

inline void PrintTo(const Instance& instance, std::ostream* os) {
  *os << "instance of " << formatObjectPath(instance.path, PathFormat{true, true}) << " {";
  for (const Binding& b : instance.properties) *os << " " << b.name << "=" << formatValue(b.value) << ";";
  *os << " }";
}

inline void PrintTo(const Binding& binding, std::ostream* os) {
  *os << binding.name << "=";
  PrintTo(binding.value, os);
}

inline void PrintTo(ResultItem::Kind kind, std::ostream* os) {
  switch (kind) {
  case ResultItem::Kind::ObjectPath: *os << "ObjectPath"; return;
  case ResultItem::Kind::Instance: *os << "Instance"; return;
  case ResultItem::Kind::Data: *os << "Data"; return;
  case ResultItem::Kind::NullObjectPath: *os << "NullObjectPath"; return;
  case ResultItem::Kind::NullInstance: *os << "NullInstance"; return;
  }
  *os << "Kind(" << static_cast<int>(kind) << ")";
}

} // namespace tvr::broker
