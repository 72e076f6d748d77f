//===- HardwareSource.cpp - Choosing where cursors read the hardware ------===//

#include "HX/HardwareSource.h"

#include "CurrentSource.h"
#include "LiveMachineSource.h"
#include "TreeFileSource.h"

namespace HX {

void useHardwareTree(std::string path) {
  detail::replaceCurrentSource(
      std::make_shared<detail::TreeFileSource>(std::move(path)));
}

void useLiveMachine(std::string fsRoot) {
  detail::replaceCurrentSource(
      std::make_shared<detail::LiveMachineSource>(std::move(fsRoot)));
}

std::string describeHardwareSource() {
  return detail::currentSource()->describe();
}

std::optional<std::string> checkHardwareTree(const std::string &path) {
  detail::TreeReading reading = detail::readHardwareTreeFile(path);
  if (reading.snapshot)
    return std::nullopt;
  return reading.refusal;
}

std::uint64_t hardwareTreeReads() { return detail::treeFileReads(); }

std::optional<std::string> hardwareTreeSystemName() {
  return detail::currentSource()->systemName();
}

} // namespace HX
