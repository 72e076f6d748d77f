// Object paths and instances of TVRHX_Slot.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "FactorySupport.h"
#include "Slot.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const slotClass = "TVRHX_Slot";
const char* const slotProvider = "SlotProvider";

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// The name space, host and keys every slot path carries. `text` ends
// holding the class name.
void fillSlotPath(CMPIObjectPath* path, const char* nameSpace, Slot& slot, std::string& text) {
  path->ft->setNameSpace(path, nameSpace);
  path->ft->setHostname(path, HX::getSystemName().c_str());
  slot.getTag(text);
  CMAddKey(path, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  slot.getCreationClassName(text);
  CMAddKey(path, "CreationClassName", text.c_str(), CMPI_chars);
}

// Sets the properties of a slot instance in their published order. `text`
// comes in holding the class name and is not cleared before the Tag is
// read, so a slot without a name gets the class name as its Tag property.
void setSlotProperties(const CMPIBroker* broker, CMPIInstance* instance, Slot& slot, std::string& text) {
  slot.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  slot.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);

  unsigned short number = 0;
  slot.getNumber(number);
  CMSetProperty(instance, "Number", &number, CMPI_uint16);
  slot.getConnectorLayout(number);
  CMSetProperty(instance, "ConnectorLayout", &number, CMPI_uint16);

  text.clear();
  slot.getElementName(text);
  CMSetProperty(instance, "ElementName", text.c_str(), CMPI_chars);

  std::vector<std::string> vendorStrings;
  if (slot.getVendorCompatSring(vendorStrings))
    HX::ProviderUtilities::setProperty(broker, instance, "VendorCompatibilityStrings", vendorStrings);
}

} // namespace

CMPIInstance* makeSlotInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Slot slot,
                               const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " slot=" << &slot
                                                << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
  CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), slotClass, nullptr);
  if (CMIsNullObject(path)) return nullptr;
  std::string text;
  fillSlotPath(path, nameSpace.c_str(), slot, text);
  CMPIInstance* instance = newInstance(broker, path, nullptr);
  if (!CMIsNullObject(instance)) setSlotProperties(broker, instance, slot, text);
  brokerTrace(broker, slotProvider, "*** Returning an instance of Slot ***");
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " slot=" << &slot
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getOneSlotInstance(const CMPIBroker* broker, const CMPIContext* context, const CMPIObjectPath* ref,
                                  const char** properties, CMPIInstance*& instance, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // The slot is found by its Tag alone, compared exactly; a path without a
  // Tag names no slot.
  const char* key = keyText(ref, "Tag", rc, rc);
  Slot slot;
  while (slot) {
    std::string current;
    slot.getTag(current);
    if (key && std::strcmp(current.c_str(), key) == 0) {
      instance = makeSlotInstance(broker, ref, slot, properties, rc);
      return 0;
    }
    ++slot;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

unsigned short getAllSlotInstances(const CMPIBroker* broker, const CMPIContext* context, const CMPIObjectPath* ref,
                                   const char** properties, std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  instances.clear();
  Slot slot;
  while (slot) {
    // A slot whose instance could not be made still answers, as a null.
    instances.push_back(makeSlotInstance(broker, ref, slot, properties, rc));
    brokerTrace(broker, slotProvider, "*** Returning an instance of Slot ***");
    ++slot;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getAllSlotCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                             std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  objpaths.clear();
  Slot slot;
  while (slot) {
    const std::string nameSpace = textOrEmpty(nameSpaceOf(ref, rc));
    CMPIObjectPath* path = newObjectPath(broker, nameSpace.c_str(), slotClass, nullptr);
    // The object manager may be out of objects for a moment: try the same
    // slot again.
    if (CMIsNullObject(path)) continue;
    std::string text;
    fillSlotPath(path, nameSpace.c_str(), slot, text);
    objpaths.push_back(path);
    ++slot;
  }
  brokerTrace(broker, slotProvider, "*** Returning COPs of Slot ***");
  return 0;
}

} // namespace HX::PhysicalAssetProvider
