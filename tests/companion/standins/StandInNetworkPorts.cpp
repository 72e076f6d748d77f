// TVRHX_NetworkPort: one port for each named NetworkPortNode of the tree.
#include "StandInAnswers.h"

#include <HX/SystemName.h>

#include <cmpimacs.h>

namespace tvr::test::standins {

namespace {

const CMPIBroker* broker = nullptr;

Keys portKeys(const std::string& nodeName) {
  return {{"SystemCreationClassName", "TVRHX_ComputerSystem"},
          {"SystemName", HX::getSystemName()},
          {"CreationClassName", "TVRHX_NetworkPort"},
          {"DeviceID", nodeName}};
}

const StandInClass ports = {HX::NodeLexicon::NetworkPortNode, "TVRHX_NetworkPort", portKeys};

} // namespace

CMPIStatus StandInPort_EnumInstanceNames(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                         const CMPIObjectPath* ref) {
  return answerNames(broker, rslt, ref, ports);
}

CMPIStatus StandInPort_EnumInstances(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* rslt,
                                     const CMPIObjectPath* ref, const char**) {
  return answerInstances(broker, rslt, ref, ports);
}

TVR_STAND_IN_REFUSALS(StandInPort_)

CMInstanceMIStub(StandInPort_, StandInNetworkPortProvider, broker, CMNoHook)

} // namespace tvr::test::standins
