//===- CurrentSource.cpp - The process-wide hardware source ---------------===//

#include "CurrentSource.h"

#include "LiveMachineSource.h"
#include "TreeFileSource.h"

#include "TVR/Settings.h"

#include <mutex>

namespace HX {
namespace detail {
namespace {

std::shared_ptr<HardwareSnapshotSource> sourceFromSettings() {
  std::optional<std::string> tree = tvr::settings::lookup("HX_HARDWARE_TREE");
  if (tree && !tree->empty())
    return std::make_shared<TreeFileSource>(std::move(*tree));
  std::optional<std::string> root = tvr::settings::lookup("HX_FS_ROOT");
  return std::make_shared<LiveMachineSource>(root ? std::move(*root)
                                                  : std::string("/"));
}

struct SourceSlot {
  std::mutex Lock;
  std::shared_ptr<HardwareSnapshotSource> Source = sourceFromSettings();
};

SourceSlot &slot() {
  static SourceSlot Slot;
  return Slot;
}

} // namespace

std::shared_ptr<HardwareSnapshotSource> currentSource() {
  SourceSlot &current = slot();
  std::lock_guard<std::mutex> guard(current.Lock);
  return current.Source;
}

void replaceCurrentSource(std::shared_ptr<HardwareSnapshotSource> source) {
  SourceSlot &current = slot();
  std::lock_guard<std::mutex> guard(current.Lock);
  current.Source.swap(source);
  // The replaced source is released after the lock, outside the critical
  // section.
}

} // namespace detail
} // namespace HX
