// TVRHX_Connector: one instance for each connector of the machine.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerConnectorProvider = "Korvane.ConnectorProvider";
const char* const connectorClass = "TVRHX_Connector";
const char* const connectorProvider = "ConnectorProvider";

const ElementFrame connectorFrame = {connectorClass, connectorProvider, loggerConnectorProvider,
                                     getAllConnectorCOP, getAllConnectorInstances, getOneConnectorInstance};

} // namespace

CMPIStatus Connector_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus Connector_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                       const CMPIObjectPath* ref) {
  return enumElementNames(connectorFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus Connector_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                   const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(connectorFrame, broker, HX_HERE, mi, ctx, result, ref, properties);
}

CMPIStatus Connector_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                 const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(connectorFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus Connector_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                    const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Connector_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                                    const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Connector_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Connector_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(Connector_, ConnectorProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
