// TVRHX_UnitaryComputerSystemPackage: the chassis that package the computer
// system. The chassis come from the hardware; the computer system is another
// provider's class, fetched back through the broker's up-calls, so every
// answer that needs it re-enters the object manager on this thread.
//
// The handlers follow the association frame of PackageInSlotProvider.cpp,
// except that a source of a class without a target answers an empty, good
// Associators, and the computer-system side is walked as an enumeration.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerUnitaryComputerSystemPackage = "Korvane.UnitaryComputerSystemPackage";
const char* const cspkgClass = "TVRHX_UnitaryComputerSystemPackage";
const char* const csClass = "TVRHX_ComputerSystem";
const char* const chassisClass = "TVRHX_Chassis";
const char* const cspkgProvider = "UnitaryComputerSystemPackage";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// The base classes a client may name as result class instead of the far
// class itself.
const char* const csBaseClass = "CIM_ComputerSystem";
const char* const chassisBaseClass = "CIM_Chassis";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

bool resultClassAllows(const char* resultClass, const char* elementClass, const char* baseClass) {
  return !resultClass || sameClass(resultClass, elementClass) || sameClass(resultClass, baseClass);
}

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

// The up-calls for the computer systems. With no broker there is no object
// manager to ask: the call fails as a failed up-call does.
CMPIEnumeration* enumerateNames(const CMPIContext* ctx, const CMPIObjectPath* path, CMPIStatus* rc) {
  if (!broker) {
    *rc = CMPIStatus{CMPI_RC_ERR_FAILED, nullptr};
    return nullptr;
  }
  return CBEnumInstanceNames(broker, ctx, path, rc);
}

CMPIEnumeration* enumerateInstances(const CMPIContext* ctx, const CMPIObjectPath* path, CMPIStatus* rc) {
  if (!broker) {
    *rc = CMPIStatus{CMPI_RC_ERR_FAILED, nullptr};
    return nullptr;
  }
  return CBEnumInstances(broker, ctx, path, nullptr, rc);
}

// An enumeration the broker could not make has nothing in it.
bool hasNext(const CMPIEnumeration* enumeration, CMPIStatus* rc) {
  return !CMIsNullObject(enumeration) && CMHasNext(enumeration, rc);
}

// Sets a reference property; an instance the broker could not make takes
// nothing.
void setReference(CMPIInstance* instance, const char* name, const CMPIObjectPath* path) {
  if (!CMIsNullObject(instance)) CMSetProperty(instance, name, &path, CMPI_ref);
}

// The messages keep the runs of blanks they have always had.
const char* const builderNullPathMessage = "CMPIObjectPath is                      NULL for Chassis";
const char* const namesNullPathMessage = "CMPIObjectPath is                                NULL for Chassis";

} // namespace

CMPIStatus UnitaryComputerSystemPackage_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus UnitaryComputerSystemPackage_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus UnitaryComputerSystemPackage_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                       const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus UnitaryComputerSystemPackage_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                       const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus UnitaryComputerSystemPackage_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                       const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus UnitaryComputerSystemPackage_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus UnitaryComputerSystemPackage_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                    const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                    const char* assocClass, const char* resultClass,
                                                    const char* role, const char* resultRole,
                                                    const char** properties) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  // A source this association does not know is no failure here.
  if (CMIsNullObject(target)) return CMPIStatus{CMPI_RC_OK, nullptr};
  const char* targetClass = charPtr(target->ft->getClassName(target, &status), &status);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* systems = enumerateInstances(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMReturnInstance(rslt, system.value.inst);
    }
  } else if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    std::vector<CMPIInstance*> chassis;
    if (getAllChassisInstances(broker, ctx, cop, properties, chassis, &status) != 0) {
      freeList(chassis);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, chassis.at(index));
    freeList(chassis);
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  return status;
}

CMPIStatus UnitaryComputerSystemPackage_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                        const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                        const char* assocClass, const char* resultClass,
                                                        const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) return CMPIStatus{CMPI_RC_OK, nullptr};
  const char* targetClass = charPtr(target->ft->getClassName(target, &status), &status);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMReturnObjectPath(rslt, system.value.ref);
    }
  } else if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    std::vector<CMPIObjectPath*> chassis;
    if (getAllChassisCOP(broker, ctx, cop, chassis, &status) != 0) {
      brokerTrace(broker, physicalAssetProvider, "*** Can't get Chassis COPs, Exiting EnumerateInstanceNames***");
      freeList(chassis);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* path = chassis.at(index);
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMReturnObjectPath(rslt, path);
    }
    freeList(chassis);
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  return status;
}

