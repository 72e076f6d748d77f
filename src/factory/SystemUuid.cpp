// The UUID of the computer system, as the hardware reports it.
#include "PhysicalAssetProvider.h"

#include <HX/Instrumentation.h>

namespace HX::PhysicalAssetProvider {

bool getUnitaryComputerSystem_UUID(std::string& uuid) {
  HX::Instrumentation system;
  system.selectNode(HX::NodeLexicon::SystemNode);
  return system && system.getProperty(HX::NodeLexicon::PropUUID, uuid);
}

} // namespace HX::PhysicalAssetProvider
