// tvrpa: asks the physical-asset providers about a machine and prints the
// answer. See --help, or the manual page it is generated with.
#include "BuildPaths.h"
#include "CommandLine.h"
#include "ExitStatus.h"
#include "HelpText.h"
#include "ManPage.h"
#include "Run.h"
#include "Session.h"

#include <exception>
#include <iostream>

namespace {

using namespace tvrpa;

ExitStatus run(const CommandLine& cl) {
  if (cl.man) {
    std::cout << manPage(TVRPA_VERSION);
    return kExitOk;
  }
  if (cl.help) {
    std::cout << (cl.helpTopic ? commandHelpText(*cl.helpTopic) : toolHelpText());
    return kExitOk;
  }
  switch (cl.command) {
  case Command::Inventory: return runInventory(cl, std::cout, std::cerr);
  case Command::Classes: return runClasses(cl, std::cout);
  case Command::Help: return kExitOk;
  default: return runCimOperation(cl, std::cout, std::cerr);
  }
}

} // namespace

int main(int argc, char** argv) {
  const std::vector<std::string> args(argv + 1, argv + argc);
  std::string error;
  const auto commandLine = parseCommandLine(args, &error);
  if (!commandLine) {
    std::cerr << "tvrpa: " << error << "\n";
    return kExitUsage;
  }
  try {
    return run(*commandLine);
  } catch (const UsageError& e) {
    std::cerr << "tvrpa: " << e.message << "\n";
    return kExitUsage;
  } catch (const std::exception& e) {
    std::cerr << "tvrpa: " << e.what() << "\n";
    return kExitUsage;
  }
}
