// TVRHX_ChipSystemPackaging: which computer system packages which IDE chip.
// The hardware does not say; the path of every storage controller node as a
// TVRHX_ChipIDECont (also of a node that has no chip instance) is paired
// with every TVRHX_ComputerSystem the object manager knows, which is
// fetched back by up-calls.
//
// The target lookup has no rule for this association: its own class finds
// no far class, so the four association handlers answer it with a failure.
// EnumInstanceNames, EnumInstances and GetInstance do not ask the lookup and
// serve the class.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerChipSystemPackaging = "Korvane.ChipSystemPackaging";
const char* const chipPackagingClass = "TVRHX_ChipSystemPackaging";
const char* const csClass = "TVRHX_ComputerSystem";
const char* const ideChipClass = "TVRHX_ChipIDECont";
const char* const chipPkgProvider = "AssociationProvider ChipIDECont And ComputerSystem";

// The base-class names a client's result class may use for either end.
const char* const csBaseClass = "CIM_ComputerSystem";
const char* const chipBaseClass = "CIM_Chip";

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

CMPIStatus ChipSystemPackaging_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus ChipSystemPackaging_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus ChipSystemPackaging_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ChipSystemPackaging_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ChipSystemPackaging_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ChipSystemPackaging_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                         const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ChipSystemPackaging_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                           const char* role, const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerChipSystemPackaging,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in Associators.");
    brokerTrace(broker, chipPkgProvider, "Object Path is NULL in Associators.");
    return status;
  }
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    // The request's property list does not reach the up-call.
    CMPIEnumeration* computerSystems = enumComputerSystems(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerChipSystemPackaging, HX::kLevelFailure, upCallFailed);
      return status;
    }
    while (hasNext(computerSystems, &status)) CMReturnInstance(rslt, CMGetNext(computerSystems, &status).value.inst);
  } else if (sameClass(targetClass, ideChipClass)) {
    if (!resultClassAllows(resultClass, ideChipClass, chipBaseClass)) return status;
    std::vector<CMPIInstance*> instances;
    if (getAllIDEChipControllerInstances(broker, ctx, cop, properties, instances, &status) != 0) {
      freeList(instances);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
    freeList(instances);
  }
  HX_TRACE_EXIT(loggerChipSystemPackaging,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  return status;
}

CMPIStatus ChipSystemPackaging_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                               const CMPIObjectPath* cop, const char* assocClass,
                                               const char* resultClass, const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerChipSystemPackaging,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in AssociatorNames.");
    brokerTrace(broker, chipPkgProvider, "Object Path is NULL in AssociatorNames.");
    return status;
  }
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerChipSystemPackaging, HX::kLevelFailure, upCallFailed);
      return status;
    }
    while (hasNext(computerSystems, &status)) CMReturnObjectPath(rslt, CMGetNext(computerSystems, &status).value.ref);
  } else if (sameClass(targetClass, ideChipClass)) {
    if (!resultClassAllows(resultClass, ideChipClass, chipBaseClass)) return status;
    std::vector<CMPIObjectPath*> paths;
    if (getAllIDEChipCOP(broker, ctx, cop, paths, &status) != 0) {
      brokerTrace(broker, chipPkgProvider, "*** Can't get IDEChip COPs, Exiting EnumerateInstanceNames***");
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
  HX_TRACE_EXIT(loggerChipSystemPackaging,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  return status;
}

namespace {

// One association on `assocPath`: the computer system is the Dependent,
// the chip the Antecedent, set in that order.
CMPIInstance* newAssociation(CMPIObjectPath* assocPath, const CMPIObjectPath* computerSystem,
                             const CMPIObjectPath* chip, CMPIStatus* status) {
  CMPIInstance* association = newInstance(broker, assocPath, status);
  if (!association) return nullptr;
  CMSetProperty(association, "Dependent", &computerSystem, CMPI_ref);
  CMSetProperty(association, "Antecedent", &chip, CMPI_ref);
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

// What References and ReferenceNames share: both work on paths only, and
// differ in how they hand an association out and in the text that reports
// a failed chip list. Returns false on a failure, which leaves out the exit
// trace.
bool answerReferences(const CMPIContext* ctx, const CMPIResult* rslt, const CMPIObjectPath* cop,
                      const CMPIObjectPath* target, CMPIObjectPath* assocPath, Answer answer,
                      const char* chipListFailed, CMPIStatus* status) {
  std::vector<CMPIObjectPath*> paths;
  // One comparison decides the branch; the chip is tried first.
  const char* targetClass = classNameOf(target);
  if (sameClass(targetClass, ideChipClass)) {
    if (getAllIDEChipCOP(broker, ctx, cop, paths, status) != 0) {
      brokerTrace(broker, chipPkgProvider, chipListFailed);
      freeList(paths);
      return false;
    }
    const unsigned short count = static_cast<unsigned short>(paths.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, status);
      CMPIObjectPath* chip = paths.at(index);
      if (chip) {
        chip->ft->setNameSpace(chip, nameSpaceOf(cop, nullptr));
        chip->ft->setHostname(chip, HX::getSystemName().c_str());
      }
      if (association) {
        CMSetProperty(association, "Dependent", &cop, CMPI_ref);
        CMSetProperty(association, "Antecedent", &chip, CMPI_ref);
      }
      returnAssociation(rslt, answer, association, cop);
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, target, status);
    if (status->rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerChipSystemPackaging, HX::kLevelFailure, upCallFailed);
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

CMPIStatus ChipSystemPackaging_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                          const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                          const char** properties) {
  HX_TRACE_ENTER(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                            << " resultClass=" << HX::traceText(resultClass)
                                            << " role=" << HX::traceText(role) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, chipPackagingClass, nullptr, &status);
  // The association path gets neither namespace nor host name again.
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), chipPackagingClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in References.");
    brokerTrace(broker, chipPkgProvider, "Object Path is NULL in References.");
    return status;
  }
  if (!answerReferences(ctx, rslt, cop, target, assocPath, Answer::Instances,
                        "*** Can't get IDEChip COPs, Exiting EnumerateInstanceNames***", &status))
    return status;
  HX_TRACE_EXIT(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                           << " resultClass=" << HX::traceText(resultClass)
                                           << " role=" << HX::traceText(role) << " properties=" << properties);
  return status;
}

CMPIStatus ChipSystemPackaging_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                              const CMPIObjectPath* cop, const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                            << " resultClass=" << HX::traceText(resultClass)
                                            << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, chipPackagingClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), chipPackagingClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in ReferenceNames.");
    brokerTrace(broker, chipPkgProvider, "Object Path is NULL in ReferenceNames.");
    return status;
  }
  // This handler's report of a failed chip list names the disk controller.
  if (!answerReferences(ctx, rslt, cop, target, assocPath, Answer::Names,
                        "*** Can't get DiskController COPs, Exiting EnumerateInstanceNames***", &status))
    return status;
  HX_TRACE_EXIT(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                                           << " resultClass=" << HX::traceText(resultClass)
                                           << " role=" << HX::traceText(role));
  return status;
}

