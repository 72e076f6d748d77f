#include "cmpi/Convert.h"

#include "cmpi/Objects.h"

#include <cstdio>
#include <cstring>
#include <ctime>

namespace tvr::broker::detail {

namespace {

// Copies only the union member of the type's size: providers point `value`
// at a plain local of that type (an unsigned short for CMPI_uint16), so
// reading the whole 16-byte union would read past it.
bool copyScalar(const CMPIValue* in, CMPIType type, CMPIValue* out) {
  switch (type) {
  case CMPI_boolean: out->boolean = in->boolean; return true;
  case CMPI_char16: out->char16 = in->char16; return true;
  case CMPI_uint8: out->uint8 = in->uint8; return true;
  case CMPI_uint16: out->uint16 = in->uint16; return true;
  case CMPI_uint32: out->uint32 = in->uint32; return true;
  case CMPI_uint64: out->uint64 = in->uint64; return true;
  case CMPI_sint8: out->sint8 = in->sint8; return true;
  case CMPI_sint16: out->sint16 = in->sint16; return true;
  case CMPI_sint32: out->sint32 = in->sint32; return true;
  case CMPI_sint64: out->sint64 = in->sint64; return true;
  case CMPI_real32: out->real32 = in->real32; return true;
  case CMPI_real64: out->real64 = in->real64; return true;
  default: return false;
  }
}

// Text arrays hold strings whichever text type names them.
bool sameElementType(CMPIType declared, CMPIType held) {
  auto text = [](CMPIType t) { return t == CMPI_chars || t == CMPI_string; };
  return declared == held || (text(declared) && text(held));
}

Value invalid(CMPIType type, CMPIrc* rc, CMPIrc code) {
  if (rc) *rc = code;
  return Value::nullOf(type);
}

} // namespace

Value copyIn(const CMPIValue* value, CMPIType type, CMPIrc* rc) {
  if (rc) *rc = CMPI_RC_OK;
  if (!value || type == CMPI_null) return Value::nullOf(type);

  if (type & CMPI_ARRAY) {
    ArrayObject* array = arrayOf(value->array);
    if (!array) return value->array ? invalid(type, rc, CMPI_RC_ERR_INVALID_HANDLE) : Value::nullOf(type);
    if (!sameElementType(static_cast<CMPIType>(type & ~CMPI_ARRAY), array->elementType))
      return invalid(type, rc, CMPI_RC_ERR_TYPE_MISMATCH);
    Value v = Value::array(array->elementType, array->elements);
    v.type = type;
    return v;
  }

  switch (type) {
  case CMPI_chars:
    // By convention the value pointer of CMPI_chars is the text itself, not
    // a CMPIValue holding a pointer to it.
    return Value::chars(reinterpret_cast<const char*>(value));
  case CMPI_charsptr: {
    if (!value->dataPtr.ptr) return Value::nullOf(type);
    Value v = Value::chars(std::string(static_cast<const char*>(value->dataPtr.ptr),
                                       strnlen(static_cast<const char*>(value->dataPtr.ptr),
                                               value->dataPtr.length)));
    v.type = CMPI_charsptr;
    return v;
  }
  case CMPI_string: {
    if (!value->string) return Value::nullOf(type);
    StringObject* s = stringOf(value->string);
    if (!s) return invalid(type, rc, CMPI_RC_ERR_INVALID_HANDLE);
    return s->null ? Value::nullOf(type) : Value::string(s->text);
  }
  case CMPI_ref: {
    if (!value->ref) return Value::nullOf(type);
    PathObject* p = pathOf(value->ref);
    if (!p) return invalid(type, rc, CMPI_RC_ERR_INVALID_HANDLE);
    return Value::reference(p->path);
  }
  case CMPI_instance: {
    if (!value->inst) return Value::nullOf(type);
    InstanceObject* i = instanceOf(value->inst);
    if (!i) return invalid(type, rc, CMPI_RC_ERR_INVALID_HANDLE);
    Value v;
    v.type = CMPI_instance;
    v.null = false;
    v.instance = std::make_shared<const Instance>(i->instance);
    return v;
  }
  case CMPI_dateTime: {
    if (!value->dateTime) return Value::nullOf(type);
    DateTimeObject* d = dateTimeOf(value->dateTime);
    if (!d) return invalid(type, rc, CMPI_RC_ERR_INVALID_HANDLE);
    Value v = Value::chars(dateTimeText(d->microseconds, d->interval));
    v.type = CMPI_dateTime;
    return v;
  }
  default: {
    Value v;
    v.type = type;
    v.null = false;
    if (!copyScalar(value, type, &v.scalar)) return invalid(type, rc, CMPI_RC_ERR_INVALID_DATA_TYPE);
    return v;
  }
  }
}

const ObjectPath* pathIn(const CMPIObjectPath* path) {
  PathObject* p = pathOf(path);
  return p ? &p->path : nullptr;
}

CMPIData dataOut(ObjectManagerCore* core, const Value& v, CMPIValueState state) {
  CMPIType type = v.type;
  if (type == CMPI_chars || type == CMPI_charsptr) type = CMPI_string;
  if (v.isArray()) {
    CMPIType element = static_cast<CMPIType>(type & ~CMPI_ARRAY);
    if (element == CMPI_chars) element = CMPI_string;
    type = static_cast<CMPIType>(element | CMPI_ARRAY);
  }
  if (v.null) return nullData(type, static_cast<CMPIValueState>(CMPI_nullValue | state));

  CMPIData d;
  d.type = type;
  d.state = state;
  d.value.uint64 = 0;
  if (v.isArray()) {
    d.value.array = newArrayObject(core, static_cast<CMPIType>(type & ~CMPI_ARRAY), v.elements);
  } else if (type == CMPI_string) {
    d.value.string = newStringObject(core, v.text.c_str());
  } else if (type == CMPI_dateTime) {
    CMPIUint64 us = 0;
    bool interval = false;
    parseDateTimeText(v.text.c_str(), &us, &interval);
    d.value.dateTime = newDateTimeObject(core, us, interval);
  } else if (type == CMPI_ref) {
    d.value.ref = v.ref ? newPathObject(core, *v.ref) : nullptr;
  } else if (type == CMPI_instance) {
    d.value.inst = v.instance ? newInstanceObject(core, *v.instance) : nullptr;
  } else {
    copyScalar(&v.scalar, type, &d.value);
  }
  return d;
}

std::string dateTimeText(CMPIUint64 microseconds, bool interval) {
  char buffer[96];
  const unsigned long long us = microseconds % 1000000ULL;
  unsigned long long seconds = microseconds / 1000000ULL;
  if (interval) {
    const unsigned long long days = seconds / 86400ULL;
    seconds %= 86400ULL;
    std::snprintf(buffer, sizeof buffer, "%08llu%02llu%02llu%02llu.%06llu:000", days % 100000000ULL,
                  seconds / 3600ULL, (seconds / 60ULL) % 60ULL, seconds % 60ULL, us);
    return buffer;
  }
  const std::time_t t = static_cast<std::time_t>(seconds);
  std::tm tm{};
  gmtime_r(&t, &tm);
  std::snprintf(buffer, sizeof buffer, "%04d%02d%02d%02d%02d%02d.%06llu+000", tm.tm_year + 1900,
                tm.tm_mon + 1, tm.tm_mday, tm.tm_hour, tm.tm_min, tm.tm_sec, us);
  return buffer;
}

bool parseDateTimeText(const char* text, CMPIUint64* microseconds, bool* interval) {
  if (!text || std::strlen(text) != 25 || text[14] != '.') return false;
  for (int i = 0; i < 25; ++i) {
    if (i == 14 || i == 21) continue;
    if (text[i] < '0' || text[i] > '9') return false;
  }
  auto number = [&](int from, int count) {
    unsigned long long n = 0;
    for (int i = from; i < from + count; ++i) n = n * 10 + static_cast<unsigned>(text[i] - '0');
    return n;
  };
  const unsigned long long us = number(15, 6);
  if (text[21] == ':') {
    *interval = true;
    *microseconds =
        ((number(0, 8) * 86400ULL) + number(8, 2) * 3600ULL + number(10, 2) * 60ULL + number(12, 2)) *
            1000000ULL +
        us;
    return true;
  }
  if (text[21] != '+' && text[21] != '-') return false;
  std::tm tm{};
  tm.tm_year = static_cast<int>(number(0, 4)) - 1900;
  tm.tm_mon = static_cast<int>(number(4, 2)) - 1;
  tm.tm_mday = static_cast<int>(number(6, 2));
  tm.tm_hour = static_cast<int>(number(8, 2));
  tm.tm_min = static_cast<int>(number(10, 2));
  tm.tm_sec = static_cast<int>(number(12, 2));
  if (tm.tm_mon < 0 || tm.tm_mon > 11 || tm.tm_mday < 1 || tm.tm_mday > 31 || tm.tm_hour > 23 ||
      tm.tm_min > 59 || tm.tm_sec > 60)
    return false;
  long long seconds = static_cast<long long>(timegm(&tm));
  const long long offsetMinutes = static_cast<long long>(number(22, 3));
  seconds -= (text[21] == '+' ? 1 : -1) * offsetMinutes * 60;
  if (seconds < 0) return false;
  *interval = false;
  *microseconds = static_cast<CMPIUint64>(seconds) * 1000000ULL + us;
  return true;
}

} // namespace tvr::broker::detail
