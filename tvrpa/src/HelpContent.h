// The words of tvrpa's documentation, kept once: --help, the help of each
// command and the manual page are all rendered from this content.
#pragma once

#include "Commands.h"

#include <string>
#include <vector>

namespace tvrpa {

/// A term and what it means: an exit status, a setting, a file.
struct HelpItem {
  std::string term;
  std::string text;
};

struct HelpExample {
  std::string command;     ///< as typed at a shell prompt, without "$ "
  std::string explanation; ///< what it shows
};

/// A titled part of the tool's documentation. Paragraphs are plain prose;
/// items, when present, follow them as a list.
struct HelpSection {
  std::string title;
  std::vector<std::string> paragraphs;
  std::vector<HelpItem> items;
};

struct CommandHelp {
  Command command;
  std::string summary;                 ///< one line for command lists
  std::vector<std::string> paragraphs; ///< what it does, in full
  std::vector<HelpExample> examples;
};

/// One line: what the tool is.
const std::string& toolSummary();
/// The tool's description, before the command list.
const std::vector<std::string>& toolDescription();
/// The sections after the option list: object paths, formats, exit status,
/// settings, files.
const std::vector<HelpSection>& toolSections();
/// Examples of the tool as a whole.
const std::vector<HelpExample>& toolExamples();
/// The help of one command.
const CommandHelp& commandHelp(Command command);

} // namespace tvrpa
