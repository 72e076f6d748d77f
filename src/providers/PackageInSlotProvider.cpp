// TVRHX_PackageInSlot: which package sits in which slot. The hardware does
// not say; every slot of the machine is paired with the first chassis.
//
// This module also lays down the association handler frame the other
// association providers follow: Associators and AssociatorNames ask the
// target lookup for the class at the far end and answer with that class's
// elements; References and ReferenceNames build an association instance for
// each of them, with the source at its own end. None of the four calls
// returnDone.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerPackageInSlotProvider = "Korvane.PackageInSlotProvider";
const char* const pkgInSlotClass = "TVRHX_PackageInSlot";
const char* const chassisClass = "TVRHX_Chassis";
const char* const slotClass = "TVRHX_Slot";
const char* const pkgInSlotProvider = "PackageInSlotProvider";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// The frame's parameters: the first element class, the chassis, is the
// association's Dependent; the second, the slot, its Antecedent.
const char* const chassisBaseClass = "CIM_Chassis";
const char* const slotBaseClass = "CIM_Slot";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString.
const char* classNameOf(const CMPIObjectPath* path) {
  return charPtr(path->ft->getClassName(path, nullptr), nullptr);
}

// A client's result class narrows the answer to the far class or its base
// class; any other name leaves nothing to answer.
bool resultClassAllows(const char* resultClass, const char* elementClass, const char* baseClass) {
  return !resultClass || sameClass(resultClass, elementClass) || sameClass(resultClass, baseClass);
}

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

} // namespace

CMPIStatus PackageInSlot_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus PackageInSlot_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus PackageInSlot_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus PackageInSlot_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus PackageInSlot_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus PackageInSlot_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                   const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus PackageInSlot_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                     const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                     const char* role, const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in Associations.");
    brokerTrace(broker, pkgInSlotProvider, "Object Path is NULL in Associations.");
    return status;
  }
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getAllChassisInstances(broker, ctx, cop, properties, instances, &status);
  } else if (sameClass(targetClass, slotClass)) {
    if (!resultClassAllows(resultClass, slotClass, slotBaseClass)) return status;
    failed = getAllSlotInstances(broker, ctx, cop, properties, instances, &status);
  }
  if (failed != 0) return status;
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerPackageInSlotProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMPIStatus PackageInSlot_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                         const CMPIObjectPath* cop, const char* assocClass,
                                         const char* resultClass, const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in Associations.");
    brokerTrace(broker, pkgInSlotProvider, "Object Path is NULL in Associations.");
    return status;
  }
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getAllChassisCOP(broker, ctx, cop, paths, &status);
  } else if (sameClass(targetClass, slotClass)) {
    if (!resultClassAllows(resultClass, slotClass, slotBaseClass)) return status;
    failed = getAllSlotCOP(broker, ctx, cop, paths, &status);
  }
  if (failed != 0) return status;
  const unsigned short count = static_cast<unsigned short>(paths.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnObjectPath(rslt, paths.at(index));
  HX_TRACE_EXIT(loggerPackageInSlotProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  freeList(paths);
  return status;
}

namespace {

// The association path every References answer is built on: the class
// alone, in the source's namespace, with this system's host name.
CMPIObjectPath* newAssociationPath(const CMPIObjectPath* cop, CMPIStatus* status) {
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), pkgInSlotClass, status);
  if (assocPath) {
    assocPath->ft->setNameSpace(assocPath, nameSpaceOf(cop, nullptr));
    assocPath->ft->setHostname(assocPath, HX::getSystemName().c_str());
  }
  return assocPath;
}

// One association between the source `cop` and a far element: the chassis
// end is always Dependent, the slot end Antecedent.
CMPIInstance* newAssociation(CMPIObjectPath* assocPath, const CMPIObjectPath* target, const CMPIObjectPath* cop,
                             const CMPIObjectPath* far, CMPIStatus* status) {
  CMPIInstance* association = newInstance(broker, assocPath, status);
  if (!association) return nullptr;
  if (sameClass(classNameOf(target), chassisClass)) {
    CMSetProperty(association, "Dependent", &far, CMPI_ref);
    CMSetProperty(association, "Antecedent", &cop, CMPI_ref);
  } else if (sameClass(classNameOf(target), slotClass)) {
    CMSetProperty(association, "Dependent", &cop, CMPI_ref);
    CMSetProperty(association, "Antecedent", &far, CMPI_ref);
  }
  return association;
}

} // namespace

