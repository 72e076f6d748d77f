// The text form of CIM object paths, as WBEM clients write them:
//
//   [//host/][namespace:]Class[.Key="value",Key2=42,Ref="nested path"]
//
// String values are written in double quotes with '"' and '\' escaped by a
// backslash. Numbers are written bare, booleans as TRUE or FALSE. A reference
// key is its own path in this form, written as a quoted string; when reading,
// a quoted value that is itself a complete path with at least one key is
// taken for a reference. Everything `formatObjectPath` writes reads back to
// the same path with `parseObjectPath`.
#pragma once

#include "tvr/broker/Value.h"

#include <optional>
#include <string>
#include <string_view>

namespace tvr::broker {

struct PathFormat {
  bool withHost = false;      ///< write "//host/" when the path has a host
  bool withNamespace = true;  ///< write "namespace:" when the path has one
};

/// Writes a path in text form. Keys appear in the path's own order.
std::string formatObjectPath(const ObjectPath& path, PathFormat format = {});

/// Writes one value as it stands in a key binding or in a property listing
/// (strings quoted and escaped, references as quoted paths).
std::string formatValue(const Value& value);

/// Why a path text could not be read, and where (1-based column).
struct PathParseError {
  std::size_t column = 0;
  std::string message;
};

/// Reads a path in text form. String keys come back as `CMPI_chars`, bare
/// integers as `CMPI_uint64` (or `CMPI_sint64` when negative), TRUE/FALSE as
/// `CMPI_boolean`, references as `CMPI_ref`.
std::optional<ObjectPath> parseObjectPath(std::string_view text, PathParseError* error = nullptr);

} // namespace tvr::broker
