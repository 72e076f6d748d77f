// CMPIArray: a fixed number of elements of one simple type, null until set.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

namespace tvr::broker::detail {

ArrayObject::ArrayObject(ObjectManagerCore* c, CMPIType type, std::vector<Value> e, bool hollow)
    : elementType(type), elements(std::move(e)), core(c) {
  shell.cmpi.hdl = hollow ? nullptr : this;
  shell.cmpi.ft = &arrayFT;
  shell.owner = this;
}

CMPIArray* newArrayObject(ObjectManagerCore* core, CMPIType elementType, std::vector<Value> elements) {
  return &arenaFor(core).make<ArrayObject>(core, elementType, std::move(elements))->shell.cmpi;
}

namespace {

ArrayObject* checked(const CMPIArray* a, CMPIStatus* rc) {
  ArrayObject* array = arrayOf(a);
  setStatus(rc, array ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return array;
}

CMPIStatus release(CMPIArray* a) {
  ArrayObject* array = arrayOf(a);
  if (!array) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(array);
  return status(CMPI_RC_OK);
}

CMPIArray* clone(const CMPIArray* a, CMPIStatus* rc) {
  ArrayObject* array = checked(a, rc);
  return array ? newArrayObject(array->core, array->elementType, array->elements) : nullptr;
}

CMPICount getSize(const CMPIArray* a, CMPIStatus* rc) {
  ArrayObject* array = checked(a, rc);
  return array ? static_cast<CMPICount>(array->elements.size()) : 0;
}

CMPIType getSimpleType(const CMPIArray* a, CMPIStatus* rc) {
  ArrayObject* array = checked(a, rc);
  return array ? array->elementType : CMPI_null;
}

CMPIData getElementAt(const CMPIArray* a, CMPICount index, CMPIStatus* rc) {
  ArrayObject* array = checked(a, rc);
  if (!array) return nullData();
  if (index >= array->elements.size()) {
    setStatus(rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
    return nullData(array->elementType, CMPI_badValue);
  }
  return dataOut(array->core, array->elements[index]);
}

// Text handed in as chars goes into a string array as a string; any other
// mismatch between the element's type and the array's is refused.
CMPIStatus setElementAt(CMPIArray* a, CMPICount index, const CMPIValue* value, CMPIType type) {
  ArrayObject* array = arrayOf(a);
  if (!array) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (index >= array->elements.size()) return status(CMPI_RC_ERR_NO_SUCH_PROPERTY);
  const bool textIntoString = array->elementType == CMPI_string && type == CMPI_chars;
  if (type != array->elementType && !textIntoString) return status(CMPI_RC_ERR_TYPE_MISMATCH);
  CMPIrc rc = CMPI_RC_OK;
  Value v = copyIn(value, type, &rc);
  if (rc != CMPI_RC_OK) return status(rc);
  v.type = array->elementType;
  array->elements[index] = std::move(v);
  return status(CMPI_RC_OK);
}

} // namespace

CMPIArrayFT arrayFT = {CMPICurrentVersion, release, clone, getSize, getSimpleType, getElementAt, setElementAt};

} // namespace tvr::broker::detail
