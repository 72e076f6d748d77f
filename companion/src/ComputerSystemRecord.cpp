#include "ComputerSystemRecord.h"

#include <HX/Instrumentation.h>
#include <HX/SystemName.h>

namespace tvr::companion {

std::optional<ComputerSystemRecord> readComputerSystem() {
  HX::Instrumentation system;
  system.selectNode(HX::NodeLexicon::SystemNode);
  if (!system) return std::nullopt;
  ComputerSystemRecord record;
  record.name = HX::getSystemName();
  record.description = system.getNodeDescription();
  std::string uuid;
  if (system.getProperty(HX::NodeLexicon::PropUUID, uuid) && !uuid.empty()) record.uuid = uuid;
  return record;
}

} // namespace tvr::companion
