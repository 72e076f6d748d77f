// TVRHX_DiskControllerCSPackage: which computer system packages which disk
// controller. The hardware does not say; every storage controller node is
// paired with every TVRHX_ComputerSystem the object manager knows.
//
// The computer system is not a class of this library: its side is fetched
// back from the object manager by up-calls (enumerate instances or names),
// never read from the hardware. Associators from a computer system hands
// the source path to getAllDiskControllerInstances, which builds instances
// only for the classes it presents; a computer system is none of them, so
// that answer is empty while AssociatorNames lists every controller.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerDiskControllerCSPackage = "Korvane.DiskControllerCSPackage";
const char* const DiskPkgClass = "TVRHX_DiskControllerCSPackage";
const char* const csClass = "TVRHX_ComputerSystem";
const char* const DiskControllerClass = "TVRHX_DiskController";
const char* const diskPkgProvider = "AssociationProvider DiskController And ComputerSystem";

// The base-class names a client's result class may use for either end. A
// disk controller is accepted as a card.
const char* const csBaseClass = "CIM_ComputerSystem";
const char* const diskControllerBaseClass = "CIM_Card";

const char* const upCallFailed = "Call to CBEnumInstances of target Class Failed.";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString.
const char* classNameOf(const CMPIObjectPath* path) { return charPtr(path->ft->getClassName(path, nullptr), nullptr); }

// A client's result class narrows the answer to the far class or its base
// class; any other name leaves nothing to answer.
bool resultClassAllows(const char* resultClass, const char* elementClass, const char* baseClass) {
  return !resultClass || sameClass(resultClass, elementClass) || sameClass(resultClass, baseClass);
}

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

// The up-calls to the object manager. Without a broker there is nobody to
// ask, and the call fails as a refused up-call does.
CMPIEnumeration* enumComputerSystemNames(const CMPIContext* ctx, const CMPIObjectPath* path, CMPIStatus* status) {
  if (!broker) {
    *status = CMPIStatus{CMPI_RC_ERR_FAILED, nullptr};
    return nullptr;
  }
  return CBEnumInstanceNames(broker, ctx, path, status);
}

CMPIEnumeration* enumComputerSystems(const CMPIContext* ctx, const CMPIObjectPath* path, CMPIStatus* status) {
  if (!broker) {
    *status = CMPIStatus{CMPI_RC_ERR_FAILED, nullptr};
    return nullptr;
  }
  return CBEnumInstances(broker, ctx, path, nullptr, status);
}

// An enumeration the object manager handed back as a success; one that is
// missing has nothing more.
bool hasNext(const CMPIEnumeration* computerSystems, CMPIStatus* status) {
  return !CMIsNullObject(computerSystems) && CMHasNext(computerSystems, status);
}

} // namespace

