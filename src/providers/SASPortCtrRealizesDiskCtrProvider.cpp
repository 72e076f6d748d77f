// TVRHX_SASPortRealizesDisk: which SAS port controller realises which disk
// controller. Both are presentations of the same storage controller nodes,
// so the enumeration ties each node's SAS port controller (its DeviceID) to
// the disk controller of the same node (its Tag).
//
// The four association handlers do not apply that pairing: like the frame
// of PackageInSlot they answer with every element of the far class. Where
// the target lookup knows no far class they close with markProviderExit and
// answer OK, not with a failure.
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
const std::string loggerSASPortCtrRealizesDiskCtrProvider = "Korvane.SASPortCtrRealizesDiskCtrProvider";
const char* const sasPortRealizesDiskClass = "TVRHX_SASPortRealizesDisk";
const char* const DiskControllerClass = "TVRHX_DiskController";
const char* const SASPortControllerClass = "TVRHX_SASPortController";
const char* const SASPortRealizesDiskDriveProvider = "SASPortController Realizes DiskDriveControllerProvider";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString.
const char* classNameOf(const CMPIObjectPath* path) { return charPtr(path->ft->getClassName(path, nullptr), nullptr); }

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

const CMPIStatus okStatus = {CMPI_RC_OK, nullptr};

} // namespace

CMPIStatus SASPortRealizesDisk_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus SASPortRealizesDisk_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus SASPortRealizesDisk_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortRealizesDisk_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortRealizesDisk_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                              const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortRealizesDisk_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                         const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortRealizesDisk_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                           const char* role, const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                 << " properties=" << properties);
  CMPIStatus local = okStatus;
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerSASPortCtrRealizesDiskCtrProvider);
    freeList(instances);
    return okStatus;
  }
  // The result class has done its part in the lookup; it narrows nothing here.
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, DiskControllerClass))
    failed = getAllDiskControllerInstances(broker, ctx, cop, properties, instances, &local);
  else if (sameClass(targetClass, SASPortControllerClass))
    failed = getAllSASPortControllerInstances(broker, ctx, cop, properties, instances, &local);
  if (failed != 0) {
    freeList(instances);
    return local;
  }
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return local;
}

CMPIStatus SASPortRealizesDisk_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                               const CMPIObjectPath* cop, const char* assocClass,
                                               const char* resultClass, const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                 << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus local = okStatus;
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerSASPortCtrRealizesDiskCtrProvider);
    freeList(paths);
    return okStatus;
  }
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, DiskControllerClass))
    failed = getAllDiskControllerCOP(broker, ctx, cop, paths, &local);
  else if (sameClass(targetClass, SASPortControllerClass))
    failed = getAllSASPortControllerCOP(broker, ctx, cop, paths, &local);
  if (failed != 0) {
    freeList(paths);
    return local;
  }
  // The paths go out as the lists made them.
  const unsigned short count = static_cast<unsigned short>(paths.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnObjectPath(rslt, paths.at(index));
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
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
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), sasPortRealizesDiskClass, status);
  if (assocPath) {
    assocPath->ft->setNameSpace(assocPath, nameSpaceOf(cop, nullptr));
    assocPath->ft->setHostname(assocPath, HX::getSystemName().c_str());
  }
  return assocPath;
}

// One association between the source `cop` and a far element. The disk
// controller end is the Antecedent, the SAS port end the Dependent; the
// Antecedent is set first either way.
CMPIInstance* newAssociation(CMPIObjectPath* assocPath, const CMPIObjectPath* target, const CMPIObjectPath* cop,
                             const CMPIObjectPath* far, CMPIStatus* status) {
  CMPIInstance* association = newInstance(broker, assocPath, status);
  if (!association) return nullptr;
  if (sameClass(classNameOf(target), DiskControllerClass)) {
    CMSetProperty(association, "Antecedent", &far, CMPI_ref);
    CMSetProperty(association, "Dependent", &cop, CMPI_ref);
  } else if (sameClass(classNameOf(target), SASPortControllerClass)) {
    CMSetProperty(association, "Antecedent", &cop, CMPI_ref);
    CMSetProperty(association, "Dependent", &far, CMPI_ref);
  }
  return association;
}

} // namespace

