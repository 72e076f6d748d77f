// Behaviours that answer with fixed content, so tests can compare every
// element the broker recorded with what was handed over here.
#include "Behaviours.h"

#include <stdexcept>

namespace tvrtest {

namespace {

/// Thrown by answerByThrowing: not derived from std::exception.
struct ProviderFault {
  int code;
};

const char* kAllTypesKeys[] = {"CreationClassName", "Name", nullptr};

CMPIObjectPath* allTypesPath(const Request& request, const std::string& name) {
  CMPIObjectPath* path = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), "TVR_AllTypes", nullptr);
  CMAddKey(path, "CreationClassName", "TVR_AllTypes", CMPI_chars);
  CMAddKey(path, "Name", name.c_str(), CMPI_chars);
  return path;
}

// The properties are set in the order the tests expect to read them back;
// "Replaced" is set twice, the second time under another spelling.
CMPIInstance* allTypesInstance(const Request& request, const std::string& name) {
  const CMPIBroker* b = request.broker;
  CMPIInstance* inst = CMNewInstance(b, allTypesPath(request, name), nullptr);
  if (request.properties) CMSetPropertyFilter(inst, request.properties, kAllTypesKeys);

  CMSetProperty(inst, "Chars", "plain text", CMPI_chars);
  CMPIUint8 first = 1;
  CMSetProperty(inst, "Replaced", &first, CMPI_uint8);
  CMPIString* string = CMNewString(b, "quoted \"text\" and \\ backslash", nullptr);
  CMSetProperty(inst, "String", &string, CMPI_string);
  CMPIBoolean yes = 1;
  CMPIBoolean no = 0;
  CMSetProperty(inst, "BooleanTrue", &yes, CMPI_boolean);
  CMSetProperty(inst, "BooleanFalse", &no, CMPI_boolean);
  CMPIUint8 u8 = 200;
  CMPIUint16 u16 = 65000;
  CMPIUint32 u32 = 4000000000u;
  CMPIUint64 u64 = 18000000000000000000ull;
  CMPISint8 s8 = -100;
  CMPISint16 s16 = -32000;
  CMPISint32 s32 = -2000000000;
  CMPISint64 s64 = -9000000000000000000ll;
  CMPIReal32 r32 = 1.5f;
  CMPIReal64 r64 = -2.25;
  CMPIChar16 c16 = 'Z';
  CMSetProperty(inst, "Uint8", &u8, CMPI_uint8);
  CMSetProperty(inst, "Uint16", &u16, CMPI_uint16);
  CMSetProperty(inst, "Uint32", &u32, CMPI_uint32);
  CMSetProperty(inst, "Uint64", &u64, CMPI_uint64);
  CMSetProperty(inst, "Sint8", &s8, CMPI_sint8);
  CMSetProperty(inst, "Sint16", &s16, CMPI_sint16);
  CMSetProperty(inst, "Sint32", &s32, CMPI_sint32);
  CMSetProperty(inst, "Sint64", &s64, CMPI_sint64);
  CMSetProperty(inst, "Real32", &r32, CMPI_real32);
  CMSetProperty(inst, "Real64", &r64, CMPI_real64);
  CMSetProperty(inst, "Char16", &c16, CMPI_char16);
  CMPIDateTime* when = CMNewDateTimeFromChars(b, "20240229123456.789012+000", nullptr);
  CMSetProperty(inst, "DateTime", &when, CMPI_dateTime);
  CMPIObjectPath* other = CMNewObjectPath(b, nameSpaceOf(request.path).c_str(), "TVR_Other", nullptr);
  CMAddKey(other, "Id", "7", CMPI_chars);
  CMSetProperty(inst, "Ref", &other, CMPI_ref);

  CMPIArray* strings = CMNewArray(b, 3, CMPI_string, nullptr);
  CMPIString* alpha = CMNewString(b, "alpha", nullptr);
  CMSetArrayElementAt(strings, 0, &alpha, CMPI_string);
  CMSetArrayElementAt(strings, 1, "beta", CMPI_chars); // text into a string array
  CMSetProperty(inst, "Strings", &strings, CMPI_stringA);
  CMPIArray* numbers = CMNewArray(b, 3, CMPI_uint16, nullptr);
  for (CMPICount i = 0; i < 3; ++i) {
    CMPIUint16 n = static_cast<CMPIUint16>(i == 2 ? 65535 : i + 1);
    CMSetArrayElementAt(numbers, i, &n, CMPI_uint16);
  }
  CMSetProperty(inst, "Uint16s", &numbers, CMPI_uint16A);

  CMSetProperty(inst, "NullString", nullptr, CMPI_string);
  CMPIUint8 second = 2;
  CMSetProperty(inst, "REPLACED", &second, CMPI_uint8);
  return inst;
}

CMPIObjectPath* sequencePath(const Request& request, const char* id) {
  CMPIObjectPath* path = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), "TVR_Sequence", nullptr);
  CMAddKey(path, "Id", id, CMPI_chars);
  return path;
}

