// Object paths and instances of TVRHX_IDEController, the logical IDE
// controller, and TVRHX_ChipIDECont, the chip that carries it. Both are
// built from the storage controller nodes through the DiskController view.
//
// Every node has a path of both classes; only a node that has other
// identifying information (PropOtherIdentifyingInfo) has instances. Nothing
// else about a node is looked at: a node with that property is presented as
// IDE whatever controller it is.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "DiskController.h"
#include "FactorySupport.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const ideDiskClass = "TVRHX_IDEController";
const char* const ideChipClass = "TVRHX_ChipIDECont";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// CIM EnabledState values.
constexpr unsigned short kEnabled = 2;
constexpr unsigned short kDisabled = 3;
constexpr unsigned short kEnabledStateUnknown = 0;
// The node status codes published as enabled and as disabled; every other
// code is an unknown state.
constexpr unsigned short kNodeStatusEnabled = 1;
constexpr unsigned short kNodeStatusDisabled = 16;
// Published when the node does not say: the protocol code of IDE
// controllers, and the two devices of an IDE channel.
constexpr unsigned short kProtocolIDE = 36;
constexpr CMPIUint32 kDevicesPerIDEChannel = 2;

using PerNodePath = unsigned short (*)(const CMPIBroker*, const CMPIObjectPath*, DiskController, CMPIStatus*,
                                       CMPIObjectPath**);
using PerNodeInstance = CMPIInstance* (*)(const CMPIBroker*, const CMPIObjectPath*, DiskController, const char**,
                                          CMPIStatus*);

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// A path of `className` in the namespace of `ref`, on this system; null
// when the object manager could make none.
CMPIObjectPath* newControllerPath(const CMPIBroker* broker, const CMPIObjectPath* ref, const char* className,
                                  CMPIStatus* rc) {
  CMPIObjectPath* path = newObjectPath(broker, textOrEmpty(nameSpaceOf(ref, rc)).c_str(), className, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  path->ft->setNameSpace(path, textOrEmpty(nameSpaceOf(ref, rc)).c_str());
  path->ft->setHostname(path, HX::getSystemName().c_str());
  return path;
}

// The path of every node, in node order. A path that cannot be made is
// tried again on the same node until it can.
void collectPaths(const CMPIBroker* broker, const CMPIObjectPath* ref, PerNodePath pathOf,
                  std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  DiskController dc;
  objpaths.clear();
  while (dc) {
    CMPIObjectPath* path = nullptr;
    pathOf(broker, ref, dc, rc, &path);
    if (!path) continue;
    objpaths.push_back(path);
    ++dc;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning COPs of DiskController ***");
}

// The instances of the nodes that qualify, in node order.
void collectInstances(const CMPIBroker* broker, const CMPIObjectPath* ref, const char** properties,
                      PerNodeInstance instanceOf, std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  DiskController dc;
  instances.clear();
  while (dc) {
    if (CMPIInstance* instance = instanceOf(broker, ref, dc, properties, rc)) {
      instances.push_back(instance);
      brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of IDEChipController ***");
    }
    ++dc;
  }
}

unsigned short enabledStateOf(DiskController& dc) {
  unsigned short status = 0;
  if (!dc.getHealthState(status)) return kEnabledStateUnknown;
  if (status == kNodeStatusEnabled) return kEnabled;
  if (status == kNodeStatusDisabled) return kDisabled;
  return kEnabledStateUnknown;
}

// The two properties both classes publish last, each only when the node
// has it.
void setTypeAndIdentifyingInfo(CMPIInstance* instance, DiskController& dc) {
  std::string text;
  if (dc.getCaption(text)) CMSetProperty(instance, "Description", text.c_str(), CMPI_chars);
  text.clear();
  if (dc.getOtherIdentifyingInfo(text)) CMSetProperty(instance, "OtherIdentifyingInfo", text.c_str(), CMPI_chars);
}

void setIDEControllerProperties(CMPIInstance* instance, DiskController& dc) {
  std::string text;
  dc.getTag(text);
  CMSetProperty(instance, "DeviceID", text.c_str(), CMPI_chars);
  CMSetProperty(instance, "CreationClassName", "TVRHX_IDEController", CMPI_chars);
  CMSetProperty(instance, "SystemCreationClassName", "TVRHX_ComputerSystem", CMPI_chars);
  text = HX::getSystemName().c_str();
  CMSetProperty(instance, "SystemName", text.c_str(), CMPI_chars);

  unsigned short shortNumber = enabledStateOf(dc);
  CMSetProperty(instance, "EnabledState", &shortNumber, CMPI_uint16);
  CMPIUint32 number = 0;
  shortNumber = dc.getPortType(number) ? static_cast<unsigned short>(number) : kProtocolIDE;
  CMSetProperty(instance, "ProtocolSupported", &shortNumber, CMPI_uint16);
  number = 0;
  if (!dc.getNumControlled(number)) number = kDevicesPerIDEChannel;
  CMSetProperty(instance, "MaxNumberControlled", &number, CMPI_uint32);
  setTypeAndIdentifyingInfo(instance, dc);
}

void setIDEChipProperties(CMPIInstance* instance, DiskController& dc) {
  std::string text;
  dc.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  CMSetProperty(instance, "CreationClassName", ideChipClass, CMPI_chars);

  CMPIUint32 number = 0;
  const unsigned short formFactor = dc.getFormFactor(number) ? static_cast<unsigned short>(number) : 0;
  CMSetProperty(instance, "FormFactor", &formFactor, CMPI_uint16);
  // A chip is soldered on: it can be neither swapped, removed nor replaced.
  const CMPIBoolean soldered = 0;
  CMSetProperty(instance, "HotSwappable", &soldered, CMPI_boolean);
  CMSetProperty(instance, "Removable", &soldered, CMPI_boolean);
  CMSetProperty(instance, "Replaceable", &soldered, CMPI_boolean);
  setTypeAndIdentifyingInfo(instance, dc);
}

} // namespace

unsigned short getIDEDiskControllerCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                       CMPIStatus* rc, CMPIObjectPath** path) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                                << " rc=" << rc << " op_parm=" << path);
  if (CMPIObjectPath* made = newControllerPath(broker, ref, ideDiskClass, rc)) {
    std::string text;
    dc.getTag(text);
    CMAddKey(made, "DeviceID", text.c_str(), CMPI_chars);
    text = "TVRHX_IDEController";
    CMAddKey(made, "CreationClassName", text.c_str(), CMPI_chars);
    text = "TVRHX_ComputerSystem";
    CMAddKey(made, "SystemCreationClassName", text.c_str(), CMPI_chars);
    text = HX::getSystemName().c_str();
    CMAddKey(made, "SystemName", text.c_str(), CMPI_chars);
    *path = made;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning COPs of DiskController ***");
  return 0;
}

