// Behaviours that ask the broker for instances of other classes (up-calls)
// and hand back what they got.
#include "Behaviours.h"

#include <cstring>

namespace tvrtest {

namespace {

bool isReservedKey(const std::string& name) {
  return name == "Call" || name == "Target" || name == "AssocClass";
}

// The path an up-call goes to: the Target class in the request's namespace,
// with every key of the request that is not an instruction for this provider.
CMPIObjectPath* upCallTarget(const Request& request) {
  CMPIObjectPath* target = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(),
                                           keyText(request.path, "Target").c_str(), nullptr);
  const CMPICount keys = CMGetKeyCount(request.path, nullptr);
  for (CMPICount i = 0; i < keys; ++i) {
    CMPIString* name = nullptr;
    CMPIData key = CMGetKeyAt(request.path, i, &name, nullptr);
    if (isReservedKey(textOf(name))) continue;
    CMAddKey(target, textOf(name).c_str(), &key.value, key.type);
  }
  return target;
}

// Reads the Name property of an instance the up-call gave, to show that
// the provider can use what it got.
void reportName(const CMPIResult* result, const CMPIInstance* inst) {
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  const CMPIData name = CMGetProperty(inst, "Name", &rc);
  if (rc.rc == CMPI_RC_OK && name.type == CMPI_string) returnText(result, "read Name=" + textOf(name.value.string));
}

// Hands every element of an up-call's answer to this request's result.
void returnEverything(const CMPIResult* result, CMPIEnumeration* found) {
  while (CMHasNext(found, nullptr)) {
    CMPIData item = CMGetNext(found, nullptr);
    if (item.type == CMPI_ref) {
      CMReturnObjectPath(result, item.value.ref);
    } else if (item.type == CMPI_instance) {
      reportName(result, item.value.inst);
      CMReturnInstance(result, item.value.inst);
    } else {
      CMReturnData(result, &item.value, item.type);
    }
  }
}

} // namespace

CMPIStatus answerByUpCall(const Request& request) {
  const CMPIBroker* b = request.broker;
  const std::string call = keyText(request.path, "Call");
  const std::string assocClass = keyText(request.path, "AssocClass");
  const char* assoc = assocClass.empty() ? nullptr : assocClass.c_str();
  CMPIObjectPath* target = upCallTarget(request);
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  CMPIEnumeration* found = nullptr;
  CMPIInstance* single = nullptr;

  if (call == "enumerateInstanceNames") found = CBEnumInstanceNames(b, request.context, target, &rc);
  else if (call == "enumerateInstances") found = CBEnumInstances(b, request.context, target, nullptr, &rc);
  else if (call == "getInstance") single = CBGetInstance(b, request.context, target, nullptr, &rc);
  else if (call == "associators")
    found = CBAssociators(b, request.context, target, assoc, nullptr, nullptr, nullptr, nullptr, &rc);
  else if (call == "associatorNames")
    found = CBAssociatorNames(b, request.context, target, assoc, nullptr, nullptr, nullptr, &rc);
  else if (call == "references") found = CBReferences(b, request.context, target, assoc, nullptr, nullptr, &rc);
  else if (call == "referenceNames") found = CBReferenceNames(b, request.context, target, assoc, nullptr, &rc);
  else return failure(b, CMPI_RC_ERR_INVALID_PARAMETER, "unknown up-call " + call);

  returnStatus(request.result, "upcall", rc.rc);
  if (call == "getInstance") {
    returnText(request.result, "instance=" + shapeOf(single));
    // Used as an instance only once the broker says it is one.
    const std::string kind = CMIsNullObject(single) ? "nothing" : textOf(CDGetType(b, single, nullptr));
    if (kind == "CMPIInstance") {
      reportName(request.result, single);
      CMReturnInstance(request.result, single);
    } else if (single) {
      returnText(request.result, "got a " + kind);
    }
  } else {
    returnText(request.result, "enumeration=" + shapeOf(found));
    if (!CMIsNullObject(found)) returnEverything(request.result, found);
  }
  CMPIUint64 thread = currentThreadNumber();
  CMReturnData(request.result, &thread, CMPI_uint64);
  CMReturnDone(request.result);
  return ok();
}

// Each level returns what the deeper levels returned plus one path of its
// own, keyed with how many it got and the status of its up-call.
CMPIStatus answerByRecursiveUpCall(const Request& request) {
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  CMPIEnumeration* deeper = CBEnumInstanceNames(request.broker, request.context, request.path, &rc);
  CMPIUint32 got = 0;
  if (!CMIsNullObject(deeper)) {
    while (CMHasNext(deeper, nullptr)) {
      CMPIData item = CMGetNext(deeper, nullptr);
      CMReturnObjectPath(request.result, item.value.ref);
      ++got;
    }
  }
  CMPIObjectPath* own =
      CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), "TVR_Recursive", nullptr);
  CMAddKey(own, "Below", &got, CMPI_uint32);
  CMPIUint32 status = rc.rc;
  CMAddKey(own, "UpCallStatus", &status, CMPI_uint32);
  CMReturnObjectPath(request.result, own);
  return ok();
}

} // namespace tvrtest
