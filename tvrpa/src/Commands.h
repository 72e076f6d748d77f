// The commands and options tvrpa knows, as tables: what each command is
// called, what it takes, which options and output formats it accepts. The
// command-line parser, the help texts and the man page all read these
// tables, so they cannot disagree.
#pragma once

#include "tvr/broker/Response.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tvrpa {

enum class Command {
  EnumerateInstances,
  EnumerateInstanceNames,
  GetInstance,
  Associators,
  AssociatorNames,
  References,
  ReferenceNames,
  Inventory,
  Classes,
  Help,
};

enum class Format { Text, Mof, Json, Dot };

enum class OptionId {
  Tree,
  NameSpace,
  Format,
  Properties,
  AssocClass,
  ResultClass,
  Role,
  ResultRole,
  Trace,
  Registration,
  Schema,
  ProviderLibrary,
  Help,
};

/// What a command takes after its name.
enum class Positional {
  None,       ///< nothing
  ClassName,  ///< one class name, optionally "namespace:Class"
  ObjectPath, ///< one object path, then optional KEY=VALUE words
  Topic,      ///< an optional command name (help)
};

struct OptionDef {
  OptionId id;
  const char* flag;     ///< e.g. "--tree"
  const char* argument; ///< the value's name in help texts, e.g. "FILE"; null for a flag
  const char* summary;  ///< one line for option lists
};

struct CommandDef {
  Command command;
  const char* word;    ///< what the user types, e.g. "ai"
  const char* cimName; ///< the CIM operation, e.g. "Associators"; empty for tool commands
  Positional positional;
  const char* arguments; ///< the positional part of the synopsis, e.g. "PATH [KEY=VALUE...]"
  std::vector<OptionId> options;
  std::vector<Format> formats; ///< first is the default
};

/// Every option, in the order help texts list them.
const std::vector<OptionDef>& allOptions();
/// Every command, in the order help texts list them.
const std::vector<CommandDef>& allCommands();

const OptionDef& optionDef(OptionId id);
const CommandDef& commandDef(Command command);
/// The command typed as `word`, or null.
const CommandDef* findCommand(std::string_view word);

/// "text", "mof", "json", "dot".
const char* formatName(Format format);
std::optional<Format> parseFormat(std::string_view word);

/// True for the seven commands that send one CIM operation.
bool isCimOperation(Command command);
/// True for ai, ain, ri, rin.
bool isAssociationOperation(Command command);
/// The broker operation of a CIM operation command.
tvr::broker::Operation brokerOperation(Command command);

/// "ei, ein, gi, ai, ain, ri, rin, inventory, classes or help".
std::string commandWordList();

} // namespace tvrpa
