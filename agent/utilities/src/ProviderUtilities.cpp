//===- ProviderUtilities.cpp - Reading and writing CMPI values ------------===//

#include "HX/ProviderUtilities.h"

#include "CmpiAccess.h"

namespace HX {

using detail::stringValueOf;

bool ProviderUtilities::getKeyProperty(const CMPIObjectPath *path,
                                       const char *name, std::string &value) {
  std::optional<CMPIData> key = detail::keyOf(path, name);
  std::optional<std::string> text = key ? stringValueOf(*key) : std::nullopt;
  if (!text)
    return false;
  value = std::move(*text);
  return true;
}

namespace {

/// The first property of \p instance named \p name without regard to case.
std::optional<CMPIData> propertyIgnoringCase(const CMPIInstance *instance,
                                             const char *name) {
  std::optional<CMPICount> count = detail::propertyCountOf(instance);
  for (CMPICount index = 0; count && index < *count; ++index) {
    std::optional<detail::NamedData> property =
        detail::propertyAt(instance, index);
    if (property && detail::equalIgnoringCase(property->name, name))
      return property->data;
  }
  return std::nullopt;
}

} // namespace

bool ProviderUtilities::getProperty(const CMPIInstance *instance,
                                    const char *name, std::string &value,
                                    bool caseInsensitive) {
  if (!instance || !name)
    return false;
  std::optional<CMPIData> property = detail::propertyOf(instance, name);
  if (!property && caseInsensitive)
    property = propertyIgnoringCase(instance, name);
  std::optional<std::string> text =
      property ? stringValueOf(*property) : std::nullopt;
  if (!text)
    return false;
  value = std::move(*text);
  return true;
}

bool ProviderUtilities::setProperty(const CMPIBroker *broker,
                                    CMPIInstance *instance, const char *name,
                                    std::vector<std::string> &values) {
  if (!broker || !broker->eft || !broker->eft->newArray || !instance ||
      !instance->ft || !instance->ft->setProperty || !name)
    return false;

  CMPIStatus status{CMPI_RC_OK, nullptr};
  CMPIArray *array = CMNewArray(broker, static_cast<CMPICount>(values.size()),
                                CMPI_string, &status);
  if (status.rc != CMPI_RC_OK || !array || !array->ft ||
      !array->ft->setElementAt)
    return false;
  for (std::size_t index = 0; index < values.size(); ++index) {
    // A CMPI_chars value is passed as the text pointer itself.
    status = CMSetArrayElementAt(array, static_cast<CMPICount>(index),
                                 values[index].c_str(), CMPI_chars);
    if (status.rc != CMPI_RC_OK)
      return false;
  }

  CMPIValue arrayValue;
  arrayValue.array = array;
  status = CMSetProperty(instance, name, &arrayValue, CMPI_stringA);
  return status.rc == CMPI_RC_OK;
}

} // namespace HX
