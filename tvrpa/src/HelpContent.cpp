#include "HelpContent.h"

namespace tvrpa {

namespace {

const char* const kBlade = "--tree examples/blade-system.json";
const char* const kChassisPath = "'TVRHX_Chassis.Tag=\"/System/Blade Chassis\",CreationClassName=\"TVRHX_Chassis\"'";

std::string blade(const std::string& command) { return command + " " + kBlade; }

const std::vector<CommandHelp>& allHelp() {
  static const std::vector<CommandHelp> help = {
      {Command::EnumerateInstances,
       "EnumerateInstances: every instance of CLASS",
       {"Sends EnumerateInstances for CLASS to the provider registered for it and prints every instance it "
        "returns, in the order it returned them, each under its object path. CLASS may carry a namespace, as in "
        "root/cimv2:TVRHX_Chassis.",
        "--properties hands the provider a property list; the provider decides what it does with it."},
       {{"tvrpa ei TVRHX_Chassis", "every chassis of this machine"},
        {blade("tvrpa ei TVRHX_Slot") + " --format mof", "the slots of the example blade system, as MOF"},
        {"tvrpa ei TVRHX_NetworkCard --format json | jq '.items[].path.text'", "the paths, for a script"}}},
      {Command::EnumerateInstanceNames,
       "EnumerateInstanceNames: the object path of every instance of CLASS",
       {"Sends EnumerateInstanceNames for CLASS and prints one object path per line. Every path printed can be "
        "pasted back into gi, ai, ain, ri or rin."},
       {{"tvrpa ein TVRHX_Chassis", "the paths of this machine's chassis"},
        {blade("tvrpa ein TVRHX_Connector"), "the connectors of the example blade system"}}},
      {Command::GetInstance,
       "GetInstance: the instance PATH names",
       {"Sends GetInstance for the object path PATH and prints the instance, if the provider finds one. Keys may "
        "also follow the class name as KEY=VALUE words, which saves quoting: the value is taken as a string.",
        "A path that names nothing gives an empty answer and exit status 0, as the provider answers OK."},
       {{blade(std::string("tvrpa gi ") + kChassisPath), "the blade chassis"},
        {blade("tvrpa gi TVRHX_Chassis 'Tag=/System/Blade Chassis' CreationClassName=TVRHX_Chassis"),
         "the same, keys as words"}}},
      {Command::Associators,
       "Associators: the instances tied to PATH",
       {"Sends Associators from the instance PATH names and prints the instances at the far end of its "
        "associations. Without --assoc-class every registered association provider is asked, each with its own "
        "association class, and the answers are printed one after the other in registration order, as an object "
        "manager merges them for a client that names no class. --assoc-class asks only the provider of that "
        "class.",
        "--result-class, --role, --result-role and --properties are handed to the provider unchanged. "
        "Association providers do not always complete their answer (returnDone); what they returned is printed "
        "anyway, and --format json says whether the answer was completed."},
       {{blade(std::string("tvrpa ai ") + kChassisPath), "everything tied to the blade chassis"},
        {blade(std::string("tvrpa ai ") + kChassisPath + " --assoc-class TVRHX_SlotOnChassis"),
         "the slots on the blade chassis"}}},
      {Command::AssociatorNames,
       "AssociatorNames: the paths of the instances tied to PATH",
       {"As ai, but the providers answer with object paths only, printed one per line. There is no property "
        "list."},
       {{blade(std::string("tvrpa ain ") + kChassisPath + " --result-class TVRHX_Slot"),
         "the paths of the slots tied to the blade chassis"}}},
      {Command::References,
       "References: the association instances that refer to PATH",
       {"Sends References from the instance PATH names and prints the association instances that refer to it, "
        "with their reference properties as nested object paths. References names its association class in its "
        "result class argument: --assoc-class and --result-class both set it. Without either, every registered "
        "association provider is asked with its own class and the answers are merged as for ai.",
        "References has no result role; --role and --properties are handed to the provider unchanged."},
       {{blade(std::string("tvrpa ri ") + kChassisPath), "every association instance that names the blade chassis"},
        {blade(std::string("tvrpa ri ") + kChassisPath + " --assoc-class TVRHX_SlotOnChassis --role GroupComponent"),
         "the SlotOnChassis instances where it is the group"}}},
      {Command::ReferenceNames,
       "ReferenceNames: the paths of the association instances that refer to PATH",
       {"As ri, but the providers answer with object paths only. An association's path carries its references "
        "as quoted nested paths; it can be pasted into gi like any other path."},
       {{blade(std::string("tvrpa rin ") + kChassisPath), "the paths of the association instances"}}},
      {Command::Inventory,
       "the whole machine as one picture",
       {"Enumerates the instances of every element class and of every association class the registration "
        "serves in the namespace, once each, and draws the machine from them: which slots and connectors stand "
        "on which chassis, which cards sit where, what ties to the computer system. An association draws an "
        "edge from its GroupComponent or Antecedent to its PartComponent or Dependent. Elements that no "
        "association ties to anything stand on their own, and elements served elsewhere (such as the computer "
        "system) appear where an association names them.",
        "The text format is a tree; an element reached a second time is named with \"(see above)\" instead of "
        "being drawn again. --format json gives the elements, the ties and what each class's provider answered; "
        "--format dot gives a Graphviz graph. Each class is one request whose memory is freed before the next, "
        "and only names and paths are kept, so large machines stay within a small memory."},
       {{"tvrpa inventory", "this machine"},
        {blade("tvrpa inventory"), "the example blade system"},
        {"tvrpa inventory --format dot | dot -Tsvg > machine.svg", "a drawing of this machine"}}},
      {Command::Classes,
       "the classes the registration serves",
       {"Lists every class of the provider registration with the provider that serves it, the kinds of provider "
        "(instance, association) and the namespaces. Element classes have an instance provider only; association "
        "classes have both."},
       {{"tvrpa classes", "the registered classes"}, {"tvrpa classes --format json", "the same, for a script"}}},
      {Command::Help,
       "this text, or the help of COMMAND",
       {"Describes the tool, or one command with its options and examples. 'tvrpa COMMAND --help' does the "
        "same."},
       {{"tvrpa help ai", "the help of ai"}}},
  };
  return help;
}

} // namespace

const std::string& toolSummary() {
  static const std::string summary = "ask the physical-asset providers about a machine";
  return summary;
}

const std::vector<std::string>& toolDescription() {
  static const std::vector<std::string> description = {
      "tvrpa asks the physical-asset providers about the hardware of a machine and prints their answer. It loads "
      "the provider library into an object manager built into the tool, the way a CIM server loads it, and sends "
      "it the CIM read operations: no CIM server is needed. The hardware is this machine's, or that of a "
      "hardware-tree file given with --tree.",
      "Each run sends its requests in one process; the memory of a request is freed when it ends, and answers "
      "are printed while the provider returns them."};
  return description;
}

const std::vector<HelpSection>& toolSections() {
  static const std::vector<HelpSection> sections = {
      {"Object paths",
       {"Object paths are written [namespace:]Class.Key=\"value\",Key2=\"value\". In a quoted value a double "
        "quote and a backslash are escaped with a backslash. Numbers stand bare, booleans as TRUE or FALSE. A "
        "reference-valued key, as in an association's path, is itself a path, written as a quoted value with its "
        "own quotes escaped. tvrpa prints paths in the same form, so every path it prints can be pasted back into "
        "gi, ai, ain, ri or rin. A path that cannot be read is a usage error naming the column where reading "
        "stopped."},
       {}},
      {"Output formats",
       {"text (the default) prints paths one per line and instances as their path followed by one line per "
        "property. mof prints instances as MOF instance declarations, each after a comment with its path; paths "
        "are printed as in text. json prints one object with the request, the items, the status, whether the "
        "provider completed its answer (done) and what each provider asked answered. inventory also takes dot."},
       {}},
      {"Exit status",
       {},
       {{"0", "the answer is OK"},
        {"1", "usage error: the command line, an object path, the registration or the hardware-tree file is "
              "wrong; the message says what was expected"},
        {"2", "a provider answered with an error (its CMPI status name and message are printed), or no provider "
              "serves the class or namespace; an answer merged from every association provider fails only when "
              "all of them failed, as an object manager merges it (--trace and --format json show each one)"},
        {"3", "an exception escaped a provider"}}},
      {"Environment",
       {"The agent libraries read their settings from the environment, else from /etc/opt/tvr/platform.conf "
        "(another file with TVR_CONFIG_FILE)."},
       {{"HX_HARDWARE_TREE", "a hardware-tree file to read instead of this machine (--tree wins)"},
        {"HX_FS_ROOT", "the root of the file system the live machine is read below"},
        {"KVLOG_LOG, KVLOG_LOG_LEVEL", "where the logger's log channel writes, and from which level"},
        {"KVLOG_TRACE, KVLOG_TRACE_LEVEL", "where the logger's trace channel writes, and from which level"}}},
      {"Files",
       {"An installed tvrpa reads the registration share/tvr-physical-asset/sfcb/tvrhx-physical-asset.reg and "
        "the schema share/tvr-physical-asset/TVRHX_PhysicalAsset.mof below its own prefix, and loads the provider "
        "libraries from /opt/tvr/platform/lib; one run from the build tree uses the source tree's files and the "
        "build's libraries. Where the companion providers' files (tvrhx-companion.reg, TVRHX_Companion.mof) lie "
        "beside them, they are read too, so that TVRHX_ComputerSystem and TVRHX_NetworkPort are served. The "
        "schema gives the key properties of each class, so that an instance a provider returns without keys in "
        "its path is shown with them."},
       {}},
  };
  return sections;
}

const std::vector<HelpExample>& toolExamples() {
  static const std::vector<HelpExample> examples = {
      {"tvrpa inventory", "this machine as one picture"},
      {"tvrpa ei TVRHX_Chassis", "this machine's chassis"},
      {blade("tvrpa ein TVRHX_Slot"), "the slots of the example blade system"},
      {blade(std::string("tvrpa ai ") + kChassisPath), "everything tied to its blade chassis"},
      {blade("tvrpa ei TVRHX_Chassis --trace"), "with the providers' trace and log lines on standard error"},
  };
  return examples;
}

const CommandHelp& commandHelp(Command command) {
  for (const CommandHelp& h : allHelp())
    if (h.command == command) return h;
  return allHelp().front();
}

} // namespace tvrpa