CMPIStatus PackageInSlot_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                    const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                    const char** properties) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, pkgInSlotClass, nullptr, &status);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in References.");
    brokerTrace(broker, pkgInSlotProvider, "Object Path is NULL in References.");
    freeList(instances);
    return status;
  }
  // The far elements are listed against the target path, not the source.
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), chassisClass))
    failed = getAllChassisInstances(broker, ctx, target, properties, instances, &status);
  else if (sameClass(classNameOf(target), slotClass))
    failed = getAllSlotInstances(broker, ctx, target, properties, instances, &status);
  if (failed != 0) {
    freeList(instances);
    return status;
  }
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* element = instances.at(index);
    const CMPIObjectPath* far = element ? CMGetObjectPath(element, nullptr) : nullptr;
    CMReturnInstance(rslt, newAssociation(assocPath, target, cop, far, &status));
  }
  HX_TRACE_EXIT(loggerPackageInSlotProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMPIStatus PackageInSlot_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                        const CMPIObjectPath* cop, const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, pkgInSlotClass, nullptr, &status);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in ReferenceNames.");
    brokerTrace(broker, pkgInSlotProvider, "Object Path is NULL in ReferenceNames.");
    freeList(paths);
    return status;
  }
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), chassisClass))
    failed = getAllChassisCOP(broker, ctx, cop, paths, &status);
  else if (sameClass(classNameOf(target), slotClass))
    failed = getAllSlotCOP(broker, ctx, cop, paths, &status);
  if (failed != 0) {
    freeList(paths);
    return status;
  }
  const unsigned short count = static_cast<unsigned short>(paths.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* association = newAssociation(assocPath, target, cop, paths.at(index), &status);
    CMPIObjectPath* name = association ? CMGetObjectPath(association, nullptr) : nullptr;
    if (name) {
      name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
      name->ft->setHostname(name, HX::getSystemName().c_str());
    }
    CMReturnObjectPath(rslt, name);
  }
  HX_TRACE_EXIT(loggerPackageInSlotProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(paths);
  return status;
}

/// Every PackageInSlot association: each slot with the first chassis. The
/// builder's own status is lost; its failures reach the client as an empty
/// answer.
unsigned short PackageInSlotCMPIInstances(const CMPIObjectPath* cop, const CMPIContext* ctx,
                                          const char** properties, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> chassisPaths;
  if (getAllChassisCOP(broker, ctx, cop, chassisPaths, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get COP, Exiting PackageInSlotCMPIInstances***");
    return 1;
  }
  // Only the first chassis is ever used; a machine without one has no
  // first chassis, and the checked access says so with an exception.
  CMPIObjectPath* chassis = chassisPaths.at(0);
  if (CMIsNullObject(chassis)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                       "CMPIObjectPath is                                NULL for Chassis");
    brokerTrace(broker, pkgInSlotProvider, "CMPIObjectPath is NULL for Chassis");
    return 1;
  }
  chassis->ft->setNameSpace(chassis, nameSpaceOf(cop, nullptr));
  std::vector<CMPIObjectPath*> slots;
  if (getAllSlotCOP(broker, ctx, cop, slots, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get COPs, Exiting PackageInSlotCMPIInstances***");
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(slots.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIObjectPath* slot = slots.at(index);
    if (CMIsNullObject(slot)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for Slot");
      brokerTrace(broker, pkgInSlotProvider, "CMPIObjectPath is NULL for Slot");
      return 1;
    }
    CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), pkgInSlotClass, &status);
    if (CMIsNullObject(path)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed for PackageInSlot");
      brokerTrace(broker, pkgInSlotProvider, "Create CMPIObjectPath failed for PackageInSlot.");
      return 1;
    }
    path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
    path->ft->setHostname(path, HX::getSystemName().c_str());
    CMPIInstance* association = newInstance(broker, path, nullptr);
    if (!CMIsNullObject(association)) {
      CMSetProperty(association, "Dependent", &chassis, CMPI_ref);
      CMSetProperty(association, "Antecedent", &slot, CMPI_ref);
    }
    instances.push_back(association);
  }
  HX_TRACE_EXIT(loggerPackageInSlotProvider,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus PackageInSlot_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> chassisPaths;
  if (getAllChassisCOP(broker, ctx, ref, chassisPaths, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisPaths);
    return status;
  }
  CMPIObjectPath* chassis = chassisPaths.at(0);
  if (CMIsNullObject(chassis)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                       "CMPIObjectPath is                              NULL for Chassis");
    brokerTrace(broker, pkgInSlotProvider, "CMPIObjectPath is NULL for Chassis");
    return status;
  }
  std::vector<CMPIObjectPath*> slots;
  if (getAllSlotCOP(broker, ctx, ref, slots, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisPaths);
    freeList(slots);
    return status;
  }
  const unsigned short count = static_cast<unsigned short>(slots.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIObjectPath* slot = slots.at(index);
    if (CMIsNullObject(slot)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for Slot");
      brokerTrace(broker, pkgInSlotProvider, "CMPIObjectPath is NULL for Slot");
      freeList(chassisPaths);
      freeList(slots);
      return status;
    }
    CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), pkgInSlotClass, &status);
    if (CMIsNullObject(path)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed for PackageInSlot");
      brokerTrace(broker, pkgInSlotProvider, "Create CMPIObjectPath failed for PackageInSlot.");
      freeList(chassisPaths);
      freeList(slots);
      return status;
    }
    path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
    path->ft->setHostname(path, HX::getSystemName().c_str());
    CMAddKey(path, "Antecedent", &slot, CMPI_ref);
    CMAddKey(path, "Dependent", &chassis, CMPI_ref);
    CMReturnObjectPath(rslt, path);
  }
  HX_TRACE_EXIT(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  freeList(chassisPaths);
  freeList(slots);
  return status;
}

CMPIStatus PackageInSlot_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                       const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                              << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (PackageInSlotCMPIInstances(ref, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                             << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus PackageInSlot_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                     const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                              << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, pkgInSlotProvider, "At least one key should be passed");
  } else if (PackageInSlotCMPIInstances(cop, ctx, properties, instances) == 0) {
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
  HX_TRACE_EXIT(loggerPackageInSlotProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                             << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(PackageInSlot_, PackageInSlotProvider, broker, CMNoHook)
CMAssociationMIStub(PackageInSlot_, PackageInSlotProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