CMPIStatus SASPortRealizesDisk_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                          const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                          const char** properties) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop << " resultClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role) << " properties=" << properties);
  CMPIStatus local = okStatus;
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, sasPortRealizesDiskClass, nullptr, &local);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerSASPortCtrRealizesDiskCtrProvider);
    freeList(instances);
    return okStatus;
  }
  // The far elements are listed against the target path, not the source.
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), DiskControllerClass))
    failed = getAllDiskControllerInstances(broker, ctx, target, properties, instances, &local);
  else if (sameClass(classNameOf(target), SASPortControllerClass))
    failed = getAllSASPortControllerInstances(broker, ctx, target, properties, instances, &local);
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
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop << " resultClass="
                << HX::traceText(resultClass) << " role=" << HX::traceText(role) << " properties=" << properties);
  freeList(instances);
  return local;
}

CMPIStatus SASPortRealizesDisk_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                              const CMPIObjectPath* cop, const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus local = okStatus;
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, sasPortRealizesDiskClass, nullptr, &local);
  CMPIObjectPath* assocPath = newAssociationPath(cop, &local);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerSASPortCtrRealizesDiskCtrProvider);
    freeList(paths);
    return okStatus;
  }
  unsigned short failed = 0;
  if (sameClass(classNameOf(target), DiskControllerClass))
    failed = getAllDiskControllerCOP(broker, ctx, cop, paths, &local);
  else if (sameClass(classNameOf(target), SASPortControllerClass))
    failed = getAllSASPortControllerCOP(broker, ctx, cop, paths, &local);
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
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(paths);
  return local;
}

namespace {

/// The paths of both ends of the class, read once per request: the disk
/// controllers and the SAS port controllers of every storage node.
struct ControllerPaths {
  std::vector<CMPIObjectPath*> diskControllers;
  std::vector<CMPIObjectPath*> sasPorts;

  void free() {
    freeList(diskControllers);
    freeList(sasPorts);
  }
};

// The text of a string key, or nothing when the path has no such key; a
// missing key matches no other.
std::optional<std::string> keyValue(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  const char* text = keyText(path, name, status, nullptr);
  if (!text) return std::nullopt;
  return std::string(text);
}

/// Walks every SAS port (outside) against every disk controller (inside)
/// and hands each pair whose DeviceID equals the Tag to `onPair`, which
/// returns false to stop the walk. Returns false when the walk stopped
/// early; failures set `status`.
template <class OnPair>
bool walkMatchingPairs(const CMPIContext* ctx, const CMPIObjectPath* ref, CMPIStatus* status, ControllerPaths& lists,
                       OnPair onPair) {
  if (getAllDiskControllerCOP(broker, ctx, ref, lists.diskControllers, status) != 0 ||
      getAllSASPortControllerCOP(broker, ctx, ref, lists.sasPorts, status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    return false;
  }
  const unsigned short portCount = static_cast<unsigned short>(lists.sasPorts.size());
  for (unsigned short portIndex = 0; portIndex < portCount; ++portIndex) {
    CMPIObjectPath* sasPort = lists.sasPorts.at(portIndex);
    if (CMIsNullObject(sasPort)) {
      setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for SASPort");
      brokerTrace(broker, SASPortRealizesDiskDriveProvider, "CMPIObjectPath is NULL for SASPort");
      return false;
    }
    const std::optional<std::string> deviceID = keyValue(sasPort, "DeviceID", status);
    const unsigned short diskCount = static_cast<unsigned short>(lists.diskControllers.size());
    for (unsigned short diskIndex = 0; diskIndex < diskCount; ++diskIndex) {
      CMPIObjectPath* diskController = lists.diskControllers.at(diskIndex);
      if (CMIsNullObject(diskController)) {
        setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL");
        brokerTrace(broker, SASPortRealizesDiskDriveProvider, "CMPIObjectPath is NULL");
        return false;
      }
      const std::optional<std::string> tag = keyValue(diskController, "Tag", status);
      if (!deviceID || !tag || *deviceID != *tag) continue;
      if (!onPair(sasPort, diskController)) return false;
    }
  }
  return true;
}

// The path of a new association in the namespace of `ref`, with this
// system's host name; null, with the failure set on `status`, when the
// broker makes none.
CMPIObjectPath* newPairPath(const CMPIObjectPath* ref, CMPIStatus* status) {
  CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), sasPortRealizesDiskClass, status);
  if (CMIsNullObject(path)) {
    // The message lacks the full stop the trace has.
    setStatusWithChars(broker, status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed for SASPortRealizesDisk");
    brokerTrace(broker, SASPortRealizesDiskDriveProvider, "Create CMPIObjectPath failed for SASPortRealizesDisk.");
    return nullptr;
  }
  path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
  path->ft->setHostname(path, HX::getSystemName().c_str());
  return path;
}

} // namespace

