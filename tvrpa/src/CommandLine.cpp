#include "CommandLine.h"

#include "tvr/broker/PathText.h"

#include <algorithm>

namespace tvrpa {

namespace {

using tvr::broker::ObjectPath;

const char* const kPathExample = "'TVRHX_Chassis.Tag=\"/System/Blade Chassis\",CreationClassName=\"TVRHX_Chassis\"'";

struct UsageProblem {
  std::string message;
};

// One option as it stood on the command line.
struct GivenOption {
  OptionId id;
  std::string flag;
  std::string value;
};

std::string trimmed(const std::string& text) {
  const std::size_t first = text.find_first_not_of(" \t");
  if (first == std::string::npos) return std::string();
  const std::size_t last = text.find_last_not_of(" \t");
  return text.substr(first, last - first + 1);
}

// "a, b,,c" -> {"a", "b", "c"}; an empty text is an empty list, which asks
// for no properties at all.
std::vector<std::string> propertyNames(const std::string& text) {
  std::vector<std::string> out;
  std::size_t start = 0;
  while (start <= text.size()) {
    const std::size_t comma = std::min(text.find(',', start), text.size());
    std::string name = trimmed(text.substr(start, comma - start));
    if (!name.empty()) out.push_back(std::move(name));
    start = comma + 1;
  }
  return out;
}

std::string optionList(const CommandDef& def) {
  std::string out;
  for (OptionId id : def.options) {
    if (id == OptionId::Help) continue;
    if (!out.empty()) out += ", ";
    out += optionDef(id).flag;
  }
  return out;
}

std::string formatList(const CommandDef& def) {
  std::string out;
  for (std::size_t i = 0; i < def.formats.size(); ++i) {
    if (i) out += i + 1 == def.formats.size() ? " or " : ", ";
    out += formatName(def.formats[i]);
  }
  return out;
}

bool accepts(const CommandDef& def, OptionId id) {
  return std::find(def.options.begin(), def.options.end(), id) != def.options.end();
}

// Points at the column where reading a path failed.
std::string pathProblem(const std::string& what, const std::string& text, const tvr::broker::PathParseError& error) {
  const std::size_t column = std::max<std::size_t>(error.column, 1);
  return "bad " + what + " at column " + std::to_string(column) + ": " + error.message + "\n  " + text + "\n  " +
         std::string(column - 1, ' ') + "^";
}

const OptionDef* findOption(const std::string& flag) {
  for (const OptionDef& o : allOptions())
    if (flag == o.flag) return &o;
  return nullptr;
}

// The words of the command line, sorted into options and positional words.
struct Words {
  std::vector<GivenOption> options;
  std::vector<std::string> positional;
};

Words splitWords(const std::vector<std::string>& args) {
  Words words;
  bool optionsEnded = false;
  for (std::size_t i = 0; i < args.size(); ++i) {
    const std::string& arg = args[i];
    if (optionsEnded || arg.size() < 2 || arg[0] != '-') {
      words.positional.push_back(arg);
      continue;
    }
    if (arg == "--") {
      optionsEnded = true;
      continue;
    }
    const std::size_t equals = arg.find('=');
    const std::string flag = arg.substr(0, equals);
    const OptionDef* def = arg.rfind("--", 0) == 0 ? findOption(flag) : nullptr;
    if (!def) throw UsageProblem{"unknown option " + flag + " (see tvrpa --help for the options)"};
    GivenOption given{def->id, flag, std::string()};
    if (!def->argument) {
      if (equals != std::string::npos) throw UsageProblem{flag + " takes no value, got '" + arg + "'"};
    } else if (equals != std::string::npos) {
      given.value = arg.substr(equals + 1);
    } else if (i + 1 < args.size()) {
      given.value = args[++i];
    } else {
      throw UsageProblem{flag + " needs " + def->argument + " after it: " + def->summary};
    }
    words.options.push_back(std::move(given));
  }
  return words;
}

void applyOption(CommandLine& cl, const CommandDef& def, const GivenOption& o) {
  if (!accepts(def, o.id))
    throw UsageProblem{std::string(def.word) + " does not take " + o.flag + " (it takes " + optionList(def) + ")"};
  switch (o.id) {
  case OptionId::Tree:
    if (o.value.empty()) throw UsageProblem{"--tree needs a hardware-tree file"};
    cl.tree = o.value;
    break;
  case OptionId::NameSpace:
    if (o.value.empty()) throw UsageProblem{"--namespace needs a namespace, e.g. root/cimv2"};
    cl.nameSpace = o.value;
    break;
  case OptionId::Format: {
    const std::optional<Format> format = parseFormat(o.value);
    if (!format || std::find(def.formats.begin(), def.formats.end(), *format) == def.formats.end())
      throw UsageProblem{"--format for " + std::string(def.word) + " takes " + formatList(def) + ", got '" + o.value +
                         "'"};
    cl.format = *format;
    break;
  }
  case OptionId::Properties: cl.properties = propertyNames(o.value); break;
  case OptionId::AssocClass:
  case OptionId::ResultClass:
  case OptionId::Role:
  case OptionId::ResultRole:
    if (o.value.empty()) throw UsageProblem{o.flag + " needs a name"};
    if (o.id == OptionId::AssocClass) cl.assocClass = o.value;
    if (o.id == OptionId::ResultClass) cl.resultClass = o.value;
    if (o.id == OptionId::Role) cl.role = o.value;
    if (o.id == OptionId::ResultRole) cl.resultRole = o.value;
    break;
  case OptionId::Trace: cl.trace = true; break;
  case OptionId::Registration:
    if (o.value.empty()) throw UsageProblem{"--registration needs a registration file"};
    cl.registrations.push_back(o.value);
    break;
  case OptionId::Schema:
    if (o.value.empty()) throw UsageProblem{"--schema needs a MOF schema file"};
    cl.schemas.push_back(o.value);
    break;
  case OptionId::ProviderLibrary:
    if (o.value.empty()) throw UsageProblem{"--provider-library needs the path of a provider library"};
    cl.providerLibrary = o.value;
    break;
  case OptionId::Help: cl.help = true; break;
  }
}

// References name their association class in the CMPI resultClass argument:
// for ri and rin --assoc-class and --result-class are two names of it.
void mergeReferenceClass(CommandLine& cl) {
  if (cl.command != Command::References && cl.command != Command::ReferenceNames) return;
  if (cl.assocClass && cl.resultClass && *cl.assocClass != *cl.resultClass)
    throw UsageProblem{std::string(commandDef(cl.command).word) +
                       " takes one association class, but --assoc-class and --result-class differ"};
  if (cl.assocClass) cl.resultClass = cl.assocClass;
  cl.assocClass.reset();
}

ObjectPath classTarget(const CommandLine& cl, const CommandDef& def) {
  const std::string word = def.word;
  if (cl.arguments.empty()) throw UsageProblem{word + " needs a class name, e.g. TVRHX_Chassis"};
  if (cl.arguments.size() > 1)
    throw UsageProblem{word + " takes one class name, got " + std::to_string(cl.arguments.size()) + " arguments"};
  tvr::broker::PathParseError error;
  auto path = tvr::broker::parseObjectPath(cl.arguments.front(), &error);
  if (!path) throw UsageProblem{pathProblem("class name", cl.arguments.front(), error)};
  if (!path->keys.empty() || !path->host.empty())
    throw UsageProblem{word + " takes a class name such as TVRHX_Chassis, not an object path"};
  if (path->nameSpace.empty()) path->nameSpace = cl.nameSpace;
  return *path;
}

ObjectPath pathTarget(const CommandLine& cl, const CommandDef& def) {
  const std::string word = def.word;
  if (cl.arguments.empty()) throw UsageProblem{word + " needs an object path, e.g. " + kPathExample};
  tvr::broker::PathParseError error;
  auto path = tvr::broker::parseObjectPath(cl.arguments.front(), &error);
  if (!path) throw UsageProblem{pathProblem("object path", cl.arguments.front(), error)};
  for (std::size_t i = 1; i < cl.arguments.size(); ++i) {
    const std::string& keyWord = cl.arguments[i];
    const std::size_t equals = keyWord.find('=');
    if (equals == std::string::npos || equals == 0)
      throw UsageProblem{"expected KEY=VALUE after the path, got '" + keyWord + "'"};
    path->setKey(keyWord.substr(0, equals), tvr::broker::Value::chars(keyWord.substr(equals + 1)));
  }
  if (cl.command == Command::GetInstance && path->keys.empty())
    throw UsageProblem{"gi needs the keys of the instance, e.g. " + std::string(kPathExample) +
                       " or TVRHX_Chassis 'Tag=/System/Blade Chassis'"};
  if (path->nameSpace.empty()) path->nameSpace = cl.nameSpace;
  return *path;
}

void checkPositional(CommandLine& cl, const CommandDef& def) {
  switch (def.positional) {
  case Positional::None:
    if (!cl.arguments.empty())
      throw UsageProblem{std::string(def.word) + " takes no arguments, got '" + cl.arguments.front() + "'"};
    break;
  case Positional::ClassName: cl.target = classTarget(cl, def); break;
  case Positional::ObjectPath: cl.target = pathTarget(cl, def); break;
  case Positional::Topic:
    if (cl.arguments.size() > 1) throw UsageProblem{"help takes at most one command name"};
    if (!cl.arguments.empty()) {
      const CommandDef* topic = findCommand(cl.arguments.front());
      if (!topic) throw UsageProblem{"no help on '" + cl.arguments.front() + "' (expected " + commandWordList() + ")"};
      cl.helpTopic = topic->command;
    }
    cl.help = true;
    break;
  }
}

// --help and --man are answered whatever else the line says, so that
// appending --help to a half-written command always works. The help is that
// of the first command word on the line, if any.
std::optional<CommandLine> helpRequest(const std::vector<std::string>& args) {
  CommandLine cl;
  const CommandDef* topic = nullptr;
  for (const std::string& arg : args) {
    if (arg == "--") break;
    if (arg == "--man") cl.man = true;
    if (arg == "--help" || arg == "-h") cl.help = true;
    const CommandDef* command = findCommand(arg);
    if (command && (!topic || topic->command == Command::Help)) topic = command;
  }
  if (!cl.man && !cl.help) return std::nullopt;
  if (topic && topic->command != Command::Help) cl.helpTopic = topic->command;
  return cl;
}

CommandLine parse(const std::vector<std::string>& args) {
  if (std::optional<CommandLine> help = helpRequest(args)) return *help;
  const Words words = splitWords(args);
  CommandLine cl;
  const CommandDef* def = words.positional.empty() ? nullptr : findCommand(words.positional.front());
  if (words.positional.empty())
    throw UsageProblem{"no command given (expected " + commandWordList() + "; see tvrpa --help)"};
  if (!def)
    throw UsageProblem{"unknown command '" + words.positional.front() + "' (expected " + commandWordList() + ")"};
  cl.command = def->command;
  cl.format = def->formats.front();
  cl.arguments.assign(words.positional.begin() + 1, words.positional.end());
  for (const GivenOption& o : words.options) applyOption(cl, *def, o);
  mergeReferenceClass(cl);
  checkPositional(cl, *def);
  return cl;
}

} // namespace

std::optional<CommandLine> parseCommandLine(const std::vector<std::string>& args, std::string* error) {
  try {
    return parse(args);
  } catch (const UsageProblem& problem) {
    *error = problem.message;
    return std::nullopt;
  }
}

} // namespace tvrpa
