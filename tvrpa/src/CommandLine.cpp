#include "CommandLine.h"

namespace tvrpa {

namespace {

const std::vector<std::string> kOperations = {"ei", "ein", "gi"};

bool isOperation(const std::string& word) {
  for (const std::string& op : kOperations)
    if (op == word) return true;
  return false;
}

std::vector<std::string> splitList(const std::string& text) {
  std::vector<std::string> out;
  std::string current;
  for (char c : text) {
    if (c == ',') {
      if (!current.empty()) out.push_back(current);
      current.clear();
    } else {
      current += c;
    }
  }
  if (!current.empty()) out.push_back(current);
  return out;
}

} // namespace

std::optional<CommandLine> parseCommandLine(const std::vector<std::string>& args, std::string* error) {
  CommandLine cl;
  auto fail = [&](std::string message) -> std::optional<CommandLine> {
    *error = std::move(message);
    return std::nullopt;
  };
  for (std::size_t i = 0; i < args.size(); ++i) {
    const std::string& arg = args[i];
    auto value = [&](const char* option) -> std::optional<std::string> {
      const std::string prefix = std::string(option) + "=";
      if (arg.rfind(prefix, 0) == 0) return arg.substr(prefix.size());
      if (i + 1 >= args.size()) return std::nullopt;
      return args[++i];
    };
    auto is = [&](const char* option) {
      return arg == option || arg.rfind(std::string(option) + "=", 0) == 0;
    };
    if (arg == "--help" || arg == "-h") {
      cl.help = true;
    } else if (is("--tree")) {
      auto v = value("--tree");
      if (!v) return fail("--tree needs a hardware-tree file");
      cl.tree = *v;
    } else if (is("--namespace")) {
      auto v = value("--namespace");
      if (!v || v->empty()) return fail("--namespace needs a namespace, e.g. root/cimv2");
      cl.nameSpace = *v;
    } else if (is("--format")) {
      auto v = value("--format");
      if (v && *v == "text") cl.format = Format::Text;
      else if (v && *v == "json") cl.format = Format::Json;
      else return fail("--format takes text or json");
    } else if (is("--properties")) {
      auto v = value("--properties");
      if (!v) return fail("--properties needs a comma-separated list of property names");
      cl.properties = splitList(*v);
    } else if (is("--registration")) {
      auto v = value("--registration");
      if (!v) return fail("--registration needs a registration file");
      cl.registration = *v;
    } else if (is("--provider-library")) {
      auto v = value("--provider-library");
      if (!v) return fail("--provider-library needs the path of a provider library");
      cl.providerLibrary = *v;
    } else if (arg.size() > 1 && arg[0] == '-') {
      return fail("unknown option " + arg);
    } else if (cl.operation.empty()) {
      if (!isOperation(arg)) return fail("unknown operation '" + arg + "' (expected ei, ein or gi)");
      cl.operation = arg;
    } else {
      cl.arguments.push_back(arg);
    }
  }
  if (cl.help) return cl;
  if (cl.operation.empty()) return fail("no operation given (expected ei, ein or gi; see --help)");
  if (cl.arguments.empty()) {
    if (cl.operation == "gi") return fail("gi needs an object path, e.g. 'TVRHX_Chassis.Tag=\"/Main\"'");
    return fail(cl.operation + " needs a class name, e.g. TVRHX_Chassis");
  }
  if (cl.operation != "gi" && cl.arguments.size() > 1)
    return fail(cl.operation + " takes one class name, got " + std::to_string(cl.arguments.size()) + " arguments");
  return cl;
}

std::string usageText() {
  return R"(Usage: tvrpa OPERATION ARGUMENTS [OPTIONS]

Asks the physical-asset providers about a machine, through an object manager
built into this tool, and prints the answer.

Operations:
  ei CLASS              EnumerateInstances: every instance of CLASS
  ein CLASS             EnumerateInstanceNames: the object path of every instance
  gi PATH [KEY=VALUE]   GetInstance: the instance PATH names; keys may follow
                        the class name as KEY=VALUE words

Options:
  --tree FILE           read the hardware from a hardware-tree file instead of
                        this machine
  --namespace NS        the CIM namespace (default root/cimv2)
  --format text|json    text for people (default), JSON for scripts
  --properties a,b,c    the property list handed to the provider
  --registration FILE   another provider registration file
  --provider-library P  load this provider library instead of the installed one
  --help                this text

Object paths are written [namespace:]Class.Key="value",Key2="value".

Exit status: 0 the provider answered OK, 2 the provider answered with an
error, 3 an exception escaped the provider, 1 usage error.

Examples:
  tvrpa ei TVRHX_Chassis
  tvrpa ein TVRHX_Chassis --tree examples/blade-system.json
  tvrpa gi 'TVRHX_Chassis.Tag="/System/Blade Chassis"' --tree examples/blade-system.json
  tvrpa gi TVRHX_Chassis 'Tag=/System/Blade Chassis' --format json
)";
}

} // namespace tvrpa
