// Object paths and instances of TVRHX_SASPortController: each storage
// controller node as a logical device of the computer system, named by the
// system's class and name, its own class and the node's path text.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "FactorySupport.h"
#include "SASPortController.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const SASPortControllerClass = "TVRHX_SASPortController";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// The four keys of a system device, in their published order. The
// instance's properties are these same four, set the same way.
template <class SetValue>
void setDeviceKeys(SASPortController& controller, SetValue set) {
  std::string text;
  controller.getSystemCreationClassName(text);
  set("SystemCreationClassName", text);
  text.clear();
  controller.getCreationClassName(text);
  set("CreationClassName", text);
  text = HX::getSystemName();
  set("SystemName", text);
  text.clear();
  controller.getDeviceID(text);
  set("DeviceID", text);
}

void addDeviceKeys(CMPIObjectPath* path, SASPortController& controller) {
  setDeviceKeys(controller, [path](const char* name, const std::string& text) {
    CMAddKey(path, name, text.c_str(), CMPI_chars);
  });
}

void setDeviceProperties(CMPIInstance* instance, SASPortController& controller) {
  setDeviceKeys(controller, [instance](const char* name, const std::string& text) {
    CMSetProperty(instance, name, text.c_str(), CMPI_chars);
  });
}

// A path of the class in the namespace of `ref`, on this system, without
// keys; null when the object manager could make none.
CMPIObjectPath* newControllerPath(const CMPIBroker* broker, const CMPIObjectPath* ref, CMPIStatus* rc) {
  CMPIObjectPath* path =
      newObjectPath(broker, textOrEmpty(nameSpaceOf(ref, rc)).c_str(), SASPortControllerClass, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  path->ft->setNameSpace(path, textOrEmpty(nameSpaceOf(ref, rc)).c_str());
  path->ft->setHostname(path, HX::getSystemName().c_str());
  return path;
}

} // namespace

CMPIInstance* makeSASPortControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                            SASPortController controller, const char** properties,
                                            CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc="
                                                << &controller << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  CMPIObjectPath* path = newControllerPath(broker, ref, rc);
  if (!path) return nullptr;
  addDeviceKeys(path, controller);
  CMPIInstance* instance = newInstance(broker, path, nullptr);
  if (!CMIsNullObject(instance)) setDeviceProperties(instance, controller);
  brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of SASPortController ***");
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &controller
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getOneSASPortControllerInstance(const CMPIBroker* broker, const CMPIContext* context,
                                               const CMPIObjectPath* ref, const char** properties,
                                               CMPIInstance*& instance, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // Only DeviceID tells controllers apart; the system's keys are not read,
  // so a path naming another host finds the controller all the same.
  const char* deviceID = keyText(ref, "DeviceID", rc, rc);
  SASPortController controller;
  while (controller) {
    std::string current;
    controller.getDeviceID(current);
    if (deviceID && std::strcmp(current.c_str(), deviceID) == 0) {
      instance = makeSASPortControllerInstance(broker, ref, controller, properties, rc);
      return 0;
    }
    ++controller;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

unsigned short getAllSASPortControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                                const CMPIObjectPath* ref, const char** properties,
                                                std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  instances.clear();
  SASPortController controller;
  while (controller) {
    instances.push_back(makeSASPortControllerInstance(broker, ref, controller, properties, rc));
    brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of SASPortController ***");
    ++controller;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getAllSASPortControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx,
                                          const CMPIObjectPath* ref, std::vector<CMPIObjectPath*>& objpaths,
                                          CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  objpaths.clear();
  SASPortController controller;
  while (controller) {
    CMPIObjectPath* path = newControllerPath(broker, ref, rc);
    // The object manager may be out of objects for a moment: try the same
    // controller again.
    if (!path) continue;
    addDeviceKeys(path, controller);
    objpaths.push_back(path);
    ++controller;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning COPs of SASPortController ***");
  return 0;
}

} // namespace HX::PhysicalAssetProvider
