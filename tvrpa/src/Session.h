// One tvrpa run: the hardware source and the embedded object manager, set
// up as the command line asks.
#pragma once

#include "CommandLine.h"

#include "tvr/broker/ObjectManager.h"
#include "tvr/broker/Registration.h"

#include <memory>
#include <string>

namespace tvrpa {

/// Why a run could not be set up; the text is for the user, and the run
/// ends with the usage exit status.
struct UsageError {
  std::string message;
};

/// The registration the run uses: the --registration files, else the
/// physical-asset providers' registration installed beside tvrpa (or the
/// source tree's) and the companion providers' beside it when it is there;
/// a class registered twice takes the later section. Throws UsageError when
/// a file cannot be read.
tvr::broker::RegistrationTable loadRegistration(const CommandLine& commandLine);

class Session {
public:
  /// Selects the hardware source and sets up the object manager. Throws
  /// UsageError for a refused hardware-tree file (with the agent's message),
  /// an unreadable registration, schema or provider library.
  explicit Session(const CommandLine& commandLine);

  tvr::broker::ObjectManager& objectManager() { return *om_; }
  /// "tree file <path>" or "live machine at <root>".
  std::string hardwareSource() const;

private:
  std::unique_ptr<tvr::broker::ObjectManager> om_;
};

} // namespace tvrpa
