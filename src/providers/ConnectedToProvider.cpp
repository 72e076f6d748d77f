// TVRHX_ConnectedTo: the one cable the system knows, from the first
// connector whose Tag holds "Compute" to the first connector whose Tag holds
// "PXU" or "PME". So the class has at most one instance on any machine.
//
// Both ends are connectors. Associators and AssociatorNames run the
// association handler frame of PackageInSlotProvider.cpp, as
// SlotOnChassisProvider.cpp does, with one element class and the lookup
// getConnectorforConnector, which answers nothing for a connector that
// exists. References are refused.
#include "BrokerCalls.h"
#include "PhysicalAssetProvider.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <strings.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerConnectedToProvider = "Korvane.ConnectedToProvider";
const char* const connectedToClass = "TVRHX_ConnectedTo";
const char* const connectorClass = "TVRHX_Connector";
const char* const conectedToProvider = "ConnectedToProvider";

// The frame's parameter: both ends are connectors, whose base class is the
// physical connector.
const char* const connectorBaseClass = "CIM_PhysicalConnector";

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString. A missing path
// has no class.
const char* classNameOf(const CMPIObjectPath* path) {
  if (CMIsNullObject(path)) return nullptr;
  return charPtr(path->ft->getClassName(path, nullptr), nullptr);
}

// A result class is answered only if it names both the connector class and
// its base class, which no single name does: only a request without a
// result class gets an answer.
bool resultClassAllows(const char* resultClass) {
  if (!resultClass) return true;
  if (strcasecmp(resultClass, connectorClass) != 0) return false;
  if (strcasecmp(resultClass, connectorBaseClass) != 0) return false;
  return true;
}

bool contains(const std::string& text, const char* word) { return text.find(word) != std::string::npos; }

// The text of a string value; empty for a null or absent value.
std::string textOf(const CMPIData& data) {
  if (data.state & (CMPI_nullValue | CMPI_notFound)) return std::string();
  const char* text = nullptr;
  if (data.type == CMPI_chars) text = data.value.chars;
  else if (data.type == CMPI_string) text = charPtr(data.value.string, nullptr);
  return text ? text : std::string();
}

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

} // namespace

