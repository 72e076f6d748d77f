// Object paths and instances of TVRHX_NetworkCard.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "FactorySupport.h"
#include "NetworkCard.h"
#include "Trace.h"

#include <HX/SystemName.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const NetworkCardClass = "TVRHX_NetworkCard";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// The name space, host and keys every network card path carries. `text`
// ends holding the class name.
void fillNetworkCardPath(CMPIObjectPath* path, const char* nameSpace, NetworkCard& nc, std::string& text) {
  path->ft->setNameSpace(path, nameSpace);
  path->ft->setHostname(path, HX::getSystemName().c_str());
  nc.getTag(text);
  CMAddKey(path, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  nc.getCreationClassName(text);
  CMAddKey(path, "CreationClassName", text.c_str(), CMPI_chars);
}

// The card's operational status as a uint16 array property. The array is
// made with the caller's status, which so learns of a failure; without an
// array the property is left out.
void setOperationalStatus(const CMPIBroker* broker, CMPIInstance* instance, NetworkCard& nc, CMPIStatus* rc) {
  std::vector<unsigned short> values;
  if (!nc.getOperationalStatus(values)) return;
  const unsigned short count = static_cast<unsigned short>(values.size());
  CMPIArray* array = newArray(broker, count, CMPI_uint16, rc);
  if (!array) return;
  for (unsigned short index = 0; index < count; ++index)
    CMSetArrayElementAt(array, index, &values.at(index), CMPI_uint16);
  CMSetProperty(instance, "OperationalStatus", &array, CMPI_uint16A);
}

// Sets the properties of a network card instance in their published order.
// `text` comes in holding the class name and is not cleared before the Tag
// is read, so a card without a name gets the class name as its Tag property.
void setNetworkCardProperties(const CMPIBroker* broker, CMPIInstance* instance, NetworkCard& nc,
                              std::string& text, CMPIStatus* rc) {
  nc.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  nc.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);
  text.clear();
  nc.getName(text);
  CMSetProperty(instance, "Name", text.c_str(), CMPI_chars);
  text.clear();
  nc.getElementName(text);
  CMSetProperty(instance, "ElementName", text.c_str(), CMPI_chars);
  text.clear();
  nc.getSerialNumber(text);
  CMSetProperty(instance, "SerialNumber", text.c_str(), CMPI_chars);
  text.clear();
  nc.getStatus(text);
  CMSetProperty(instance, "Status", text.c_str(), CMPI_chars);

  unsigned short packageType = 0;
  if (nc.getPackageType(packageType)) CMSetProperty(instance, "PackageType", &packageType, CMPI_uint16);

  text.clear();
  nc.getDescription(text);
  CMSetProperty(instance, "Description", text.c_str(), CMPI_chars);
  setOperationalStatus(broker, instance, nc, rc);
}

} // namespace

CMPIInstance* makeNetworkCardInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, NetworkCard nc,
                                      const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " nc=" << &nc
                                                << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
  CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), NetworkCardClass, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  std::string text;
  fillNetworkCardPath(path, nameSpace.c_str(), nc, text);
  CMPIInstance* instance = newInstance(broker, path, nullptr);
  if (!CMIsNullObject(instance)) setNetworkCardProperties(broker, instance, nc, text, rc);
  // This trace reads "Chassis" although a card was made; the card's own
  // text follows from getAllNetworkCardInstances.
  brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of Chassis ***");
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " nc=" << &nc
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getOneNetworkCardInstance(const CMPIBroker* broker, const CMPIContext* context,
                                         const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                         CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // The card is found by its Tag alone, compared exactly; a path without a
  // Tag names no card.
  const char* key = keyText(ref, "Tag", rc, rc);
  NetworkCard nc;
  while (nc) {
    std::string current;
    nc.getTag(current);
    if (key && std::strcmp(current.c_str(), key) == 0) {
      instance = makeNetworkCardInstance(broker, ref, nc, properties, rc);
      return 0;
    }
    ++nc;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

unsigned short getAllNetworkCardInstances(const CMPIBroker* broker, const CMPIContext* context,
                                          const CMPIObjectPath* ref, const char** properties,
                                          std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  instances.clear();
  NetworkCard nc;
  while (nc) {
    // A card whose instance could not be made still answers, as a null.
    instances.push_back(makeNetworkCardInstance(broker, ref, nc, properties, rc));
    brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of NetworkCard ***");
    ++nc;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getAllNetworkCardCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                    std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  objpaths.clear();
  NetworkCard nc;
  while (nc) {
    const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
    CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), NetworkCardClass, nullptr);
    // The object manager may be out of objects for a moment: try the same
    // card again.
    if (CMIsNullObject(path)) continue;
    std::string text;
    fillNetworkCardPath(path, nameSpace.c_str(), nc, text);
    objpaths.push_back(path);
    ++nc;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning an COPs of NetCard ***");
  return 0;
}

} // namespace HX::PhysicalAssetProvider
