// TVRHX_Chassis: one instance for each chassis of the machine.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerChassisProvider = "Korvane.ChassisProvider";
const char* const chassisClass = "TVRHX_Chassis";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

const ElementFrame chassisFrame = {chassisClass, physicalAssetProvider, loggerChassisProvider,
                                   getAllChassisCOP, getAllChassisInstances, getOneChassisInstance};

} // namespace

CMPIStatus Chassis_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus Chassis_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                     const CMPIObjectPath* ref) {
  return enumElementNames(chassisFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus Chassis_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                 const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(chassisFrame, broker, HX_HERE, mi, ctx, result, ref, properties);
}

CMPIStatus Chassis_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                               const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(chassisFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus Chassis_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                  const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Chassis_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                  const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Chassis_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Chassis_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                             const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(Chassis_, ChassisProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
