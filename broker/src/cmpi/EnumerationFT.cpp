// CMPIEnumeration: the answer of an up-call, walked once with getNext.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

namespace tvr::broker::detail {

EnumerationObject::EnumerationObject(ObjectManagerCore* c, std::vector<Value> i, bool hollow)
    : items(std::move(i)), core(c) {
  shell.cmpi.hdl = hollow ? nullptr : this;
  shell.cmpi.ft = &enumerationFT;
  shell.owner = this;
}

CMPIEnumeration* newEnumerationObject(ObjectManagerCore* core, std::vector<Value> items) {
  return &arenaFor(core).make<EnumerationObject>(core, std::move(items))->shell.cmpi;
}

namespace {

EnumerationObject* checked(const CMPIEnumeration* e, CMPIStatus* rc) {
  EnumerationObject* en = enumerationOf(e);
  setStatus(rc, en ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return en;
}

CMPIStatus release(CMPIEnumeration* e) {
  EnumerationObject* en = enumerationOf(e);
  if (!en) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(en);
  return status(CMPI_RC_OK);
}

CMPIEnumeration* clone(const CMPIEnumeration* e, CMPIStatus* rc) {
  EnumerationObject* en = checked(e, rc);
  if (!en) return nullptr;
  auto* copy = arenaFor(en->core).make<EnumerationObject>(en->core, en->items);
  copy->next = en->next;
  return &copy->shell.cmpi;
}

CMPIData getNext(const CMPIEnumeration* e, CMPIStatus* rc) {
  EnumerationObject* en = checked(e, rc);
  if (!en) return nullData();
  if (en->next >= en->items.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData();
  }
  return dataOut(en->core, en->items[en->next++]);
}

CMPIBoolean hasNext(const CMPIEnumeration* e, CMPIStatus* rc) {
  EnumerationObject* en = checked(e, rc);
  return en && en->next < en->items.size();
}

CMPIArray* toArray(const CMPIEnumeration* e, CMPIStatus* rc) {
  EnumerationObject* en = checked(e, rc);
  if (!en) return nullptr;
  const CMPIType type = en->items.empty() ? CMPI_ref : en->items.front().type;
  return newArrayObject(en->core, type, en->items);
}

} // namespace

CMPIEnumerationFT enumerationFT = {CMPICurrentVersion, release, clone, getNext, hasNext, toArray};

} // namespace tvr::broker::detail
