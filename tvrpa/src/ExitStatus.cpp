#include "ExitStatus.h"

namespace tvrpa {

namespace {

void describeException(const tvr::broker::EscapedException& e, std::ostream& err) {
  err << e.type;
  if (!e.what.empty()) err << ": " << e.what;
}

} // namespace

ExitStatus exitStatusOf(const tvr::broker::Response& response) {
  if (response.exception) return kExitProviderException;
  if (response.rc != CMPI_RC_OK) return kExitProviderError;
  return kExitOk;
}

ExitStatus worse(ExitStatus a, ExitStatus b) { return a > b ? a : b; }

void reportFailures(const tvr::broker::Response& response, std::ostream& err, const std::string& subject) {
  if (response.ok()) return;
  const std::string lead = subject.empty() ? "tvrpa: " : "tvrpa: " + subject + ": ";
  if (response.outcomes.empty()) {
    err << lead << tvr::broker::statusName(response.rc);
    if (response.message) err << ": " << *response.message;
    err << "\n";
    return;
  }
  for (const tvr::broker::ProviderOutcome& o : response.outcomes) {
    if (o.exception) {
      err << lead << "an exception escaped the provider " << o.provider << " (" << o.className << "): ";
      describeException(*o.exception, err);
      err << "\n";
    } else if (o.rc != CMPI_RC_OK) {
      err << lead << o.provider << " (" << o.className << ") answered " << tvr::broker::statusName(o.rc);
      if (o.message) err << ": " << *o.message;
      err << "\n";
    }
  }
}

} // namespace tvrpa
