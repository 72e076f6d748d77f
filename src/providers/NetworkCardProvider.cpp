// TVRHX_NetworkCard: one instance for each network card of the machine.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerNetworkCardProvider = "Korvane.NetworkCardProvider";
const char* const NetworkCardClass = "TVRHX_NetworkCard";
const char* const physicalAssetProvider = "PhysicalAssetProvider";

const ElementFrame networkCardFrame = {NetworkCardClass, physicalAssetProvider, loggerNetworkCardProvider,
                                       getAllNetworkCardCOP, getAllNetworkCardInstances, getOneNetworkCardInstance};

} // namespace

CMPIStatus NetworkCard_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus NetworkCard_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                         const CMPIObjectPath* ref) {
  return enumElementNames(networkCardFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus NetworkCard_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                     const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(networkCardFrame, broker, HX_HERE, mi, ctx, result, ref, properties);
}

CMPIStatus NetworkCard_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                   const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(networkCardFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus NetworkCard_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                      const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetworkCard_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                      const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetworkCard_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus NetworkCard_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                 const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(NetworkCard_, NetworkCardProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
