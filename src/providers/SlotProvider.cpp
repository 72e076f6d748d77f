// TVRHX_Slot: one instance for each slot of the machine.
#include "ElementProviderFrame.h"
#include "PhysicalAssetProvider.h"

#include <cmpimacs.h>

namespace HX::PhysicalAssetProvider {

namespace {

const CMPIBroker* broker = nullptr;
const std::string loggerSlotProvider = "Korvane.SlotProvider";
const char* const slotClass = "TVRHX_Slot";
const char* const slotProvider = "SlotProvider";

const ElementFrame slotFrame = {slotClass, slotProvider, loggerSlotProvider,
                                getAllSlotCOP, getAllSlotInstances, getOneSlotInstance};

} // namespace

CMPIStatus Slot_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) { CMReturn(CMPI_RC_OK); }

CMPIStatus Slot_EnumInstanceNames(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                                  const CMPIObjectPath* ref) {
  return enumElementNames(slotFrame, broker, HX_HERE, mi, ctx, result, ref);
}

CMPIStatus Slot_EnumInstances(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                              const CMPIObjectPath* ref, const char** properties) {
  return enumElementInstances(slotFrame, broker, HX_HERE, mi, ctx, result, ref, properties);
}

CMPIStatus Slot_GetInstance(CMPIInstanceMI* mi, const CMPIContext* ctx, const CMPIResult* result,
                            const CMPIObjectPath* cop, const char** properties) {
  return getElementInstance(slotFrame, broker, HX_HERE, mi, ctx, result, cop, properties);
}

CMPIStatus Slot_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const CMPIInstance*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Slot_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                               const CMPIInstance*, const char**) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Slot_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPIStatus Slot_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                          const char*, const char*) {
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(Slot_, SlotProvider, broker, CMNoHook)

} // namespace HX::PhysicalAssetProvider