CMPIStatus UnitaryComputerSystemPackage_References(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                   const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                   const char* resultClass, const char* role,
                                                   const char** properties) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> chassis;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, cspkgClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), cspkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in References.");
    brokerTrace(broker, cspkgProvider, "Object Path is NULL in References.");
    freeList(chassis);
    return status;
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), &status);
  if (sameClass(targetClass, chassisClass)) {
    // From a computer system: one association for each chassis. Only the
    // chassis paths are needed, so no chassis instance is made.
    if (getAllChassisCOP(broker, ctx, cop, chassis, &status) != 0) {
      brokerTrace(broker, physicalAssetProvider, "*** Can't get Chassis COPs, Exiting EnumerateInstanceNames***");
      freeList(chassis);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      CMPIObjectPath* path = chassis.at(index);
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      setReference(association, "Dependent", cop);
      setReference(association, "Antecedent", path);
      CMReturnInstance(rslt, association);
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(chassis);
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      setReference(association, "Dependent", system.value.ref);
      setReference(association, "Antecedent", cop);
      CMReturnInstance(rslt, association);
    }
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                << " properties=" << properties);
  freeList(chassis);
  return status;
}

namespace {

// The path a ReferenceNames answer gives for an association: the
// instance's own path, in the source's namespace, with no host name set.
CMPIObjectPath* associationName(CMPIInstance* association, const CMPIObjectPath* cop, CMPIStatus* status) {
  CMPIObjectPath* name = CMIsNullObject(association) ? nullptr : CMGetObjectPath(association, status);
  if (name) name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
  return name;
}

} // namespace

CMPIStatus UnitaryComputerSystemPackage_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                       const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                       const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> chassis;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, cspkgClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), cspkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in ReferenceNames.");
    brokerTrace(broker, cspkgProvider, "Object Path is NULL in ReferenceNames.");
    freeList(chassis);
    return status;
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), &status);
  if (sameClass(targetClass, chassisClass)) {
    if (getAllChassisCOP(broker, ctx, cop, chassis, &status) != 0) {
      brokerTrace(broker, physicalAssetProvider, "*** Can't get Chassis COPs, Exiting EnumerateInstanceNames***");
      freeList(chassis);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      CMPIObjectPath* path = chassis.at(index);
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      setReference(association, "Dependent", cop);
      setReference(association, "Antecedent", path);
      CMReturnObjectPath(rslt, associationName(association, cop, &status));
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(chassis);
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      setReference(association, "Dependent", system.value.ref);
      setReference(association, "Antecedent", cop);
      CMReturnObjectPath(rslt, associationName(association, cop, &status));
    }
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(chassis);
  return status;
}