/// Every ChipSystemPackaging association: each computer system the object
/// manager knows with each chip path. The builder's own status is lost; its
/// failures reach the client as an empty answer.
unsigned short ChipSystemPackagingCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                const CMPIContext* ctx, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerChipSystemPackaging,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* csPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), csClass, &status);
  if (CMIsNullObject(csPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, chipPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return 1;
  }
  CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, csPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerChipSystemPackaging, HX::kLevelFailure, upCallFailed);
    return 1;
  }
  while (hasNext(computerSystems, &status)) {
    const CMPIObjectPath* computerSystem = CMGetNext(computerSystems, &status).value.ref;
    std::vector<CMPIObjectPath*> chips;
    if (getAllIDEChipCOP(broker, ctx, cop, chips, &status) != 0) {
      brokerTrace(broker, chipPkgProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      freeList(chips);
      return 1;
    }
    const unsigned short count = static_cast<unsigned short>(chips.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* chip = chips.at(index);
      if (CMIsNullObject(chip)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for IDEChipCont");
        brokerTrace(broker, chipPkgProvider, "CMPIObjectPath is NULL for IDEChipCont");
        freeList(chips);
        return 1;
      }
      chip->ft->setNameSpace(chip, nameSpaceOf(cop, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), chipPackagingClass, &status);
      if (CMIsNullObject(path)) {
        // The message lacks the full stop the trace has.
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed for ChipSystemPackaging");
        brokerTrace(broker, chipPkgProvider, "Create CMPIObjectPath failed for ChipSystemPackaging.");
        freeList(chips);
        return 1;
      }
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      instances.push_back(newAssociation(path, computerSystem, chip, nullptr));
    }
    freeList(chips);
  }
  HX_TRACE_EXIT(loggerChipSystemPackaging,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus ChipSystemPackaging_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                 const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* csPath = newObjectPath(broker, nameSpaceOf(ref, nullptr), csClass, &status);
  if (CMIsNullObject(csPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, chipPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return status;
  }
  CMPIEnumeration* computerSystems = enumComputerSystemNames(ctx, csPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerChipSystemPackaging, HX::kLevelFailure, upCallFailed);
    return status;
  }
  while (hasNext(computerSystems, &status)) {
    CMPIObjectPath* computerSystem = CMGetNext(computerSystems, &status).value.ref;
    std::vector<CMPIObjectPath*> chips;
    if (getAllIDEChipCOP(broker, ctx, ref, chips, &status) != 0) {
      brokerTrace(broker, chipPkgProvider, "***Can't get ChipIDECont COPs, Exiting EnumerateInstanceNames***");
      freeList(chips);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(chips.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* chip = chips.at(index);
      if (CMIsNullObject(chip)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for ChipIDECont");
        brokerTrace(broker, chipPkgProvider, "CMPIObjectPath is NULL for ChipIDECont");
        freeList(chips);
        return status;
      }
      chip->ft->setNameSpace(chip, nameSpaceOf(ref, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), chipPackagingClass, &status);
      if (CMIsNullObject(path)) {
        // Here the message has the full stop too.
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for ChipSystemPackaging.");
        brokerTrace(broker, chipPkgProvider, "Create CMPIObjectPath failed for ChipSystemPackaging.");
        freeList(chips);
        return status;
      }
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMAddKey(path, "Dependent", &computerSystem, CMPI_ref);
      CMAddKey(path, "Antecedent", &chip, CMPI_ref);
      CMReturnObjectPath(rslt, path);
    }
    freeList(chips);
  }
  // Done before the exit trace, the reverse of the frame.
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  return status;
}

CMPIStatus ChipSystemPackaging_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                             const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                            << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (ChipSystemPackagingCMPIInstances(ref, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                           << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus ChipSystemPackaging_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                            << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, chipPkgProvider, "At least one key should be passed");
  } else if (ChipSystemPackagingCMPIInstances(cop, properties, ctx, instances) == 0) {
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
  HX_TRACE_EXIT(loggerChipSystemPackaging, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                           << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(ChipSystemPackaging_, ChipSystemPackagingProvider, broker, CMNoHook)
    CMAssociationMIStub(ChipSystemPackaging_, ChipSystemPackagingProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
