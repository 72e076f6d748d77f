// The broker's factories and helpers (eft): new encapsulated objects, type
// information, messages and the trace function providers report through.
#include "cmpi/Convert.h"
#include "cmpi/Objects.h"
#include "core/ObjectManagerCore.h"
#include "tvr/broker/PathText.h"
#include "tvr/broker/Response.h"

#include <strings.h>
#include <sys/time.h>

#include <cstdarg>
#include <cstdio>
#include <cstring>

namespace tvr::broker::detail {

namespace {

// The kind of an encapsulated object, told by its function table. Every
// encapsulated struct starts with `hdl` and `ft`. A hollow object (null
// `hdl`) is none, except a string, whose null `hdl` is a null text.
const char* kindOf(const void* object) {
  if (!object) return nullptr;
  const void* hdl = static_cast<const void* const*>(object)[0];
  const void* ft = static_cast<const void* const*>(object)[1];
  if (ft == &stringFT) return "CMPIString";
  if (!hdl) return nullptr;
  if (ft == &objectPathFT) return "CMPIObjectPath";
  if (ft == &instanceFT) return "CMPIInstance";
  if (ft == &arrayFT) return "CMPIArray";
  if (ft == &enumerationFT) return "CMPIEnumeration";
  if (ft == &dateTimeFT) return "CMPIDateTime";
  if (ft == &argsFT) return "CMPIArgs";
  if (ft == &contextFT) return "CMPIContext";
  if (ft == &resultFT) return "CMPIResult";
  if (ft == &brokerFT) return "CMPIBroker";
  return nullptr;
}

// Answers a failed factory call as the fault injector asks: null, or an
// object with a null handle.
bool injectedFailure(ObjectManagerCore* core, Fault fault, CMPIStatus* rc, FailureShape* shape) {
  if (!core->faults().shouldFail(fault, shape)) return false;
  setStatus(rc, CMPI_RC_ERR_FAILED);
  return true;
}

CMPIInstance* newInstance(const CMPIBroker* mb, const CMPIObjectPath* op, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  FailureShape shape;
  if (injectedFailure(core, Fault::NewInstance, rc, &shape))
    return shape == FailureShape::Hollow ? &arenaFor(core).make<InstanceObject>(core, Instance{}, true)->shell.cmpi
                                         : nullptr;
  const ObjectPath* path = pathIn(op);
  if (!path) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  // A new instance starts with the keys of its path as properties, so the
  // keys come first in property order, as object managers lay instances out.
  Instance instance;
  instance.path = *path;
  instance.properties = path->keys;
  setStatus(rc, CMPI_RC_OK);
  return newInstanceObject(core, std::move(instance));
}

CMPIObjectPath* newObjectPath(const CMPIBroker* mb, const char* ns, const char* cn, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  FailureShape shape;
  if (injectedFailure(core, Fault::NewObjectPath, rc, &shape))
    return shape == FailureShape::Hollow ? &arenaFor(core).make<PathObject>(core, ObjectPath{}, true)->shell.cmpi
                                         : nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newPathObject(core, ObjectPath(ns ? ns : "", cn ? cn : ""));
}

CMPIArgs* newArgs(const CMPIBroker* mb, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newArgsObject(core);
}

CMPIString* newString(const CMPIBroker* mb, const char* data, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newStringObject(core, data);
}

CMPIArray* newArray(const CMPIBroker* mb, CMPICount max, CMPIType type, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  FailureShape shape;
  if (injectedFailure(core, Fault::NewArray, rc, &shape))
    return shape == FailureShape::Hollow
               ? &arenaFor(core).make<ArrayObject>(core, type, std::vector<Value>{}, true)->shell.cmpi
               : nullptr;
  // Text arrays hold strings, whichever of the two text types was asked for.
  CMPIType element = static_cast<CMPIType>(type & ~CMPI_ARRAY);
  if (element == CMPI_chars) element = CMPI_string;
  constexpr CMPICount kLargestArray = 1u << 24;
  if (max > kLargestArray) return setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newArrayObject(core, element, std::vector<Value>(max, Value::nullOf(element)));
}

CMPIDateTime* newDateTime(const CMPIBroker* mb, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  timeval now{};
  gettimeofday(&now, nullptr);
  setStatus(rc, CMPI_RC_OK);
  return newDateTimeObject(core, static_cast<CMPIUint64>(now.tv_sec) * 1000000ULL + static_cast<CMPIUint64>(now.tv_usec),
                           false);
}

CMPIDateTime* newDateTimeFromBinary(const CMPIBroker* mb, CMPIUint64 binTime, CMPIBoolean interval,
                                    CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newDateTimeObject(core, binTime, interval != 0);
}

CMPIDateTime* newDateTimeFromChars(const CMPIBroker* mb, const char* utcTime, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  CMPIUint64 us = 0;
  bool interval = false;
  if (!parseDateTimeText(utcTime, &us, &interval)) return setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newDateTimeObject(core, us, interval);
}

CMPISelectExp* newSelectExp(const CMPIBroker*, const char*, const char*, CMPIArray**, CMPIStatus* st) {
  setStatus(st, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullptr;
}

// No class hierarchy is known here: a path is of a class only by name.
CMPIBoolean classPathIsA(const CMPIBroker* mb, const CMPIObjectPath* op, const char* type, CMPIStatus* rc) {
  const ObjectPath* path = pathIn(op);
  if (!coreOf(mb) || !path) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), 0;
  if (!type) return setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER), 0;
  setStatus(rc, CMPI_RC_OK);
  return strcasecmp(path->className.c_str(), type) == 0;
}

CMPIString* toString(const CMPIBroker* mb, const void* object, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  const char* kind = kindOf(object);
  if (!core || !kind) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  std::string text;
  if (const ObjectPath* path = pathIn(static_cast<const CMPIObjectPath*>(object))) {
    text = formatObjectPath(*path, PathFormat{true, true});
  } else if (InstanceObject* i = instanceOf(static_cast<const CMPIInstance*>(object))) {
    text = "instance of " + formatObjectPath(core->pathOfInstance(i->instance)) + " {";
    for (const Binding& b : i->instance.properties) text += " " + b.name + "=" + formatValue(b.value) + ";";
    text += " }";
  } else if (StringObject* s = stringOf(static_cast<const CMPIString*>(object))) {
    text = s->text;
  } else {
    text = kind;
  }
  setStatus(rc, CMPI_RC_OK);
  return newStringObject(core, text.c_str());
}

CMPIBoolean isOfType(const CMPIBroker* mb, const void* object, const char* type, CMPIStatus* rc) {
  const char* kind = kindOf(object);
  if (!coreOf(mb) || !kind) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), 0;
  if (!type) return setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER), 0;
  setStatus(rc, CMPI_RC_OK);
  return strcmp(kind, type) == 0;
}

