//===- HX/SystemName.h - Name of the managed computer system --------------===//

#ifndef HX_SYSTEMNAME_H
#define HX_SYSTEMNAME_H

#include <string>

namespace HX {

/// The name of the managed computer system, as object paths carry it.
///
/// \returns the "systemName" of the hardware-tree file in use when a tree is
///   in use and names one (see HX/HardwareSource.h); otherwise this
///   machine's fully qualified host name. The host name is resolved once per
///   process and kept, as every object path built asks for it; when it
///   cannot be resolved to a fully qualified name, the plain host name (or
///   "localhost" if even that is unavailable) stands in. Never throws.
std::string getSystemName();

} // namespace HX

#endif // HX_SYSTEMNAME_H
