// Object paths and instances of TVRHX_DiskController, and the one list
// function through which a request's class picks which presentation of the
// storage controller nodes is built.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "DiskController.h"
#include "FactorySupport.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const DiskControllerClass = "TVRHX_DiskController";
const char* const ideDiskClass = "TVRHX_IDEController";
const char* const ideChipClass = "TVRHX_ChipIDECont";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

std::string textOrEmpty(const char* text) { return text ? text : ""; }

// Class names are compared as lower-case copies of exactly the same length:
// case plays no part, but a longer or shorter name is another class.
bool sameClassIgnoringCase(const CMPIString* requested, CMPIStatus* rc, const char* served) {
  std::string requestedLower;
  std::string servedLower;
  lcase(const_cast<char*>(charPtr(requested, rc)), requestedLower);
  lcase(const_cast<char*>(served), servedLower);
  return requestedLower.size() == servedLower.size() &&
         std::memcmp(requestedLower.data(), servedLower.data(), requestedLower.size()) == 0;
}

// Sets the properties of a disk controller instance in their published
// order. Every property is set, whatever the node lacks: a missing text
// leaves an empty string, a missing form factor 0.
void setDiskControllerProperties(CMPIInstance* instance, DiskController& dc) {
  unsigned number = 0;
  unsigned short shortNumber = 0;
  std::string text;
  dc.getTag(text);
  CMSetProperty(instance, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  dc.getCreationClassName(text);
  CMSetProperty(instance, "CreationClassName", text.c_str(), CMPI_chars);
  text.clear();
  dc.getManufacturer(text);
  CMSetProperty(instance, "Manufacturer", text.c_str(), CMPI_chars);
  text.clear();
  dc.getModel(text);
  CMSetProperty(instance, "Model", text.c_str(), CMPI_chars);
  text.clear();
  dc.getCaption(text);
  CMSetProperty(instance, "Caption", text.c_str(), CMPI_chars);
  text.clear();
  dc.getOtherIdentifyingInfo(text);
  CMSetProperty(instance, "OtherIdentifyingInfo", text.c_str(), CMPI_chars);
  text.clear();
  dc.getElementName(text);
  CMSetProperty(instance, "ElementName", text.c_str(), CMPI_chars);
  dc.getHealthState(shortNumber);
  CMSetProperty(instance, "HealthState", &shortNumber, CMPI_uint16);
  dc.getPackageType(shortNumber);
  CMSetProperty(instance, "PackageType", &shortNumber, CMPI_uint16);
  // The form factor is what this class publishes as its primary status.
  dc.getFormFactor(number);
  shortNumber = static_cast<unsigned short>(number);
  CMSetProperty(instance, "PrimaryStatus", &shortNumber, CMPI_uint16);
}

} // namespace

unsigned short getDiskControllerCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                    CMPIStatus* rc, CMPIObjectPath** path) {
  CMPIObjectPath* made =
      newObjectPath(broker, textOrEmpty(nameSpaceOf(ref, rc)).c_str(), DiskControllerClass, nullptr);
  if (CMIsNullObject(made)) return 0;
  made->ft->setNameSpace(made, textOrEmpty(nameSpaceOf(ref, rc)).c_str());
  made->ft->setHostname(made, HX::getSystemName().c_str());
  std::string text;
  dc.getTag(text);
  CMAddKey(made, "Tag", text.c_str(), CMPI_chars);
  text.clear();
  dc.getCreationClassName(text);
  CMAddKey(made, "CreationClassName", text.c_str(), CMPI_chars);
  *path = made;
  return 0;
}

unsigned short getAllDiskControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                       std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " broker=" << broker << " ctx=" << ctx << " ref=" << ref << " objpaths=" << &objpaths
                 << " rc=" << rc);
  DiskController dc;
  objpaths.clear();
  while (dc) {
    CMPIObjectPath* path = nullptr;
    getDiskControllerCOP(broker, ref, dc, rc, &path);
    // The object manager may be out of objects for a moment: try the same
    // controller again.
    if (!path) continue;
    objpaths.push_back(path);
    ++dc;
  }
  brokerTrace(broker, physicalAssetProvider, "*** Returning COPs of DiskController ***");
  return 0;
}

CMPIInstance* makeDiskControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                         const char** properties, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                                << " properties=" << properties << " rc=" << rc);
  const std::map<std::string, std::string> requested = requestedProperties(properties);
  CMPIInstance* instance = nullptr;
  CMPIObjectPath* path = nullptr;
  getDiskControllerCOP(broker, ref, dc, rc, &path);
  if (path) {
    instance = newInstance(broker, path, nullptr);
    if (!CMIsNullObject(instance)) setDiskControllerProperties(instance, dc);
    brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of DiskController ***");
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " ref=" << ref << " dc=" << &dc
                                               << " properties=" << properties << " rc=" << rc);
  return instance;
}

unsigned short getAllDiskControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                             const CMPIObjectPath* ref, const char** properties,
                                             std::vector<CMPIInstance*>& instances, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instances="
                                                << &instances << " rc=" << rc);
  DiskController dc;
  instances.clear();
  const CMPIString* className = CMGetClassName(ref, rc);
  while (dc) {
    // The request's class picks the presentation of the node. A disk
    // controller is kept even when it could not be made; an IDE controller
    // or chip only when it was.
    if (sameClassIgnoringCase(className, rc, DiskControllerClass)) {
      instances.push_back(makeDiskControllerInstance(broker, ref, dc, properties, rc));
      brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of DiskController ***");
    } else if (sameClassIgnoringCase(className, rc, ideChipClass)) {
      if (CMPIInstance* chip = makeIDEChipControllerInstance(broker, ref, dc, properties, rc)) {
        instances.push_back(chip);
        brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of DiskController ***");
      }
    } else if (sameClassIgnoringCase(className, rc, ideDiskClass)) {
      if (CMPIInstance* controller = makeIDEDiskControllerInstance(broker, ref, dc, properties, rc)) {
        instances.push_back(controller);
        brokerTrace(broker, physicalAssetProvider, "*** Returning an instance of DiskController ***");
      }
    }
    ++dc;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << &instances << " rc=" << rc);
  return 0;
}

unsigned short getOneDiskControllerInstance(const CMPIBroker* broker, const CMPIContext* context,
                                            const CMPIObjectPath* ref, const char** properties,
                                            CMPIInstance*& instance, CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                                << ref << " properties=" << properties << " instance="
                                                << instance << " rc=" << rc);
  // The controller is found by its Tag alone, compared exactly; a path
  // without one finds nothing.
  const char* tag = keyText(ref, "Tag", rc, rc);
  DiskController dc;
  while (dc) {
    std::string current;
    dc.getTag(current);
    if (tag && std::strcmp(current.c_str(), tag) == 0) {
      instance = makeDiskControllerInstance(broker, ref, dc, properties, rc);
      return 0;
    }
    ++dc;
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory, << " broker=" << broker << " context=" << context << " ref="
                                               << ref << " properties=" << properties << " instances="
                                               << instance << " rc=" << rc);
  return 1;
}

} // namespace HX::PhysicalAssetProvider
