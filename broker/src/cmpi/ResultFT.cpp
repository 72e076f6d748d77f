// CMPIResult: hands each returned element to the request's sink at once,
// copied out of the provider's objects.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"
#include "core/ResultSink.h"

namespace tvr::broker::detail {

ResultObject::ResultObject(ObjectManagerCore* c, ResultSink* s) : sink(s), core(c) {
  shell.cmpi.hdl = this;
  shell.cmpi.ft = &resultFT;
  shell.owner = this;
}

namespace {

// Results belong to the object manager, which frees them with the request.
CMPIStatus release(CMPIResult* r) {
  return status(resultOf(r) ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
}

CMPIResult* clone(const CMPIResult* r, CMPIStatus* rc) {
  setStatus(rc, resultOf(r) ? CMPI_RC_ERR_NOT_SUPPORTED : CMPI_RC_ERR_INVALID_HANDLE);
  return nullptr;
}

CMPIStatus returnData(const CMPIResult* r, const CMPIValue* value, const CMPIType type) {
  ResultObject* result = resultOf(r);
  if (!result) return status(CMPI_RC_ERR_INVALID_HANDLE);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  result->sink->onData(v);
  return status(CMPI_RC_OK);
}

// A null or hollow instance is recorded as such: providers do hand them over.
CMPIStatus returnInstance(const CMPIResult* r, const CMPIInstance* inst) {
  ResultObject* result = resultOf(r);
  if (!result) return status(CMPI_RC_ERR_INVALID_HANDLE);
  InstanceObject* i = instanceOf(inst);
  if (!i) {
    result->sink->onInstance(nullptr, nullptr);
    return status(CMPI_RC_ERR_INVALID_PARAMETER);
  }
  const ObjectPath path = result->core->pathOfInstance(i->instance);
  result->sink->onInstance(&i->instance, &path);
  return status(CMPI_RC_OK);
}

CMPIStatus returnObjectPath(const CMPIResult* r, const CMPIObjectPath* ref) {
  ResultObject* result = resultOf(r);
  if (!result) return status(CMPI_RC_ERR_INVALID_HANDLE);
  const ObjectPath* path = pathIn(ref);
  result->sink->onPath(path);
  return status(path ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_PARAMETER);
}

CMPIStatus returnDone(const CMPIResult* r) {
  ResultObject* result = resultOf(r);
  if (!result) return status(CMPI_RC_ERR_INVALID_HANDLE);
  result->sink->onDone();
  return status(CMPI_RC_OK);
}

CMPIStatus returnError(const CMPIResult* r, const CMPIError*) {
  return status(resultOf(r) ? CMPI_RC_ERR_NOT_SUPPORTED : CMPI_RC_ERR_INVALID_HANDLE);
}

} // namespace

CMPIResultFT resultFT = {CMPICurrentVersion, release,          clone,      returnData,
                         returnInstance,     returnObjectPath, returnDone, returnError};

} // namespace tvr::broker::detail
