//===- CmpiAccess.cpp - Null-safe reads through CMPI function tables ------===//

#include "CmpiAccess.h"

namespace HX {
namespace detail {
namespace {

CMPIStatus okStatus() { return CMPIStatus{CMPI_RC_OK, nullptr}; }

char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

/// Reads one of the path's string attributes through \p getter. A path
/// without that attribute (a local path has no host) reads as empty.
std::optional<std::string>
pathText(const CMPIObjectPath *path,
         CMPIString *(*CMPIObjectPathFT::*getter)(const CMPIObjectPath *,
                                                  CMPIStatus *)) {
  if (!path || !path->ft || !(path->ft->*getter))
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPIString *text = (path->ft->*getter)(path, &status);
  if (status.rc != CMPI_RC_OK)
    return std::nullopt;
  return textOf(text).value_or(std::string());
}

} // namespace

std::optional<std::string> textOf(const CMPIString *string) {
  if (!string || !string->ft || !string->ft->getCharPtr)
    return std::nullopt;
  CMPIStatus status = okStatus();
  const char *text = string->ft->getCharPtr(string, &status);
  if (status.rc != CMPI_RC_OK || !text)
    return std::nullopt;
  return std::string(text);
}

bool holdsValue(const CMPIData &data) {
  return (data.state & (CMPI_nullValue | CMPI_notFound | CMPI_badValue)) == 0;
}

std::optional<std::string> stringValueOf(const CMPIData &data) {
  if (!holdsValue(data))
    return std::nullopt;
  if (data.type == CMPI_string)
    return textOf(data.value.string);
  if (data.type == CMPI_chars && data.value.chars)
    return std::string(data.value.chars);
  return std::nullopt;
}

bool equalIgnoringCase(std::string_view a, std::string_view b) {
  if (a.size() != b.size())
    return false;
  for (std::size_t i = 0; i < a.size(); ++i)
    if (lowered(a[i]) != lowered(b[i]))
      return false;
  return true;
}

std::optional<CMPIData> keyOf(const CMPIObjectPath *path, const char *name) {
  if (!path || !path->ft || !path->ft->getKey || !name)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPIData data = path->ft->getKey(path, name, &status);
  if (status.rc != CMPI_RC_OK || (data.state & CMPI_notFound))
    return std::nullopt;
  return data;
}

std::optional<NamedData> keyAt(const CMPIObjectPath *path, CMPICount index) {
  if (!path || !path->ft || !path->ft->getKeyAt)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPIString *name = nullptr;
  CMPIData data = path->ft->getKeyAt(path, index, &name, &status);
  std::optional<std::string> text = textOf(name);
  if (status.rc != CMPI_RC_OK || (data.state & CMPI_notFound) || !text)
    return std::nullopt;
  return NamedData{std::move(*text), data};
}

std::optional<CMPICount> keyCountOf(const CMPIObjectPath *path) {
  if (!path || !path->ft || !path->ft->getKeyCount)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPICount count = path->ft->getKeyCount(path, &status);
  if (status.rc != CMPI_RC_OK)
    return std::nullopt;
  return count;
}

std::optional<std::string> classNameOf(const CMPIObjectPath *path) {
  return pathText(path, &CMPIObjectPathFT::getClassName);
}

std::optional<std::string> nameSpaceOf(const CMPIObjectPath *path) {
  return pathText(path, &CMPIObjectPathFT::getNameSpace);
}

std::optional<std::string> hostNameOf(const CMPIObjectPath *path) {
  return pathText(path, &CMPIObjectPathFT::getHostname);
}

std::optional<CMPIData> propertyOf(const CMPIInstance *instance,
                                   const char *name) {
  if (!instance || !instance->ft || !instance->ft->getProperty || !name)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPIData data = instance->ft->getProperty(instance, name, &status);
  if (status.rc != CMPI_RC_OK || (data.state & CMPI_notFound))
    return std::nullopt;
  return data;
}

std::optional<NamedData> propertyAt(const CMPIInstance *instance,
                                    CMPICount index) {
  if (!instance || !instance->ft || !instance->ft->getPropertyAt)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPIString *name = nullptr;
  CMPIData data = instance->ft->getPropertyAt(instance, index, &name, &status);
  std::optional<std::string> text = textOf(name);
  if (status.rc != CMPI_RC_OK || (data.state & CMPI_notFound) || !text)
    return std::nullopt;
  return NamedData{std::move(*text), data};
}

std::optional<CMPICount> propertyCountOf(const CMPIInstance *instance) {
  if (!instance || !instance->ft || !instance->ft->getPropertyCount)
    return std::nullopt;
  CMPIStatus status = okStatus();
  CMPICount count = instance->ft->getPropertyCount(instance, &status);
  if (status.rc != CMPI_RC_OK)
    return std::nullopt;
  return count;
}

} // namespace detail
} // namespace HX
