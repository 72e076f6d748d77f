// CMPIString: a NUL-terminated text kept in `hdl`, as CMGetCharPtr expects.
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

namespace tvr::broker::detail {

StringObject::StringObject(ObjectManagerCore* c, std::string t, bool isNull)
    : text(std::move(t)), null(isNull), core(c) {
  shell.cmpi.hdl = null ? nullptr : const_cast<char*>(text.c_str());
  shell.cmpi.ft = &stringFT;
  shell.owner = this;
}

CMPIString* newStringObject(ObjectManagerCore* core, const char* text) {
  auto* s = arenaFor(core).make<StringObject>(core, text ? std::string(text) : std::string(), text == nullptr);
  return &s->shell.cmpi;
}

namespace {

CMPIStatus release(CMPIString* s) {
  StringObject* object = stringOf(s);
  if (!object) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(object);
  return status(CMPI_RC_OK);
}

CMPIString* clone(const CMPIString* s, CMPIStatus* rc) {
  StringObject* object = stringOf(s);
  if (!object) {
    setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE);
    return nullptr;
  }
  setStatus(rc, CMPI_RC_OK);
  auto* copy = arenaFor(object->core).make<StringObject>(object->core, object->text, object->null);
  return &copy->shell.cmpi;
}

const char* getCharPtr(const CMPIString* s, CMPIStatus* rc) {
  StringObject* object = stringOf(s);
  if (!object) {
    setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE);
    return nullptr;
  }
  setStatus(rc, CMPI_RC_OK);
  return object->null ? nullptr : object->text.c_str();
}

} // namespace

CMPIStringFT stringFT = {CMPICurrentVersion, release, clone, getCharPtr};

} // namespace tvr::broker::detail
