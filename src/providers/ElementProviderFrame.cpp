#include "ElementProviderFrame.h"

#include "BrokerCalls.h"

#include <strings.h>

namespace HX::PhysicalAssetProvider {

namespace {

// The request's class name: getClassName twice, the first string only
// reaching the function table of the second, whose text is read.
const char* classNameOf(const CMPIObjectPath* ref, CMPIStatus* classRc, CMPIStatus* textRc) {
  CMPIString* first = ref->ft->getClassName(ref, classRc);
  if (!first) return nullptr;
  return first->ft->getCharPtr(ref->ft->getClassName(ref, classRc), textRc);
}

bool sameClass(const char* requested, const char* served) {
  return requested && strcasecmp(requested, served) == 0;
}

} // namespace

CMPIStatus enumElementNames(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                            CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                            const CMPIObjectPath* ref) {
  auto params = [&](KVLog::KVMessageBuffer& p) -> const std::string& {
    return p.str(p << " mi=" << mi << " ctx=" << ctx << " result=" << result << " ref=" << ref);
  };
  traceEvent(frame.category, MsgEnter, at, params);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const char* className = classNameOf(ref, &status, nullptr);
  std::vector<CMPIObjectPath*> paths;
  if (sameClass(className, frame.className)) {
    if (frame.allPaths(broker, ctx, ref, paths, &status) != 0) {
      brokerTrace(broker, frame.component, "***Can't get Instances, Exiting EnumerateInstanceNames***");
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(paths.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnObjectPath(result, paths.at(index));
  }
  CMReturnDone(result);
  traceEvent(frame.category, MsgExit, at, params);
  return status;
}

CMPIStatus enumElementInstances(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                                CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                const CMPIObjectPath* ref, const char** properties, bool compareClass) {
  auto params = [&](KVLog::KVMessageBuffer& p) -> const std::string& {
    return p.str(p << " mi=" << mi << " ctx=" << ctx << " result=" << result << " ref=" << ref
                   << " properties=" << properties);
  };
  traceEvent(frame.category, MsgEnter, at, params);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const char* className = classNameOf(ref, nullptr, &status);
  std::vector<CMPIInstance*> instances;
  if (!compareClass || sameClass(className, frame.className)) {
    if (frame.allInstances(broker, ctx, ref, properties, instances, &status) != 0) {
      brokerTrace(broker, frame.component, "*** Could not get instances, exiting EnumerateInstance ***");
      return status;
    }
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(result, instances.at(index));
  }
  CMReturnDone(result);
  traceEvent(frame.category, MsgExit, at, params);
  return status;
}

CMPIStatus getElementInstance(const ElementFrame& frame, const CMPIBroker* broker, const TraceOrigin& at,
                              CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                              const CMPIObjectPath* cop, const char** properties) {
  auto params = [&](KVLog::KVMessageBuffer& p) -> const std::string& {
    return p.str(p << " mi=" << mi << " ctx=" << ctx << " result=" << result << " cop=" << cop
                   << " properties=" << properties);
  };
  traceEvent(frame.category, MsgEnter, at, params);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const char* className = classNameOf(cop, &status, nullptr);
  CMPIInstance* instance = nullptr;
  if (sameClass(className, frame.className)) {
    if (frame.oneInstance(broker, ctx, cop, properties, instance, &status) != 0) return status;
    CMReturnInstance(result, instance);
  }
  CMReturnDone(result);
  traceEvent(frame.category, MsgExit, at, params);
  return status;
}

} // namespace HX::PhysicalAssetProvider
