#include "Behaviours.h"

#include <pthread.h>

namespace tvrtest {

CMPIStatus ok() { CMReturn(CMPI_RC_OK); }

CMPIStatus failure(const CMPIBroker* broker, CMPIrc rc, const std::string& message) {
  CMReturnWithChars(broker, rc, message.c_str());
}

void returnText(const CMPIResult* result, const std::string& text) {
  CMReturnData(result, text.c_str(), CMPI_chars);
}

void returnStatus(const CMPIResult* result, const std::string& label, CMPIrc rc) {
  returnText(result, label + " " + std::to_string(rc));
}

std::string textOf(const CMPIString* s) {
  if (!s) return std::string();
  const char* text = CMGetCharsPtr(s, nullptr);
  return text ? text : std::string();
}

std::string keyText(const CMPIObjectPath* path, const char* key) {
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  const CMPIData data = CMGetKey(path, key, &rc);
  if (rc.rc != CMPI_RC_OK || CMIsNullValue(data) || data.type != CMPI_string) return std::string();
  return textOf(data.value.string);
}

std::string nameSpaceOf(const CMPIObjectPath* path) { return textOf(CMGetNameSpace(path, nullptr)); }

std::string classNameOf(const CMPIObjectPath* path) { return textOf(CMGetClassName(path, nullptr)); }

std::string shapeOf(const void* object) {
  if (!object) return "null";
  return CMIsNullObject(object) ? "hollow" : "ok";
}

CMPIUint64 currentThreadNumber() { return static_cast<CMPIUint64>(pthread_self()); }

} // namespace tvrtest