CMPIStatus DiskControllerCSPackage_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus DiskControllerCSPackage_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus DiskControllerCSPackage_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskControllerCSPackage_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskControllerCSPackage_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                  const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskControllerCSPackage_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskControllerCSPackage_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                               const CMPIObjectPath* cop, const char* assocClass,
                                               const char* resultClass, const char* role, const char* resultRole,
                                               const char** properties) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  // No far class is no failure here: the answer is simply empty.
  if (CMIsNullObject(target)) return status;
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    // The request's property list does not reach the up-call.
    CMPIEnumeration* computerSystems = enumComputerSystems(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerDiskControllerCSPackage, HX::kLevelFailure, upCallFailed);
      return status;
    }
    while (hasNext(computerSystems, &status)) CMReturnInstance(rslt, CMGetNext(computerSystems, &status).value.inst);
  } else if (sameClass(targetClass, DiskControllerClass)) {
    if (!resultClassAllows(resultClass, DiskControllerClass, diskControllerBaseClass)) return status;
    std::vector<CMPIInstance*> instances;
    // Listed against the source path, whose class picks the presentation.
    if (getAllDiskControllerInstances(broker, ctx, cop, properties, instances, &status) != 0) {
      freeList(instances);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
    freeList(instances);
  }
  HX_TRACE_EXIT(loggerDiskControllerCSPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  return status;
}

CMPIStatus DiskControllerCSPackage_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                   const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                   const char* assocClass, const char* resultClass, const char* role,
                                                   const char* resultRole) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) return status;
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerDiskControllerCSPackage, HX::kLevelFailure, upCallFailed);
      return status;
    }
    while (hasNext(computerSystems, &status)) CMReturnObjectPath(rslt, CMGetNext(computerSystems, &status).value.ref);
  } else if (sameClass(targetClass, DiskControllerClass)) {
    if (!resultClassAllows(resultClass, DiskControllerClass, diskControllerBaseClass)) return status;
    std::vector<CMPIObjectPath*> paths;
    if (getAllDiskControllerCOP(broker, ctx, cop, paths, &status) != 0) {
      brokerTrace(broker, diskPkgProvider, "*** Can't get DiskController COPs, Exiting EnumerateInstanceNames***");
      freeList(paths);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(paths.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* path = paths.at(index);
      if (path) {
        path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
        path->ft->setHostname(path, HX::getSystemName().c_str());
      }
      CMReturnObjectPath(rslt, path);
    }
    freeList(paths);
  }
  HX_TRACE_EXIT(loggerDiskControllerCSPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  return status;
}

namespace {

// One association on `assocPath`: the computer system is the Dependent,
// the disk controller the Antecedent, set in that order.
CMPIInstance* newAssociation(CMPIObjectPath* assocPath, const CMPIObjectPath* computerSystem,
                             const CMPIObjectPath* diskController, CMPIStatus* status) {
  CMPIInstance* association = newInstance(broker, assocPath, status);
  if (!association) return nullptr;
  CMSetProperty(association, "Dependent", &computerSystem, CMPI_ref);
  CMSetProperty(association, "Antecedent", &diskController, CMPI_ref);
  return association;
}

/// How References and ReferenceNames hand an association out.
enum class Answer { Instances, Names };

// Hands out one association: the instance itself, or its path in the
// source's namespace (with no host name of its own).
void returnAssociation(const CMPIResult* rslt, Answer answer, CMPIInstance* association, const CMPIObjectPath* cop) {
  if (answer == Answer::Instances) {
    CMReturnInstance(rslt, association);
    return;
  }
  CMPIObjectPath* name = association ? CMGetObjectPath(association, nullptr) : nullptr;
  if (name) name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
  CMReturnObjectPath(rslt, name);
}

// What References and ReferenceNames share to the letter: both work on
// paths only, and differ in how they hand an association out. Returns false
// on a failure, which leaves out the exit trace.
bool answerReferences(const CMPIContext* ctx, const CMPIResult* rslt, const CMPIObjectPath* cop,
                      const CMPIObjectPath* target, CMPIObjectPath* assocPath, Answer answer, CMPIStatus* status) {
  std::vector<CMPIObjectPath*> paths;
  // One comparison decides the branch; the disk controller is tried first.
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, DiskControllerClass)) {
    if (getAllDiskControllerCOP(broker, ctx, cop, paths, status) != 0) {
      brokerTrace(broker, diskPkgProvider, "*** Can't get DiskController COPs, Exiting EnumerateInstanceNames***");
      freeList(paths);
      return false;
    }
    const unsigned short count = static_cast<unsigned short>(paths.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, status);
      CMPIObjectPath* diskController = paths.at(index);
      if (diskController) {
        diskController->ft->setNameSpace(diskController, nameSpaceOf(cop, nullptr));
        diskController->ft->setHostname(diskController, HX::getSystemName().c_str());
      }
      if (association) {
        CMSetProperty(association, "Dependent", &cop, CMPI_ref);
        CMSetProperty(association, "Antecedent", &diskController, CMPI_ref);
      }
      returnAssociation(rslt, answer, association, cop);
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, target, status);
    if (status->rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerDiskControllerCSPackage, HX::kLevelFailure, upCallFailed);
      freeList(paths);
      return false;
    }
    while (hasNext(computerSystems, status)) {
      const CMPIObjectPath* computerSystem = CMGetNext(computerSystems, status).value.ref;
      returnAssociation(rslt, answer, newAssociation(assocPath, computerSystem, cop, status), cop);
    }
  }
  freeList(paths);
  return true;
}

} // namespace

CMPIStatus DiskControllerCSPackage_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                              const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                              const char** properties) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                                << " resultClass=" << HX::traceText(resultClass)
                                                << " role=" << HX::traceText(role) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, DiskPkgClass, nullptr, &status);
  // The association path gets neither namespace nor host name again.
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), DiskPkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in References.");
    brokerTrace(broker, diskPkgProvider, "Object Path is NULL in References.");
    return status;
  }
  if (!answerReferences(ctx, rslt, cop, target, assocPath, Answer::Instances, &status)) return status;
  HX_TRACE_EXIT(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                               << " resultClass=" << HX::traceText(resultClass)
                                               << " role=" << HX::traceText(role) << " properties=" << properties);
  return status;
}

CMPIStatus DiskControllerCSPackage_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                  const CMPIObjectPath* cop, const char* resultClass,
                                                  const char* role) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                                << " resultClass=" << HX::traceText(resultClass)
                                                << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, DiskPkgClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), DiskPkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in ReferenceNames.");
    brokerTrace(broker, diskPkgProvider, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  if (!answerReferences(ctx, rslt, cop, target, assocPath, Answer::Names, &status)) return status;
  HX_TRACE_EXIT(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                               << " resultClass=" << HX::traceText(resultClass)
                                               << " role=" << HX::traceText(role));
  return status;
}

