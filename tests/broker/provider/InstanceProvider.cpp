// TestInstanceProvider: serves every TVR_ test class by running the
// behaviour the class names.
#include "Behaviours.h"

#include <strings.h>

namespace tvrtest {
namespace {

const CMPIBroker* broker = nullptr;

struct ClassBehaviour {
  const char* className;
  Behaviour behaviour;
};

constexpr ClassBehaviour kBehaviours[] = {
    {"TVR_AllTypes", answerAllTypes},
    {"TVR_Sequence", answerSequence},
    {"TVR_NullInstance", answerNullInstance},
    {"TVR_DoneTwice", answerDoneTwice},
    {"TVR_Error", answerError},
    {"TVR_Throws", answerByThrowing},
    {"TVR_Keyless", answerKeyless},
    {"TVR_Echo", answerEcho},
    {"TVR_Traces", answerWithTraces},
    {"TVR_Context", answerWithContext},
    {"TVR_UpCaller", answerByUpCall},
    {"TVR_Recursive", answerByRecursiveUpCall},
    {"TVR_Threads", answerWithThreadServices},
    {"TVR_Memory", answerWithMemoryServices},
    {"TVR_Bulk", answerWithBulkObjects},
    {"TVR_Release", answerByReleasingObjects},
    {"TVR_HelperThread", answerWithHelperThreadObjects},
    {"TVR_Factories", answerWithFactoryResults},
    {"TVR_NullProbe", answerWithNullArgumentProbes},
    {"TVR_HollowProbe", answerWithHollowObjectProbes},
};

CMPIStatus dispatch(Operation operation, const CMPIContext* ctx, const CMPIResult* rslt, const CMPIObjectPath* cop,
                    const char** properties) {
  // With RequestOptions::nullBroker the entry point was last called with a
  // null broker: nothing can be made, but the result can still be used.
  if (!broker) {
    returnText(rslt, "no broker");
    CMReturn(CMPI_RC_ERR_FAILED);
  }
  const std::string className = classNameOf(cop);
  for (const ClassBehaviour& entry : kBehaviours) {
    if (strcasecmp(className.c_str(), entry.className) == 0)
      return entry.behaviour(Request{broker, ctx, rslt, cop, properties, operation});
  }
  return failure(broker, CMPI_RC_ERR_NOT_SUPPORTED, "TestInstanceProvider does not serve " + className);
}

} // namespace
} // namespace tvrtest

using tvrtest::Operation;

/// How often the object manager called the cleanup function, and with
/// which terminating flag last; read by the tests through the symbol table.
CMPI_EXTERN_C int tvrTestInstanceCleanups;
int tvrTestInstanceCleanups = 0;
CMPI_EXTERN_C int tvrTestLastTerminating;
int tvrTestLastTerminating = -1;

static CMPIStatus TestCleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean terminating) {
  ++tvrTestInstanceCleanups;
  tvrTestLastTerminating = terminating;
  tvrtest::forgetHelperThreadObjects();
  return tvrtest::ok();
}

static CMPIStatus TestEnumInstanceNames(CMPIInstanceMI*, const CMPIContext* ctx, const CMPIResult* rslt,
                                        const CMPIObjectPath* cop) {
  return tvrtest::dispatch(Operation::EnumerateInstanceNames, ctx, rslt, cop, nullptr);
}

static CMPIStatus TestEnumInstances(CMPIInstanceMI*, const CMPIContext* ctx, const CMPIResult* rslt,
                                    const CMPIObjectPath* cop, const char** properties) {
  return tvrtest::dispatch(Operation::EnumerateInstances, ctx, rslt, cop, properties);
}

static CMPIStatus TestGetInstance(CMPIInstanceMI*, const CMPIContext* ctx, const CMPIResult* rslt,
                                  const CMPIObjectPath* cop, const char** properties) {
  return tvrtest::dispatch(Operation::GetInstance, ctx, rslt, cop, properties);
}

static CMPIStatus notSupported() { CMReturn(CMPI_RC_ERR_NOT_SUPPORTED); }

static CMPIStatus TestCreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                     const CMPIInstance*) {
  return notSupported();
}

static CMPIStatus TestModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                     const CMPIInstance*, const char**) {
  return notSupported();
}

static CMPIStatus TestDeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                     const CMPIObjectPath*) {
  return notSupported();
}

static CMPIStatus TestExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                const char*, const char*) {
  return notSupported();
}

CMInstanceMIStub(Test, TestInstanceProvider, tvrtest::broker, CMNoHook)
