//===- CmpiObjects.h - Building the companion providers' answers ----------===//
//
/// \file
/// The few CMPI operations the companion providers build their answers
/// with. Every function tolerates a null broker or a broker that cannot
/// make an object: it then reports failure instead of going on.
//
//===----------------------------------------------------------------------===//
#pragma once

#include <cmpift.h>

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace tvr::companion {

/// A status with \p text as its message. Without a broker there is nothing
/// to make the message with, and the status has none.
CMPIStatus statusWith(const CMPIBroker* broker, CMPIrc rc, const std::string& text);

/// The namespace of \p path; empty when it cannot be read.
std::string nameSpaceOf(const CMPIObjectPath* path);

/// A new object path of \p className in \p nameSpace, with this system's
/// host name. Null when the broker cannot make one.
CMPIObjectPath* newPath(const CMPIBroker* broker, const std::string& nameSpace, const char* className);

/// Adds a string key; false when the path refuses it.
bool addTextKey(CMPIObjectPath* path, const char* name, const std::string& value);

/// A new instance on \p path. Null when the broker cannot make one.
CMPIInstance* newInstanceOn(const CMPIBroker* broker, const CMPIObjectPath* path);

/// Narrows what \p instance carries to \p properties (and its keys): a null
/// list leaves every property.
void limitProperties(CMPIInstance* instance, const char** properties, const char* const* keys);

/// Property setters; each answers whether the instance took the value.
bool setText(CMPIInstance* instance, const char* name, const std::string& value);
bool setUint16(CMPIInstance* instance, const char* name, std::uint16_t value);
bool setUint64(CMPIInstance* instance, const char* name, std::uint64_t value);
bool setUint16Array(const CMPIBroker* broker, CMPIInstance* instance, const char* name,
                    const std::vector<std::uint16_t>& values);
bool setTextArray(const CMPIBroker* broker, CMPIInstance* instance, const char* name,
                  const std::vector<std::string>& values);

/// The string key \p name of \p path; nullopt when it has none.
std::optional<std::string> textKey(const CMPIObjectPath* path, const char* name);

/// ASCII comparison without regard to case, as CIM compares class names
/// and host names.
bool equalIgnoringCase(const std::string& a, const std::string& b);

} // namespace tvr::companion
