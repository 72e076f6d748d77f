// Calls into the object manager, made safe against a missing broker.
//
// A provider's broker variable is null until the object manager has called
// an entry point, and an object manager may pass null. The broker's
// factories then answer as a broker that could make nothing: a null object.
// Reading texts of objects handed in by the object manager tolerates null
// objects the same way.
#pragma once

#include <cmpift.h>
#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

inline CMPIObjectPath* newObjectPath(const CMPIBroker* broker, const char* ns, const char* cn, CMPIStatus* rc) {
  return broker ? CMNewObjectPath(broker, ns, cn, rc) : nullptr;
}

inline CMPIInstance* newInstance(const CMPIBroker* broker, const CMPIObjectPath* path, CMPIStatus* rc) {
  return broker ? CMNewInstance(broker, path, rc) : nullptr;
}

inline CMPIArray* newArray(const CMPIBroker* broker, CMPICount count, CMPIType type, CMPIStatus* rc) {
  return broker ? CMNewArray(broker, count, type, rc) : nullptr;
}

/// Sets a status and its message; with no broker the message stays null.
inline void setStatusWithChars(const CMPIBroker* broker, CMPIStatus* status, CMPIrc rc, const char* text) {
  status->rc = rc;
  status->msg = broker ? CMNewString(broker, text, nullptr) : nullptr;
}

/// The text of a CMPI string through its function table; null for a null string.
inline const char* charPtr(const CMPIString* text, CMPIStatus* rc) {
  return text ? text->ft->getCharPtr(text, rc) : nullptr;
}

/// The namespace of a path as a text, read through getNameSpace and
/// getCharPtr with `rc` given to each.
inline const char* nameSpaceOf(const CMPIObjectPath* path, CMPIStatus* rc) {
  return path ? charPtr(path->ft->getNameSpace(path, rc), rc) : nullptr;
}

/// The text of a string key of a path: getKey with `keyRc`, then getCharPtr
/// with `charRc`. Null when the path has no such key.
inline const char* keyText(const CMPIObjectPath* path, const char* name, CMPIStatus* keyRc, CMPIStatus* charRc) {
  if (!path) return nullptr;
  const CMPIData key = path->ft->getKey(path, name, keyRc);
  if (key.state & (CMPI_nullValue | CMPI_notFound)) return nullptr;
  if (key.type == CMPI_chars) return key.value.chars;
  if (key.type != CMPI_string) return nullptr;
  return charPtr(key.value.string, charRc);
}

} // namespace HX::PhysicalAssetProvider
