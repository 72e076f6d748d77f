// Object paths and instances of TVRHX_Connector.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "Connector.h"
#include "FactorySupport.h"
#include "Trace.h"

#include <HX/SystemName.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const connectorClass = "TVRHX_Connector";
const char* const connectorProvider = "ConnectorProvider";

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// The name space, host and keys every connector path carries. `text` ends
// holding the class name.
void fillConnectorPath(CMPIObjectPath* path, const char* nameSpace, Connector& connector, std::string& text) {
  path->ft->setNameSpace(path, nameSpace);
  path->ft->setHostname(path, HX::getSystemName().c_str());
  connector.getTag(text);
  CMAddKey(path, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  connector.getCreationClassName(text);
  CMAddKey(path, "CreationClassName", text.c_str(), CMPI_chars);
}

// Sets the properties of a connector instance in their published order.
// `text` comes in holding the class name and is not cleared before the Tag
// is read, so a connector without a name gets the class name as its Tag
// property.
void setConnectorProperties(CMPIInstance* instance, Connector& connector, std::string& text) {
  connector.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  connector.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);

  unsigned short layout = 0;
  connector.getConnectorLayout(layout);
  CMSetProperty(instance, "ConnectorLayout", &layout, CMPI_uint16);

  text.clear();
  connector.getElementName(text);
  CMSetProperty(instance, "ElementName", text.c_str(), CMPI_chars);
  // The hardware describes a connector by its name alone.
  CMSetProperty(instance, "ConnectorDescription", text.c_str(), CMPI_chars);
}

} // namespace

CMPIInstance* makeConnectorInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Connector connector,
                                    const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " connector="
                                                << &connector << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
  CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), connectorClass, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  std::string text;
  fillConnectorPath(path, nameSpace.c_str(), connector, text);
  CMPIInstance* instance = newInstance(broker, path, nullptr);
  if (!CMIsNullObject(instance)) setConnectorProperties(instance, connector, text);
  brokerTrace(broker, connectorProvider, "*** Returning an instance of Connector ***");
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " connector="
                                               << &connector << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getOneConnectorInstance(const CMPIBroker* broker, const CMPIContext* context,
                                       const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                       CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // The connector is found by its Tag alone, compared exactly; a path
  // without a Tag names no connector.
  const char* key = keyText(ref, "Tag", rc, rc);
  Connector connector;
  while (connector) {
    std::string current;
    connector.getTag(current);
    if (key && std::strcmp(current.c_str(), key) == 0) {
      instance = makeConnectorInstance(broker, ref, connector, properties, rc);
      return 0;
    }
    ++connector;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

unsigned short getAllConnectorInstances(const CMPIBroker* broker, const CMPIContext* context,
                                        const CMPIObjectPath* ref, const char** properties,
                                        std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  instances.clear();
  Connector connector;
  while (connector) {
    // A connector whose instance could not be made is left out of the answer.
    CMPIInstance* instance = makeConnectorInstance(broker, ref, connector, properties, rc);
    if (!CMIsNullObject(instance)) instances.push_back(instance);
    brokerTrace(broker, connectorProvider, "*** Returning an instance of Connector ***");
    ++connector;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getAllConnectorCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                  std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  objpaths.clear();
  Connector connector;
  while (connector) {
    const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
    CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), connectorClass, nullptr);
    // The object manager may be out of objects for a moment: try the same
    // connector again.
    if (CMIsNullObject(path)) continue;
    std::string text;
    fillConnectorPath(path, nameSpace.c_str(), connector, text);
    objpaths.push_back(path);
    ++connector;
  }
  brokerTrace(broker, connectorProvider, "*** Returning COPs of Connector ***");
  return 0;
}

} // namespace HX::PhysicalAssetProvider
