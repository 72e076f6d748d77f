// What the user asked tvrpa to do, read and checked from its command line.
#pragma once

#include "Commands.h"

#include "tvr/broker/ObjectManager.h"

#include <optional>
#include <string>
#include <vector>

namespace tvrpa {

struct CommandLine {
  Command command = Command::Help;
  std::vector<std::string> arguments; ///< the words after the command
  /// The class (ei, ein) or object path (gi, ai, ...) the request names,
  /// with the namespace filled in from --namespace when the text had none.
  tvr::broker::ObjectPath target;
  std::optional<std::string> tree;            ///< --tree FILE
  std::string nameSpace = "root/cimv2";       ///< --namespace NS
  Format format = Format::Text;               ///< --format
  tvr::broker::PropertyList properties;       ///< --properties a,b,c
  std::optional<std::string> assocClass;      ///< --assoc-class
  std::optional<std::string> resultClass;     ///< --result-class
  std::optional<std::string> role;            ///< --role
  std::optional<std::string> resultRole;      ///< --result-role
  bool trace = false;                         ///< --trace
  std::vector<std::string> registrations;     ///< every --registration FILE, in order
  std::vector<std::string> schemas;           ///< every --schema FILE, in order
  std::optional<std::string> providerLibrary; ///< --provider-library PATH
  /// --help (or `help`): describe `helpTopic`, or the tool when it is empty.
  bool help = false;
  std::optional<Command> helpTopic;
  bool man = false; ///< --man: print the manual page in roff
};

/// Reads the arguments after the program name. On a usage error returns
/// nullopt and sets `error` to a message saying what was wrong and what was
/// expected instead.
std::optional<CommandLine> parseCommandLine(const std::vector<std::string>& args, std::string* error);

} // namespace tvrpa
