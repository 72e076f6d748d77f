// TVRHX_NPRealizesNC: which network card realises which network port. The
// ports are another provider's class, fetched back through the broker's
// up-calls. A port and a card belong together exactly when the port's
// DeviceID equals the card's Tag, byte for byte; one card may realise
// several ports and one port may be realised by several cards.
//
// Associators, AssociatorNames and the instance handlers pair by that rule;
// References and ReferenceNames answer one association for every element
// of the far class. The association handlers work on a status of their own
// and never report a source without a target as a failure: they close with
// the provider-exit lines instead.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <optional>
#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerNetPortRealizesNetCard = "Korvane.NetPortRealizesNetCard";
const char* const NPRealizesNCClass = "TVRHX_NPRealizesNC";
const char* const ncClass = "TVRHX_NetworkCard";
const char* const npClass = "TVRHX_NetworkPort";
const char* const NPRealizesNCProvider = "AssociationProvider NetworkPort And NetworkCard";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// A string key of a path, copied; nullopt when the path has no such key.
std::optional<std::string> keyCopy(const CMPIObjectPath* path, const char* name, CMPIStatus* status) {
  const char* text = keyText(path, name, status, nullptr);
  return text ? std::optional<std::string>(text) : std::nullopt;
}

// The pairing rule on keys read through the broker: a key that is not
// there pairs with nothing.
bool pairs(const std::optional<std::string>& deviceID, const std::optional<std::string>& tag) {
  return deviceID && tag && *deviceID == *tag;
}

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

// The up-calls for the network ports. With no broker there is no object
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

// The path a ReferenceNames answer gives for an association: the
// instance's own path, in the source's namespace, with no host name set.
CMPIObjectPath* associationName(CMPIInstance* association, const CMPIObjectPath* cop) {
  CMPIObjectPath* name = CMIsNullObject(association) ? nullptr : CMGetObjectPath(association, nullptr);
  if (name) name->ft->setNameSpace(name, nameSpaceOf(cop, nullptr));
  return name;
}

} // namespace

CMPIStatus NetPortRealizesNetCard_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus NetPortRealizesNetCard_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus NetPortRealizesNetCard_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                 const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetPortRealizesNetCard_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                 const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetPortRealizesNetCard_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                 const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetPortRealizesNetCard_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                            const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetPortRealizesNetCard_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                              const CMPIObjectPath* cop, const char* assocClass,
                                              const char* resultClass, const char* role, const char* resultRole,
                                              const char** properties) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerNetPortRealizesNetCard);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, ncClass)) {
    // From a port: the cards whose Tag is the port's DeviceID.
    std::string deviceID;
    if (!HX::ProviderUtilities::getKeyProperty(cop, "DeviceID", deviceID)) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure, "Did not get DeviceID in the object path");
      return status;
    }
    std::vector<CMPIInstance*> cards;
    if (getAllNetworkCardInstances(broker, ctx, cop, properties, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "*** Can't get All NetworkCard Instances, Exiting***");
      freeList(cards);
      return status;
    }
    for (unsigned short index = 0; index < cards.size(); ++index) {
      CMPIInstance* card = cards.at(index);
      std::string tag;
      if (HX::ProviderUtilities::getProperty(card, "Tag", tag, false) && tag == deviceID)
        CMReturnInstance(rslt, card);
    }
    freeList(cards);
  } else if (sameClass(targetClass, npClass)) {
    // From a card: the ports whose DeviceID is the card's Tag.
    std::string tag;
    if (!HX::ProviderUtilities::getKeyProperty(cop, "Tag", tag)) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure, "Did not get Tag in the object path");
      return status;
    }
    CMPIEnumeration* ports = enumerateInstances(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(ports, &status)) {
      CMPIInstance* port = CMGetNext(ports, &status).value.inst;
      std::string deviceID;
      if (HX::ProviderUtilities::getProperty(port, "DeviceID", deviceID, false) && deviceID == tag)
        CMReturnInstance(rslt, port);
    }
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  return status;
}

