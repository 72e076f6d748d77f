// CMPIObjectPath: namespace, host, class and keys in the order added.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"
#include "tvr/broker/PathText.h"

#include <strings.h>

namespace tvr::broker::detail {

PathObject::PathObject(ObjectManagerCore* c, ObjectPath p, bool hollow) : path(std::move(p)), core(c) {
  shell.cmpi.hdl = hollow ? nullptr : this;
  shell.cmpi.ft = &objectPathFT;
  shell.owner = this;
}

CMPIObjectPath* newPathObject(ObjectManagerCore* core, ObjectPath path) {
  return &arenaFor(core).make<PathObject>(core, std::move(path))->shell.cmpi;
}

namespace {

// Looks up the object; on failure sets rc and returns null.
PathObject* checked(const CMPIObjectPath* op, CMPIStatus* rc) {
  PathObject* p = pathOf(op);
  setStatus(rc, p ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return p;
}

CMPIStatus release(CMPIObjectPath* op) {
  PathObject* p = pathOf(op);
  if (!p) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(p);
  return status(CMPI_RC_OK);
}

CMPIObjectPath* clone(const CMPIObjectPath* op, CMPIStatus* rc) {
  PathObject* p = checked(op, rc);
  return p ? newPathObject(p->core, p->path) : nullptr;
}

CMPIStatus setText(CMPIObjectPath* op, const char* text, std::string ObjectPath::*field) {
  PathObject* p = pathOf(op);
  if (!p) return status(CMPI_RC_ERR_INVALID_HANDLE);
  p->path.*field = text ? text : "";
  return status(CMPI_RC_OK);
}

CMPIString* getText(const CMPIObjectPath* op, CMPIStatus* rc, std::string ObjectPath::*field) {
  PathObject* p = checked(op, rc);
  return p ? newStringObject(p->core, (p->path.*field).c_str()) : nullptr;
}

CMPIStatus setNameSpace(CMPIObjectPath* op, const char* ns) {
  return setText(op, ns, &ObjectPath::nameSpace);
}
CMPIString* getNameSpace(const CMPIObjectPath* op, CMPIStatus* rc) {
  return getText(op, rc, &ObjectPath::nameSpace);
}
CMPIStatus setHostname(CMPIObjectPath* op, const char* hn) { return setText(op, hn, &ObjectPath::host); }
CMPIString* getHostname(const CMPIObjectPath* op, CMPIStatus* rc) {
  return getText(op, rc, &ObjectPath::host);
}
CMPIStatus setClassName(CMPIObjectPath* op, const char* cn) {
  return setText(op, cn, &ObjectPath::className);
}
CMPIString* getClassName(const CMPIObjectPath* op, CMPIStatus* rc) {
  return getText(op, rc, &ObjectPath::className);
}

CMPIStatus addKey(CMPIObjectPath* op, const char* name, const CMPIValue* value, const CMPIType type) {
  PathObject* p = pathOf(op);
  if (!p) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (!name) return status(CMPI_RC_ERR_INVALID_PARAMETER);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  p->path.setKey(name, std::move(v));
  return status(CMPI_RC_OK);
}

const Binding* keyNamed(const ObjectPath& path, const char* name) {
  for (const Binding& b : path.keys)
    if (strcasecmp(b.name.c_str(), name) == 0) return &b;
  return nullptr;
}

CMPIData getKey(const CMPIObjectPath* op, const char* name, CMPIStatus* rc) {
  PathObject* p = checked(op, rc);
  if (!p) return nullData();
  if (!name) {
    setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER);
    return nullData();
  }
  const Binding* key = keyNamed(p->path, name);
  if (!key) {
    setStatus(rc, CMPI_RC_ERR_NOT_FOUND);
    return nullData(CMPI_null, CMPI_notFound);
  }
  return dataOut(p->core, key->value, CMPI_keyValue);
}

CMPIData getKeyAt(const CMPIObjectPath* op, CMPICount index, CMPIString** name, CMPIStatus* rc) {
  PathObject* p = checked(op, rc);
  if (!p) return nullData();
  if (index >= p->path.keys.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(CMPI_null, CMPI_notFound);
  }
  const Binding& key = p->path.keys[index];
  if (name) *name = newStringObject(p->core, key.name.c_str());
  return dataOut(p->core, key.value, CMPI_keyValue);
}

CMPICount getKeyCount(const CMPIObjectPath* op, CMPIStatus* rc) {
  PathObject* p = checked(op, rc);
  return p ? static_cast<CMPICount>(p->path.keys.size()) : 0;
}

CMPIStatus setNameSpaceFromObjectPath(CMPIObjectPath* op, const CMPIObjectPath* src) {
  PathObject* p = pathOf(op);
  PathObject* s = pathOf(src);
  if (!p || !s) return status(CMPI_RC_ERR_INVALID_HANDLE);
  p->path.nameSpace = s->path.nameSpace;
  return status(CMPI_RC_OK);
}

CMPIStatus setHostAndNameSpaceFromObjectPath(CMPIObjectPath* op, const CMPIObjectPath* src) {
  PathObject* p = pathOf(op);
  PathObject* s = pathOf(src);
  if (!p || !s) return status(CMPI_RC_ERR_INVALID_HANDLE);
  p->path.nameSpace = s->path.nameSpace;
  p->path.host = s->path.host;
  return status(CMPI_RC_OK);
}

// The embedded object manager keeps no class definitions, so it has no
// qualifiers to give.
CMPIData noQualifier(const CMPIObjectPath* op, CMPIStatus* rc) {
  if (checked(op, rc)) setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullData();
}
CMPIData getClassQualifier(const CMPIObjectPath* op, const char*, CMPIStatus* rc) {
  return noQualifier(op, rc);
}
CMPIData getPropertyQualifier(const CMPIObjectPath* op, const char*, const char*, CMPIStatus* rc) {
  return noQualifier(op, rc);
}
CMPIData getMethodQualifier(const CMPIObjectPath* op, const char*, const char*, CMPIStatus* rc) {
  return noQualifier(op, rc);
}
CMPIData getParameterQualifier(const CMPIObjectPath* op, const char*, const char*, const char*,
                               CMPIStatus* rc) {
  return noQualifier(op, rc);
}

CMPIString* toString(const CMPIObjectPath* op, CMPIStatus* rc) {
  PathObject* p = checked(op, rc);
  if (!p) return nullptr;
  return newStringObject(p->core, formatObjectPath(p->path, PathFormat{true, true}).c_str());
}

} // namespace

CMPIObjectPathFT objectPathFT = {
    CMPICurrentVersion,
    release,
    clone,
    setNameSpace,
    getNameSpace,
    setHostname,
    getHostname,
    setClassName,
    getClassName,
    addKey,
    getKey,
    getKeyAt,
    getKeyCount,
    setNameSpaceFromObjectPath,
    setHostAndNameSpaceFromObjectPath,
    getClassQualifier,
    getPropertyQualifier,
    getMethodQualifier,
    getParameterQualifier,
    toString,
};

} // namespace tvr::broker::detail
