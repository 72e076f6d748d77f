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

} // namespace HX::PhysicalAssetProvider
