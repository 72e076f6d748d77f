// Object paths and instances of TVRHX_Chassis.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "FactorySupport.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const chassisClass = "TVRHX_Chassis";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

// The name space, host and keys every chassis path carries.
void fillChassisPath(CMPIObjectPath* path, const char* nameSpace, Chassis& chassis) {
  path->ft->setNameSpace(path, nameSpace);
  path->ft->setHostname(path, HX::getSystemName().c_str());
  std::string text;
  chassis.getTag(text);
  CMAddKey(path, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getCreationClassName(text);
  CMAddKey(path, "CreationClassName", text.c_str(), CMPI_chars);
}

// Sets the properties of a chassis instance in their published order.
void setChassisProperties(const CMPIBroker* broker, CMPIInstance* instance, Chassis& chassis) {
  std::string text;
  chassis.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);

  unsigned number = 0;
  chassis.getChassisPackageType(number);
  const unsigned short chassisPackageType = static_cast<unsigned short>(number);
  CMSetProperty(instance, "ChassisPackageType", &chassisPackageType, CMPI_uint16);
  number = 0;
  chassis.getPackageType(number);
  const unsigned short packageType = static_cast<unsigned short>(number);
  CMSetProperty(instance, "PackageType", &packageType, CMPI_uint16);

  text.clear();
  chassis.getManufacturer(text);
  CMSetProperty(instance, "Manufacturer", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getModel(text);
  CMSetProperty(instance, "Model", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getSerialNumber(text);
  CMSetProperty(instance, "SerialNumber", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getPartNumber(text);
  CMSetProperty(instance, "PartNumber", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getSKU(text);
  CMSetProperty(instance, "SKU", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getElementName(text);
  CMSetProperty(instance, "ElementName", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getCaption(text);
  CMSetProperty(instance, "Caption", text.c_str(), CMPI_chars);
  // An "Other" chassis describes itself with its caption.
  if (chassisPackageType == 1) CMSetProperty(instance, "ChassisTypeDescription", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getDescription(text);
  CMSetProperty(instance, "Description", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getCStatus(text);
  CMSetProperty(instance, "Status", text.c_str(), CMPI_chars);
  text.clear();
  chassis.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);

  std::vector<std::string> vendorStrings;
  if (chassis.getVendorCompatSring(vendorStrings))
    HX::ProviderUtilities::setProperty(broker, instance, "VendorCompatibilityStrings", vendorStrings);
  CMSetProperty(instance, "Name", "Chassis", CMPI_chars);
}

std::string textOrEmpty(const char* text) { return text ? text : ""; }

} // namespace

CMPIInstance* makeChassisInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Chassis chassis,
                                  const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " chassis="
                                                << &chassis << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  CMPIInstance* instance = nullptr;
  const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
  CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), chassisClass, nullptr);
  if (!CMIsNullObject(path)) {
    fillChassisPath(path, nameSpace.c_str(), chassis);
    instance = newInstance(broker, path, nullptr);
    if (!CMIsNullObject(instance)) setChassisProperties(broker, instance, chassis);
    brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of Chassis ***");
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " chassis="
                                               << &chassis << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getAllChassisCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  Chassis chassis;
  objpaths.clear();
  while (chassis) {
    const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
    CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), chassisClass, nullptr);
    // The object manager may be out of objects for a moment: try the same
    // chassis again.
    if (CMIsNullObject(path)) continue;
    fillChassisPath(path, nameSpace.c_str(), chassis);
    objpaths.push_back(path);
    ++chassis;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning an COPs of Chassis ***");
  return 0;
}

unsigned short getAllChassisInstances(const CMPIBroker* broker, const CMPIContext* context,
                                      const CMPIObjectPath* ref, const char** properties,
                                      std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  Chassis chassis;
  instances.clear();
  while (chassis) {
    instances.push_back(makeChassisInstance(broker, ref, chassis, properties, rc));
    brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of Chassis ***");
    ++chassis;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getOneChassisInstance(const CMPIBroker* broker, const CMPIContext* context,
                                     const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                     CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // The chassis is found by its Tag alone, compared exactly.
  const CMPIData tagKey = CMGetKey(ref, "Tag", rc);
  const CMPIString* tag = tagKey.type == CMPI_string ? tagKey.value.string : nullptr;
  charPtr(tag, rc); // read once with the caller's status, which learns of a bad key here
  Chassis chassis;
  while (chassis) {
    std::string current;
    chassis.getTag(current);
    const char* key = charPtr(tag, nullptr);
    if (key && std::strcmp(current.c_str(), key) == 0) {
      instance = makeChassisInstance(broker, ref, chassis, properties, rc);
      return 0;
    }
    ++chassis;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

} // namespace HX::PhysicalAssetProvider
