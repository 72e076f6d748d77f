#include "tvr/broker/Value.h"

#include <strings.h>

#include <cstring>

namespace tvr::broker {

namespace {

Value scalarOf(CMPIType type, const CMPIValue& value) {
  Value v;
  v.type = type;
  v.null = false;
  v.scalar = value;
  return v;
}

bool sameName(std::string_view a, std::string_view b) {
  return a.size() == b.size() && strncasecmp(a.data(), b.data(), a.size()) == 0;
}

void setBinding(std::vector<Binding>& bindings, std::string_view name, Value value) {
  for (Binding& b : bindings) {
    if (sameName(b.name, name)) {
      b.value = std::move(value);
      return;
    }
  }
  bindings.push_back(Binding{std::string(name), std::move(value)});
}

const Value* findBinding(const std::vector<Binding>& bindings, std::string_view name) {
  for (const Binding& b : bindings)
    if (b.name == name) return &b.value;
  return nullptr;
}

bool sameScalar(CMPIType type, const CMPIValue& a, const CMPIValue& b) {
  switch (type) {
  case CMPI_boolean: return a.boolean == b.boolean;
  case CMPI_char16: return a.char16 == b.char16;
  case CMPI_uint8: return a.uint8 == b.uint8;
  case CMPI_uint16: return a.uint16 == b.uint16;
  case CMPI_uint32: return a.uint32 == b.uint32;
  case CMPI_uint64: return a.uint64 == b.uint64;
  case CMPI_sint8: return a.sint8 == b.sint8;
  case CMPI_sint16: return a.sint16 == b.sint16;
  case CMPI_sint32: return a.sint32 == b.sint32;
  case CMPI_sint64: return a.sint64 == b.sint64;
  case CMPI_real32: return a.real32 == b.real32;
  case CMPI_real64: return a.real64 == b.real64;
  default: return std::memcmp(&a, &b, sizeof a) == 0;
  }
}

} // namespace

Value Value::nullOf(CMPIType type) {
  Value v;
  v.type = type;
  v.null = true;
  return v;
}

Value Value::chars(std::string_view text) {
  Value v;
  v.type = CMPI_chars;
  v.null = false;
  v.text = std::string(text);
  return v;
}

Value Value::string(std::string_view text) {
  Value v = chars(text);
  v.type = CMPI_string;
  return v;
}

Value Value::boolean(bool value) {
  CMPIValue c{};
  c.boolean = value ? 1 : 0;
  return scalarOf(CMPI_boolean, c);
}

#define TVR_SCALAR_FACTORY(fn, member, ctype, code)                                               \
  Value Value::fn(ctype value) {                                                                \
    CMPIValue c{};                                                                              \
    c.member = value;                                                                           \
    return scalarOf(code, c);                                                                   \
  }

TVR_SCALAR_FACTORY(uint8, uint8, std::uint8_t, CMPI_uint8)
TVR_SCALAR_FACTORY(uint16, uint16, std::uint16_t, CMPI_uint16)
TVR_SCALAR_FACTORY(uint32, uint32, std::uint32_t, CMPI_uint32)
TVR_SCALAR_FACTORY(uint64, uint64, std::uint64_t, CMPI_uint64)
TVR_SCALAR_FACTORY(sint8, sint8, std::int8_t, CMPI_sint8)
TVR_SCALAR_FACTORY(sint16, sint16, std::int16_t, CMPI_sint16)
TVR_SCALAR_FACTORY(sint32, sint32, std::int32_t, CMPI_sint32)
TVR_SCALAR_FACTORY(sint64, sint64, std::int64_t, CMPI_sint64)
TVR_SCALAR_FACTORY(real32, real32, float, CMPI_real32)
TVR_SCALAR_FACTORY(real64, real64, double, CMPI_real64)

#undef TVR_SCALAR_FACTORY

Value Value::reference(ObjectPath path) {
  Value v;
  v.type = CMPI_ref;
  v.null = false;
  v.ref = std::make_shared<const ObjectPath>(std::move(path));
  return v;
}

Value Value::array(CMPIType elementType, std::vector<Value> elements) {
  Value v;
  v.type = static_cast<CMPIType>(elementType | CMPI_ARRAY);
  v.null = false;
  v.elements = std::move(elements);
  return v;
}

bool Value::isText() const {
  return type == CMPI_chars || type == CMPI_string || type == CMPI_dateTime;
}

std::uint64_t Value::asUnsigned() const {
  switch (type) {
  case CMPI_uint8: return scalar.uint8;
  case CMPI_uint16: return scalar.uint16;
  case CMPI_uint32: return scalar.uint32;
  case CMPI_uint64: return scalar.uint64;
  case CMPI_sint8: return static_cast<std::uint64_t>(scalar.sint8);
  case CMPI_sint16: return static_cast<std::uint64_t>(scalar.sint16);
  case CMPI_sint32: return static_cast<std::uint64_t>(scalar.sint32);
  case CMPI_sint64: return static_cast<std::uint64_t>(scalar.sint64);
  default: return 0;
  }
}

std::int64_t Value::asSigned() const {
  switch (type) {
  case CMPI_sint8: return scalar.sint8;
  case CMPI_sint16: return scalar.sint16;
  case CMPI_sint32: return scalar.sint32;
  case CMPI_sint64: return scalar.sint64;
  default: return static_cast<std::int64_t>(asUnsigned());
  }
}

bool Value::operator==(const Value& other) const {
  if (type != other.type || null != other.null) return false;
  if (null) return true;
  if (isArray()) return elements == other.elements;
  if (isText()) return text == other.text;
  if (type == CMPI_ref) {
    if (!ref || !other.ref) return ref == other.ref;
    return *ref == *other.ref;
  }
  if (type == CMPI_instance) {
    if (!instance || !other.instance) return instance == other.instance;
    return *instance == *other.instance;
  }
  return sameScalar(type, scalar, other.scalar);
}

const Value* ObjectPath::key(std::string_view name) const { return findBinding(keys, name); }

void ObjectPath::setKey(std::string_view name, Value value) {
  setBinding(keys, name, std::move(value));
}

bool ObjectPath::operator==(const ObjectPath& other) const {
  return nameSpace == other.nameSpace && host == other.host && className == other.className &&
         keys == other.keys;
}

const Value* Instance::property(std::string_view name) const {
  return findBinding(properties, name);
}

void Instance::setProperty(std::string_view name, Value value) {
  setBinding(properties, name, std::move(value));
}

namespace {

struct TypeNames {
  CMPIType type;
  const char* cmpi;
  const char* cim;
};

constexpr TypeNames kTypeNames[] = {
    {CMPI_boolean, "CMPI_boolean", "boolean"},   {CMPI_char16, "CMPI_char16", "char16"},
    {CMPI_real32, "CMPI_real32", "real32"},      {CMPI_real64, "CMPI_real64", "real64"},
    {CMPI_uint8, "CMPI_uint8", "uint8"},         {CMPI_uint16, "CMPI_uint16", "uint16"},
    {CMPI_uint32, "CMPI_uint32", "uint32"},      {CMPI_uint64, "CMPI_uint64", "uint64"},
    {CMPI_sint8, "CMPI_sint8", "sint8"},         {CMPI_sint16, "CMPI_sint16", "sint16"},
    {CMPI_sint32, "CMPI_sint32", "sint32"},      {CMPI_sint64, "CMPI_sint64", "sint64"},
    {CMPI_instance, "CMPI_instance", "instance"}, {CMPI_ref, "CMPI_ref", "ref"},
    {CMPI_args, "CMPI_args", "args"},            {CMPI_class, "CMPI_class", "class"},
    {CMPI_filter, "CMPI_filter", "filter"},      {CMPI_enumeration, "CMPI_enumeration", "enumeration"},
    {CMPI_string, "CMPI_string", "string"},      {CMPI_chars, "CMPI_chars", "string"},
    {CMPI_dateTime, "CMPI_dateTime", "datetime"}, {CMPI_ptr, "CMPI_ptr", "ptr"},
    {CMPI_charsptr, "CMPI_charsptr", "string"},  {CMPI_null, "CMPI_null", "null"},
};

const TypeNames* namesOf(CMPIType simple) {
  for (const TypeNames& t : kTypeNames)
    if (t.type == simple) return &t;
  return nullptr;
}

} // namespace

std::string typeName(CMPIType type) {
  const bool array = (type & CMPI_ARRAY) != 0;
  const CMPIType simple = static_cast<CMPIType>(type & ~CMPI_ARRAY);
  const TypeNames* names = namesOf(simple);
  std::string name = names ? names->cmpi : "CMPI_type(" + std::to_string(type) + ")";
  if (array && names) name += "A";
  return name;
}

std::string cimTypeName(CMPIType type) {
  const bool array = (type & CMPI_ARRAY) != 0;
  const CMPIType simple = static_cast<CMPIType>(type & ~CMPI_ARRAY);
  const TypeNames* names = namesOf(simple);
  std::string name = names ? names->cim : "unknown";
  if (array) name += "[]";
  return name;
}

} // namespace tvr::broker
