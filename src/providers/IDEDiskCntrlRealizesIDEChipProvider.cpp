// TVRHX_ICRealizesChip: which IDE chip realises which IDE controller. Both
// are presentations of the same storage controller nodes, so a chip and a
// controller belong together when the chip's Tag and the controller's
// DeviceID hold the same path text. Every chip is compared with every
// controller, and a chip pairs with each controller of its text.
//
// The target lookup has no rule for this association, nor one that leads to
// either IDE class, so the four association handlers find no target for
// their own class and close with markProviderExit and OK. The pairing is
// seen through EnumInstanceNames, EnumInstances and GetInstance. The
// association handlers work on a local status and hand it out only at the
// end.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

#include <optional>
#include <string>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerIDEDiskCntrlRealizesIDEChipProvider = "Korvane.IDEDiskCntrlRealizesIDEChipProvider";
const char* const icChipRealizesClass = "TVRHX_ICRealizesChip";
const char* const ideChipClass = "TVRHX_ChipIDECont";
const char* const ideDiskClass = "TVRHX_IDEController";
const char* const IDEDiskRealizesIDEChipProvider = "IDE Disk Controller Realizes IDE Chip Controller Provider";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString.
const char* classNameOf(const CMPIObjectPath* path) { return charPtr(path->ft->getClassName(path, nullptr), nullptr); }

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

const CMPIStatus okStatus = {CMPI_RC_OK, nullptr};

} // namespace

CMPIStatus IDEDiskRealizesIDEChipCtlr_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                     const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                     const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                     const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                  const CMPIObjectPath* cop, const char* assocClass,
                                                  const char* resultClass, const char* role, const char* resultRole,
                                                  const char** properties) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                 << " properties=" << properties);
  CMPIStatus local = okStatus;
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider);
    freeList(instances);
    return okStatus;
  }
  // No result class narrows the answer of this provider.
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, ideChipClass))
    failed = getAllIDEChipControllerInstances(broker, ctx, cop, properties, instances, &local);
  else if (sameClass(targetClass, ideDiskClass))
    failed = getAllIDEControllerInstances(broker, ctx, cop, properties, instances, &local);
  if (failed != 0) {
    freeList(instances);
    return local;
  }
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return local;
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                      const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                      const char* assocClass, const char* resultClass, const char* role,
                                                      const char* resultRole) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus local = okStatus;
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider);
    freeList(paths);
    return okStatus;
  }
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, ideChipClass))
    failed = getAllIDEChipCOP(broker, ctx, cop, paths, &local);
  else if (sameClass(targetClass, ideDiskClass))
    failed = getAllIDEDiskControllerCOP(broker, ctx, cop, paths, &local);
  if (failed != 0) {
    freeList(paths);
    return local;
  }
  // The paths go out as the lists made them.
  const unsigned short count = static_cast<unsigned short>(paths.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnObjectPath(rslt, paths.at(index));
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  freeList(paths);
  return local;
}

namespace {

// The association path every References answer is built on: the class
// alone, in the source's namespace, with this system's host name.
CMPIObjectPath* newAssociationPath(const CMPIObjectPath* cop, CMPIStatus* status) {
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), icChipRealizesClass, status);
  if (assocPath) {
    assocPath->ft->setNameSpace(assocPath, nameSpaceOf(cop, nullptr));
    assocPath->ft->setHostname(assocPath, HX::getSystemName().c_str());
  }
  return assocPath;
}

// One association between the source `cop` and a far element: the chip end
// is the Antecedent, the controller end the Dependent.
CMPIInstance* newAssociation(CMPIObjectPath* assocPath, const CMPIObjectPath* target, const CMPIObjectPath* cop,
                             const CMPIObjectPath* far, CMPIStatus* status) {
  CMPIInstance* association = newInstance(broker, assocPath, status);
  if (!association) return nullptr;
  if (sameClass(classNameOf(target), ideChipClass)) {
    CMSetProperty(association, "Antecedent", &far, CMPI_ref);
    CMSetProperty(association, "Dependent", &cop, CMPI_ref);
  } else if (sameClass(classNameOf(target), ideDiskClass)) {
    CMSetProperty(association, "Antecedent", &cop, CMPI_ref);
    CMSetProperty(association, "Dependent", &far, CMPI_ref);
  }
  return association;
}

} // namespace

