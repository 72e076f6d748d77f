// TVRHX_ComputerSystem: this machine, as the physical-asset associations
// see it through the broker. One instance, keyed by the same system name the
// providers' paths carry, when the hardware describes a system.
#include "CmpiObjects.h"
#include "ComputerSystemRecord.h"
#include "RequestGuard.h"

#include <cmpimacs.h>

namespace tvr::companion {

namespace {

const CMPIBroker* broker = nullptr;
const char* const kProvider = "CompanionComputerSystemProvider";
const char* const kClassName = "TVRHX_ComputerSystem";
const char* const kKeys[] = {"CreationClassName", "Name", nullptr};

// CIM values: the name is a host name; a general-purpose machine; running.
const char* const kNameFormatHostName = "IP";
const std::uint16_t kDedicatedNotDedicated = 0;
const std::uint16_t kEnabledStateEnabled = 2;
const char* const kGuidDescription = "CIM:GUID";

CMPIObjectPath* pathOf(const ComputerSystemRecord& system, const std::string& nameSpace) {
  CMPIObjectPath* path = newPath(broker, nameSpace, kClassName);
  if (!path) return nullptr;
  if (!addTextKey(path, "CreationClassName", kClassName) || !addTextKey(path, "Name", system.name)) return nullptr;
  return path;
}

CMPIInstance* instanceOf(const ComputerSystemRecord& system, const std::string& nameSpace,
                         const char** properties) {
  CMPIInstance* instance = newInstanceOn(broker, pathOf(system, nameSpace));
  if (!instance) return nullptr;
  limitProperties(instance, properties, kKeys);
  setText(instance, "CreationClassName", kClassName);
  setText(instance, "Name", system.name);
  setText(instance, "ElementName", system.name);
  setText(instance, "NameFormat", kNameFormatHostName);
  if (!system.description.empty()) setText(instance, "Description", system.description);
  setUint16Array(broker, instance, "Dedicated", {kDedicatedNotDedicated});
  setUint16(instance, "EnabledState", kEnabledStateEnabled);
  if (system.uuid) {
    setTextArray(broker, instance, "OtherIdentifyingInfo", {*system.uuid});
    setTextArray(broker, instance, "IdentifyingDescriptions", {kGuidDescription});
  }
  return instance;
}

// Whether a path names this system: class names and host names are
// compared without regard to case.
bool names(const CMPIObjectPath* path, const ComputerSystemRecord& system) {
  const std::optional<std::string> creationClass = textKey(path, "CreationClassName");
  const std::optional<std::string> name = textKey(path, "Name");
  return creationClass && name && equalIgnoringCase(*creationClass, kClassName) &&
         equalIgnoringCase(*name, system.name);
}

CMPIStatus cannotBuild() { return statusWith(broker, CMPI_RC_ERR_FAILED, "cannot build the computer system"); }

} // namespace

CMPIStatus CompanionComputerSystem_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus CompanionComputerSystem_EnumInstanceNames(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                                     const CMPIObjectPath* ref) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    if (const std::optional<ComputerSystemRecord> system = readComputerSystem()) {
      CMPIObjectPath* path = pathOf(*system, nameSpaceOf(ref));
      if (!path) return cannotBuild();
      CMReturnObjectPath(rslt, path);
    }
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionComputerSystem_EnumInstances(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                                 const CMPIObjectPath* ref, const char** properties) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    if (const std::optional<ComputerSystemRecord> system = readComputerSystem()) {
      CMPIInstance* instance = instanceOf(*system, nameSpaceOf(ref), properties);
      if (!instance) return cannotBuild();
      CMReturnInstance(rslt, instance);
    }
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionComputerSystem_GetInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                               const CMPIObjectPath* cop, const char** properties) {
  return guarded(broker, kProvider, [&]() -> CMPIStatus {
    const std::optional<ComputerSystemRecord> system = readComputerSystem();
    if (!system || !names(cop, *system)) return statusWith(broker, CMPI_RC_ERR_NOT_FOUND, "no such computer system");
    CMPIInstance* instance = instanceOf(*system, nameSpaceOf(cop), properties);
    if (!instance) return cannotBuild();
    CMReturnInstance(rslt, instance);
    CMReturnDone(rslt);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
}

CMPIStatus CompanionComputerSystem_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionComputerSystem_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionComputerSystem_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CompanionComputerSystem_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(CompanionComputerSystem_, CompanionComputerSystemProvider, broker, CMNoHook)

} // namespace tvr::companion
