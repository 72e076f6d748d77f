// TVRHX_ComputerSystem: one system for each named SystemNode of the tree.
#include "StandInAnswers.h"

#include <cmpimacs.h>

namespace tvr::test::standins {

namespace {

const CMPIBroker* broker = nullptr;

Keys systemKeys(const std::string& nodeName) {
  return {{"CreationClassName", "TVRHX_ComputerSystem"}, {"Name", nodeName}};
}

const StandInClass systems = {HX::NodeLexicon::SystemNode, "TVRHX_ComputerSystem", systemKeys};

} // namespace

CMPIStatus StandInSystem_EnumInstanceNames(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                           const CMPIObjectPath* ref) {
  return answerNames(broker, rslt, ref, systems);
}

CMPIStatus StandInSystem_EnumInstances(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                       const CMPIObjectPath* ref, const char**) {
  return answerInstances(broker, rslt, ref, systems);
}

TVR_STAND_IN_REFUSALS(StandInSystem_)

CMInstanceMIStub(StandInSystem_, StandInComputerSystemProvider, broker, CMNoHook)

} // namespace tvr::test::standins
