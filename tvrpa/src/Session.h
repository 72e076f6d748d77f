// One tvrpa run: the object manager set up as the command line asks, and
// the request it sends.
#pragma once

#include "CommandLine.h"

#include "tvr/broker/ObjectManager.h"

#include <memory>
#include <string>

namespace tvrpa {

/// Why a run could not be set up or the request not be formed; the text
/// is for the user.
struct UsageError {
  std::string message;
};

class Session {
public:
  /// Sets up the hardware source and the object manager. Throws UsageError.
  explicit Session(const CommandLine& commandLine);
  /// Sends the command line's request. Throws UsageError for a bad path.
  tvr::broker::Response run();

private:
  const CommandLine& commandLine_;
  std::unique_ptr<tvr::broker::ObjectManager> om_;
};

} // namespace tvrpa