/// Every DiskControllerCSPackage association: each computer system the
/// object manager knows with each disk controller, PlatformGUID "0". The
/// builder's own status is lost; its failures reach the client as an empty
/// answer.
unsigned short DiskControllerCSPackageCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                    const CMPIContext* ctx, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* csPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), csClass, &status);
  if (CMIsNullObject(csPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, diskPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return 1;
  }
  CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, csPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerDiskControllerCSPackage, HX::kLevelFailure, upCallFailed);
    return 1;
  }
  while (hasNext(computerSystems, &status)) {
    const CMPIObjectPath* computerSystem = CMGetNext(computerSystems, &status).value.ref;
    std::vector<CMPIObjectPath*> diskControllers;
    if (getAllDiskControllerCOP(broker, ctx, cop, diskControllers, &status) != 0) {
      brokerTrace(broker, diskPkgProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      freeList(diskControllers);
      return 1;
    }
    const unsigned short count = static_cast<unsigned short>(diskControllers.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* diskController = diskControllers.at(index);
      if (CMIsNullObject(diskController)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for DiskController");
        brokerTrace(broker, diskPkgProvider, "CMPIObjectPath is NULL for DiskController");
        freeList(diskControllers);
        return 1;
      }
      diskController->ft->setNameSpace(diskController, nameSpaceOf(cop, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), DiskPkgClass, &status);
      if (CMIsNullObject(path)) {
        // The message lacks the full stop the trace has.
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for DiskControllerCSPackage");
        brokerTrace(broker, diskPkgProvider, "Create CMPIObjectPath failed for DiskControllerCSPackage.");
        freeList(diskControllers);
        return 1;
      }
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMPIInstance* association = newAssociation(path, computerSystem, diskController, nullptr);
      if (association) CMSetProperty(association, "PlatformGUID", "0", CMPI_chars);
      instances.push_back(association);
    }
    freeList(diskControllers);
  }
  HX_TRACE_EXIT(loggerDiskControllerCSPackage,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus DiskControllerCSPackage_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                     const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* csPath = newObjectPath(broker, nameSpaceOf(ref, nullptr), csClass, &status);
  if (CMIsNullObject(csPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, diskPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return status;
  }
  CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, csPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerDiskControllerCSPackage, HX::kLevelFailure, upCallFailed);
    return status;
  }
  while (hasNext(computerSystems, &status)) {
    CMPIObjectPath* computerSystem = CMGetNext(computerSystems, &status).value.ref;
    std::vector<CMPIObjectPath*> diskControllers;
    if (getAllDiskControllerCOP(broker, ctx, ref, diskControllers, &status) != 0) {
      brokerTrace(broker, diskPkgProvider, "***Can't get DiskController COPs, Exiting EnumerateInstanceNames***");
      freeList(diskControllers);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(diskControllers.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* diskController = diskControllers.at(index);
      if (CMIsNullObject(diskController)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for DiskController");
        brokerTrace(broker, diskPkgProvider, "CMPIObjectPath is NULL for DiskController");
        freeList(diskControllers);
        return status;
      }
      diskController->ft->setNameSpace(diskController, nameSpaceOf(ref, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), DiskPkgClass, &status);
      if (CMIsNullObject(path)) {
        // Here the message has the full stop too.
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for DiskControllerCSPackage.");
        brokerTrace(broker, diskPkgProvider, "Create CMPIObjectPath failed for DiskControllerCSPackage.");
        freeList(diskControllers);
        return status;
      }
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMAddKey(path, "Dependent", &computerSystem, CMPI_ref);
      CMAddKey(path, "Antecedent", &diskController, CMPI_ref);
      CMReturnObjectPath(rslt, path);
    }
    freeList(diskControllers);
  }
  // Done before the exit trace, the reverse of the frame.
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  return status;
}

CMPIStatus DiskControllerCSPackage_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                 const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                                << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (DiskControllerCSPackageCMPIInstances(ref, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                               << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus DiskControllerCSPackage_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                               const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                                << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, diskPkgProvider, "At least one key should be passed");
  } else if (DiskControllerCSPackageCMPIInstances(cop, properties, ctx, instances) == 0) {
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
  HX_TRACE_EXIT(loggerDiskControllerCSPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                               << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(DiskControllerCSPackage_, DiskControllerCSPackageProvider, broker, CMNoHook)
    CMAssociationMIStub(DiskControllerCSPackage_, DiskControllerCSPackageProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
