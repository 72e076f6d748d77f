// TVRHX_SlotOnChassis: on which chassis a slot stands. The slot's Tag
// decides: a Tag that carries an expansion marker ("PME", "PXU" or "PEN",
// case significant, anywhere in the Tag) belongs to an expansion chassis,
// ChassisPackageType 18; any other Tag to a main system chassis, 17. No
// chassis of another type carries slots.
//
// Associators and AssociatorNames run the association handler frame of
// PackageInSlotProvider.cpp with lookups of their own in place of the lists
// of all elements: getChassisforSlot and getSlotforChassis. They are
// stricter than the frame about the result class, which no name passes, and
// a missing target is no failure. References are refused.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerSlotOnChassisProvider = "Korvane.SlotOnChassisProvider";
const char* const SlotOnChassisClass = "TVRHX_SlotOnChassis";
const char* const chassisClass = "TVRHX_Chassis";
const char* const slotClass = "TVRHX_Slot";
const char* const slotOnChassisProvider = "SlotOnChassisProvider";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// The frame's parameters: the first element class, the chassis, is the
// association's GroupComponent; the second, the slot, its PartComponent.
const char* const chassisBaseClass = "CIM_Chassis";
const char* const slotBaseClass = "CIM_Slot";

const unsigned short mainSystemChassis = 17;
const unsigned short expansionChassis = 18;

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString. A missing path
// has no class.
const char* classNameOf(const CMPIObjectPath* path) {
  if (CMIsNullObject(path)) return nullptr;
  return charPtr(path->ft->getClassName(path, nullptr), nullptr);
}

// A result class is answered only if it names both the far class and its
// base class, which no single name does: only a request without a result
// class gets an answer.
bool resultClassAllows(const char* resultClass, const char* elementClass, const char* baseClass) {
  if (!resultClass) return true;
  if (strcasecmp(resultClass, elementClass) != 0) return false;
  if (strcasecmp(resultClass, baseClass) != 0) return false;
  return true;
}

bool hasExpansionMarker(const std::string& tag) {
  return tag.find("PME") != std::string::npos || tag.find("PXU") != std::string::npos ||
         tag.find("PEN") != std::string::npos;
}

// The pairing rule: plain tags on the main system chassis, tags with an
// expansion marker on the expansion chassis.
bool slotStandsOn(const std::string& slotTag, unsigned short chassisPackageType) {
  if (hasExpansionMarker(slotTag)) return chassisPackageType == expansionChassis;
  return chassisPackageType == mainSystemChassis;
}

bool isNull(const CMPIData& data) { return (data.state & CMPI_nullValue) != 0; }

// The text of a string value; empty for a null or absent value.
std::string textOf(const CMPIData& data) {
  if (data.state & (CMPI_nullValue | CMPI_notFound)) return std::string();
  const char* text = nullptr;
  if (data.type == CMPI_chars) text = data.value.chars;
  else if (data.type == CMPI_string) text = charPtr(data.value.string, nullptr);
  return text ? text : std::string();
}

std::string textOrEmpty(const char* text) { return text ? text : std::string(); }

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

} // namespace

