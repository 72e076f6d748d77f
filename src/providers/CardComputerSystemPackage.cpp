// TVRHX_CardCSPackage: the network cards that package the computer system.
// The hardware does not say which system a card belongs to: every card is
// paired with every computer system the object manager knows. The systems
// are another provider's class, fetched back through the broker's up-calls.
//
// The handlers follow the association frame of PackageInSlotProvider.cpp;
// a source of a class without a target answers an empty Associators, and
// the computer-system side is walked as an enumeration.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerCardComputerSystemPackage = "Korvane.CardComputerSystemPackage";
const char* const cardPkgClass = "TVRHX_CardCSPackage";
const char* const csClass = "TVRHX_ComputerSystem";
const char* const NetworkCardClass = "TVRHX_NetworkCard";
const char* const cardPkgProvider = "AssociationProvider_CardAndComputerSystem";

// The base classes a client may name as result class instead of the far
// class itself.
const char* const csBaseClass = "CIM_ComputerSystem";
const char* const cardBaseClass = "CIM_Card";

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
const char* const builderNullCardMessage = "CMPIObjectPath is                      NULL for NetworkCard";
const char* const namesNullCardMessage = "CMPIObjectPath is                                NULL for NetworkCard";

} // namespace

CMPIStatus CardComputerSystemPackage_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus CardComputerSystemPackage_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus CardComputerSystemPackage_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                    const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CardComputerSystemPackage_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                    const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CardComputerSystemPackage_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                    const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CardComputerSystemPackage_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                               const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus CardComputerSystemPackage_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                 const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                 const char* assocClass, const char* resultClass, const char* role,
                                                 const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  // A source this association does not know answers nothing, with the
  // status the lookup left.
  if (CMIsNullObject(target)) return status;
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* systems = enumerateInstances(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMReturnInstance(rslt, system.value.inst);
    }
  } else if (sameClass(targetClass, NetworkCardClass)) {
    if (!resultClassAllows(resultClass, NetworkCardClass, cardBaseClass)) return status;
    std::vector<CMPIInstance*> cards;
    if (getAllNetworkCardInstances(broker, ctx, cop, properties, cards, &status) != 0) {
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, cards.at(index));
    freeList(cards);
  }
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  return status;
}

CMPIStatus CardComputerSystemPackage_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                     const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                     const char* assocClass, const char* resultClass,
                                                     const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) return status;
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, csClass)) {
    if (!resultClassAllows(resultClass, csClass, csBaseClass)) return status;
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMReturnObjectPath(rslt, system.value.ref);
    }
  } else if (sameClass(targetClass, NetworkCardClass)) {
    if (!resultClassAllows(resultClass, NetworkCardClass, cardBaseClass)) return status;
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, cardPkgProvider, "*** Can't get NetworkCard COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      card->ft->setHostname(card, HX::getSystemName().c_str());
      CMReturnObjectPath(rslt, card);
    }
    freeList(cards);
  }
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  return status;
}

CMPIStatus CardComputerSystemPackage_References(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                const char* resultClass, const char* role,
                                                const char** properties) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> cards;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, cardPkgClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), cardPkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in References.");
    brokerTrace(broker, cardPkgProvider, "Object Path is NULL in References.");
    freeList(cards);
    return status;
  }
  // The far class is looked at once, cards first.
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, NetworkCardClass)) {
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, cardPkgProvider, "*** Can't get NetworkCard COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      CMPIObjectPath* card = cards.at(index);
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      card->ft->setHostname(card, HX::getSystemName().c_str());
      setReference(association, "Dependent", cop);
      setReference(association, "Antecedent", card);
      CMReturnInstance(rslt, association);
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(cards);
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
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                << " properties=" << properties);
  freeList(cards);
  return status;
}

namespace {

// The path a ReferenceNames answer gives for an association: the
// instance's own path, in the source's namespace, with no host name set.
CMPIObjectPath* associationName(CMPIInstance* association, const CMPIObjectPath* cop) {
  CMPIObjectPath* name = CMIsNullObject(association) ? nullptr : CMGetObjectPath(association, nullptr);
  if (name) name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
  return name;
}

} // namespace

CMPIStatus CardComputerSystemPackage_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                    const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                    const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> cards;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, cardPkgClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), cardPkgClass, &status);
  if (CMIsNullObject(target)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Object Path is NULL in ReferenceNames.");
    brokerTrace(broker, cardPkgProvider, "Object Path is NULL in ReferenceNames.");
    freeList(cards);
    return status;
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, NetworkCardClass)) {
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, cardPkgProvider, "*** Can't get NetworkCard COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      CMPIObjectPath* card = cards.at(index);
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      card->ft->setHostname(card, HX::getSystemName().c_str());
      setReference(association, "Dependent", cop);
      setReference(association, "Antecedent", card);
      CMReturnObjectPath(rslt, associationName(association, cop));
    }
  } else if (sameClass(targetClass, csClass)) {
    CMPIEnumeration* systems = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(cards);
      return status;
    }
    while (hasNext(systems, &status)) {
      const CMPIData system = CMGetNext(systems, &status);
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      setReference(association, "Dependent", system.value.ref);
      setReference(association, "Antecedent", cop);
      CMReturnObjectPath(rslt, associationName(association, cop));
    }
  }
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(cards);
  return status;
}

