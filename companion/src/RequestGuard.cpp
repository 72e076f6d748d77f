#include "RequestGuard.h"

#include "CmpiObjects.h"

#include <KVLog/KVLogger.h>

namespace tvr::companion {

const std::string kLogCategory = "TVR.CompanionProviders";

CMPIStatus failedRequest(const CMPIBroker* broker, const char* provider, const std::string& what) {
  const std::string message = "cannot read the hardware: " + what;
  KVLog::KVLogger::logLevelMessage(__func__, __FILE__, __LINE__, kLogCategory, 6000, nullptr, 0, 0,
                                   std::string(provider) + ": " + message);
  return statusWith(broker, CMPI_RC_ERR_FAILED, message);
}

} // namespace tvr::companion