CMPIStatus NetPortRealizesNetCard_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                  const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                  const char* assocClass, const char* resultClass, const char* role,
                                                  const char* resultRole) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerNetPortRealizesNetCard);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  }
  // Ports are looked for first here, cards first in Associators.
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, npClass)) {
    std::string tag;
    if (!HX::ProviderUtilities::getKeyProperty(cop, "Tag", tag)) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure, "Did not get Tag key in the object path");
      return status;
    }
    CMPIEnumeration* ports = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      return status;
    }
    while (hasNext(ports, &status)) {
      CMPIObjectPath* port = CMGetNext(ports, &status).value.ref;
      std::string deviceID;
      if (HX::ProviderUtilities::getKeyProperty(port, "DeviceID", deviceID) && deviceID == tag)
        CMReturnObjectPath(rslt, port);
    }
  } else if (sameClass(targetClass, ncClass)) {
    std::string deviceID;
    if (!HX::ProviderUtilities::getKeyProperty(cop, "DeviceID", deviceID)) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure, "Did not get DeviceID in the object path");
      return status;
    }
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "*** Can't get COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    // Every card path gets the namespace and host, matching or not.
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      card->ft->setHostname(card, HX::getSystemName().c_str());
      std::string tag;
      if (HX::ProviderUtilities::getKeyProperty(card, "Tag", tag) && tag == deviceID)
        CMReturnObjectPath(rslt, card);
    }
    freeList(cards);
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  return status;
}

CMPIStatus NetPortRealizesNetCard_References(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                             const CMPIObjectPath* cop, const char* resultClass, const char* role,
                                             const char** properties) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> cards;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, NPRealizesNCClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), NPRealizesNCClass, &status);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerNetPortRealizesNetCard);
    freeList(cards);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, ncClass)) {
    // From a port: one association for every card, paired or not.
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "*** Can't get COPs, Exiting EnumerateInstanceNames***");
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
  } else if (sameClass(targetClass, npClass)) {
    // From a card: one association for every port, paired or not.
    CMPIEnumeration* ports = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(cards);
      return status;
    }
    while (hasNext(ports, &status)) {
      const CMPIObjectPath* port = CMGetNext(ports, &status).value.ref;
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      setReference(association, "Dependent", port);
      setReference(association, "Antecedent", cop);
      CMReturnInstance(rslt, association);
    }
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                << " properties=" << properties);
  freeList(cards);
  return status;
}

CMPIStatus NetPortRealizesNetCard_ReferenceNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                                 const CMPIResult* rslt, const CMPIObjectPath* cop,
                                                 const char* resultClass, const char* role) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIObjectPath*> cards;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, NPRealizesNCClass, nullptr, &status);
  CMPIObjectPath* assocPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), NPRealizesNCClass, &status);
  if (CMIsNullObject(target)) {
    HX_MARK_PROVIDER_EXIT(loggerNetPortRealizesNetCard);
    freeList(cards);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  }
  const char* targetClass = charPtr(target->ft->getClassName(target, nullptr), nullptr);
  if (sameClass(targetClass, ncClass)) {
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "*** Can't get COPs, Exiting EnumerateInstanceNames***");
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
  } else if (sameClass(targetClass, npClass)) {
    CMPIEnumeration* ports = enumerateNames(ctx, target, &status);
    if (status.rc != CMPI_RC_OK) {
      HX_TRACE_MESSAGE(loggerNetPortRealizesNetCard, HX::kLevelFailure,
                       "Call to CBEnumInstances of target Class Failed.");
      freeList(cards);
      return status;
    }
    while (hasNext(ports, &status)) {
      const CMPIObjectPath* port = CMGetNext(ports, &status).value.ref;
      CMPIInstance* association = newInstance(broker, assocPath, &status);
      setReference(association, "Dependent", port);
      setReference(association, "Antecedent", cop);
      CMReturnObjectPath(rslt, associationName(association, cop));
    }
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " resultClass=" << HX::traceText(resultClass) << " role=" << HX::traceText(role));
  freeList(cards);
  return status;
}

