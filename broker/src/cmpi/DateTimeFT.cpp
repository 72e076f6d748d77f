// CMPIDateTime: a point in time (microseconds since the epoch, UTC) or an
// interval (microseconds).
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include "core/ObjectManagerCore.h"

namespace tvr::broker::detail {

DateTimeObject::DateTimeObject(ObjectManagerCore* c, CMPIUint64 us, bool isInterval)
    : microseconds(us), interval(isInterval), core(c) {
  shell.cmpi.hdl = this;
  shell.cmpi.ft = &dateTimeFT;
  shell.owner = this;
}

CMPIDateTime* newDateTimeObject(ObjectManagerCore* core, CMPIUint64 microseconds, bool interval) {
  return &arenaFor(core).make<DateTimeObject>(core, microseconds, interval)->shell.cmpi;
}

namespace {

DateTimeObject* checked(const CMPIDateTime* d, CMPIStatus* rc) {
  DateTimeObject* dt = dateTimeOf(d);
  setStatus(rc, dt ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
  return dt;
}

CMPIStatus release(CMPIDateTime* d) {
  DateTimeObject* dt = dateTimeOf(d);
  if (!dt) return status(CMPI_RC_ERR_INVALID_HANDLE);
  Arena::release(dt);
  return status(CMPI_RC_OK);
}

CMPIDateTime* clone(const CMPIDateTime* d, CMPIStatus* rc) {
  DateTimeObject* dt = checked(d, rc);
  return dt ? newDateTimeObject(dt->core, dt->microseconds, dt->interval) : nullptr;
}

CMPIUint64 getBinaryFormat(const CMPIDateTime* d, CMPIStatus* rc) {
  DateTimeObject* dt = checked(d, rc);
  return dt ? dt->microseconds : 0;
}

CMPIString* getStringFormat(const CMPIDateTime* d, CMPIStatus* rc) {
  DateTimeObject* dt = checked(d, rc);
  return dt ? newStringObject(dt->core, dateTimeText(dt->microseconds, dt->interval).c_str()) : nullptr;
}

CMPIBoolean isInterval(const CMPIDateTime* d, CMPIStatus* rc) {
  DateTimeObject* dt = checked(d, rc);
  return dt && dt->interval;
}

} // namespace

CMPIDateTimeFT dateTimeFT = {CMPICurrentVersion, release,         clone,
                             getBinaryFormat,    getStringFormat, isInterval};

} // namespace tvr::broker::detail
