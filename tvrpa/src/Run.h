// What each tvrpa command does once its command line has been read.
#pragma once

#include "CommandLine.h"
#include "ExitStatus.h"

#include <ostream>

namespace tvrpa {

/// ei, ein, gi, ai, ain, ri, rin: sends the request and prints the answer
/// as it comes; failures go to `err`. Throws UsageError when the run cannot
/// be set up.
ExitStatus runCimOperation(const CommandLine& commandLine, std::ostream& out, std::ostream& err);

/// inventory. Throws UsageError when the run cannot be set up.
ExitStatus runInventory(const CommandLine& commandLine, std::ostream& out, std::ostream& err);

/// classes. Throws UsageError for an unreadable registration.
ExitStatus runClasses(const CommandLine& commandLine, std::ostream& out);

} // namespace tvrpa
