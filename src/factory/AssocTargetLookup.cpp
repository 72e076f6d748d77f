// Which class lies at the far end of an association, by one table of rules.
#include "PhysicalAssetProvider.h"

#include "BrokerCalls.h"
#include "Trace.h"

#include <HX/ProviderUtilities.h>

#include <cstring>

namespace HX::PhysicalAssetProvider {

namespace {

const std::string loggerPhysicalAssetObjFactory = "Korvane.PhysicalAssetObjFactory";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

const char* const chassisClass = "TVRHX_Chassis";
const char* const slotClass = "TVRHX_Slot";
const char* const connectorClass = "TVRHX_Connector";
const char* const NetworkCardClass = "TVRHX_NetworkCard";
const char* const ncClass = "TVRHX_NetworkCard";
const char* const DiskControllerClass = "TVRHX_DiskController";
const char* const SASPortControllerClass = "TVRHX_SASPortController";
const char* const csClass = "TVRHX_ComputerSystem";
const char* const npClass = "TVRHX_NetworkPort";
const char* const pkgInSlotClass = "TVRHX_PackageInSlot";
const char* const SlotOnChassisClass = "TVRHX_SlotOnChassis";
const char* const cspkgClass = "TVRHX_UnitaryComputerSystemPackage";
const char* const cardPkgClass = "TVRHX_CardCSPackage";
const char* const DiskPkgClass = "TVRHX_DiskControllerCSPackage";
const char* const NPRealizesNCClass = "TVRHX_NPRealizesNC";
const char* const sasPortRealizesDiskClass = "TVRHX_SASPortRealizesDisk";
const char* const connOnPkgClass = "TVRHX_ConnectorOnPackage";
const char* const connectedToClass = "TVRHX_ConnectedTo";

// One rule: a source class and one or two association classes lead to a
// target class, announced by a trace text.
struct TargetRule {
  const char* sourceClass;
  const char* association;
  const char* otherAssociation; // null when the rule names one association
  const char* traceText;
  const char* target;
};

// The rules in the order they are tried. The text of the last one names the
// chassis although its target is the connector; it is kept as it stands.
const TargetRule kRules[] = {
    {chassisClass, pkgInSlotClass, SlotOnChassisClass, "Target Class is Slot", slotClass},
    {slotClass, pkgInSlotClass, SlotOnChassisClass, "Target Class is ChassisClass", chassisClass},
    {chassisClass, cspkgClass, nullptr, "Target Class is ComputerSystem Class", csClass},
    {csClass, cspkgClass, nullptr, "Target Class is ChassisClass", chassisClass},
    {csClass, cardPkgClass, nullptr, "Target Class is TVRHX_NetworkCard", NetworkCardClass},
    {NetworkCardClass, cardPkgClass, nullptr, "Target Class is ComputerSystem Class", csClass},
    {csClass, DiskPkgClass, nullptr, "Target Class is TVRHX_DiskController", DiskControllerClass},
    {DiskControllerClass, DiskPkgClass, nullptr, "Target Class is ComputerSystem Class", csClass},
    {npClass, NPRealizesNCClass, nullptr, "Target Class is TVRHX_NetworkCard", ncClass},
    {ncClass, NPRealizesNCClass, nullptr, "Target Class is TVRHX_NetworkPort", npClass},
    {SASPortControllerClass, sasPortRealizesDiskClass, nullptr, "Target Class is TVRHX_DiskController",
     DiskControllerClass},
    {DiskControllerClass, sasPortRealizesDiskClass, nullptr, "Target Class is TVRHX_SASPortController",
     SASPortControllerClass},
    {chassisClass, connOnPkgClass, nullptr, "Target Class is ConnectorClass", connectorClass},
    {connectorClass, connOnPkgClass, nullptr, "Target Class is ChassisClass", chassisClass},
    {connectorClass, connectedToClass, nullptr, "Target Class is ChassisClass", connectorClass},
};

// strcmp of two texts, where a missing text equals nothing.
bool same(const char* a, const char* b) { return a && b && std::strcmp(a, b) == 0; }

} // namespace

const char* getAssocTargetClassName(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                    const char* _RefLeftClass, const char* _RefRightClass, CMPIStatus* rc) {
  (void)_RefRightClass; // handed on by callers, never read
  const CMPIString* className = ref ? ref->ft->getClassName(ref, rc) : nullptr;
  for (const TargetRule& rule : kRules) {
    if (!same(charPtr(className, rc), rule.sourceClass)) continue;
    if (!same(_RefLeftClass, rule.association) && !same(_RefLeftClass, rule.otherAssociation)) continue;
    brokerTrace(_broker, physicalAssetProvider, rule.traceText);
    return rule.target;
  }
  return "";
}

CMPIObjectPath* getAssocTargetClassObjectPath(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                              const char* _RefLeftClass, const char* _RefRightClass,
                                              CMPIStatus* rc) {
  HX_TRACE_ENTER(loggerPhysicalAssetObjFactory,
                 << " _broker=" << _broker << " ref=" << ref << " _RefLeftClass=" << HX::traceText(_RefLeftClass)
                 << " _RefRightClass=" << HX::traceText(_RefRightClass) << " rc=" << rc);
  const char* target = getAssocTargetClassName(_broker, ref, _RefLeftClass, _RefRightClass, rc);
  CMPIObjectPath* path = nullptr;
  if (target[0] != '\0') {
    path = newObjectPath(_broker, nameSpaceOf(ref, rc), target, rc);
    if (path) {
      path->ft->setNameSpace(path, nameSpaceOf(ref, rc));
      path->ft->setHostname(path, HX::getSystemName().c_str());
    }
  }
  HX_TRACE_EXIT(loggerPhysicalAssetObjFactory,
                << " _broker=" << _broker << " ref=" << ref << " _RefLeftClass=" << HX::traceText(_RefLeftClass)
                << " _RefRightClass=" << HX::traceText(_RefRightClass) << " rc=" << rc);
  return path;
}

} // namespace HX::PhysicalAssetProvider