/// Every SASPortRealizesDisk association: each node's SAS port controller
/// with the disk controller of the same node. The builder's own status is
/// lost; its failures reach the client as an empty answer.
unsigned short SASPortRealizesDiskCMPIInstances(const CMPIObjectPath* cop, const CMPIContext* ctx,
                                                const char** properties, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus local = okStatus;
  ControllerPaths lists;
  const bool completed = walkMatchingPairs(ctx, cop, &local, lists, [&](CMPIObjectPath* sasPort, CMPIObjectPath* disk) {
    CMPIObjectPath* path = newPairPath(cop, &local);
    if (!path) return false;
    CMPIInstance* association = newInstance(broker, path, nullptr);
    if (!CMIsNullObject(association)) {
      CMSetProperty(association, "Dependent", &sasPort, CMPI_ref);
      CMSetProperty(association, "Antecedent", &disk, CMPI_ref);
    }
    instances.push_back(association);
    return true;
  });
  lists.free();
  if (!completed) return 1;
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus SASPortRealizesDisk_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                 const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = okStatus;
  ControllerPaths lists;
  const bool completed =
      walkMatchingPairs(ctx, ref, &status, lists, [&](CMPIObjectPath* sasPort, CMPIObjectPath* disk) {
        CMPIObjectPath* path = newPairPath(ref, &status);
        if (!path) return false;
        CMAddKey(path, "Dependent", &sasPort, CMPI_ref);
        CMAddKey(path, "Antecedent", &disk, CMPI_ref);
        CMReturnObjectPath(rslt, path);
        return true;
      });
  if (!completed) {
    lists.free();
    return status;
  }
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  lists.free();
  return status;
}

CMPIStatus SASPortRealizesDisk_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                             const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                          << " ref=" << ref << " properties=" << properties);
  CMPIStatus status = okStatus;
  std::vector<CMPIInstance*> instances;
  if (SASPortRealizesDiskCMPIInstances(ref, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                         << " ref=" << ref << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus SASPortRealizesDisk_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerSASPortCtrRealizesDiskCtrProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                          << " cop=" << cop << " properties=" << properties);
  CMPIStatus status = okStatus;
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, SASPortRealizesDiskDriveProvider, "At least one key should be passed");
  } else if (SASPortRealizesDiskCMPIInstances(cop, ctx, properties, instances) == 0) {
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
  HX_TRACE_EXIT(loggerSASPortCtrRealizesDiskCtrProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                         << " cop=" << cop << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(SASPortRealizesDisk_, SASPortRealizesDiskProvider, broker, CMNoHook)
    CMAssociationMIStub(SASPortRealizesDisk_, SASPortRealizesDiskProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