CMPIStatus IDEDiskRealizesIDEChipCtlr_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                 const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                                 const char** properties) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop << " resultClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role) << " properties=" << properties);
  CMPIStatus local = okStatus;
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, icChipRealizesClass, nullptr, &local);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider);
    freeList(instances);
    return okStatus;
  }
  // The far elements are listed against the target path, not the source.
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), ideChipClass))
    failed = getAllIDEChipControllerInstances(broker, ctx, target, properties, instances, &local);
  else if (sameClass(classNameOf(target), ideDiskClass))
    failed = getAllIDEControllerInstances(broker, ctx, target, properties, instances, &local);
  if (failed != 0) {
    freeList(instances);
    return local;
  }
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* element = instances.at(index);
    const CMPIObjectPath* far = element ? CMGetObjectPath(element, nullptr) : nullptr;
    CMReturnInstance(rslt, newAssociation(assocPath, target, cop, far, &local));
  }
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop << " resultClass="
                << HX::traceText(resultClass) << " role=" << HX::traceText(role) << " properties=" << properties);
  freeList(instances);
  return local;
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                     const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                     const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus local = okStatus;
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, icChipRealizesClass, nullptr, &local);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider);
    freeList(paths);
    return okStatus;
  }
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), ideChipClass))
    failed = getAllIDEChipCOP(broker, ctx, cop, paths, &local);
  else if (sameClass(classNameOf(target), ideDiskClass))
    failed = getAllIDEDiskControllerCOP(broker, ctx, cop, paths, &local);
  if (failed != 0) {
    freeList(paths);
    return local;
  }
  const unsigned short count = static_cast<unsigned short>(paths.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* association = newAssociation(assocPath, target, cop, paths.at(index), &local);
    CMPIObjectPath* name = association ? CMGetObjectPath(association, nullptr) : nullptr;
    if (name) {
      name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
      name->ft->setHostname(name, HX::getSystemName().c_str());
    }
    CMReturnObjectPath(rslt, name);
  }
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(paths);
  return local;
}

namespace {

/// The paths of both ends of the class, read once per request.
struct ChipAndControllerPaths {
  std::vector<CMPIObjectPath*> chips;
  std::vector<CMPIObjectPath*> controllers;

  void free() {
    freeList(chips);
    freeList(controllers);
  }
};

// The text of a string key, or nothing when the path has no such key; a
// missing key matches no other.
std::optional<std::string> keyValue(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  const char* text = keyText(path, name, status, nullptr);
  if (!text) return std::nullopt;
  return std::string(text);
}

/// Walks every chip (outside) against every controller (inside) and hands
/// each pair whose Tag equals the DeviceID to `onPair`, which returns false
/// to stop the walk. The walk does not stop at a chip's first match.
/// Returns false when it stopped early; failures set `status`.
template <class OnPair>
bool walkMatchingPairs(const CMPIContext* ctx, const CMPIObjectPath* ref, CMPIStatus* status,
                       ChipAndControllerPaths& lists, OnPair onPair) {
  if (getAllIDEChipCOP(broker, ctx, ref, lists.chips, status) != 0 ||
      getAllIDEDiskControllerCOP(broker, ctx, ref, lists.controllers, status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    return false;
  }
  const unsigned short chipCount = static_cast<unsigned short>(lists.chips.size());
  for (unsigned short chipIndex = 0; chipIndex < chipCount; ++chipIndex) {
    CMPIObjectPath* chip = lists.chips.at(chipIndex);
    if (CMIsNullObject(chip)) {
      setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for ideChipCOP");
      brokerTrace(broker, IDEDiskRealizesIDEChipProvider, "CMPIObjectPath is NULL for ideChipCOP");
      return false;
    }
    const std::optional<std::string> tag = keyValue(chip, "Tag", status);
    const unsigned short controllerCount = static_cast<unsigned short>(lists.controllers.size());
    for (unsigned short controllerIndex = 0; controllerIndex < controllerCount; ++controllerIndex) {
      CMPIObjectPath* controller = lists.controllers.at(controllerIndex);
      if (CMIsNullObject(controller)) {
        setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL");
        brokerTrace(broker, IDEDiskRealizesIDEChipProvider, "CMPIObjectPath is NULL");
        return false;
      }
      const std::optional<std::string> deviceID = keyValue(controller, "DeviceID", status);
      if (!tag || !deviceID || *tag != *deviceID) continue;
      if (!onPair(chip, controller)) return false;
    }
  }
  return true;
}

// The path of a new association in the namespace of `ref`, with this
// system's host name; null, with the failure set on `status`, when the
// broker makes none.
CMPIObjectPath* newPairPath(const CMPIObjectPath* ref, CMPIStatus* status) {
  CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), icChipRealizesClass, status);
  if (CMIsNullObject(path)) {
    // The message lacks the full stop the trace has.
    setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed for icChipRealizesClass");
    brokerTrace(broker, IDEDiskRealizesIDEChipProvider, "Create CMPIObjectPath failed for icChipRealizesClass.");
    return nullptr;
  }
  path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
  path->ft->setHostname(path, HX::getSystemName().c_str());
  return path;
}

} // namespace

