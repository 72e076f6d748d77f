// CMPIArgs: named method arguments. Nothing here invokes methods, but a
// provider may still ask the broker for an argument list.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

#include <strings.h>

namespace tvr::broker::detail {

ArgsObject::ArgsObject(ObjectManagerCore* c) : core(c) {
  shell.cmpi.hdl = this;
  shell.cmpi.ft = &argsFT;
  shell.owner = this;
}

CMPIArgs* newArgsObject(ObjectManagerCore* core) {
  return &arenaFor(core).make<ArgsObject>(core)->shell.cmpi;
}

namespace {

ArgsObject* checked(const CMPIArgs* a, CMPIStatus* rc) {
  ArgsObject* args = argsOf(a);
  setStatus(rc, args ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return args;
}

CMPIStatus release(CMPIArgs* a) {
  ArgsObject* args = argsOf(a);
  if (!args) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(args);
  return status(CMPI_RC_OK);
}

CMPIArgs* clone(const CMPIArgs* a, CMPIStatus* rc) {
  ArgsObject* args = checked(a, rc);
  if (!args) return nullptr;
  auto* copy = arenaFor(args->core).make<ArgsObject>(args->core);
  copy->args = args->args;
  return &copy->shell.cmpi;
}

CMPIStatus addArg(const CMPIArgs* a, const char* name, const CMPIValue* value, const CMPIType type) {
  ArgsObject* args = argsOf(a);
  if (!args) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (!name) return status(CMPI_RC_ERR_INVALID_PARAMETER);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  for (Binding& b : args->args) {
    if (strcasecmp(b.name.c_str(), name) == 0) {
      b.value = std::move(v);
      return status(CMPI_RC_OK);
    }
  }
  args->args.push_back(Binding{name, std::move(v)});
  return status(CMPI_RC_OK);
}

CMPIData getArg(const CMPIArgs* a, const char* name, CMPIStatus* rc) {
  ArgsObject* args = checked(a, rc);
  if (!args) return nullData();
  if (!name) {
    setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER);
    return nullData();
  }
  for (const Binding& b : args->args)
    if (strcasecmp(b.name.c_str(), name) == 0) return dataOut(args->core, b.value);
  setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  return nullData(CMPI_null, CMPI_notFound);
}

CMPIData getArgAt(const CMPIArgs* a, CMPICount index, CMPIString** name, CMPIStatus* rc) {
  ArgsObject* args = checked(a, rc);
  if (!args) return nullData();
  if (index >= args->args.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(CMPI_null, CMPI_notFound);
  }
  if (name) *name = newStringObject(args->core, args->args[index].name.c_str());
  return dataOut(args->core, args->args[index].value);
}

CMPICount getArgCount(const CMPIArgs* a, CMPIStatus* rc) {
  ArgsObject* args = checked(a, rc);
  return args ? static_cast<CMPICount>(args->args.size()) : 0;
}

} // namespace

CMPIArgsFT argsFT = {CMPICurrentVersion, release, clone, addArg, getArg, getArgAt, getArgCount};

} // namespace tvr::broker::detail