/// The first compute connector of the machine, the one whose Tag holds
/// "Compute", in `instance`. Returns 1 when there is none.
unsigned short getConnectorforChassis(const CMPIObjectPath* ref, const CMPIContext* ctx, CMPIInstance*& instance) {
  HX_TRACE_ENTER(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> connectors;
  if (getAllConnectorInstances(broker, ctx, ref, nullptr, connectors, &status) != 0) {
    brokerTrace(broker, conectedToProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(connectors);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(connectors.size());
  if (count == 0) {
    HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
    freeList(connectors);
    return 1;
  }
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* connector = connectors.at(index);
    if (CMIsNullObject(connector)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Connector");
      brokerTrace(broker, conectedToProvider, "CMPIInstace is NULL for Connector");
      freeList(connectors);
      return 1;
    }
    const std::string tag = textOf(CMGetProperty(connector, "Tag", &status));
    if (contains(tag, "Compute")) {
      instance = connector;
      HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
      freeList(connectors);
      return 0;
    }
  }
  HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
  freeList(connectors);
  return 1;
}

/// The first expansion connector of the machine, the one whose Tag holds
/// "PXU" or "PME", in `instance`. Returns 1 when there is none.
unsigned short getConnectorforPME(const CMPIObjectPath* ref, const CMPIContext* ctx, CMPIInstance*& instance) {
  HX_TRACE_ENTER(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> connectors;
  if (getAllConnectorInstances(broker, ctx, ref, nullptr, connectors, &status) != 0) {
    brokerTrace(broker, conectedToProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(connectors);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(connectors.size());
  if (count == 0) {
    HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
    freeList(connectors);
    return 1;
  }
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* connector = connectors.at(index);
    if (CMIsNullObject(connector)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Connector");
      brokerTrace(broker, conectedToProvider, "CMPIInstace is NULL for Connector");
      freeList(connectors);
      return 1;
    }
    // "PEN" marks an expansion slot, never the cable's connector.
    const std::string tag = textOf(CMGetProperty(connector, "Tag", &status));
    if (contains(tag, "PXU") || contains(tag, "PME")) {
      instance = connector;
      HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
      freeList(connectors);
      return 0;
    }
  }
  HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " ctx=" << ctx << " instance=" << instance);
  freeList(connectors);
  return 1;
}

/// The far end of the cable from the connector `ref` names, appended to
/// `instances`. A connector that exists is answered with failure and
/// nothing, so the far end is looked for only when the source is no
/// connector of this machine; its Tag is then empty and nothing is found.
unsigned short getConnectorforConnector(const CMPIObjectPath* ref, const CMPIContext* ctx, const char** properties,
                                        std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerConnectedToProvider,
                 << " ref=" << ref << " ctx=" << ctx << " properties=" << properties << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIInstance* source = nullptr;
  CMPIInstance* farEnd = nullptr;
  std::string tag;
  if (sameClass(classNameOf(ref), connectorClass)) {
    if (getOneConnectorInstance(broker, ctx, ref, properties, source, &status) == 0) return 1;
  }
  if (!CMIsNullObject(source)) tag = textOf(CMGetProperty(source, "Tag", &status));

  unsigned short notFound = 1;
  if (contains(tag, "Compute")) notFound = getConnectorforPME(ref, ctx, farEnd);
  else if (contains(tag, "PXU") || contains(tag, "PME")) notFound = getConnectorforChassis(ref, ctx, farEnd);
  if (notFound == 0) instances.push_back(farEnd);
  HX_TRACE_EXIT(loggerConnectedToProvider,
                << " ref=" << ref << " ctx=" << ctx << " properties=" << properties << " instances=" << &instances);
  return 0;
}

CMPIStatus ConnectedTo_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus ConnectedTo_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus ConnectedTo_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                      const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectedTo_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                      const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectedTo_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                      const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectedTo_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                 const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectedTo_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                   const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                   const char* role, const char* resultRole, const char** properties) {
  HX_TRACE_ENTER(loggerConnectedToProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A missing target is not reported: it has no class, so no far side is
  // looked up and the answer is empty.
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (sameClass(classNameOf(target), connectorClass)) {
    if (!resultClassAllows(resultClass)) return status;
    if (getConnectorforConnector(cop, ctx, properties, instances) != 0) return status;
  }
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerConnectedToProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMPIStatus ConnectedTo_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                       const CMPIObjectPath* cop, const char* assocClass, const char* resultClass,
                                       const char* role, const char* resultRole) {
  HX_TRACE_ENTER(loggerConnectedToProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  if (sameClass(classNameOf(target), connectorClass)) {
    if (!resultClassAllows(resultClass)) return status;
    if (getConnectorforConnector(cop, ctx, nullptr, instances) != 0) return status;
  }
  // The names are the paths of the far instances; an instance without a
  // usable path is passed over.
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* element = instances.at(index);
    CMPIObjectPath* name = element ? CMGetObjectPath(element, &status) : nullptr;
    if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
  }
  HX_TRACE_EXIT(loggerConnectedToProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  freeList(instances);
  return status;
}

// This class is answered from either end by Associators alone.
CMPIStatus ConnectedTo_References(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                  const char*, const char*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectedTo_ReferenceNames(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*,
                                      const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

/// The one ConnectedTo association: the first compute connector as
/// Antecedent, the first expansion connector as Dependent. A machine
/// without both gets none. The builder's own status is lost; its failures
/// reach the client as an empty answer.
unsigned short ConnectedToCMPIInstances(const CMPIObjectPath* ref, const CMPIContext* ctx, const char** properties,
                                        std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerConnectedToProvider,
                 << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIInstance* expansion = nullptr;
  if (getConnectorforPME(ref, ctx, expansion) != 0) {
    brokerTrace(broker, conectedToProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    return 1;
  }
  CMPIInstance* compute = nullptr;
  if (getConnectorforChassis(ref, ctx, compute) != 0) {
    brokerTrace(broker, conectedToProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    return 1;
  }
  CMPIObjectPath* expansionPath = expansion ? CMGetObjectPath(expansion, &status) : nullptr;
  CMPIObjectPath* computePath = compute ? CMGetObjectPath(compute, &status) : nullptr;
  if (CMIsNullObject(expansionPath) || CMIsNullObject(computePath)) {
    setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for Connectors");
    brokerTrace(broker, conectedToProvider, "CMPIObjectPath is NULL for Connectors");
    return 1;
  }
  // Without a path for the association there is nothing to answer, and
  // nothing to report.
  CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), connectedToClass, &status);
  if (CMIsNullObject(path)) {
    HX_TRACE_EXIT(loggerConnectedToProvider, << " ref=" << ref << " properties=" << properties << " ctx=" << ctx
                                             << " instances=" << &instances);
    return 0;
  }
  path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
  path->ft->setHostname(path, HX::getSystemName().c_str());
  CMPIInstance* association = newInstance(broker, path, nullptr);
  if (!CMIsNullObject(association)) {
    CMSetProperty(association, "Antecedent", &computePath, CMPI_ref);
    CMSetProperty(association, "Dependent", &expansionPath, CMPI_ref);
  }
  instances.push_back(association);
  HX_TRACE_EXIT(loggerConnectedToProvider,
                << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  return 0;
}

CMPIStatus ConnectedTo_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                         const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // The names are the paths of the instances; an association that could not
  // be made has none.
  if (ConnectedToCMPIInstances(ref, ctx, nullptr, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      CMPIObjectPath* name = association ? CMGetObjectPath(association, &status) : nullptr;
      if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
    }
  }
  HX_TRACE_EXIT(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus ConnectedTo_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                     const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                            << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (ConnectedToCMPIInstances(ref, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  }
  HX_TRACE_EXIT(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                                           << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus ConnectedTo_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                   const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                            << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A path without keys names no association: the answer is empty, not a
  // failure.
  if (CMGetKeyCount(cop, nullptr) != 0 && ConnectedToCMPIInstances(cop, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      if (CMIsNullObject(association)) continue;
      if (HX::isObjPathsEqual(cop, CMGetObjectPath(association, nullptr), true)) {
        CMReturnInstance(rslt, association);
        break;
      }
    }
  }
  CMReturnDone(rslt);
  HX_TRACE_EXIT(loggerConnectedToProvider, << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                                           << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(ConnectedTo_, ConnectedToProvider, broker, CMNoHook)
CMAssociationMIStub(ConnectedTo_, ConnectedToProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
