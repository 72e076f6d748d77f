// TVRHX_NetworkPort: the port each network card realises, as the
// physical-asset associations see it through the broker. A port's DeviceID
// is its card's node name, which is the card's Tag, so each port pairs with
// the card that realises it.
#include "CmpiObjects.h"
#include "NetworkPortRecord.h"
#include "RequestGuard.h"

#include <HX/SystemName.h>

#include <cmpimacs.h>

namespace tvr::companion {

namespace {

const CMPIBroker* broker = nullptr;
const char* const kProvider = "CompanionNetworkPortProvider";
const char* const kClassName = "TVRHX_NetworkPort";
const char* const kSystemClassName = "TVRHX_ComputerSystem";
const char* const kKeys[] = {"SystemCreationClassName", "SystemName", "CreationClassName", "DeviceID", nullptr};

CMPIObjectPath* pathOf(const NetworkPortRecord& port, const std::string& nameSpace, const std::string& systemName) {
  CMPIObjectPath* path = newPath(broker, nameSpace, kClassName);
  if (!path) return nullptr;
  if (!addTextKey(path, "SystemCreationClassName", kSystemClassName) ||
      !addTextKey(path, "SystemName", systemName) || !addTextKey(path, "CreationClassName", kClassName) ||
      !addTextKey(path, "DeviceID", port.deviceID))
    return nullptr;
  return path;
}

CMPIInstance* instanceOf(const NetworkPortRecord& port, const std::string& nameSpace, const std::string& systemName,
                         const char** properties) {
  CMPIInstance* instance = newInstanceOn(broker, pathOf(port, nameSpace, systemName));
  if (!instance) return nullptr;
  limitProperties(instance, properties, kKeys);
  setText(instance, "SystemCreationClassName", kSystemClassName);
  setText(instance, "SystemName", systemName);
  setText(instance, "CreationClassName", kClassName);
  setText(instance, "DeviceID", port.deviceID);
  setText(instance, "ElementName", port.elementName);
  if (!port.description.empty()) setText(instance, "Description", port.description);
  if (port.permanentAddress) setText(instance, "PermanentAddress", *port.permanentAddress);
  if (port.speed) setUint64(instance, "Speed", *port.speed);
  if (port.maxSpeed) setUint64(instance, "MaxSpeed", *port.maxSpeed);
  if (port.linkTechnology) setUint16(instance, "LinkTechnology", *port.linkTechnology);
  setUint16(instance, "EnabledState", port.enabledState);
  return instance;
}

// The port a path names, if any: the class names and the system name are
// compared without regard to case, the DeviceID exactly.
const NetworkPortRecord* portNamedBy(const CMPIObjectPath* path, const std::vector<NetworkPortRecord>& ports,
                                     const std::string& systemName) {
  const std::optional<std::string> systemClass = textKey(path, "SystemCreationClassName");
  const std::optional<std::string> system = textKey(path, "SystemName");
  const std::optional<std::string> creationClass = textKey(path, "CreationClassName");
  const std::optional<std::string> deviceID = textKey(path, "DeviceID");
  if (!systemClass || !system || !creationClass || !deviceID) return nullptr;
  if (!equalIgnoringCase(*systemClass, kSystemClassName) || !equalIgnoringCase(*system, systemName) ||
      !equalIgnoringCase(*creationClass, kClassName))
    return nullptr;
  for (const NetworkPortRecord& port : ports)
    if (port.deviceID == *deviceID) return &port;
  return nullptr;
}

CMPIStatus cannotBuild() { return statusWith(broker, CMPI_RC_ERR_FAILED, "cannot build a network port"); }

} // namespace

CMPIStatus CompanionNetworkPort_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus CompanionNetworkPort_EnumInstanceNames(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                                  const CMPIObjectPath* ref) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    const std::string nameSpace = nameSpaceOf(ref);
    const std::string systemName = HX::getSystemName();
    for (const NetworkPortRecord& port : readNetworkPorts()) {
      CMPIObjectPath* path = pathOf(port, nameSpace, systemName);
      if (!path) return cannotBuild();
      CMReturnObjectPath(rslt, path);
    }
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionNetworkPort_EnumInstances(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                              const CMPIObjectPath* ref, const char** properties) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    const std::string nameSpace = nameSpaceOf(ref);
    const std::string systemName = HX::getSystemName();
    for (const NetworkPortRecord& port : readNetworkPorts()) {
      CMPIInstance* instance = instanceOf(port, nameSpace, systemName, properties);
      if (!instance) return cannotBuild();
      CMReturnInstance(rslt, instance);
    }
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionNetworkPort_GetInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                            const CMPIObjectPath* cop, const char** properties) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    const std::string systemName = HX::getSystemName();
    const std::vector<NetworkPortRecord> ports = readNetworkPorts();
    const NetworkPortRecord* port = portNamedBy(cop, ports, systemName);
    if (!port) return statusWith(broker, CMPI_RC_ERR_NOT_FOUND, "no such network port");
    CMPIInstance* instance = instanceOf(*port, nameSpaceOf(cop), systemName, properties);
    if (!instance) return cannotBuild();
    CMReturnInstance(rslt, instance);
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionNetworkPort_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                               const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionNetworkPort_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                               const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionNetworkPort_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                               const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionNetworkPort_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                          const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(CompanionNetworkPort_, CompanionNetworkPortProvider, broker, CMNoHook)

} // namespace tvr::companion
