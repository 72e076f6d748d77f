//===- RefusalLog.h - Logging a refused hardware source once --------------===//
//
/// \file
/// The providers select nodes many times per request; while a hardware-tree
/// file stays broken every selection fails the same way. The refusal is
/// logged the first time it is seen, and again only when it changes or
/// comes back after the source was read successfully.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_REFUSALLOG_H
#define HX_SRC_REFUSALLOG_H

#include <string>

namespace HX {
namespace detail {

/// Logs \p message (category "TVR.HX.Instrumentation", level 6000) unless it
/// is the refusal logged last.
void reportRefusal(const std::string &message);

/// Records that the hardware source was read successfully.
void clearRefusal();

} // namespace detail
} // namespace HX

#endif // HX_SRC_REFUSALLOG_H
