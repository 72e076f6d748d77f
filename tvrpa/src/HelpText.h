// The help texts for the terminal: the tool's and each command's, rendered
// from HelpContent, wrapped to fit an 80-column terminal.
#pragma once

#include "Commands.h"

#include <string>

namespace tvrpa {

/// What `tvrpa --help` prints.
std::string toolHelpText();

/// What `tvrpa COMMAND --help` prints: synopsis, description, the options
/// the command takes, examples.
std::string commandHelpText(Command command);

/// The synopsis of one command, e.g. "tvrpa ai PATH [KEY=VALUE...] [OPTIONS]".
std::string commandSynopsis(Command command);

} // namespace tvrpa
