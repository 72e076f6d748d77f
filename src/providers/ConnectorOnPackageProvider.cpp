// TVRHX_ConnectorOnPackage: which chassis carries which connector. Only a
// connector whose Tag holds the word "Compute" (case significant, anywhere
// in the Tag) has a package, and that package is a main system chassis,
// ChassisPackageType 17. Every other connector has no association here.
//
// Associators and AssociatorNames run the association handler frame of
// PackageInSlotProvider.cpp, as SlotOnChassisProvider.cpp does, with the
// lookups getChassisforConnector and getConnectorforChassis. References are
// refused.
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
const std::string loggerConnectorOnPackageProvider = "Korvane.ConnectorOnPackageProvider";
const char* const connOnPkgClass = "TVRHX_ConnectorOnPackage";
const char* const chassisClass = "TVRHX_Chassis";
const char* const connectorClass = "TVRHX_Connector";
const char* const connOnPkgProvider = "ConnectorOnPackageProvider";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// The frame's parameters: the first element class, the chassis, is the
// association's GroupComponent; the second, the connector, its
// PartComponent. The connector's base class is the physical connector.
const char* const chassisBaseClass = "CIM_Chassis";
const char* const connectorBaseClass = "CIM_PhysicalConnector";

const unsigned short mainSystemChassis = 17;

bool sameClass(const char* a, const char* b) { return a && b && strcasecmp(a, b) == 0; }

// The text of a path's class name, through one CMPIString. A missing path
// has no class.
const char* classNameOf(const CMPIObjectPath* path) {
  if (CMIsNullObject(path)) return nullptr;
  return charPtr(path->ft->getClassName(path, nullptr), nullptr);
}

// A result class is answered only if it names both the far class and its
// base class, which no single name does: only a request without a result
// class gets an answer.
bool resultClassAllows(const char* resultClass, const char* elementClass, const char* baseClass) {
  if (!resultClass) return true;
  if (strcasecmp(resultClass, elementClass) != 0) return false;
  if (strcasecmp(resultClass, baseClass) != 0) return false;
  return true;
}

// The pairing rule: a compute connector sits on a main system chassis.
bool connectorSitsOn(const std::string& connectorTag, unsigned short chassisPackageType) {
  return connectorTag.find("Compute") != std::string::npos && chassisPackageType == mainSystemChassis;
}

bool isNull(const CMPIData& data) { return (data.state & CMPI_nullValue) != 0; }

// The text of a string value; empty for a null or absent value.
std::string textOf(const CMPIData& data) {
  if (data.state & (CMPI_nullValue | CMPI_notFound)) return std::string();
  const char* text = nullptr;
  if (data.type == CMPI_chars) text = data.value.chars;
  else if (data.type == CMPI_string) text = charPtr(data.value.string, nullptr);
  return text ? text : std::string();
}

std::string textOrEmpty(const char* text) { return text ? text : std::string(); }

template <class Element> void freeList(std::vector<Element>& list) { std::vector<Element>().swap(list); }

} // namespace

/// The connectors the chassis `cop` names carries, appended to
/// `connectorsOfChassis`: every compute connector if the chassis is a main
/// system chassis, none otherwise.
unsigned short getConnectorforChassis(const CMPIObjectPath* cop, const CMPIContext* ctx, const char** properties,
                                      std::vector<CMPIInstance*>& connectorsOfChassis) {
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  // Without a chassis instance to read, the chassis type stays 0, which
  // carries no connectors.
  CMPIData packageType{};
  if (sameClass(classNameOf(cop), chassisClass)) {
    CMPIInstance* chassis = nullptr;
    if (getOneChassisInstance(broker, ctx, cop, properties, chassis, &status) != 0) return 1;
    if (!CMIsNullObject(chassis)) packageType = CMGetProperty(chassis, "ChassisPackageType", &status);
  }
  const unsigned short chassisType = isNull(packageType) ? 0 : packageType.value.uint16;

  // Every connector is looked at, whatever properties the client asked for.
  std::vector<CMPIInstance*> connectors;
  if (getAllConnectorInstances(broker, ctx, cop, nullptr, connectors, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(connectors);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(connectors.size());
  if (count == 0) return 0;
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* connector = connectors.at(index);
    if (CMIsNullObject(connector)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Connector");
      brokerTrace(broker, connOnPkgProvider, "CMPIInstace is NULL for Connector");
      freeList(connectors);
      return 1;
    }
    const std::string tag = textOf(CMGetProperty(connector, "Tag", &status));
    if (connectorSitsOn(tag, chassisType)) connectorsOfChassis.push_back(connector);
  }
  freeList(connectors);
  return 0;
}

/// The chassis that carry the connector `cop` names, appended to
/// `chassisOfConnector`: every main system chassis if the connector exists
/// and is a compute connector. The Tag is read from the connector's own
/// instance, so a connector that does not exist is a failure.
unsigned short getChassisforConnector(const CMPIObjectPath* cop, const CMPIContext* ctx, const char** properties,
                                      std::vector<CMPIInstance*>& chassisOfConnector) {
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::string tag;
  if (sameClass(classNameOf(cop), connectorClass)) {
    CMPIInstance* connector = nullptr;
    if (getOneConnectorInstance(broker, ctx, cop, properties, connector, &status) != 0) return 1;
    if (!CMIsNullObject(connector)) tag = textOf(CMGetProperty(connector, "Tag", &status));
  }

  std::vector<CMPIInstance*> chassisList;
  if (getAllChassisInstances(broker, ctx, cop, nullptr, chassisList, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    return 1;
  }
  const unsigned short count = static_cast<unsigned short>(chassisList.size());
  if (count == 0) return 0;
  unsigned short chassisType = 0;
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* chassis = chassisList.at(index);
    // The texts speak of the connector although the element is a chassis.
    if (CMIsNullObject(chassis)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIInstance is NULL for Connector");
      brokerTrace(broker, connOnPkgProvider, "CMPIInstace is NULL for Connector");
      freeList(chassisList);
      return 1;
    }
    // A chassis without a type keeps the type of the one before it.
    const CMPIData packageType = CMGetProperty(chassis, "ChassisPackageType", &status);
    if (!isNull(packageType)) chassisType = packageType.value.uint16;
    if (connectorSitsOn(tag, chassisType)) chassisOfConnector.push_back(chassis);
  }
  freeList(chassisList);
  return 0;
}

CMPIStatus ConnectorOnPackage_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus ConnectorOnPackage_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) {
  CMReturn(CMPI_RC_OK);
}