CMPIString* getType(const CMPIBroker* mb, const void* object, CMPIStatus* rc) {
  ObjectManagerCore* core = coreOf(mb);
  const char* kind = kindOf(object);
  if (!core || !kind) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  setStatus(rc, CMPI_RC_OK);
  return newStringObject(core, kind);
}

// Fills "$0" ... "$9" in a message with the (type, value) pairs that follow
// the count, as the message functions pass them.
std::string substitute(const char* message, CMPICount count, va_list args) {
  std::vector<std::string> values;
  for (CMPICount i = 0; i < count && i < 10; ++i) {
    const int type = va_arg(args, int);
    switch (type) {
    case CMPI_sint32: values.push_back(std::to_string(va_arg(args, int))); break;
    case CMPI_uint32: values.push_back(std::to_string(va_arg(args, unsigned int))); break;
    case CMPI_sint64: values.push_back(std::to_string(va_arg(args, long long))); break;
    case CMPI_uint64: values.push_back(std::to_string(va_arg(args, unsigned long long))); break;
    case CMPI_real64: values.push_back(std::to_string(va_arg(args, double))); break;
    case CMPI_boolean: values.push_back(va_arg(args, int) ? "true" : "false"); break;
    case CMPI_chars: {
      const char* s = va_arg(args, const char*);
      values.push_back(s ? s : "");
      break;
    }
    case CMPI_string: {
      StringObject* s = stringOf(va_arg(args, const CMPIString*));
      values.push_back(s ? s->text : "");
      break;
    }
    default: i = count; break; // an unknown type: the rest cannot be read safely
    }
  }
  std::string out;
  for (const char* p = message ? message : ""; *p; ++p) {
    if (p[0] == '$' && p[1] >= '0' && p[1] <= '9') {
      const std::size_t index = static_cast<std::size_t>(p[1] - '0');
      out += index < values.size() ? values[index] : std::string();
      ++p;
    } else {
      out += *p;
    }
  }
  return out;
}