unsigned short getIDEChipCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                             CMPIStatus* rc, CMPIObjectPath** path) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                                << " rc=" << rc << " op_parm=" << path);
  if (CMPIObjectPath* made = newControllerPath(broker, ref, ideChipClass, rc)) {
    std::string text;
    dc.getTag(text);
    CMAddKey(made, "Tag", text.c_str(), CMPI_chars);
    CMAddKey(made, "CreationClassName", ideChipClass, CMPI_chars);
    *path = made;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning COPs of DiskController ***");
  return 0;
}

unsigned short getAllIDEDiskControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx,
                                          const CMPIObjectPath* ref, std::vector<CMPIObjectPath*>& objpaths,
                                          CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  collectPaths(broker, ref, getIDEDiskControllerCOP, objpaths, rc);
  return 0;
}

unsigned short getAllIDEChipCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  collectPaths(broker, ref, getIDEChipCOP, objpaths, rc);
  return 0;
}

CMPIInstance* makeIDEDiskControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                            const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                                << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  CMPIInstance* instance = nullptr;
  std::string identifyingInfo;
  if (dc.getOtherIdentifyingInfo(identifyingInfo)) {
    CMPIObjectPath* path = nullptr;
    getIDEDiskControllerCOP(broker, ref, dc, rc, &path);
    if (path) {
      instance = newInstance(broker, path, nullptr);
      if (!CMIsNullObject(instance)) setIDEControllerProperties(instance, dc);
      brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of IDEController ***");
    }
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

CMPIInstance* makeIDEChipControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                            const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                                << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  CMPIInstance* instance = nullptr;
  std::string identifyingInfo;
  if (dc.getOtherIdentifyingInfo(identifyingInfo)) {
    CMPIObjectPath* path = nullptr;
    getIDEChipCOP(broker, ref, dc, rc, &path);
    if (path) {
      instance = newInstance(broker, path, nullptr);
      if (!CMIsNullObject(instance)) setIDEChipProperties(instance, dc);
      // The chip's instance is announced with the controller's text.
      brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of IDEController ***");
    }
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getAllIDEControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                            const CMPIObjectPath* ref, const char** properties,
                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  collectInstances(broker, ref, properties, makeIDEDiskControllerInstance, instances, rc);
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getAllIDEChipControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                                const CMPIObjectPath* ref, const char** properties,
                                                std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  collectInstances(broker, ref, properties, makeIDEChipControllerInstance, instances, rc);
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

} // namespace HX::PhysicalAssetProvider
