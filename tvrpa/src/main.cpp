// tvrpa: asks the physical-asset providers about a machine and prints the
// answer. See --help.
#include "CommandLine.h"
#include "Output.h"
#include "Session.h"

#include <iostream>

namespace {

enum ExitStatus { kOk = 0, kUsage = 1, kProviderError = 2, kProviderException = 3 };

int report(const tvr::broker::Response& response, tvrpa::Format format) {
  if (format == tvrpa::Format::Json) tvrpa::writeJson(std::cout, response);
  else tvrpa::writeText(std::cout, response);
  if (response.exception) {
    std::cerr << "tvrpa: an exception escaped the provider: " << response.exception->type;
    if (!response.exception->what.empty()) std::cerr << ": " << response.exception->what;
    std::cerr << "\n";
    return kProviderException;
  }
  if (response.rc != CMPI_RC_OK) {
    std::cerr << "tvrpa: " << tvr::broker::statusName(response.rc);
    if (response.message) std::cerr << ": " << *response.message;
    std::cerr << "\n";
    return kProviderError;
  }
  return kOk;
}

} // namespace

int main(int argc, char** argv) {
  const std::vector<std::string> args(argv + 1, argv + argc);
  std::string error;
  const auto commandLine = tvrpa::parseCommandLine(args, &error);
  if (!commandLine) {
    std::cerr << "tvrpa: " << error << "\n";
    return kUsage;
  }
  if (commandLine->help) {
    std::cout << tvrpa::usageText();
    return kOk;
  }
  try {
    tvrpa::Session session(*commandLine);
    return report(session.run(), commandLine->format);
  } catch (const tvrpa::UsageError& e) {
    std::cerr << "tvrpa: " << e.message << "\n";
    return kUsage;
  }
}
