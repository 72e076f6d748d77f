// Plain C++ copies of CIM data as the embedded object manager records it.
//
// Everything a provider hands back (object paths, instances, property values)
// is copied into these types before the request's CMPI objects are freed, so
// answers can be inspected, compared and printed after the request ended.
#pragma once

#include <cmpidt.h>

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace tvr::broker {

class ObjectPath;
class Instance;

/// One CIM value with the CMPI type it was given.
///
/// `type` is exactly the type code the provider used (`CMPI_chars` stays
/// `CMPI_chars`), so tests can check what a provider set, not what an object
/// manager might have normalised it to. Array values carry the `CMPI_ARRAY`
/// bit and keep one element per entry in `elements`.
class Value {
public:
  CMPIType type = CMPI_null;
  bool null = true;
  CMPIValue scalar{};                       ///< booleans, char16, integers, reals
  std::string text;                         ///< chars, string, dateTime
  std::shared_ptr<const ObjectPath> ref;    ///< ref
  std::shared_ptr<const Instance> instance; ///< embedded instance
  std::vector<Value> elements;              ///< array elements

  static Value nullOf(CMPIType type);
  static Value chars(std::string_view text);
  static Value string(std::string_view text);
  static Value boolean(bool value);
  static Value uint8(std::uint8_t value);
  static Value uint16(std::uint16_t value);
  static Value uint32(std::uint32_t value);
  static Value uint64(std::uint64_t value);
  static Value sint8(std::int8_t value);
  static Value sint16(std::int16_t value);
  static Value sint32(std::int32_t value);
  static Value sint64(std::int64_t value);
  static Value real32(float value);
  static Value real64(double value);
  static Value reference(ObjectPath path);
  static Value array(CMPIType elementType, std::vector<Value> elements);

  bool isArray() const { return (type & CMPI_ARRAY) != 0; }
  /// True for chars, string and dateTime: the values kept in `text`.
  bool isText() const;
  /// The value as an unsigned number, for integer types; 0 otherwise.
  std::uint64_t asUnsigned() const;
  /// The value as a signed number, for integer types; 0 otherwise.
  std::int64_t asSigned() const;

  /// Same type, same nullness, same content (references compared in full).
  bool operator==(const Value& other) const;
  bool operator!=(const Value& other) const { return !(*this == other); }
};

/// A named value: a key of an object path or a property of an instance.
struct Binding {
  std::string name;
  Value value;

  bool operator==(const Binding& other) const {
    return name == other.name && value == other.value;
  }
};

/// A CIM object path: namespace, host, class and keys in the order added.
class ObjectPath {
public:
  std::string nameSpace;
  std::string host;
  std::string className;
  std::vector<Binding> keys;

  ObjectPath() = default;
  ObjectPath(std::string nameSpace, std::string className)
      : nameSpace(std::move(nameSpace)), className(std::move(className)) {}

  /// The key of that name (exact match), or null.
  const Value* key(std::string_view name) const;
  /// Adds a key, or replaces the value of a key of the same name (compared
  /// without regard to case, as CIM names are) in its place.
  void setKey(std::string_view name, Value value);

  bool operator==(const ObjectPath& other) const;
  bool operator!=(const ObjectPath& other) const { return !(*this == other); }
};

/// A CIM instance: its object path and its properties in the order set.
class Instance {
public:
  ObjectPath path;
  std::vector<Binding> properties;

  /// The property of that name (exact match), or null.
  const Value* property(std::string_view name) const;
  /// Adds a property, or replaces the value of a property of the same name
  /// (compared without regard to case) in its place, as object managers do.
  void setProperty(std::string_view name, Value value);

  bool operator==(const Instance& other) const {
    return path == other.path && properties == other.properties;
  }
};

/// The CMPI name of a type code, e.g. "CMPI_uint16" or "CMPI_stringA".
std::string typeName(CMPIType type);

/// The CIM (MOF) name of a type code, e.g. "uint16", "string", "ref", with
/// "[]" behind array types.
std::string cimTypeName(CMPIType type);

} // namespace tvr::broker