/// Every ICRealizesChip association: each chip with each controller of the
/// same path text. Unlike the other builders it answers with its status,
/// which both callers ignore; what it appended before a failure stays.
CMPIStatus IDEDiskRealizesIDEChipCtlrCMPIInstances(const CMPIObjectPath* cop, const CMPIContext* ctx,
                                                   const char** properties, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = okStatus;
  ChipAndControllerPaths lists;
  const bool completed =
      walkMatchingPairs(ctx, cop, &status, lists, [&](CMPIObjectPath* chip, CMPIObjectPath* controller) {
        CMPIObjectPath* path = newPairPath(cop, &status);
        if (!path) return false;
        CMPIInstance* association = newInstance(broker, path, nullptr);
        if (association) {
          CMSetProperty(association, "Antecedent", &chip, CMPI_ref);
          CMSetProperty(association, "Dependent", &controller, CMPI_ref);
        }
        instances.push_back(association);
        return true;
      });
  if (completed)
    HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                  << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  lists.free();
  return status;
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                        const CMPIResult* rslt, const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = okStatus;
  ChipAndControllerPaths lists;
  const bool completed =
      walkMatchingPairs(ctx, ref, &status, lists, [&](CMPIObjectPath* chip, CMPIObjectPath* controller) {
        CMPIObjectPath* path = newPairPath(ref, &status);
        if (!path) return false;
        // The reverse of the builder's order: the controller end first.
        CMAddKey(path, "Dependent", &controller, CMPI_ref);
        CMAddKey(path, "Antecedent", &chip, CMPI_ref);
        CMReturnObjectPath(rslt, path);
        return true;
      });
  if (!completed) {
    lists.free();
    return status;
  }
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  lists.free();
  return status;
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                    const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                            << " ref=" << ref << " properties=" << properties);
  CMPIStatus status = okStatus;
  std::vector<CMPIInstance*> instances;
  // A failed builder is not noticed: what it made before the failure goes out.
  IDEDiskRealizesIDEChipCtlrCMPIInstances(ref, ctx, properties, instances);
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                           << " ref=" << ref << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus IDEDiskRealizesIDEChipCtlr_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                  const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerIDEDiskCntrlRealizesIDEChipProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                            << " cop=" << cop << " properties=" << properties);
  CMPIStatus status = okStatus;
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, IDEDiskRealizesIDEChipProvider, "At least one key should be passed");
  } else {
    IDEDiskRealizesIDEChipCtlrCMPIInstances(cop, ctx, properties, instances);
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
  HX_TRACE_EXIT(loggerIDEDiskCntrlRealizesIDEChipProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                           << " cop=" << cop << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(IDEDiskRealizesIDEChipCtlr_, IDEDiskRealizesIDEChipCtlrProvider, broker, CMNoHook)
    CMAssociationMIStub(IDEDiskRealizesIDEChipCtlr_, IDEDiskRealizesIDEChipCtlrProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
