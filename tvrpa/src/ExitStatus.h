// tvrpa's exit statuses, and how an answer maps onto them.
#pragma once

#include "tvr/broker/Response.h"

#include <ostream>

namespace tvrpa {

enum ExitStatus {
  kExitOk = 0,                ///< the answer is OK
  kExitUsage = 1,             ///< the command line (or what it names) is wrong
  kExitProviderError = 2,     ///< a provider answered an error, or nobody serves the request
  kExitProviderException = 3, ///< an exception escaped a provider
};

/// The status an answer earns: an exception that escaped any provider
/// outranks an error status, which outranks OK. The status is the answer's
/// as the object manager settled it: when it asked several association
/// providers, the merged answer is OK unless every one of them failed (a
/// provider that serves other classes than the source's often refuses).
ExitStatus exitStatusOf(const tvr::broker::Response& response);

/// The worse of two statuses (for commands that send several requests).
ExitStatus worse(ExitStatus a, ExitStatus b);

/// When the answer failed, writes one "tvrpa: ..." line to `err` for each
/// failure in it: the provider, the CMPI status name and the message, or the
/// exception. A merged answer that is OK writes nothing; --trace and
/// --format json show each provider's status. `subject` (e.g. a class name)
/// is put before the lines when not empty.
void reportFailures(const tvr::broker::Response& response, std::ostream& err, const std::string& subject = "");

} // namespace tvrpa
