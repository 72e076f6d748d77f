#include "StandInAnswers.h"

#include <HX/Instrumentation.h>
#include <HX/SystemName.h>

#include <cmpimacs.h>

namespace tvr::test::standins {

namespace {

// The names of the named nodes of one type, in document order.
std::vector<std::string> namesOf(HX::NodeLexicon::NodeType type) {
  std::vector<std::string> names;
  HX::Instrumentation node;
  for (node.selectNode(type); node; ++node) {
    std::string name;
    if (node.getProperty(HX::NodeLexicon::PropNodeName, name)) names.push_back(name);
  }
  return names;
}

CMPIObjectPath* pathWith(const CMPIBroker* broker, const CMPIObjectPath* ref, const char* className,
                         const Keys& keys) {
  const CMPIString* nameSpace = CMGetNameSpace(ref, nullptr);
  CMPIObjectPath* path = CMNewObjectPath(broker, CMGetCharsPtr(nameSpace, nullptr), className, nullptr);
  CMSetHostname(path, HX::getSystemName().c_str());
  for (const auto& [name, value] : keys) CMAddKey(path, name, value.c_str(), CMPI_chars);
  return path;
}

} // namespace

CMPIStatus answerNames(const CMPIBroker* broker, const CMPIResult* rslt, const CMPIObjectPath* ref,
                       const StandInClass& served) {
  for (const std::string& name : namesOf(served.nodeType))
    CMReturnObjectPath(rslt, pathWith(broker, ref, served.className, served.keysOf(name)));
  CMReturnDone(rslt);
  CMReturn(CMPI_RC_OK);
}

CMPIStatus answerInstances(const CMPIBroker* broker, const CMPIResult* rslt, const CMPIObjectPath* ref,
                           const StandInClass& served) {
  for (const std::string& name : namesOf(served.nodeType)) {
    const Keys keys = served.keysOf(name);
    CMPIInstance* instance = CMNewInstance(broker, pathWith(broker, ref, served.className, keys), nullptr);
    for (const auto& [key, value] : keys) CMSetProperty(instance, key, value.c_str(), CMPI_chars);
    CMReturnInstance(rslt, instance);
  }
  CMReturnDone(rslt);
  CMReturn(CMPI_RC_OK);
}

} // namespace tvr::test::standins