/// Every NPRealizesNC association: each port the object manager knows with
/// each card whose Tag is the port's DeviceID, ports outside and cards
/// inside. The builder's own status is lost; its failures reach the client
/// as an empty answer.
unsigned short NetPortRealizesNetCardCMPIInstances(const CMPIObjectPath* cop, const char** properties,
                                                   const CMPIContext* ctx, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard,
                 << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* portClassPath = newObjectPath(broker, nameSpaceOf(cop, nullptr), npClass, &status);
  if (CMIsNullObject(portClassPath)) {
    // The trace names the computer system though the class is the port's.
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, NPRealizesNCProvider, "Create CMPIObjectPath failed for ComputerSystemClass.");
    return 1;
  }
  CMPIEnumeration* ports = enumerateNames(ctx, portClassPath, &status);
  if (status.rc != CMPI_RC_OK) return 1;
  while (hasNext(ports, &status)) {
    const CMPIObjectPath* port = CMGetNext(ports, &status).value.ref;
    const std::optional<std::string> deviceID = keyCopy(port, "DeviceID", &status);
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, cop, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return 1;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      // The text names the disk controller though a card's path is what
      // failed.
      if (CMIsNullObject(card)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for DiskController");
        brokerTrace(broker, NPRealizesNCProvider, "CMPIObjectPath is NULL for DiskController");
        freeList(cards);
        return 1;
      }
      if (!pairs(deviceID, keyCopy(card, "Tag", &status))) continue;
      card->ft->setNameSpace(card, nameSpaceOf(cop, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(cop, nullptr), NPRealizesNCClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for NetPortRealizesNetCard");
        brokerTrace(broker, NPRealizesNCProvider, "Create CMPIObjectPath failed for NetPortRealizesNetCard.");
        freeList(cards);
        return 1;
      }
      path->ft->setNameSpace(path, nameSpaceOf(cop, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMPIInstance* association = newInstance(broker, path, nullptr);
      setReference(association, "Dependent", port);
      setReference(association, "Antecedent", card);
      instances.push_back(association);
    }
    freeList(cards);
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard,
                << " ref=" << cop << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus NetPortRealizesNetCard_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                                    const CMPIResult* rslt, const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIObjectPath* portClassPath = newObjectPath(broker, nameSpaceOf(ref, nullptr), npClass, &status);
  if (CMIsNullObject(portClassPath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "Create CMPIObjectPath failed.");
    brokerTrace(broker, NPRealizesNCProvider, "Create CMPIObjectPath failed for NetworkPortClass.");
    return status;
  }
  CMPIEnumeration* ports = enumerateNames(ctx, portClassPath, &status);
  if (status.rc != CMPI_RC_OK) {
    // A good code with a text that tells of the failure.
    setStatusWithChars(broker, &status, CMPI_RC_OK, "CBEnumInstanceNames Failed for the TVRHX_NetworkPort");
    return status;
  }
  while (hasNext(ports, &status)) {
    const CMPIObjectPath* port = CMGetNext(ports, &status).value.ref;
    const std::optional<std::string> deviceID = keyCopy(port, "DeviceID", &status);
    std::vector<CMPIObjectPath*> cards;
    if (getAllNetworkCardCOP(broker, ctx, ref, cards, &status) != 0) {
      brokerTrace(broker, NPRealizesNCProvider, "***Can't get NetworkCard COPs, Exiting EnumerateInstanceNames***");
      freeList(cards);
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(cards.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIObjectPath* card = cards.at(index);
      if (CMIsNullObject(card)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for NetworkCard");
        brokerTrace(broker, NPRealizesNCProvider, "CMPIObjectPath is NULL for NetworkCard");
        freeList(cards);
        return status;
      }
      if (!pairs(deviceID, keyCopy(card, "Tag", &status))) continue;
      card->ft->setNameSpace(card, nameSpaceOf(ref, nullptr));
      CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), NPRealizesNCClass, &status);
      if (CMIsNullObject(path)) {
        setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED,
                           "Create CMPIObjectPath failed for NetPortRealizesNetCard.");
        brokerTrace(broker, NPRealizesNCProvider, "Create CMPIObjectPath failed for NetPortRealizesNetCard.");
        freeList(cards);
        return status;
      }
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
      CMAddKey(path, "Dependent", &port, CMPI_ref);
      CMAddKey(path, "Antecedent", &card, CMPI_ref);
      CMReturnObjectPath(rslt, path);
    }
    freeList(cards);
  }
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  return status;
}

CMPIStatus NetPortRealizesNetCard_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                               << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (NetPortRealizesNetCardCMPIInstances(ref, properties, ctx, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                              << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus NetPortRealizesNetCard_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                              const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                               << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (CMGetKeyCount(cop, nullptr) == 0) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "At least one key should be passed");
    brokerTrace(broker, NPRealizesNCProvider, "At least one key should be passed");
  } else if (NetPortRealizesNetCardCMPIInstances(cop, properties, ctx, instances) == 0) {
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
  HX_TRACE_EXIT(loggerNetPortRealizesNetCard, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                              << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(NetPortRealizesNetCard_, NetPortRealizesNetCardProvider, broker, CMNoHook)
CMAssociationMIStub(NetPortRealizesNetCard_, NetPortRealizesNetCardProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
