//===- BaselineProvider.cpp - The broker's share of a request -------------===//
//
// An instance provider that reads no hardware and writes no trace: for each
// instance of the answer it was handed it makes the object path, sets its
// host and keys, makes the instance and sets its properties in order, all
// through the broker with the CMPI types the real provider used, and returns
// it. Timing it beside a real provider on the same answer splits a request
// into the object manager's share and the provider's own.
//
//===----------------------------------------------------------------------===//

#include "BaselineAnswer.h"

#include <cmpift.h>
#include <cmpimacs.h>

#include <functional>
#include <string>
#include <vector>

namespace {

using tvr::broker::Binding;
using tvr::broker::Instance;
using tvr::broker::ObjectPath;
using tvr::broker::Value;

const CMPIBroker *broker = nullptr;
const std::vector<Instance> *answer = nullptr;

std::string nameSpaceOf(const CMPIObjectPath *ref) {
  CMPIString *text = CMGetNameSpace(ref, nullptr);
  const char *chars = text ? CMGetCharsPtr(text, nullptr) : nullptr;
  return chars ? chars : "";
}

CMPIObjectPath *makePath(const ObjectPath &path, const std::string &nameSpace);

/// Receives a value in the form CMPI functions take it.
using ValueSetter = std::function<CMPIrc(const CMPIValue *, CMPIType)>;

/// Hands \p value to \p set as CMPI callers do: text of CMPI_chars as the
/// pointer itself, numbers through a pointer to the value, strings, arrays
/// and references as broker objects made for the call.
CMPIrc withCmpiValue(const Value &value, const std::string &nameSpace, const ValueSetter &set) {
  const CMPIType type = value.type;
  if (value.null)
    return set(nullptr, type);
  if (type & CMPI_ARRAY) {
    const CMPIType element = static_cast<CMPIType>(type & ~CMPI_ARRAY);
    CMPIArray *array = CMNewArray(broker, static_cast<CMPICount>(value.elements.size()), element, nullptr);
    for (std::size_t i = 0; i < value.elements.size(); ++i)
      withCmpiValue(value.elements[i], nameSpace, [&](const CMPIValue *v, CMPIType t) {
        return CMSetArrayElementAt(array, static_cast<CMPICount>(i), v, t).rc;
      });
    CMPIValue held;
    held.array = array;
    return set(&held, type);
  }
  switch (type) {
  case CMPI_chars:
  case CMPI_dateTime:
    return set(reinterpret_cast<const CMPIValue *>(value.text.c_str()), CMPI_chars);
  case CMPI_string: {
    CMPIValue held;
    held.string = CMNewString(broker, value.text.c_str(), nullptr);
    return set(&held, type);
  }
  case CMPI_ref: {
    CMPIValue held;
    held.ref = value.ref ? makePath(*value.ref, nameSpace) : nullptr;
    return set(&held, type);
  }
  default:
    return set(&value.scalar, type);
  }
}

CMPIObjectPath *makePath(const ObjectPath &path, const std::string &nameSpace) {
  CMPIObjectPath *made = CMNewObjectPath(
      broker, path.nameSpace.empty() ? nameSpace.c_str() : path.nameSpace.c_str(), path.className.c_str(), nullptr);
  if (!made)
    return nullptr;
  if (!path.host.empty())
    CMSetHostname(made, path.host.c_str());
  for (const Binding &key : path.keys)
    withCmpiValue(key.value, nameSpace,
                  [&](const CMPIValue *v, CMPIType t) { return CMAddKey(made, key.name.c_str(), v, t).rc; });
  return made;
}

CMPIInstance *makeInstance(const Instance &instance, const std::string &nameSpace) {
  CMPIObjectPath *path = makePath(instance.path, nameSpace);
  CMPIInstance *made = path ? CMNewInstance(broker, path, nullptr) : nullptr;
  if (!made)
    return nullptr;
  for (const Binding &property : instance.properties)
    withCmpiValue(property.value, nameSpace, [&](const CMPIValue *v, CMPIType t) {
      return CMSetProperty(made, property.name.c_str(), v, t).rc;
    });
  return made;
}

} // namespace

extern "C" __attribute__((visibility("default"))) void
tvrBenchSetBaselineAnswer(const std::vector<Instance> *instances) {
  answer = instances;
}

static CMPIStatus Baseline_Cleanup(CMPIInstanceMI *, const CMPIContext *, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

static CMPIStatus Baseline_EnumInstanceNames(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *result,
                                             const CMPIObjectPath *ref) {
  const std::string nameSpace = nameSpaceOf(ref);
  if (answer)
    for (const Instance &instance : *answer)
      CMReturnObjectPath(result, makePath(instance.path, nameSpace));
  CMReturnDone(result);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus Baseline_EnumInstances(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *result,
                                         const CMPIObjectPath *ref, const char **) {
  const std::string nameSpace = nameSpaceOf(ref);
  if (answer)
    for (const Instance &instance : *answer)
      CMReturnInstance(result, makeInstance(instance, nameSpace));
  CMReturnDone(result);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus Baseline_GetInstance(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *,
                                       const CMPIObjectPath *, const char **) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus Baseline_CreateInstance(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *,
                                          const CMPIObjectPath *, const CMPIInstance *) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus Baseline_ModifyInstance(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *,
                                          const CMPIObjectPath *, const CMPIInstance *, const char **) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus Baseline_DeleteInstance(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *,
                                          const CMPIObjectPath *) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus Baseline_ExecQuery(CMPIInstanceMI *, const CMPIContext *, const CMPIResult *,
                                     const CMPIObjectPath *, const char *, const char *) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(Baseline_, BaselineProvider, broker, CMNoHook)