CMPIStatus ConnectorOnPackage_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectorOnPackage_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectorOnPackage_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectorOnPackage_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                        const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectorOnPackage_Associators(CMPIAssociationMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                          const CMPIObjectPath* cop, const char* assocClass,
                                          const char* resultClass, const char* role, const char* resultRole,
                                          const char** properties) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole) << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A missing target is not reported: it has no class, so no far side is
  // looked up and the answer is empty.
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getChassisforConnector(cop, ctx, properties, instances);
  } else if (sameClass(targetClass, connectorClass)) {
    if (!resultClassAllows(resultClass, connectorClass, connectorBaseClass)) return status;
    failed = getConnectorforChassis(cop, ctx, properties, instances);
  }
  if (failed != 0) return status;
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) CMReturnInstance(rslt, instances.at(index));
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole)
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMPIStatus ConnectorOnPackage_AssociatorNames(CMPIAssociationMI* mi, const CMPIContext* ctx,
                                              const CMPIResult* rslt, const CMPIObjectPath* cop,
                                              const char* assocClass, const char* resultClass, const char* role,
                                              const char* resultRole) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                 << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass="
                 << HX::traceText(resultClass) << " role=" << HX::traceText(role)
                 << " resultRole=" << HX::traceText(resultRole));
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, cop, assocClass, resultClass, &status);
  const char* targetClass = classNameOf(target);
  unsigned short failed = 0;
  if (sameClass(targetClass, chassisClass)) {
    if (!resultClassAllows(resultClass, chassisClass, chassisBaseClass)) return status;
    failed = getChassisforConnector(cop, ctx, nullptr, instances);
  } else if (sameClass(targetClass, connectorClass)) {
    if (!resultClassAllows(resultClass, connectorClass, connectorBaseClass)) return status;
    failed = getConnectorforChassis(cop, ctx, nullptr, instances);
  }
  if (failed != 0) return status;
  // The names are the paths of the far instances; an instance without a
  // usable path is passed over.
  const unsigned short count = static_cast<unsigned short>(instances.size());
  for (unsigned short index = 0; index < count; ++index) {
    CMPIInstance* element = instances.at(index);
    CMPIObjectPath* name = element ? CMGetObjectPath(element, &status) : nullptr;
    if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
  }
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << cop
                << " _RefLeftClass=" << HX::traceText(assocClass) << " _RefRightClass=" << HX::traceText(resultClass)
                << " role=" << HX::traceText(role) << " resultRole=" << HX::traceText(resultRole));
  freeList(instances);
  return status;
}

