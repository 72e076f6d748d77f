// The broker's up-calls (bft): a provider asks the object manager for
// instances of other classes. Read operations are routed through the
// registration table like client requests, on the calling thread; write
// operations, queries and methods are not supported.
#include "cmpi/Objects.h"
#include "core/ObjectManagerCore.h"

namespace tvr::broker::detail {

namespace {

CMPIEnumeration* notSupported(CMPIStatus* rc) {
  setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullptr;
}

AssociationArgs associationArgs(const char* assocClass, const char* resultClass, const char* role,
                                const char* resultRole, const char** properties) {
  auto text = [](const char* s) { return s ? std::optional<std::string>(s) : std::nullopt; };
  AssociationArgs args{text(assocClass), text(resultClass), text(role), text(resultRole), std::nullopt};
  if (properties) {
    args.properties.emplace();
    for (const char** p = properties; *p; ++p) args.properties->push_back(*p);
  }
  return args;
}

CMPIEnumeration* upCall(const CMPIBroker* mb, Operation op, const CMPIObjectPath* target,
                        const AssociationArgs& args, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) {
    setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE);
    return nullptr;
  }
  return core->upCall(op, target, args, rc);
}

CMPIContext* prepareAttachThread(const CMPIBroker* mb, const CMPIContext* ctx) {
  ObjectManagerCore* core = coreOf(mb);
  ContextObject* c = contextOf(ctx);
  if (!core || !c) return nullptr;
  // The context outlives the request that prepared it: it belongs to the thread to come.
  return &core->longLivedArena().make<ContextObject>(core, c->entries)->shell.cmpi;
}

CMPIStatus attachThread(const CMPIBroker* mb, const CMPIContext* ctx) {
  return status(coreOf(mb) && contextOf(ctx) ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
}

CMPIStatus detachThread(const CMPIBroker* mb, const CMPIContext* ctx) {
  return status(coreOf(mb) && contextOf(ctx) ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
}

CMPIStatus deliverIndication(const CMPIBroker*, const CMPIContext*, const char*, const CMPIInstance*) {
  return status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIEnumeration* enumerateInstanceNames(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                                        CMPIStatus* rc) {
  return upCall(mb, Operation::EnumerateInstanceNames, op, AssociationArgs{}, rc);
}

CMPIInstance* getInstance(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                          const char** properties, CMPIStatus* rc) {
  CMPIEnumeration* found =
      upCall(mb, Operation::GetInstance, op, associationArgs(nullptr, nullptr, nullptr, nullptr, properties), rc);
  if (CMIsNullObject(found)) return nullptr;
  while (found->ft->hasNext(found, nullptr)) {
    const CMPIData item = found->ft->getNext(found, nullptr);
    if (item.type == CMPI_instance && item.value.inst) return item.value.inst;
  }
  if (!rc || rc->rc == CMPI_RC_OK) setStatus(rc, CMPI_RC_ERR_NOT_FOUND);
  return nullptr;
}

CMPIObjectPath* createInstance(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                               CMPIStatus* rc) {
  setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullptr;
}

CMPIStatus modifyInstance(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                          const char**) {
  return status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus deleteInstance(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*) {
  return status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIEnumeration* execQuery(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*,
                           const char*, CMPIStatus* rc) {
  return notSupported(rc);
}

CMPIEnumeration* enumerateInstances(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                                    const char** properties, CMPIStatus* rc) {
  return upCall(mb, Operation::EnumerateInstances, op,
                associationArgs(nullptr, nullptr, nullptr, nullptr, properties), rc);
}

CMPIEnumeration* associators(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                             const char* assocClass, const char* resultClass, const char* role,
                             const char* resultRole, const char** properties, CMPIStatus* rc) {
  return upCall(mb, Operation::Associators, op,
                associationArgs(assocClass, resultClass, role, resultRole, properties), rc);
}

CMPIEnumeration* associatorNames(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                                 const char* assocClass, const char* resultClass, const char* role,
                                 const char* resultRole, CMPIStatus* rc) {
  return upCall(mb, Operation::AssociatorNames, op,
                associationArgs(assocClass, resultClass, role, resultRole, nullptr), rc);
}

CMPIEnumeration* references(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                            const char* resultClass, const char* role, const char** properties, CMPIStatus* rc) {
  return upCall(mb, Operation::References, op, associationArgs(nullptr, resultClass, role, nullptr, properties),
                rc);
}

CMPIEnumeration* referenceNames(const CMPIBroker* mb, const CMPIContext*, const CMPIObjectPath* op,
                                const char* resultClass, const char* role, CMPIStatus* rc) {
  return upCall(mb, Operation::ReferenceNames, op, associationArgs(nullptr, resultClass, role, nullptr, nullptr),
                rc);
}

CMPIData invokeMethod(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const CMPIArgs*,
                      CMPIArgs*, CMPIStatus* rc) {
  setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullData();
}

CMPIStatus setProperty(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*,
                       const CMPIValue*, CMPIType) {
  return status(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIData getProperty(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, CMPIStatus* rc) {
  setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullData();
}

} // namespace

CMPIBrokerFT brokerFT = {
    CMPI_MB_BasicRead | CMPI_MB_AssociationTraversal | CMPI_MB_OSEncapsulationSupport |
        CMPI_MB_Supports_MemEnhancements,
    CMPIVersion200,
    "TVR embedded object manager",
    prepareAttachThread,
    attachThread,
    detachThread,
    deliverIndication,
    enumerateInstanceNames,
    getInstance,
    createInstance,
    modifyInstance,
    deleteInstance,
    execQuery,
    enumerateInstances,
    associators,
    associatorNames,
    references,
    referenceNames,
    invokeMethod,
    setProperty,
    getProperty,
};

} // namespace tvr::broker::detail
