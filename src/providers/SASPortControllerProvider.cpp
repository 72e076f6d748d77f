// TVRHX_SASPortController: one instance for each storage controller of the
// machine, as a logical device of the computer system.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerSASPortControllerProvider = "Korvane.SASPortControllerProvider";
const char* const SASPortControllerClass = "TVRHX_SASPortController";
const char* const sasPortProvider = "SASPortControllerProvider";

const ElementFrame sasPortControllerFrame = {SASPortControllerClass,           sasPortProvider,
                                             loggerSASPortControllerProvider,  getAllSASPortControllerCOP,
                                             getAllSASPortControllerInstances, getOneSASPortControllerInstance};

} // namespace

CMPIStatus SASPortController_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus SASPortController_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx,
                                               const CMPIResult* result, const CMPIObjectPath* ref) {
  return enumElementNames(sasPortControllerFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus SASPortController_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                           const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(sasPortControllerFrame, broker, HX_HERE, mi, ctx, result, ref, properties);
}

CMPIStatus SASPortController_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                         const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(sasPortControllerFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus SASPortController_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                            const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortController_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                            const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortController_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                            const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus SASPortController_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                       const CMPIObjectPath*, const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(SASPortController_, SASPortControllerProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
