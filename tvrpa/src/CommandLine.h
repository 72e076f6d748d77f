// What the user asked tvrpa to do, read from its command line.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace tvrpa {

enum class Format { Text, Json };

struct CommandLine {
  std::string operation;                   ///< "ei", "ein", "gi", or empty with --help
  std::vector<std::string> arguments;      ///< the operation's positional arguments
  std::optional<std::string> tree;         ///< --tree FILE
  std::string nameSpace = "root/cimv2";    ///< --namespace NS
  Format format = Format::Text;            ///< --format text|json
  std::optional<std::vector<std::string>> properties; ///< --properties a,b,c
  std::optional<std::string> registration; ///< --registration FILE
  std::optional<std::string> providerLibrary; ///< --provider-library PATH
  bool help = false;
};

/// Reads the arguments after the program name. On a usage error returns
/// nullopt and sets `error` to a message saying what was wrong.
std::optional<CommandLine> parseCommandLine(const std::vector<std::string>& args, std::string* error);

/// The text --help prints.
std::string usageText();

} // namespace tvrpa