// No message catalogues here: the default message is the message.
CMPIString* getMessage(const CMPIBroker* mb, const char*, const char* defMsg, CMPIStatus* rc, CMPICount count,
                       ...) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  va_list args;
  va_start(args, count);
  const std::string text = substitute(defMsg, count, args);
  va_end(args);
  setStatus(rc, CMPI_RC_OK);
  return newStringObject(core, text.c_str());
}

void record(const CMPIBroker* mb, TraceLine::Source source, int level, const char* component, const char* text,
            const CMPIString* string) {
  RequestFrame* frame = currentFrame();
  if (!frame || !frame->traces) return;
  TraceLine line;
  line.source = source;
  line.level = level;
  if (component) line.component = component;
  if (text) line.text = text;
  if (StringObject* s = stringOf(string); s && !s->null) line.string = s->text;
  line.broker = mb;
  frame->traces->add(std::move(line));
}

CMPIStatus logMessage(const CMPIBroker* mb, int severity, const char* id, const char* text,
                      const CMPIString* string) {
  if (!coreOf(mb)) return status(CMPI_RC_ERR_INVALID_HANDLE);
  record(mb, TraceLine::Source::LogMessage, severity, id, text, string);
  return status(CMPI_RC_OK);
}

CMPIStatus trace(const CMPIBroker* mb, int level, const char* component, const char* text,
                 const CMPIString* string) {
  if (!coreOf(mb)) return status(CMPI_RC_ERR_INVALID_HANDLE);
  record(mb, TraceLine::Source::Trace, level, component, text, string);
  return status(CMPI_RC_OK);
}

CMPIError* newCMPIError(const CMPIBroker*, const char*, const char*, const char*, const CMPIErrorSeverity,
                        const CMPIErrorProbableCause, const CMPIrc, CMPIStatus* rc) {
  setStatus(rc, CMPI_RC_ERR_NOT_SUPPORTED);
  return nullptr;
}

// Message files: there are none, so every handle is the same placeholder
// and every message is its default text.
CMPIStatus openMessageFile(const CMPIBroker* mb, const char*, CMPIMsgFileHandle* handle) {
  if (!coreOf(mb)) return status(CMPI_RC_ERR_INVALID_HANDLE);
  if (!handle) return status(CMPI_RC_ERR_INVALID_PARAMETER);
  *handle = nullptr;
  return status(CMPI_RC_OK);
}

CMPIStatus closeMessageFile(const CMPIBroker* mb, const CMPIMsgFileHandle) {
  return status(coreOf(mb) ? CMPI_RC_OK : CMPI_RC_ERR_INVALID_HANDLE);
}

CMPIString* getMessage2(const CMPIBroker* mb, const char*, const CMPIMsgFileHandle, const char* defMsg,
                        CMPIStatus* rc, CMPICount count, ...) {
  ObjectManagerCore* core = coreOf(mb);
  if (!core) return setStatus(rc, CMPI_RC_ERR_INVALID_HANDLE), nullptr;
  va_list args;
  va_start(args, count);
  const std::string text = substitute(defMsg, count, args);
  va_end(args);
  setStatus(rc, CMPI_RC_OK);
  return newStringObject(core, text.c_str());
}

} // namespace

CMPIBrokerEncFT brokerEncFT = {
    CMPICurrentVersion, newInstance,  newObjectPath, newArgs,          newString,       newArray,
    newDateTime,        newDateTimeFromBinary, newDateTimeFromChars, newSelectExp,    classPathIsA,
    toString,           isOfType,     getType,       getMessage,       logMessage,      trace,
    newCMPIError,       openMessageFile, closeMessageFile, getMessage2,
};

} // namespace tvr::broker::detail
