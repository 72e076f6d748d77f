#include "HelpText.h"

#include "HelpContent.h"

#include <sstream>

namespace tvrpa {

namespace {

constexpr std::size_t kWidth = 79;
constexpr std::size_t kTermColumn = 26;

// Fills lines up to kWidth; every line starts with `indent` blanks. The first
// line may already hold `used` columns (a term in a two-column list).
std::string wrap(const std::string& text, std::size_t indent, std::size_t used = 0) {
  std::istringstream words(text);
  std::string out;
  std::string word;
  std::size_t column = used;
  bool lineEmpty = true;
  if (column < indent) {
    out.append(indent - column, ' ');
    column = indent;
  }
  while (words >> word) {
    if (!lineEmpty && column + 1 + word.size() > kWidth) {
      out += "\n" + std::string(indent, ' ');
      column = indent;
      lineEmpty = true;
    }
    if (!lineEmpty) {
      out += ' ';
      ++column;
    }
    out += word;
    column += word.size();
    lineEmpty = false;
  }
  return out + "\n";
}

// "  term      text that wraps under itself"
std::string listEntry(const std::string& term, const std::string& text) {
  std::string line = "  " + term;
  if (line.size() + 2 > kTermColumn) return line + "\n" + wrap(text, kTermColumn);
  return line + wrap(text, kTermColumn, line.size());
}

std::string optionTerm(const OptionDef& o) {
  return o.argument ? std::string(o.flag) + " " + o.argument : std::string(o.flag);
}

std::string commandTerm(const CommandDef& c) {
  return *c.arguments ? std::string(c.word) + " " + c.arguments : std::string(c.word);
}

std::string examples(const std::vector<HelpExample>& list) {
  std::string out = "Examples:\n";
  for (const HelpExample& e : list) out += "  " + e.command + "\n" + wrap(e.explanation, 6);
  return out;
}

} // namespace

std::string commandSynopsis(Command command) {
  const CommandDef& def = commandDef(command);
  std::string out = std::string("tvrpa ") + commandTerm(def);
  bool takesOptions = false;
  for (OptionId id : def.options) takesOptions = takesOptions || id != OptionId::Help;
  if (takesOptions) out += " [OPTIONS]";
  return out;
}

std::string toolHelpText() {
  std::string out = "Usage: tvrpa COMMAND [ARGUMENTS] [OPTIONS]\n\n";
  out += wrap("tvrpa: " + toolSummary() + ".", 0) + "\n";
  for (const std::string& p : toolDescription()) out += wrap(p, 0) + "\n";
  out += "Commands:\n";
  for (const CommandDef& c : allCommands()) {
    out += listEntry(commandTerm(c), commandHelp(c.command).summary);
  }
  out += "\nOptions:\n";
  for (const OptionDef& o : allOptions()) out += listEntry(optionTerm(o), o.summary);
  for (const HelpSection& s : toolSections()) {
    out += "\n" + s.title + ":\n";
    for (const std::string& p : s.paragraphs) out += wrap(p, 2);
    for (const HelpItem& item : s.items) out += listEntry(item.term, item.text);
  }
  out += "\n" + examples(toolExamples());
  out += "\nRun 'tvrpa COMMAND --help' for the options and examples of a command.\n";
  return out;
}

std::string commandHelpText(Command command) {
  const CommandDef& def = commandDef(command);
  const CommandHelp& help = commandHelp(command);
  std::string out = "Usage: " + commandSynopsis(command) + "\n\n";
  // The summary of a CIM operation starts with the operation's name already.
  const std::string lead = *def.cimName ? std::string() : std::string(def.word) + ": ";
  out += wrap(lead + help.summary + ".", 0) + "\n";
  for (const std::string& p : help.paragraphs) out += wrap(p, 0) + "\n";
  out += "Options:\n";
  for (OptionId id : def.options) {
    const OptionDef& o = optionDef(id);
    std::string text = o.summary;
    if (id == OptionId::Format) {
      text = "how to print the answer:";
      for (std::size_t i = 0; i < def.formats.size(); ++i)
        text += std::string(i ? ", " : " ") + formatName(def.formats[i]) + (i == 0 ? " (default)" : "");
    }
    out += listEntry(optionTerm(o), text);
  }
  out += "\n" + examples(help.examples);
  return out;
}

} // namespace tvrpa