// This class is answered from either end by Associators alone.
CMPIStatus ConnectorOnPackage_References(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*,
                                         const CMPIObjectPath*, const char*, const char*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus ConnectorOnPackage_ReferenceNames(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*,
                                             const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

/// Every ConnectorOnPackage association: each compute connector with the
/// first main system chassis. The builder's own status is lost; its
/// failures reach the client as an empty answer.
unsigned short ConnectorOnPackageCMPIInstances(const CMPIObjectPath* ref, const CMPIContext* ctx,
                                               const char** properties, std::vector<CMPIInstance*>& instances) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> chassisList;
  if (getAllChassisInstances(broker, ctx, ref, nullptr, chassisList, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    return 1;
  }
  std::vector<CMPIObjectPath*> connectors;
  if (getAllConnectorCOP(broker, ctx, ref, connectors, &status) != 0) {
    brokerTrace(broker, physicalAssetProvider, "***Can't get Instances, Exiting EnumerateInstanceNames***");
    freeList(chassisList);
    freeList(connectors);
    return 1;
  }
  const unsigned short connectorCount = static_cast<unsigned short>(connectors.size());
  if (connectorCount == 0) {
    HX_TRACE_EXIT(loggerConnectorOnPackageProvider, << " ref=" << ref << " properties=" << properties
                                                    << " ctx=" << ctx << " instances=" << &instances);
    return 0;
  }
  for (unsigned short connectorIndex = 0; connectorIndex < connectorCount; ++connectorIndex) {
    CMPIObjectPath* connector = connectors.at(connectorIndex);
    CMPIObjectPath* chassis = nullptr;
    if (CMIsNullObject(connector)) {
      setStatusWithChars(broker, &status, CMPI_RC_ERR_FAILED, "CMPIObjectPath is NULL for Connector");
      brokerTrace(broker, connOnPkgProvider, "CMPIObjectPath is NULL for Connector");
      freeList(chassisList);
      freeList(connectors);
      return 1;
    }

    // A chassis that could not be made keeps the type of the one before it,
    // which did not match this connector; the first has type 0, which
    // carries no connectors. So only a real chassis can match.
    CMPIData packageType{};
    const unsigned short chassisCount = static_cast<unsigned short>(chassisList.size());
    for (unsigned short chassisIndex = 0; chassisIndex < chassisCount; ++chassisIndex) {
      CMPIInstance* element = chassisList.at(chassisIndex);
      if (!CMIsNullObject(element)) packageType = CMGetProperty(element, "ChassisPackageType", &status);
      const unsigned short chassisType = isNull(packageType) ? 0 : packageType.value.uint16;
      // The connector's Tag is read from its path anew for every chassis; a
      // path without keys matches none.
      std::string tag;
      if (CMGetKeyCount(connector, &status) == 0) continue;
      tag = textOrEmpty(keyText(connector, "Tag", &status, &status));
      if (connectorSitsOn(tag, chassisType)) {
        chassis = element ? CMGetObjectPath(element, &status) : nullptr;
        break;
      }
    }
    if (CMIsNullObject(chassis)) continue;

    CMPIObjectPath* path = newObjectPath(broker, nameSpaceOf(ref, nullptr), connOnPkgClass, &status);
    if (path) {
      path->ft->setNameSpace(path, nameSpaceOf(ref, nullptr));
      path->ft->setHostname(path, HX::getSystemName().c_str());
    }
    // An association whose path could not be made is kept as a null one.
    CMPIInstance* association = path ? newInstance(broker, path, nullptr) : nullptr;
    if (!CMIsNullObject(association)) {
      CMSetProperty(association, "PartComponent", &connector, CMPI_ref);
      CMSetProperty(association, "GroupComponent", &chassis, CMPI_ref);
    }
    instances.push_back(association);
  }
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " ref=" << ref << " properties=" << properties << " ctx=" << ctx << " instances=" << &instances);
  freeList(chassisList);
  freeList(connectors);
  return 0;
}

CMPIStatus ConnectorOnPackage_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                                const CMPIObjectPath* ref) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // The names are the paths of the instances; an association that could not
  // be made has none.
  if (ConnectorOnPackageCMPIInstances(ref, ctx, nullptr, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      CMPIObjectPath* name = association ? CMGetObjectPath(association, &status) : nullptr;
      if (!CMIsNullObject(name)) CMReturnObjectPath(rslt, name);
    }
  }
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus ConnectorOnPackage_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                            const CMPIObjectPath* ref, const char** properties) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  if (ConnectorOnPackageCMPIInstances(ref, ctx, properties, instances) == 0) {
    const unsigned short count = static_cast<unsigned short>(instances.size());
    for (unsigned short index = 0; index < count; ++index) {
      CMPIInstance* association = instances.at(index);
      // Each association's path is read into the returned status before the
      // association goes out; the path itself is not used.
      if (association) CMGetObjectPath(association, &status);
      CMReturnInstance(rslt, association);
    }
  }
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " ref=" << ref
                << " properties=" << properties);
  CMReturnDone(rslt);
  freeList(instances);
  return status;
}

CMPIStatus ConnectorOnPackage_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* rslt,
                                          const CMPIObjectPath* cop, const char** properties) {
  HX_TRACE_ENTER(loggerConnectorOnPackageProvider,
                 << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                 << " properties=" << properties);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  std::vector<CMPIInstance*> instances;
  // A path without keys names no association: the answer is empty, not a
  // failure.
  if (CMGetKeyCount(cop, nullptr) != 0 && ConnectorOnPackageCMPIInstances(cop, ctx, properties, instances) == 0) {
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
  HX_TRACE_EXIT(loggerConnectorOnPackageProvider,
                << " mi=" << mi << " ctx=" << ctx << " rslt=" << rslt << " cop=" << cop
                << " properties=" << properties);
  freeList(instances);
  return status;
}

CMInstanceMIStub(ConnectorOnPackage_, ConnectorOnPackageProvider, broker, CMNoHook)
CMAssociationMIStub(ConnectorOnPackage_, ConnectorOnPackageProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
