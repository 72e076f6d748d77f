// TVRHX_DiskController: one instance for each storage controller of the
// machine. The same provider enumerates the instances of TVRHX_IDEController
// and TVRHX_ChipIDECont, which are built from the same nodes: its
// EnumInstances serves whatever class the object manager routes to it, and
// the list function picks the presentation by the class named.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerDiskControllerProvider = "Korvane.DiskControllerProvider";
const char* const DiskControllerClass = "TVRHX_DiskController";
const char* const diskProvider = "DiskControllerProvider";

const ElementFrame diskControllerFrame = {DiskControllerClass,           diskProvider,
                                          loggerDiskControllerProvider,  getAllDiskControllerCOP,
                                          getAllDiskControllerInstances, getOneDiskControllerInstance};

} // namespace

CMPIStatus DiskController_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus DiskController_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                            const CMPIObjectPath* ref) {
  return enumElementNames(diskControllerFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus DiskController_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                        const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(diskControllerFrame, broker, HX_HERE, mi, ctx, result, ref, properties,
                              /*compareClass=*/false);
}

CMPIStatus DiskController_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                      const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(diskControllerFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus DiskController_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                         const CMPIObjectPath*, const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskController_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                         const CMPIObjectPath*, const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskController_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                         const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus DiskController_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                    const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(DiskController_, DiskControllerProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
