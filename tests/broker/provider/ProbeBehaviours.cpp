// Behaviours that call broker functions the wrong way on purpose (null
// arguments, foreign objects, objects of the wrong kind, hollow objects)
// and report the status of every call as a data element "<label> <rc>".
#include "Behaviours.h"

namespace tvrtest {

namespace {

/// Runs one call at a time and reports its status.
class Probe {
public:
  explicit Probe(const CMPIResult* result) : result_(result) {}

  /// The status argument for the next call, preset to a code the broker
  /// never answers, so a call that leaves its status alone shows up.
  CMPIStatus* rc() {
    status_ = CMPIStatus{CMPI_RC_ERROR_SYSTEM, nullptr};
    return &status_;
  }
  /// Reports the status the call wrote through rc().
  template <class Result> void after(const std::string& label, Result&&) { returnStatus(result_, label, status_.rc); }
  /// Reports the status the call returned.
  void returned(const std::string& label, CMPIStatus status) { returnStatus(result_, label, status.rc); }

private:
  const CMPIResult* result_;
  CMPIStatus status_{CMPI_RC_OK, nullptr};
};

/// Looks like an encapsulated object (a handle and a table) but is not one
/// the broker made.
struct ForeignObject {
  void* hdl;
  const void* ft;
};
const CMPIObjectPathFT kForeignTable = {};

} // namespace

CMPIStatus answerWithFactoryResults(const Request& request) {
  const CMPIBroker* b = request.broker;
  const std::string ns = nameSpaceOf(request.path);
  for (int i = 1; i <= 3; ++i) {
    const std::string n = "#" + std::to_string(i) + " ";
    CMPIStatus rc = {CMPI_RC_OK, nullptr};
    CMPIObjectPath* path = CMNewObjectPath(b, ns.c_str(), "TVR_Factories", &rc);
    returnText(request.result, "newObjectPath" + n + shapeOf(path) + " " + std::to_string(rc.rc));
    CMPIInstance* inst = CMNewInstance(b, request.path, &rc);
    returnText(request.result, "newInstance" + n + shapeOf(inst) + " " + std::to_string(rc.rc));
    CMPIArray* array = CMNewArray(b, 2, CMPI_uint16, &rc);
    returnText(request.result, "newArray" + n + shapeOf(array) + " " + std::to_string(rc.rc));
  }
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerWithNullArgumentProbes(const Request& request) {
  const CMPIBroker* b = request.broker;
  const CMPIContext* ctx = request.context;
  const CMPIResult* r = request.result;
  Probe probe(r);
  CMPIObjectPath* path = CMNewObjectPath(b, nameSpaceOf(request.path).c_str(), "TVR_NullProbe", nullptr);
  CMPIInstance* inst = CMNewInstance(b, path, nullptr);
  CMPIString* string = CMNewString(b, "text", nullptr);
  CMPIArray* array = CMNewArray(b, 2, CMPI_uint8, nullptr);
  CMPIDateTime* dateTime = CMNewDateTime(b, nullptr);
  CMPIArgs* args = CMNewArgs(b, nullptr);
  CMPIObjectPath* echo = CMNewObjectPath(b, nameSpaceOf(request.path).c_str(), "TVR_Echo", nullptr);
  CMPIEnumeration* found = CBEnumInstanceNames(b, ctx, echo, nullptr);
  ForeignObject foreign{&foreign, &kForeignTable};
  auto* foreignPath = reinterpret_cast<CMPIObjectPath*>(&foreign);
  auto* foreignString = reinterpret_cast<CMPIString*>(&foreign);
  auto* instAsPath = reinterpret_cast<CMPIObjectPath*>(inst);
  auto* pathAsInstance = reinterpret_cast<CMPIInstance*>(path);
  CMPIUint8 small = 1;

  probe.after("path.getKeyCount(null)", path->ft->getKeyCount(nullptr, probe.rc()));
  probe.after("path.getKey(null name)", CMGetKey(path, nullptr, probe.rc()));
  probe.returned("path.addKey(null name)", CMAddKey(path, nullptr, &small, CMPI_uint8));
  probe.after("path.getKeyCount(instance)", path->ft->getKeyCount(instAsPath, probe.rc()));
  probe.after("path.getKey(foreign)", path->ft->getKey(foreignPath, "x", probe.rc()));
  probe.returned("path.addKey(instance as ref)", CMAddKey(path, "r", &inst, CMPI_ref));
  probe.returned("path.setNameSpaceFromObjectPath(null)", CMSetNameSpaceFromObjectPath(path, nullptr));

  probe.after("instance.getProperty(null name)", CMGetProperty(inst, nullptr, probe.rc()));
  probe.returned("instance.setProperty(null name)", CMSetProperty(inst, nullptr, &small, CMPI_uint8));
  probe.after("instance.getPropertyCount(path)", inst->ft->getPropertyCount(pathAsInstance, probe.rc()));
  probe.returned("instance.setObjectPath(null)", CMSetObjectPath(inst, nullptr));
  probe.returned("instance.setProperty(path as instance)", CMSetProperty(inst, "e", &path, CMPI_instance));
  probe.returned("instance.setProperty(foreign string)", CMSetProperty(inst, "s", &foreignString, CMPI_string));
  probe.returned("instance.setProperty(path as array)", CMSetProperty(inst, "a", &path, CMPI_uint8A));

  probe.after("string.getCharPtr(null)", string->ft->getCharPtr(nullptr, probe.rc()));
  probe.after("string.getCharPtr(path)", string->ft->getCharPtr(reinterpret_cast<CMPIString*>(path), probe.rc()));
  probe.after("array.getSize(null)", array->ft->getSize(nullptr, probe.rc()));
  probe.returned("array.setElementAt(path)",
                 array->ft->setElementAt(reinterpret_cast<CMPIArray*>(path), 0, reinterpret_cast<CMPIValue*>(&small),
                                         CMPI_uint8));
  probe.after("dateTime.getBinaryFormat(null)", dateTime->ft->getBinaryFormat(nullptr, probe.rc()));
  probe.after("dateTime.isInterval(string)",
              dateTime->ft->isInterval(reinterpret_cast<CMPIDateTime*>(string), probe.rc()));
  probe.returned("args.addArg(null name)", CMAddArg(args, nullptr, &small, CMPI_uint8));
  probe.after("args.getArg(null name)", CMGetArg(args, nullptr, probe.rc()));
  probe.after("args.getArgCount(null)", args->ft->getArgCount(nullptr, probe.rc()));
  probe.after("context.getEntry(null name)", CMGetContextEntry(ctx, nullptr, probe.rc()));
  probe.returned("context.addEntry(null name)", CMAddContextEntry(ctx, nullptr, &small, CMPI_uint8));
  probe.after("context.getEntryCount(instance)",
              ctx->ft->getEntryCount(reinterpret_cast<CMPIContext*>(inst), probe.rc()));
  probe.after("enumeration.getNext(null)", found->ft->getNext(nullptr, probe.rc()));
  probe.after("enumeration.hasNext(path)",
              found->ft->hasNext(reinterpret_cast<CMPIEnumeration*>(path), probe.rc()));
  probe.returned("result.returnData(null result)",
                 r->ft->returnData(nullptr, reinterpret_cast<CMPIValue*>(&small), CMPI_uint8));
  probe.returned("result.release(null)", r->ft->release(nullptr));
  probe.after("result.clone(null)", r->ft->clone(nullptr, probe.rc()));
  probe.returned("result.returnInstance(null result)", r->ft->returnInstance(nullptr, inst));
  probe.returned("result.returnObjectPath(null result)", r->ft->returnObjectPath(nullptr, path));
  probe.returned("result.returnDone(null)", r->ft->returnDone(nullptr));
  probe.returned("result.returnError(null)", r->ft->returnError(nullptr, nullptr));
  probe.returned("result.returnData(foreign)",
                 r->ft->returnData(reinterpret_cast<CMPIResult*>(&foreign), reinterpret_cast<CMPIValue*>(&small),
                                   CMPI_uint8));
  probe.returned("result.returnObjectPath(instance)", CMReturnObjectPath(r, instAsPath));
  probe.returned("result.returnInstance(null)", CMReturnInstance(r, nullptr));

  probe.after("newInstance(null path)", CMNewInstance(b, nullptr, probe.rc()));
  probe.after("newInstance(instance as path)", CMNewInstance(b, instAsPath, probe.rc()));
  probe.after("newDateTimeFromChars(null)", CMNewDateTimeFromChars(b, nullptr, probe.rc()));
  probe.after("newDateTimeFromChars(malformed)", CMNewDateTimeFromChars(b, "not a date", probe.rc()));
  probe.after("classPathIsA(null type)", CMClassPathIsA(b, path, nullptr, probe.rc()));
  probe.after("classPathIsA(instance)", CMClassPathIsA(b, instAsPath, "TVR_NullProbe", probe.rc()));
  probe.after("toString(null)", CDToString(b, nullptr, probe.rc()));
  probe.after("isOfType(null type)", CDIsOfType(b, path, nullptr, probe.rc()));
  probe.after("getType(foreign)", CDGetType(b, &foreign, probe.rc()));
  probe.returned("openMessageFile(null handle)", b->eft->openMessageFile(b, "messages", nullptr));

  probe.after("enumerateInstanceNames(null path)", CBEnumInstanceNames(b, ctx, nullptr, probe.rc()));
  probe.after("getInstance(instance as path)", CBGetInstance(b, ctx, instAsPath, nullptr, probe.rc()));
  probe.after("associators(null path)",
              CBAssociators(b, ctx, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, probe.rc()));
  probe.returned("attachThread(null context)", CBAttachThread(b, nullptr));
  probe.returned("mft.release(null mark)", b->mft->release(b, nullptr));
  CMReturnDone(r);
  return ok();
}

CMPIStatus answerWithHollowObjectProbes(const Request& request) {
  const CMPIBroker* b = request.broker;
  const CMPIResult* r = request.result;
  const std::string ns = nameSpaceOf(request.path);
  Probe probe(r);
  CMPIObjectPath* path = CMNewObjectPath(b, ns.c_str(), "TVR_HollowProbe", probe.rc());
  probe.after("made path " + shapeOf(path), 0);
  CMPIInstance* inst = CMNewInstance(b, request.path, probe.rc());
  probe.after("made instance " + shapeOf(inst), 0);
  CMPIArray* array = CMNewArray(b, 2, CMPI_uint8, probe.rc());
  probe.after("made array " + shapeOf(array), 0);
  if (!path || !inst || !array) return failure(b, CMPI_RC_ERR_FAILED, "expected three hollow objects");
  CMPIObjectPath* goodPath = CMNewObjectPath(b, ns.c_str(), "TVR_HollowProbe", nullptr);
  CMPIInstance* goodInst = CMNewInstance(b, goodPath, nullptr);
  CMPIUint8 small = 1;
  CMPIString* name = nullptr;

  probe.returned("path.release", CMRelease(path));
  probe.after("path.clone", CMClone(path, probe.rc()));
  probe.returned("path.setNameSpace", CMSetNameSpace(path, "root/x"));
  probe.after("path.getNameSpace", CMGetNameSpace(path, probe.rc()));
  probe.returned("path.setHostname", CMSetHostname(path, "host"));
  probe.after("path.getHostname", CMGetHostname(path, probe.rc()));
  probe.returned("path.setClassName", CMSetClassName(path, "X"));
  probe.after("path.getClassName", CMGetClassName(path, probe.rc()));
  probe.returned("path.addKey", CMAddKey(path, "k", &small, CMPI_uint8));
  probe.after("path.getKey", CMGetKey(path, "k", probe.rc()));
  probe.after("path.getKeyAt", CMGetKeyAt(path, 0, &name, probe.rc()));
  probe.after("path.getKeyCount", CMGetKeyCount(path, probe.rc()));
  probe.returned("path.setNameSpaceFromObjectPath", CMSetNameSpaceFromObjectPath(path, goodPath));
  probe.returned("path.setNameSpaceFromObjectPath(hollow source)", CMSetNameSpaceFromObjectPath(goodPath, path));
  probe.returned("path.setHostAndNameSpaceFromObjectPath", CMSetHostAndNameSpaceFromObjectPath(path, goodPath));
  probe.after("path.getClassQualifier", CMGetClassQualifier(path, "q", probe.rc()));
  probe.after("path.getPropertyQualifier", CMGetPropertyQualifier(path, "p", "q", probe.rc()));
  probe.after("path.getMethodQualifier", CMGetMethodQualifier(path, "m", "q", probe.rc()));
  probe.after("path.getParameterQualifier", CMGetParameterQualifier(path, "m", "p", "q", probe.rc()));
  probe.after("path.toString", path->ft->toString(path, probe.rc()));

  probe.returned("instance.release", CMRelease(inst));
  probe.after("instance.clone", CMClone(inst, probe.rc()));
  probe.after("instance.getProperty", CMGetProperty(inst, "p", probe.rc()));
  probe.after("instance.getPropertyAt", CMGetPropertyAt(inst, 0, &name, probe.rc()));
  probe.after("instance.getPropertyCount", CMGetPropertyCount(inst, probe.rc()));
  probe.returned("instance.setProperty", CMSetProperty(inst, "p", &small, CMPI_uint8));
  probe.after("instance.getObjectPath", CMGetObjectPath(inst, probe.rc()));
  probe.returned("instance.setPropertyFilter", CMSetPropertyFilter(inst, nullptr, nullptr));
  probe.returned("instance.setObjectPath", CMSetObjectPath(inst, goodPath));
  probe.returned("instance.setObjectPath(hollow path)", CMSetObjectPath(goodInst, path));
  probe.returned("instance.setPropertyWithOrigin", CMSetPropertyWithOrigin(inst, "p", &small, CMPI_uint8, "X"));

  probe.returned("array.release", CMRelease(array));
  probe.after("array.clone", CMClone(array, probe.rc()));
  probe.after("array.getSize", CMGetArrayCount(array, probe.rc()));
  probe.after("array.getSimpleType", CMGetArrayType(array, probe.rc()));
  probe.after("array.getElementAt", CMGetArrayElementAt(array, 0, probe.rc()));
  probe.returned("array.setElementAt", CMSetArrayElementAt(array, 0, &small, CMPI_uint8));

  probe.after("newInstance(hollow path)", CMNewInstance(b, path, probe.rc()));
  probe.returned("instance.setProperty(hollow ref)", CMSetProperty(goodInst, "r", &path, CMPI_ref));
  probe.returned("instance.setProperty(hollow array)", CMSetProperty(goodInst, "a", &array, CMPI_uint8A));
  probe.returned("instance.setProperty(hollow instance)", CMSetProperty(goodInst, "i", &inst, CMPI_instance));
  probe.returned("path.addKey(hollow ref)", CMAddKey(goodPath, "r", &path, CMPI_ref));
  probe.after("classPathIsA(hollow)", CMClassPathIsA(b, path, "TVR_HollowProbe", probe.rc()));
  probe.after("enumerateInstanceNames(hollow)", CBEnumInstanceNames(b, request.context, path, probe.rc()));
  probe.returned("result.returnObjectPath(hollow)", CMReturnObjectPath(r, path));
  probe.returned("result.returnInstance(hollow)", CMReturnInstance(r, inst));
  probe.after("toString(hollow)", CDToString(b, path, probe.rc()));
  probe.after("isOfType(hollow)", CDIsOfType(b, inst, "CMPIInstance", probe.rc()));
  probe.after("getType(hollow)", CDGetType(b, array, probe.rc()));
  CMReturnDone(r);
  return ok();
}

} // namespace tvrtest
