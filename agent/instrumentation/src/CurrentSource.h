//===- CurrentSource.h - The process-wide hardware source -----------------===//

#ifndef HX_SRC_CURRENTSOURCE_H
#define HX_SRC_CURRENTSOURCE_H

#include "HardwareSnapshotSource.h"

#include <memory>

namespace HX {
namespace detail {

/// The source cursors read now. Chosen from the settings on first use;
/// replaced by useHardwareTree and useLiveMachine. A caller keeps the
/// source it got alive even if another thread replaces it meanwhile.
std::shared_ptr<HardwareSnapshotSource> currentSource();

void replaceCurrentSource(std::shared_ptr<HardwareSnapshotSource> source);

} // namespace detail
} // namespace HX

#endif // HX_SRC_CURRENTSOURCE_H