/// The slots that stand on the chassis `cop` names, appended to `slots`: the
/// chassis's own ChassisPackageType is read from its instance, then every
/// slot's Tag is matched against it.
unsigned short getSlotforChassis(const CMPIObjectPath* cop, const CMPIContext* ctx, const char** properties,
                                 std::vector<CMPIInstance*>& slotsOfChassis) {
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  // Without a chassis instance to read, the chassis type stays 0, which
  // carries no slots.
  CMPIData packageType{};
  if (sameClass(classNameOf(cop), chassisClass)) {
    CMPIInstance* chassis = nullptr;
    if (getOneChassisInstance(broker, ctx, cop, properties, chassis, &status) != 0) return 1;
    if (!CMIsNullObject(chassis)) packageType = CMGetProperty(chassis, "ChassisPackageType", &status);
  }
  const unsigned short chassisType = isNull(packageType) ? 0 : packageType.value.uint16;

  // Every slot is looked at, whatever properties the client asked for.
  std::vector<CMPIInstance*> slots;
  if (getAllSlotInstances(broker, ctx, cop, nullptr, slots, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(slots);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(slots.size());
  if (count == 0) return 0;
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* slot = slots.at(index);
    if (CMIsNullObject(slot)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Slot");
      brokerTrace(broker, slotOnChassisProvider, "CMPIInstace is NULL for Slot");
      freeList(slots);
      return 1;
    }
    const std::string tag = textOf(CMGetProperty(slot, "Tag", &status));
    if (chassisType == mainSystemChassis && !hasExpansionMarker(tag)) slotsOfChassis.push_back(slot);
    if (chassisType == expansionChassis && hasExpansionMarker(tag)) slotsOfChassis.push_back(slot);
  }
  freeList(slots);
  return 0;
}

/// The chassis the slot `cop` names stands on, appended to `chassisOfSlot`:
/// every chassis of the slot's kind, in node order. The slot's Tag is taken
/// from the key of the path, so the slot need not exist. The property list
/// plays no part.
unsigned short getChassisforSlot(const CMPIObjectPath* cop, const CMPIContext* ctx, const char** /*properties*/,
                                 std::vector<CMPIInstance*>& chassisOfSlot) {
  if (CMIsNullObject(cop)) return 1;
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const std::string tag = textOrEmpty(keyText(cop, "Tag", &status, &status));
  // The class is read but the rule table has already chosen the far side.
  cop->ft->getClassName(cop, &status);

  std::vector<CMPIInstance*> chassisList;
  if (getAllChassisInstances(broker, ctx, cop, nullptr, chassisList, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(chassisList.size());
  if (count == 0) return 0;
  unsigned short chassisType = 0;
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* chassis = chassisList.at(index);
    if (CMIsNullObject(chassis)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Chassis");
      brokerTrace(broker, slotOnChassisProvider, "CMPIInstace is NULL for Chassis");
      freeList(chassisList);
      return 1;
    }
    // A chassis without a type keeps the type of the one before it.
    const CMPIData packageType = CMGetProperty(chassis, "ChassisPackageType", &status);
    if (!isNull(packageType)) chassisType = packageType.value.uint16;
    if (slotStandsOn(tag, chassisType)) chassisOfSlot.push_back(chassis);
  }
  freeList(chassisList);
  return 0;
}

CMPIStatus SlotOnChassis_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus SlotOnChassis_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus SlotOnChassis_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SlotOnChassis_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SlotOnChassis_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SlotOnChassis_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                   const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SlotOnChassis_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                     const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                     const char* role, const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A missing target is not reported: it has no class, so no far side is
  // looked up and the answer is empty.
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getChassisforSlot(cop, ctx, properties, instances);
  } else if (sameClass(targetClass, slotClass)) {
    if (!resultClassAllows(resultClass, slotClass, slotBaseClass)) return status;
    failed = getSlotforChassis(cop, ctx, properties, instances);
  }
  if (failed != 0) return status;
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerSlotOnChassisProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMPIStatus SlotOnChassis_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                         const CMPIObjectPath* cop, const char* assocClass,
                                         const char* resultClass, const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getChassisforSlot(cop, ctx, nullptr, instances);
  } else if (sameClass(targetClass, slotClass)) {
    if (!resultClassAllows(resultClass, slotClass, slotBaseClass)) return status;
    failed = getSlotforChassis(cop, ctx, nullptr, instances);
  }
  if (failed != 0) return status;
  // The names are the paths of the far instances; an instance without a
  // usable path is passed over.
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* element = instances.at(index);
    CMPIObjectPath* name = element ? CMGetObjectPath(element, &status) : nullptr;
    if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
  }
  HX_TRACE_EXIT(loggerSlotOnChassisProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  freeList(instances);
  return status;
}

