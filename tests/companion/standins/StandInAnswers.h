// Stand-ins for the companion providers, for tests that need computer
// systems and network ports the companion would not give: they read their
// instances from the hardware tree, so a fixture names them in its nodes.
//
//  - StandInComputerSystemProvider serves TVRHX_ComputerSystem: one system
//    for each named SystemNode, its Name the node's name.
//  - StandInNetworkPortProvider serves TVRHX_NetworkPort: one port for each
//    named NetworkPortNode, its DeviceID the node's name.
//
// They answer EnumerateInstanceNames and EnumerateInstances, which is what
// the associations ask of them, and refuse everything else.
#pragma once

#include <HX/NodeLexicon.h>

#include <cmpift.h>

#include <string>
#include <utility>
#include <vector>

namespace tvr::test::standins {

/// The key names and values of one instance, in path order.
using Keys = std::vector<std::pair<const char*, std::string>>;

/// What a stand-in serves: instances of `className`, one for each named node
/// of `nodeType`, with the keys `keysOf(node name)`.
struct StandInClass {
  HX::NodeLexicon::NodeType nodeType;
  const char* className;
  Keys (*keysOf)(const std::string& nodeName);
};

CMPIStatus answerNames(const CMPIBroker* broker, const CMPIResult* rslt, const CMPIObjectPath* ref,
                       const StandInClass& served);
CMPIStatus answerInstances(const CMPIBroker* broker, const CMPIResult* rslt, const CMPIObjectPath* ref,
                           const StandInClass& served);

} // namespace tvr::test::standins

/// Defines the handlers a stand-in refuses, with the prefix `pfx`.
#define TVR_STAND_IN_REFUSALS(pfx)                                                                            \
  CMPIStatus pfx##Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }         \
  CMPIStatus pfx##GetInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,    \
                              const char**) {                                                                   \
    CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);                                                                        \
  }                                                                                                             \
  CMPIStatus pfx##CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, \
                                 const CMPIInstance*) {                                                         \
    CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);                                                                        \
  }                                                                                                             \
  CMPIStatus pfx##ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, \
                                 const CMPIInstance*, const char**) {                                           \
    CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);                                                                        \
  }                                                                                                             \
  CMPIStatus pfx##DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,                        \
                                 const CMPIObjectPath*) {                                                       \
    CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);                                                                        \
  }                                                                                                             \
  CMPIStatus pfx##ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,      \
                            const char*, const char*) {                                                         \
    CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);                                                                        \
  }
