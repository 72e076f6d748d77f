//===- CmpiAccess.h - Null-safe reads through CMPI function tables --------===//
//
/// \file
/// Every read goes through the object's function table, and an object
/// manager (or a test double) may hand over null objects or tables with
/// empty slots. These wrappers check each pointer and each status, so the
/// helpers built on them fail cleanly instead of crashing.
//
//===----------------------------------------------------------------------===//

#ifndef HX_UTILITIES_SRC_CMPIACCESS_H
#define HX_UTILITIES_SRC_CMPIACCESS_H

#include "cmpidt.h"
#include "cmpift.h"

#include <optional>
#include <string>
#include <string_view>

namespace HX {
namespace detail {

/// The text of \p string, or nullopt when it cannot be read.
std::optional<std::string> textOf(const CMPIString *string);

/// True when \p data holds a value: not null, found and not bad.
bool holdsValue(const CMPIData &data);

/// The text of \p data when it holds a CMPI_string or CMPI_chars value.
std::optional<std::string> stringValueOf(const CMPIData &data);

/// Compares ASCII letters without regard to case.
bool equalIgnoringCase(std::string_view a, std::string_view b);

/// The key \p name of \p path as the path's table reports it.
std::optional<CMPIData> keyOf(const CMPIObjectPath *path, const char *name);

/// Key \p index of \p path with its name.
struct NamedData {
  std::string name;
  CMPIData data;
};
std::optional<NamedData> keyAt(const CMPIObjectPath *path, CMPICount index);

/// The number of keys of \p path.
std::optional<CMPICount> keyCountOf(const CMPIObjectPath *path);

/// The class name, namespace or host name of \p path: nullopt when the
/// path cannot be asked, empty when it has none.
std::optional<std::string> classNameOf(const CMPIObjectPath *path);
std::optional<std::string> nameSpaceOf(const CMPIObjectPath *path);
std::optional<std::string> hostNameOf(const CMPIObjectPath *path);

/// The property \p name of \p instance as its table reports it.
std::optional<CMPIData> propertyOf(const CMPIInstance *instance,
                                   const char *name);
std::optional<NamedData> propertyAt(const CMPIInstance *instance,
                                    CMPICount index);
std::optional<CMPICount> propertyCountOf(const CMPIInstance *instance);

} // namespace detail
} // namespace HX

#endif // HX_UTILITIES_SRC_CMPIACCESS_H
