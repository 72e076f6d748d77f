// The factory functions of the physical-asset providers: for each element
// class, the functions that turn the nodes of its view into CMPI object
// paths and instances, and the lookups the association providers share.
//
// Conventions of the family, with <X> an element:
//  - getAll<X>COP fills a list with the object paths of all elements;
//  - getAll<X>Instances fills a list with instances of all elements;
//  - getOne<X>Instance finds the element a path names and makes its instance;
//  - make<X>Instance makes the instance of the element a view stands on.
// The 16-bit results are 0 for success; callers test zero or non-zero only.
// Lists hold pointers borrowed from the object manager, which owns every
// path and instance: nothing here releases them.
#pragma once

#include "Chassis.h"

#include <cmpift.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

// The views are complete where their functions are defined or called with
// a view; here they need only be named.
class Slot;
class Connector;
class NetworkCard;
class DiskController;
class SASPortController;

// ---- TVRHX_Chassis -------------------------------------------------------

CMPIInstance* makeChassisInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Chassis chassis,
                                  const char** properties, CMPIStatus* rc);
unsigned short getAllChassisCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);
unsigned short getAllChassisInstances(const CMPIBroker* broker, const CMPIContext* context,
                                      const CMPIObjectPath* ref, const char** properties,
                                      std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getOneChassisInstance(const CMPIBroker* broker, const CMPIContext* context,
                                     const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                     CMPIStatus* rc);

// ---- TVRHX_Slot ------------------------------------------------------------

CMPIInstance* makeSlotInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Slot slot,
                               const char** properties, CMPIStatus* rc);
unsigned short getOneSlotInstance(const CMPIBroker* broker, const CMPIContext* context, const CMPIObjectPath* ref,
                                  const char** properties, CMPIInstance*& instance, CMPIStatus* rc);
unsigned short getAllSlotInstances(const CMPIBroker* broker, const CMPIContext* context, const CMPIObjectPath* ref,
                                   const char** properties, std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getAllSlotCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                             std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);

// ---- TVRHX_Connector -------------------------------------------------------

CMPIInstance* makeConnectorInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, Connector connector,
                                    const char** properties, CMPIStatus* rc);
unsigned short getOneConnectorInstance(const CMPIBroker* broker, const CMPIContext* context,
                                       const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                       CMPIStatus* rc);
unsigned short getAllConnectorInstances(const CMPIBroker* broker, const CMPIContext* context,
                                        const CMPIObjectPath* ref, const char** properties,
                                        std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getAllConnectorCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                  std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);

// ---- TVRHX_NetworkCard -----------------------------------------------------

CMPIInstance* makeNetworkCardInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, NetworkCard nc,
                                      const char** properties, CMPIStatus* rc);
unsigned short getOneNetworkCardInstance(const CMPIBroker* broker, const CMPIContext* context,
                                         const CMPIObjectPath* ref, const char** properties, CMPIInstance*& instance,
                                         CMPIStatus* rc);
unsigned short getAllNetworkCardInstances(const CMPIBroker* broker, const CMPIContext* context,
                                          const CMPIObjectPath* ref, const char** properties,
                                          std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getAllNetworkCardCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                    std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);

// ---- TVRHX_DiskController --------------------------------------------------

unsigned short getDiskControllerCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                    CMPIStatus* rc, CMPIObjectPath** path);
unsigned short getAllDiskControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                       std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);
CMPIInstance* makeDiskControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                         const char** properties, CMPIStatus* rc);
unsigned short getAllDiskControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                             const CMPIObjectPath* ref, const char** properties,
                                             std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getOneDiskControllerInstance(const CMPIBroker* broker, const CMPIContext* context,
                                            const CMPIObjectPath* ref, const char** properties,
                                            CMPIInstance*& instance, CMPIStatus* rc);

// ---- TVRHX_IDEController and TVRHX_ChipIDECont -----------------------------

unsigned short getIDEDiskControllerCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                       CMPIStatus* rc, CMPIObjectPath** path);
unsigned short getIDEChipCOP(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                             CMPIStatus* rc, CMPIObjectPath** path);
unsigned short getAllIDEDiskControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx,
                                          const CMPIObjectPath* ref, std::vector<CMPIObjectPath*>& objpaths,
                                          CMPIStatus* rc);
unsigned short getAllIDEChipCOP(const CMPIBroker* broker, const CMPIContext* ctx, const CMPIObjectPath* ref,
                                std::vector<CMPIObjectPath*>& objpaths, CMPIStatus* rc);
CMPIInstance* makeIDEDiskControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                            const char** properties, CMPIStatus* rc);
CMPIInstance* makeIDEChipControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref, DiskController dc,
                                            const char** properties, CMPIStatus* rc);
unsigned short getAllIDEControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                            const CMPIObjectPath* ref, const char** properties,
                                            std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getAllIDEChipControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                                const CMPIObjectPath* ref, const char** properties,
                                                std::vector<CMPIInstance*>& instances, CMPIStatus* rc);

// ---- TVRHX_SASPortController -----------------------------------------------

CMPIInstance* makeSASPortControllerInstance(const CMPIBroker* broker, const CMPIObjectPath* ref,
                                            SASPortController controller, const char** properties, CMPIStatus* rc);
unsigned short getOneSASPortControllerInstance(const CMPIBroker* broker, const CMPIContext* context,
                                               const CMPIObjectPath* ref, const char** properties,
                                               CMPIInstance*& instance, CMPIStatus* rc);
unsigned short getAllSASPortControllerInstances(const CMPIBroker* broker, const CMPIContext* context,
                                                const CMPIObjectPath* ref, const char** properties,
                                                std::vector<CMPIInstance*>& instances, CMPIStatus* rc);
unsigned short getAllSASPortControllerCOP(const CMPIBroker* broker, const CMPIContext* ctx,
                                          const CMPIObjectPath* ref, std::vector<CMPIObjectPath*>& objpaths,
                                          CMPIStatus* rc);

// ---- Association target lookup and shared helpers -------------------------

/// The class at the far end of an association from the class of `ref`, by
/// the rule table; an empty text when no rule holds.
const char* getAssocTargetClassName(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                    const char* _RefLeftClass, const char* _RefRightClass, CMPIStatus* rc);
/// An object path without keys of that far class, in the namespace of `ref`
/// with this system's host name; null when no rule holds.
CMPIObjectPath* getAssocTargetClassObjectPath(const CMPIBroker* _broker, const CMPIObjectPath* ref,
                                              const char* _RefLeftClass, const char* _RefRightClass,
                                              CMPIStatus* rc);
/// The UUID of the computer system node, when the machine reports one.
bool getUnitaryComputerSystem_UUID(std::string& uuid);
/// `text` in lower case, in `out` and as the result.
std::string lcase(char* text, std::string& out);
/// The first fourteen digits of a date text as a CIM date-time string.
std::string adjustString(std::string text);

} // namespace HX::PhysicalAssetProvider
