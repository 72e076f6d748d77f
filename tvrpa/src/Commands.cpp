#include "Commands.h"

namespace tvrpa {

namespace {

using O = OptionId;

// Options every command that reads the hardware accepts.
const std::vector<OptionId> kSetup = {O::Tree,         O::NameSpace, O::Format,          O::Trace,
                                      O::Registration, O::Schema,    O::ProviderLibrary, O::Help};

std::vector<OptionId> with(std::vector<OptionId> own) {
  std::vector<OptionId> out = std::move(own);
  out.insert(out.end(), kSetup.begin(), kSetup.end());
  return out;
}

const std::vector<Format> kAnswerFormats = {Format::Text, Format::Mof, Format::Json};

} // namespace

const std::vector<OptionDef>& allOptions() {
  static const std::vector<OptionDef> options = {
      {O::Tree, "--tree", "FILE", "read the hardware from a hardware-tree file instead of this machine"},
      {O::NameSpace, "--namespace", "NS", "the CIM namespace of the request (default root/cimv2)"},
      {O::Format, "--format", "FORMAT", "how to print the answer: text, mof, json (inventory: text, json, dot)"},
      {O::Properties, "--properties", "a,b,c", "the property list handed to the provider (empty: no properties)"},
      {O::AssocClass, "--assoc-class", "CLASS", "only this association class (default: every association provider)"},
      {O::ResultClass, "--result-class", "CLASS", "ai, ain: the class of the far end; ri, rin: the association class"},
      {O::Role, "--role", "ROLE", "the role the source plays in the association"},
      {O::ResultRole, "--result-role", "ROLE", "the role the far end plays in the association"},
      {O::Trace, "--trace", nullptr, "show the request, the broker trace lines and the logger lines on standard error"},
      {O::Registration, "--registration", "FILE", "read this provider registration file instead (may be repeated)"},
      {O::Schema, "--schema", "FILE", "read class keys from this MOF schema file instead (may be repeated)"},
      {O::ProviderLibrary, "--provider-library", "PATH", "load this build of the provider library instead"},
      {O::Help, "--help", nullptr, "describe the tool, or the command it follows, and exit"},
  };
  return options;
}

const std::vector<CommandDef>& allCommands() {
  static const std::vector<CommandDef> commands = {
      {Command::EnumerateInstances, "ei", "EnumerateInstances", Positional::ClassName, "CLASS", with({O::Properties}),
       kAnswerFormats},
      {Command::EnumerateInstanceNames, "ein", "EnumerateInstanceNames", Positional::ClassName, "CLASS", with({}),
       kAnswerFormats},
      {Command::GetInstance, "gi", "GetInstance", Positional::ObjectPath, "PATH [KEY=VALUE...]", with({O::Properties}),
       kAnswerFormats},
      {Command::Associators, "ai", "Associators", Positional::ObjectPath, "PATH [KEY=VALUE...]",
       with({O::AssocClass, O::ResultClass, O::Role, O::ResultRole, O::Properties}), kAnswerFormats},
      {Command::AssociatorNames, "ain", "AssociatorNames", Positional::ObjectPath, "PATH [KEY=VALUE...]",
       with({O::AssocClass, O::ResultClass, O::Role, O::ResultRole}), kAnswerFormats},
      {Command::References, "ri", "References", Positional::ObjectPath, "PATH [KEY=VALUE...]",
       with({O::AssocClass, O::ResultClass, O::Role, O::Properties}), kAnswerFormats},
      {Command::ReferenceNames, "rin", "ReferenceNames", Positional::ObjectPath, "PATH [KEY=VALUE...]",
       with({O::AssocClass, O::ResultClass, O::Role}), kAnswerFormats},
      {Command::Inventory, "inventory", "", Positional::None, "", with({}), {Format::Text, Format::Json, Format::Dot}},
      {Command::Classes,
       "classes",
       "",
       Positional::None,
       "",
       {O::Format, O::Registration, O::Help},
       {Format::Text, Format::Json}},
      {Command::Help, "help", "", Positional::Topic, "[COMMAND]", {O::Help}, {Format::Text}},
  };
  return commands;
}

const OptionDef& optionDef(OptionId id) {
  for (const OptionDef& o : allOptions())
    if (o.id == id) return o;
  return allOptions().front();
}

const CommandDef& commandDef(Command command) {
  for (const CommandDef& c : allCommands())
    if (c.command == command) return c;
  return allCommands().front();
}

const CommandDef* findCommand(std::string_view word) {
  for (const CommandDef& c : allCommands())
    if (word == c.word) return &c;
  return nullptr;
}

const char* formatName(Format format) {
  switch (format) {
  case Format::Text: return "text";
  case Format::Mof: return "mof";
  case Format::Json: return "json";
  case Format::Dot: return "dot";
  }
  return "text";
}

std::optional<Format> parseFormat(std::string_view word) {
  for (Format f : {Format::Text, Format::Mof, Format::Json, Format::Dot})
    if (word == formatName(f)) return f;
  return std::nullopt;
}

bool isCimOperation(Command command) {
  return command != Command::Inventory && command != Command::Classes && command != Command::Help;
}

bool isAssociationOperation(Command command) {
  return command == Command::Associators || command == Command::AssociatorNames || command == Command::References ||
         command == Command::ReferenceNames;
}

tvr::broker::Operation brokerOperation(Command command) {
  using tvr::broker::Operation;
  switch (command) {
  case Command::EnumerateInstanceNames: return Operation::EnumerateInstanceNames;
  case Command::GetInstance: return Operation::GetInstance;
  case Command::Associators: return Operation::Associators;
  case Command::AssociatorNames: return Operation::AssociatorNames;
  case Command::References: return Operation::References;
  case Command::ReferenceNames: return Operation::ReferenceNames;
  default: return Operation::EnumerateInstances;
  }
}

std::string commandWordList() {
  std::string out;
  const auto& commands = allCommands();
  for (std::size_t i = 0; i < commands.size(); ++i) {
    if (i) out += i + 1 == commands.size() ? " or " : ", ";
    out += commands[i].word;
  }
  return out;
}

} // namespace tvrpa