/// Every UnitaryComputerSystemPackage association: each computer system the
/// object manager knows with each chassis, carrying the system's UUID when
/// the hardware reports one. The builder's own status is lost; its failures
/// reach the client as an empty answer.
unsigned short UnitaryComputerSystemPackageCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                         const CMPIContext* ctx,
                                                         std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* systemClassPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), csClass, &status);
  if (CMIsNullObject(systemClassPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, cspkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return 1;
  }
  CMPIEnumeration* systems = enumerateNames(ctx, systemClassPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                     "Call to CBEnumInstances of target Class Failed.");
    return 1;
  }
  while (hasNext(systems, &status)) {
    const CMPIObjectPath* system = CMGetNext(systems, &status).value.ref;
    std::vector<CMPIObjectPath*> chassis;
    if (getAllChassisCOP(broker, ctx, cop, chassis, &status) != 0) {
      brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      freeList(chassis);
      return 1;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    if (count == 0) {
      freeList(chassis);
      continue;
    }
    // The text names the chassis though the system's path is what failed.
    if (CMIsNullObject(system)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, builderNullPathMessage);
      brokerTrace(broker, cspkgProvider, "CMPIObjectPath is NULL for Chassis");
      freeList(chassis);
      return 1;
    }
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* package = chassis.at(index);
      if (CMIsNullObject(package)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, builderNullPathMessage);
        brokerTrace(broker, cspkgProvider, "CMPIObjectPath is NULL for Chassis");
        freeList(chassis);
        return 1;
      }
      package->ft->setNameSpace(package, nameSpaceOf(cop, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), cspkgClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for UnitaryComputerSystemPackage");
        brokerTrace(broker, cspkgProvider, "Create CMPIObjectPath failed for UnitaryComputerSystemPackage.");
        freeList(chassis);
        return 1;
      }
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMPIInstance* association = newInstance(broker, path, nullptr);
      setReference(association, "Dependent", system);
      setReference(association, "Antecedent", package);
      std::string uuid;
      if (getUnitaryComputerSystem_UUID(uuid) && !CMIsNullObject(association))
        CMSetProperty(association, "PlatformGUID", uuid.c_str(), CMPI_chars);
      instances.push_back(association);
    }
    freeList(chassis);
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus UnitaryComputerSystemPackage_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                          const CMPIResult* rslt, const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* systemClassPath = newObjectPath(broker, nameSpaceOf(ref, nullptr), csClass, &status);
  if (CMIsNullObject(systemClassPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, cspkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return status;
  }
  CMPIEnumeration* systems = enumerateNames(ctx, systemClassPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerUnitaryComputerSystemPackage, HX::kLevelFailure,
                     "Call to CBEnumInstances of target Class Failed.");
    return status;
  }
  while (hasNext(systems, &status)) {
    const CMPIObjectPath* system = CMGetNext(systems, &status).value.ref;
    std::vector<CMPIObjectPath*> chassis;
    if (getAllChassisCOP(broker, ctx, ref, chassis, &status) != 0) {
      brokerTrace(broker, physicalAssetProvider, "***Can't get Chassis COPs, Exiting EnumerateInstanceNames***");
      freeList(chassis);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chassis.size());
    if (count == 0) {
      freeList(chassis);
      continue;
    }
    if (CMIsNullObject(system)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, namesNullPathMessage);
      brokerTrace(broker, cspkgProvider, "CMPIObjectPath is NULL for Chassis");
      freeList(chassis);
      return status;
    }
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* package = chassis.at(index);
      if (CMIsNullObject(package)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, namesNullPathMessage);
        brokerTrace(broker, cspkgProvider, "CMPIObjectPath is NULL for Chassis");
        freeList(chassis);
        return status;
      }
      package->ft->setNameSpace(package, nameSpaceOf(ref, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), cspkgClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for UnitaryComputerSystemPackage.");
        brokerTrace(broker, cspkgProvider, "Create CMPIObjectPath failed for UnitaryComputerSystemPackage.");
        freeList(chassis);
        return status;
      }
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMAddKey(path, "Dependent", &system, CMPI_ref);
      CMAddKey(path, "Antecedent", &package, CMPI_ref);
      CMReturnObjectPath(rslt, path);
    }
    freeList(chassis);
  }
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  return status;
}

CMPIStatus UnitaryComputerSystemPackage_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                      const CMPIResult* rslt, const CMPIObjectPath* ref,
                                                      const char** properties) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                     << " ref=" << ref << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (UnitaryComputerSystemPackageCMPIInstances(ref, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                    << " ref=" << ref << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus UnitaryComputerSystemPackage_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                    const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                    const char** properties) {
  HX_TRACE_ENTER(loggerUnitaryComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                     << " cop=" << cop << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, cspkgProvider, "At least one key should be passed");
  } else if (UnitaryComputerSystemPackageCMPIInstances(cop, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      if (CMIsNullObject(association)) continue;
      if (HX::isObjPathsEqual(cop, CMGetObjectPath(association, nullptr), true)) {
        CMReturnInstance(rslt, association);
        break;
      }
    }
  }
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerUnitaryComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                    << " cop=" << cop << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(UnitaryComputerSystemPackage_, UnitaryComputerSystemPackageProvider, broker, CMNoHook)
CMAssociationMIStub(UnitaryComputerSystemPackage_, UnitaryComputerSystemPackageProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
