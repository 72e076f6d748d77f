// CMPIInstance: an object path and properties in the order first set.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"
#include "tvr/broker/PathText.h"

#include <strings.h>

namespace tvr::broker::detail {

InstanceObject::InstanceObject(ObjectManagerCore* c, Instance i, bool hollow)
    : instance(std::move(i)), core(c) {
  shell.cmpi.hdl = hollow ? nullptr : this;
  shell.cmpi.ft = &instanceFT;
  shell.owner = this;
}

bool InstanceObject::passesFilter(const char* name) const {
  if (!filter) return true;
  for (const std::string& kept : *filter)
    if (strcasecmp(kept.c_str(), name) == 0) return true;
  return false;
}

CMPIInstance* newInstanceObject(ObjectManagerCore* core, Instance instance) {
  return &arenaFor(core).make<InstanceObject>(core, std::move(instance))->shell.cmpi;
}

namespace {

InstanceObject* checked(const CMPIInstance* ci, CMPIStatus* rc) {
  InstanceObject* i = instanceOf(ci);
  setStatus(rc, i ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return i;
}

CMPIStatus release(CMPIInstance* ci) {
  InstanceObject* i = instanceOf(ci);
  if (!i) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(i);
  return status(CMPI_RC_OK);
}

CMPIInstance* clone(const CMPIInstance* ci, CMPIStatus* rc) {
  InstanceObject* i = checked(ci, rc);
  return i ? newInstanceObject(i->core, i->instance) : nullptr;
}

const Binding* propertyNamed(const Instance& instance, const char* name) {
  for (const Binding& b : instance.properties)
    if (strcasecmp(b.name.c_str(), name) == 0) return &b;
  return nullptr;
}

CMPIData getProperty(const CMPIInstance* ci, const char* name, CMPIStatus* rc) {
  InstanceObject* i = checked(ci, rc);
  if (!i) return nullData();
  if (!name) {
    setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER);
    return nullData();
  }
  const Binding* b = propertyNamed(i->instance, name);
  if (!b) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(CMPI_null, CMPI_notFound);
  }
  return dataOut(i->core, b->value);
}

CMPIData getPropertyAt(const CMPIInstance* ci, CMPICount index, CMPIString** name, CMPIStatus* rc) {
  InstanceObject* i = checked(ci, rc);
  if (!i) return nullData();
  if (index >= i->instance.properties.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(CMPI_null, CMPI_notFound);
  }
  const Binding& b = i->instance.properties[index];
  if (name) *name = newStringObject(i->core, b.name.c_str());
  return dataOut(i->core, b.value);
}

CMPICount getPropertyCount(const CMPIInstance* ci, CMPIStatus* rc) {
  InstanceObject* i = checked(ci, rc);
  return i ? static_cast<CMPICount>(i->instance.properties.size()) : 0;
}

CMPIStatus setProperty(const CMPIInstance* ci, const char* name, const CMPIValue* value, CMPIType type) {
  InstanceObject* i = instanceOf(ci);
  if (!i) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (!name) return status(CMPI_RC_ERR_INVALID_PARAMETER);
  if (!i->passesFilter(name)) return status(CMPI_RC_OK);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  i->instance.setProperty(name, std::move(v));
  return status(CMPI_RC_OK);
}

CMPIObjectPath* getObjectPath(const CMPIInstance* ci, CMPIStatus* rc) {
  InstanceObject* i = checked(ci, rc);
  if (!i) return nullptr;
  return newPathObject(i->core, i->core ? i->core->pathOfInstance(i->instance) : i->instance.path);
}

CMPIStatus setPropertyFilter(CMPIInstance* ci, const char** propertyList, const char** keys) {
  InstanceObject* i = instanceOf(ci);
  if (!i) return status(CMPI_RC_ERR_INVALID_HANDLE);
  i->filter.reset();
  if (propertyList) {
    i->filter.emplace();
    for (const char** p = propertyList; *p; ++p) i->filter->push_back(*p);
    for (const char** k = keys; k && *k; ++k) i->filter->push_back(*k);
  }
  return status(CMPI_RC_OK);
}

CMPIStatus setObjectPath(CMPIInstance* ci, const CMPIObjectPath* op) {
  InstanceObject* i = instanceOf(ci);
  const ObjectPath* path = pathIn(op);
  if (!i || !path) return status(CMPI_RC_ERR_INVALID_HANDLE);
  i->instance.path = *path;
  return status(CMPI_RC_OK);
}

// Class origins are not kept: the value is set as setProperty would.
CMPIStatus setPropertyWithOrigin(const CMPIInstance* ci, const char* name, const CMPIValue* value,
                                 const CMPIType type, const char*) {
  return setProperty(ci, name, value, type);
}

} // namespace

CMPIInstanceFT instanceFT = {
    CMPICurrentVersion, release,        clone,           getProperty,       getPropertyAt,
    getPropertyCount,   setProperty,    getObjectPath,   setPropertyFilter, setObjectPath,
    setPropertyWithOrigin,
};

} // namespace tvr::broker::detail
