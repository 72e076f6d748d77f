#include "CmpiObjects.h"

#include <HX/ProviderUtilities.h>
#include <HX/SystemName.h>

#include <cmpimacs.h>

#include <strings.h>

namespace tvr::companion {

CMPIStatus statusWith(const CMPIBroker* broker, CMPIrc rc, const std::string& text) {
  CMPIStatus status = {rc, nullptr};
  if (broker) status.msg = CMNewString(broker, text.c_str(), nullptr);
  return status;
}

std::string nameSpaceOf(const CMPIObjectPath* path) {
  if (CMIsNullObject(path)) return std::string();
  const CMPIString* text = CMGetNameSpace(path, nullptr);
  const char* chars = CMIsNullObject(text) ? nullptr : CMGetCharsPtr(text, nullptr);
  return chars ? chars : "";
}

CMPIObjectPath* newPath(const CMPIBroker* broker, const std::string& nameSpace, const char* className) {
  if (!broker) return nullptr;
  CMPIObjectPath* path = CMNewObjectPath(broker, nameSpace.c_str(), className, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  CMSetHostname(path, HX::getSystemName().c_str());
  return path;
}

bool addTextKey(CMPIObjectPath* path, const char* name, const std::string& value) {
  return CMAddKey(path, name, value.c_str(), CMPI_chars).rc == CMPI_RC_OK;
}

CMPIInstance* newInstanceOn(const CMPIBroker* broker, const CMPIObjectPath* path) {
  if (!broker || CMIsNullObject(path)) return nullptr;
  CMPIInstance* instance = CMNewInstance(broker, path, nullptr);
  return CMIsNullObject(instance) ? nullptr : instance;
}

void limitProperties(CMPIInstance* instance, const char** properties, const char* const* keys) {
  if (properties) CMSetPropertyFilter(instance, properties, const_cast<const char**>(keys));
}

bool setText(CMPIInstance* instance, const char* name, const std::string& value) {
  return CMSetProperty(instance, name, value.c_str(), CMPI_chars).rc == CMPI_RC_OK;
}

bool setUint16(CMPIInstance* instance, const char* name, std::uint16_t value) {
  return CMSetProperty(instance, name, &value, CMPI_uint16).rc == CMPI_RC_OK;
}

bool setUint64(CMPIInstance* instance, const char* name, std::uint64_t value) {
  return CMSetProperty(instance, name, &value, CMPI_uint64).rc == CMPI_RC_OK;
}

bool setUint16Array(const CMPIBroker* broker, CMPIInstance* instance, const char* name,
                    const std::vector<std::uint16_t>& values) {
  if (!broker) return false;
  CMPIArray* array = CMNewArray(broker, static_cast<CMPICount>(values.size()), CMPI_uint16, nullptr);
  if (CMIsNullObject(array)) return false;
  for (std::size_t index = 0; index < values.size(); ++index) {
    const std::uint16_t value = values[index];
    if (CMSetArrayElementAt(array, static_cast<CMPICount>(index), &value, CMPI_uint16).rc != CMPI_RC_OK)
      return false;
  }
  return CMSetProperty(instance, name, &array, CMPI_uint16A).rc == CMPI_RC_OK;
}

bool setTextArray(const CMPIBroker* broker, CMPIInstance* instance, const char* name,
                  const std::vector<std::string>& values) {
  std::vector<std::string> copy = values;
  return HX::ProviderUtilities::setProperty(broker, instance, name, copy);
}

std::optional<std::string> textKey(const CMPIObjectPath* path, const char* name) {
  std::string value;
  if (!HX::ProviderUtilities::getKeyProperty(path, name, value)) return std::nullopt;
  return value;
}

bool equalIgnoringCase(const std::string& a, const std::string& b) {
  return a.size() == b.size() && strncasecmp(a.c_str(), b.c_str(), a.size()) == 0;
}

} // namespace tvr::companion