CMPIInstance* sequenceInstance(const Request& request, const char* id) {
  return CMNewInstance(request.broker, sequencePath(request, id), nullptr);
}

} // namespace

CMPIStatus answerAllTypes(const Request& request) {
  if (request.operation == Operation::GetInstance) {
    CMReturnInstance(request.result, allTypesInstance(request, keyText(request.path, "Name")));
  } else {
    for (const char* name : {"one", "two"}) {
      if (request.operation == Operation::EnumerateInstanceNames)
        CMReturnObjectPath(request.result, allTypesPath(request, name));
      else
        CMReturnInstance(request.result, allTypesInstance(request, name));
    }
  }
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerSequence(const Request& request) {
  const CMPIResult* r = request.result;
  CMReturnObjectPath(r, sequencePath(request, "a"));
  CMReturnInstance(r, sequenceInstance(request, "b"));
  CMReturnData(r, "between", CMPI_chars);
  CMReturnInstance(r, nullptr);
  CMReturnObjectPath(r, nullptr);
  CMReturnInstance(r, sequenceInstance(request, "c"));
  CMReturnDone(r);
  return ok();
}

CMPIStatus answerNullInstance(const Request& request) {
  CMReturnInstance(request.result, nullptr);
  return ok();
}

CMPIStatus answerDoneTwice(const Request& request) {
  CMReturnObjectPath(request.result, sequencePath(request, "only"));
  CMReturnDone(request.result);
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerError(const Request& request) {
  return failure(request.broker, CMPI_RC_ERR_NOT_FOUND, "no such widget");
}

CMPIStatus answerByThrowing(const Request& request) {
  CMReturnObjectPath(request.result, sequencePath(request, "before the throw"));
  if (request.operation == Operation::EnumerateInstanceNames) throw ProviderFault{42};
  throw std::out_of_range("widget index 7 is out of range");
}

CMPIStatus answerKeyless(const Request& request) {
  CMPIObjectPath* path = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), "TVR_Keyless", nullptr);
  CMPIInstance* inst = CMNewInstance(request.broker, path, nullptr);
  CMSetProperty(inst, "Label", "no keys in my path", CMPI_chars);
  CMSetProperty(inst, "Id", "k1", CMPI_chars);
  CMReturnInstance(request.result, inst);
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerEcho(const Request& request) {
  const std::string id =
      request.operation == Operation::GetInstance ? keyText(request.path, "Id") : std::string("enumerated");
  CMTraceMessage(request.broker, 1, "echo", ("echo " + id).c_str(), nullptr);
  CMPIObjectPath* path = CMNewObjectPath(request.broker, nameSpaceOf(request.path).c_str(), "TVR_Echo", nullptr);
  CMAddKey(path, "Id", id.c_str(), CMPI_chars);
  CMPIInstance* inst = CMNewInstance(request.broker, path, nullptr);
  CMPIUint64 thread = currentThreadNumber();
  CMSetProperty(inst, "Thread", &thread, CMPI_uint64);
  CMReturnInstance(request.result, inst);
  CMReturnDone(request.result);
  return ok();
}

CMPIStatus answerWithTraces(const Request& request) {
  const CMPIBroker* b = request.broker;
  CMTraceMessage(b, 4, "TestComponent", "full trace", nullptr);
  CMTraceMessage(b, 2, nullptr, nullptr, nullptr);
  CMTraceMessage(b, 3, "WithString", "text", CMNewString(b, "attached", nullptr));
  CMLogMessage(b, 1, "TVR0001", "logged message", nullptr);
  CMReturnDone(request.result);
  return ok();
}

namespace {

std::string contextValueText(const CMPIData& data) {
  if (CMIsNullValue(data)) return "NULL";
  if (data.type == CMPI_string) return textOf(data.value.string);
  if (data.type == CMPI_uint32) return std::to_string(data.value.uint32);
  return "type " + std::to_string(data.type);
}

} // namespace

CMPIStatus answerWithContext(const Request& request) {
  const CMPIContext* ctx = request.context;
  const CMPICount entries = CMGetContextEntryCount(ctx, nullptr);
  for (CMPICount i = 0; i < entries; ++i) {
    CMPIString* name = nullptr;
    const CMPIData data = CMGetContextEntryAt(ctx, i, &name, nullptr);
    returnText(request.result, "entry " + textOf(name) + "=" + contextValueText(data));
  }
  CMAddContextEntry(ctx, "TvrTestEntry", "added", CMPI_chars);
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  const CMPIData added = CMGetContextEntry(ctx, "tvrtestentry", &rc);
  returnText(request.result, "added " + contextValueText(added) + " " + std::to_string(rc.rc));
  CMGetContextEntry(ctx, "NoSuchEntry", &rc);
  returnStatus(request.result, "missing", rc.rc);
  CMReturnDone(request.result);
  return ok();
}

} // namespace tvrtest
