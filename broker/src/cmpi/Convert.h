// Conversions between what providers pass through CMPI (CMPIValue with a
// type code, encapsulated objects) and the object manager's own copies.
#pragma once

#include "tvr/broker/Value.h"

#include <cmpift.h>

namespace tvr::broker::detail {

class ObjectManagerCore;

/// Copies a value a provider handed in. `value` may be null, which gives a
/// null value of that type. For CMPI_chars `value` points at the text itself,
/// as CMPI callers pass it. Objects that are not ours, or hollow, make
/// `*rc` CMPI_RC_ERR_INVALID_HANDLE (when rc is given) and give a null value.
Value copyIn(const CMPIValue* value, CMPIType type, CMPIrc* rc = nullptr);

/// Copies an object path a provider handed in (null if not ours or hollow).
const ObjectPath* pathIn(const CMPIObjectPath* path);

/// Makes the CMPIData a provider reads for a stored value. Text values come
/// back as CMPI_string, references, arrays, instances and date-times as new
/// encapsulated objects in the current arena. `state` is OR-ed in (e.g.
/// CMPI_keyValue for keys).
CMPIData dataOut(ObjectManagerCore* core, const Value& value, CMPIValueState state = CMPI_goodValue);

/// Text of a date-time value in the CIM form (25 characters).
std::string dateTimeText(CMPIUint64 microseconds, bool interval);

/// Reads the CIM text form of a date-time. False if malformed.
bool parseDateTimeText(const char* text, CMPIUint64* microseconds, bool* interval);

} // namespace tvr::broker::detail