// This class is answered from either end by Associators alone.
CMPIStatus SlotOnChassis_References(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*,
                                    const CMPIObjectPath*, const char*, const char*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SlotOnChassis_ReferenceNames(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

/// Every SlotOnChassis association: each slot with the first chassis of its
/// kind. A slot with no chassis of its kind gets none. The builder's own
/// status is lost; its failures reach the client as an empty answer.
unsigned short SlotOnChassisCMPIInstances(const CMPIObjectPath* ref, const CMPIContext* ctx,
                                          const char** properties, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider,
                 << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> chassisList;
  if (getAllChassisInstances(broker, ctx, ref, nullptr, chassisList, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    return 1;
  }
  std::vector<CMPIObjectPath*> slots;
  if (getAllSlotCOP(broker, ctx, ref, slots, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    freeList(slots);
    return 1;
  }
  const unsigned short slotCount = static_cast<unsigned short>(slots.size());
  if (slotCount == 0) {
    HX_TRACE_EXIT(loggerSlotOnChassisProvider, << " ref=" << ref << " properties=" << properties << " ctx=" << ctx
                                               << " instances=" << &instances);
    return 0;
  }
  for (unsigned short slotIndex = 0; slotIndex < slotCount; ++slotIndex) {
    CMPIObjectPath* slot = slots.at(slotIndex);
    CMPIObjectPath* chassis = nullptr;
    if (CMIsNullObject(slot)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for Slot");
      brokerTrace(broker, slotOnChassisProvider, "CMPIObjectPath is NULL for Slot");
      freeList(chassisList);
      freeList(slots);
      return 1;
    }
    std::string tag;
    if (CMGetKeyCount(slot, &status) != 0) tag = textOrEmpty(keyText(slot, "Tag", &status, &status));

    // A chassis that could not be made keeps the type of the one before it,
    // which did not match this slot; the first has type 0, which carries
    // no slots. So only a real chassis can match.
    CMPIData packageType{};
    const unsigned short chassisCount = static_cast<unsigned short>(chassisList.size());
    for (unsigned short chassisIndex = 0; chassisIndex < chassisCount; ++chassisIndex) {
      CMPIInstance* element = chassisList.at(chassisIndex);
      if (!CMIsNullObject(element)) packageType = CMGetProperty(element, "ChassisPackageType", &status);
      const unsigned short chassisType = isNull(packageType) ? 0 : packageType.value.uint16;
      if (slotStandsOn(tag, chassisType)) {
        chassis = element ? CMGetObjectPath(element, &status) : nullptr;
        break;
      }
    }
    if (CMIsNullObject(chassis)) continue;

    CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), SlotOnChassisClass, &status);
    if (path) {
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
    }
    // An association whose path could not be made is kept as a null one.
    CMPIInstance* association = path ? newInstance(broker, path, nullptr) : nullptr;
    if (!CMIsNullObject(association)) {
      CMSetProperty(association, "PartComponent", &slot, CMPI_ref);
      CMSetProperty(association, "GroupComponent", &chassis, CMPI_ref);
    }
    instances.push_back(association);
  }
  HX_TRACE_EXIT(loggerSlotOnChassisProvider,
                << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  freeList(chassisList);
  freeList(slots);
  return 0;
}

CMPIStatus SlotOnChassis_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                           const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // The names are the paths of the instances; an association that could not
  // be made has none.
  if (SlotOnChassisCMPIInstances(ref, ctx, nullptr, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      CMPIObjectPath* name = association ? CMGetObjectPath(association, &status) : nullptr;
      if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
    }
  }
  HX_TRACE_EXIT(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus SlotOnChassis_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                       const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                              << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (SlotOnChassisCMPIInstances(ref, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                             << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus SlotOnChassis_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                     const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                              << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A path without keys names no association: the answer is empty, not a
  // failure.
  if (CMGetKeyCount(cop, nullptr) != 0 && SlotOnChassisCMPIInstances(cop, ctx, properties, instances) == 0) {
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
  HX_TRACE_EXIT(loggerSlotOnChassisProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                             << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(SlotOnChassis_, SlotOnChassisProvider, broker, CMNoHook)
CMAssociationMIStub(SlotOnChassis_, SlotOnChassisProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
