//===- RequestGuard.h - No exception leaves a companion handler -----------===//
//
/// \file
/// Handlers run their work through guarded(): a hardware that cannot be
/// read (or any other exception) fails the request with a message instead
/// of unwinding into the object manager, and is logged once per request.
//
//===----------------------------------------------------------------------===//
#pragma once

#include <cmpift.h>

#include <exception>
#include <string>

namespace tvr::companion {

/// The logger category of the companion providers.
extern const std::string kLogCategory;

/// Logs the failure of \p provider at level 6000 and returns
/// CMPI_RC_ERR_FAILED with the message "cannot read the hardware: <what>".
CMPIStatus failedRequest(const CMPIBroker* broker, const char* provider, const std::string& what);

/// Runs \p work, which returns the handler's status.
template <class Work> CMPIStatus guarded(const CMPIBroker* broker, const char* provider, Work&& work) noexcept {
  try {
    return work();
  } catch (const std::exception& e) {
    return failedRequest(broker, provider, e.what());
  } catch (...) {
    return failedRequest(broker, provider, "unknown exception");
  }
}

} // namespace tvr::companion
