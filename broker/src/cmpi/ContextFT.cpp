// CMPIContext: the request's named entries (namespace, flags, principal).
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

#include <strings.h>

namespace tvr::broker::detail {

ContextObject::ContextObject(ObjectManagerCore* c, std::vector<Binding> e) : entries(std::move(e)), core(c) {
  shell.cmpi.hdl = this;
  shell.cmpi.ft = &contextFT;
  shell.owner = this;
}

CMPIContext* newContextObject(ObjectManagerCore* core, std::vector<Binding> entries) {
  return &arenaFor(core).make<ContextObject>(core, std::move(entries))->shell.cmpi;
}

namespace {

ContextObject* checked(const CMPIContext* c, CMPIStatus* rc) {
  ContextObject* ctx = contextOf(c);
  setStatus(rc, ctx ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return ctx;
}

CMPIStatus release(CMPIContext* c) {
  ContextObject* ctx = contextOf(c);
  if (!ctx) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(ctx);
  return status(CMPI_RC_OK);
}

CMPIContext* clone(const CMPIContext* c, CMPIStatus* rc) {
  ContextObject* ctx = checked(c, rc);
  return ctx ? newContextObject(ctx->core, ctx->entries) : nullptr;
}

CMPIData getEntry(const CMPIContext* c, const char* name, CMPIStatus* rc) {
  ContextObject* ctx = checked(c, rc);
  if (!ctx) return nullData();
  if (!name) {
    setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER);
    return nullData();
  }
  for (const Binding& b : ctx->entries)
    if (strcasecmp(b.name.c_str(), name) == 0) return dataOut(ctx->core, b.value);
  setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  return nullData(CMPI_null, CMPI_notFound);
}

CMPIData getEntryAt(const CMPIContext* c, CMPICount index, CMPIString** name, CMPIStatus* rc) {
  ContextObject* ctx = checked(c, rc);
  if (!ctx) return nullData();
  if (index >= ctx->entries.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(CMPI_null, CMPI_notFound);
  }
  if (name) *name = newStringObject(ctx->core, ctx->entries[index].name.c_str());
  return dataOut(ctx->core, ctx->entries[index].value);
}

CMPICount getEntryCount(const CMPIContext* c, CMPIStatus* rc) {
  ContextObject* ctx = checked(c, rc);
  return ctx ? static_cast<CMPICount>(ctx->entries.size()) : 0;
}

CMPIStatus addEntry(const CMPIContext* c, const char* name, const CMPIValue* value, const CMPIType type) {
  ContextObject* ctx = contextOf(c);
  if (!ctx) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (!name) return status(CMPI_RC_ERR_INVALID_PARAMETER);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  for (Binding& b : ctx->entries) {
    if (strcasecmp(b.name.c_str(), name) == 0) {
      b.value = std::move(v);
      return status(CMPI_RC_OK);
    }
  }
  ctx->entries.push_back(Binding{name, std::move(v)});
  return status(CMPI_RC_OK);
}

} // namespace

CMPIContextFT contextFT = {CMPICurrentVersion, release, clone, getEntry, getEntryAt, getEntryCount, addEntry};

} // namespace tvr::broker::detail
