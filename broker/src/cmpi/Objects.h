// The embedded object manager's encapsulated CMPI objects.
//
// Each object is an arena object holding a `Shell`: the two-pointer CMPI
// struct the provider sees, followed by a pointer back to the object. The
// shell is standard layout with the CMPI struct first, so a CMPI pointer
// handed back by a provider converts to its shell and from there to the
// object, once its function table has shown it to be ours.
//
// `hdl` points at the object itself, except for strings, whose `hdl` is the
// NUL-terminated text (the CMGetCharPtr macro reads it there). A "hollow"
// object, made only by fault injection, has a null `hdl`; every function
// answers CMPI_RC_ERR_INVALID_HANDLE for it.
#pragma once

#include "cmpi/Arena.h"
#include "tvr/broker/Value.h"

#include <cmpift.h>

#include <optional>
#include <string>
#include <vector>

namespace tvr::broker::detail {

class ObjectManagerCore;
class ResultSink;

template <class Cmpi> struct Shell {
  Cmpi cmpi;
  ArenaObject* owner;
};

extern CMPIStringFT stringFT;
extern CMPIObjectPathFT objectPathFT;
extern CMPIInstanceFT instanceFT;
extern CMPIArrayFT arrayFT;
extern CMPIEnumerationFT enumerationFT;
extern CMPIDateTimeFT dateTimeFT;
extern CMPIArgsFT argsFT;
extern CMPIContextFT contextFT;
extern CMPIResultFT resultFT;

struct StringObject : ArenaObject {
  Shell<CMPIString> shell;
  std::string text;
  bool null = false;
  ObjectManagerCore* core;
  StringObject(ObjectManagerCore* c, std::string t, bool isNull = false);
};

struct PathObject : ArenaObject {
  Shell<CMPIObjectPath> shell;
  ObjectPath path;
  ObjectManagerCore* core;
  PathObject(ObjectManagerCore* c, ObjectPath p, bool hollow = false);
};

struct InstanceObject : ArenaObject {
  Shell<CMPIInstance> shell;
  Instance instance;
  ObjectManagerCore* core;
  /// Names a setPropertyFilter call keeps (properties and keys); none: all.
  std::optional<std::vector<std::string>> filter;
  InstanceObject(ObjectManagerCore* c, Instance i, bool hollow = false);
  bool passesFilter(const char* name) const;
};

struct ArrayObject : ArenaObject {
  Shell<CMPIArray> shell;
  CMPIType elementType;
  std::vector<Value> elements;
  ObjectManagerCore* core;
  ArrayObject(ObjectManagerCore* c, CMPIType type, std::vector<Value> e, bool hollow = false);
};

struct EnumerationObject : ArenaObject {
  Shell<CMPIEnumeration> shell;
  std::vector<Value> items; ///< each a CMPI_ref or CMPI_instance value
  std::size_t next = 0;
  ObjectManagerCore* core;
  EnumerationObject(ObjectManagerCore* c, std::vector<Value> i, bool hollow = false);
};

struct DateTimeObject : ArenaObject {
  Shell<CMPIDateTime> shell;
  CMPIUint64 microseconds; ///< since the epoch (UTC), or the interval's length
  bool interval;
  ObjectManagerCore* core;
  DateTimeObject(ObjectManagerCore* c, CMPIUint64 us, bool isInterval);
};

struct ArgsObject : ArenaObject {
  Shell<CMPIArgs> shell;
  std::vector<Binding> args;
  ObjectManagerCore* core;
  explicit ArgsObject(ObjectManagerCore* c);
};

struct ContextObject : ArenaObject {
  Shell<CMPIContext> shell;
  std::vector<Binding> entries;
  ObjectManagerCore* core;
  ContextObject(ObjectManagerCore* c, std::vector<Binding> e);
};

struct ResultObject : ArenaObject {
  Shell<CMPIResult> shell;
  ResultSink* sink;
  ObjectManagerCore* core;
  ResultObject(ObjectManagerCore* c, ResultSink* s);
};

/// The object behind a CMPI pointer, if it is one of ours of that kind and
/// not hollow; null otherwise.
template <class Object, class Cmpi> Object* objectOf(const Cmpi* cmpi, const void* expectedFT) {
  if (!cmpi || !cmpi->hdl || static_cast<const void*>(cmpi->ft) != expectedFT) return nullptr;
  const auto* shell = reinterpret_cast<const Shell<Cmpi>*>(cmpi);
  return static_cast<Object*>(shell->owner);
}

inline StringObject* stringOf(const CMPIString* s) {
  if (!s || s->ft != &stringFT) return nullptr;
  return static_cast<StringObject*>(reinterpret_cast<const Shell<CMPIString>*>(s)->owner);
}
inline PathObject* pathOf(const CMPIObjectPath* p) { return objectOf<PathObject>(p, &objectPathFT); }
inline InstanceObject* instanceOf(const CMPIInstance* i) {
  return objectOf<InstanceObject>(i, &instanceFT);
}
inline ArrayObject* arrayOf(const CMPIArray* a) { return objectOf<ArrayObject>(a, &arrayFT); }
inline EnumerationObject* enumerationOf(const CMPIEnumeration* e) {
  return objectOf<EnumerationObject>(e, &enumerationFT);
}
inline DateTimeObject* dateTimeOf(const CMPIDateTime* d) {
  return objectOf<DateTimeObject>(d, &dateTimeFT);
}
inline ArgsObject* argsOf(const CMPIArgs* a) { return objectOf<ArgsObject>(a, &argsFT); }
inline ContextObject* contextOf(const CMPIContext* c) { return objectOf<ContextObject>(c, &contextFT); }
inline ResultObject* resultOf(const CMPIResult* r) { return objectOf<ResultObject>(r, &resultFT); }

/// Sets `*rc` when the caller asked for a status.
inline void setStatus(CMPIStatus* rc, CMPIrc code) {
  if (rc) {
    rc->rc = code;
    rc->msg = nullptr;
  }
}

inline CMPIStatus status(CMPIrc code) {
  CMPIStatus st;
  st.rc = code;
  st.msg = nullptr;
  return st;
}

/// A CMPIData that says "nothing here": null state with the given type.
inline CMPIData nullData(CMPIType type = CMPI_null, CMPIValueState state = CMPI_nullValue) {
  CMPIData d;
  d.type = type;
  d.state = state;
  d.value.uint64 = 0;
  return d;
}

// Factories used across the object kinds. All allocate in the arena the
// current thread works for (see arenaFor).
CMPIString* newStringObject(ObjectManagerCore* core, const char* text);
CMPIObjectPath* newPathObject(ObjectManagerCore* core, ObjectPath path);
CMPIInstance* newInstanceObject(ObjectManagerCore* core, Instance instance);
CMPIArray* newArrayObject(ObjectManagerCore* core, CMPIType elementType, std::vector<Value> elements);
CMPIDateTime* newDateTimeObject(ObjectManagerCore* core, CMPIUint64 microseconds, bool interval);
CMPIEnumeration* newEnumerationObject(ObjectManagerCore* core, std::vector<Value> items);
CMPIArgs* newArgsObject(ObjectManagerCore* core);
CMPIContext* newContextObject(ObjectManagerCore* core, std::vector<Binding> entries);

} // namespace tvr::broker::detail