/// Every CardCSPackage association: each computer system the object manager
/// knows with each network card, systems outside and cards inside. The
/// builder's own status is lost; its failures reach the client as an empty
/// answer.
unsigned short CardComputerSystemPackageCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                      const CMPIContext* ctx,
                                                      std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* systemClassPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), csClass, &status);
  if (CMIsNullObject(systemClassPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, cardPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return 1;
  }
  CMPIEnumeration* systems = enumerateNames(ctx, systemClassPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                     "Call to CBEnumInstances of target Class Failed.");
    return 1;
  }
  while (hasNext(systems, &status)) {
    const CMPIObjectPath* system = CMGetNext(systems, &status).value.ref;
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, cardPkgProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return 1;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      if (CMIsNullObject(card)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, builderNullCardMessage);
        brokerTrace(broker, cardPkgProvider, "CMPIObjectPath is NULL for NetworkCard");
        freeList(cards);
        return 1;
      }
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), cardPkgClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for CardComputerSystemPackage");
        brokerTrace(broker, cardPkgProvider, "Create CMPIObjectPath failed for CardComputerSystemPackage.");
        freeList(cards);
        return 1;
      }
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMPIInstance* association = newInstance(broker, path, nullptr);
      setReference(association, "Dependent", system);
      setReference(association, "Antecedent", card);
      // The card's package carries no real platform identity: a constant.
      if (!CMIsNullObject(association)) CMSetProperty(association, "PlatformGUID", "0", CMPI_chars);
      instances.push_back(association);
    }
    freeList(cards);
  }
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus CardComputerSystemPackage_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                       const CMPIResult* rslt, const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* systemClassPath = newObjectPath(broker, nameSpaceOf(ref, nullptr), csClass, &status);
  if (CMIsNullObject(systemClassPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, cardPkgProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return status;
  }
  CMPIEnumeration* systems = enumerateNames(ctx, systemClassPath, &status);
  if (status.rc != CMPI_RC_OK) {
    HX_TRACE_MESSAGE(loggerCardComputerSystemPackage, HX::kLevelFailure,
                     "Call to CBEnumInstances of target Class Failed.");
    return status;
  }
  while (hasNext(systems, &status)) {
    const CMPIObjectPath* system = CMGetNext(systems, &status).value.ref;
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, ref, cards, &status) != 0) {
      brokerTrace(broker, cardPkgProvider, "***Can't get NetworkCard COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      if (CMIsNullObject(card)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, namesNullCardMessage);
        brokerTrace(broker, cardPkgProvider, "CMPIObjectPath is NULL for NetworkCard");
        freeList(cards);
        return status;
      }
      card->ft->setNameSpace(card, nameSpaceOf(ref, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), cardPkgClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for CardComputerSystemPackage.");
        brokerTrace(broker, cardPkgProvider, "Create CMPIObjectPath failed for CardComputerSystemPackage.");
        freeList(cards);
        return status;
      }
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMAddKey(path, "Dependent", &system, CMPI_ref);
      CMAddKey(path, "Antecedent", &card, CMPI_ref);
      CMReturnObjectPath(rslt, path);
    }
    freeList(cards);
  }
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerCardComputerSystemPackage,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  return status;
}

CMPIStatus CardComputerSystemPackage_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                   const CMPIResult* rslt, const CMPIObjectPath* ref,
                                                   const char** properties) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                  << " ref=" << ref << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CardComputerSystemPackageCMPIInstances(ref, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerCardComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                 << " ref=" << ref << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus CardComputerSystemPackage_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                 const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                 const char** properties) {
  HX_TRACE_ENTER(loggerCardComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                  << " cop=" << cop << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, cardPkgProvider, "At least one key should be passed");
  } else if (CardComputerSystemPackageCMPIInstances(cop, properties, ctx, instances) == 0) {
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
  HX_TRACE_EXIT(loggerCardComputerSystemPackage, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt
                                                 << " cop=" << cop << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(CardComputerSystemPackage_, CardComputerSystemPackageProvider, broker, CMNoHook)
CMAssociationMIStub(CardComputerSystemPackage_, CardComputerSystemPackageProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
