// Helper executable for the logger tests: runs the commands given as
// arguments in a process of its own, so that each test controls the
// environment and configuration file the logger reads at load.
//
//   settings                      prints "log=<destination> <level>" and
//                                 "trace=<destination> <level>"
//   log LEVEL CATEGORY TEXT       KVLogger::logLevelMessage
//   trace LEVEL CATEGORY TEXT     KVLogger::traceLevelMessage
//   clearenv                      empties the environment

#include "KVLog/KVLogConfig.h"
#include "KVLog/KVLogger.h"

#include <cstdlib>
#include <iostream>

namespace {

std::string describe(const KVLog::SinkSettings& settings) {
  using Destination = KVLog::SinkSettings::Destination;
  switch (settings.destination) {
  case Destination::Off:
    return "off " + std::to_string(settings.minimumLevel);
  case Destination::Syslog:
    return "syslog " + std::to_string(settings.minimumLevel);
  case Destination::Stderr:
    return "stderr " + std::to_string(settings.minimumLevel);
  case Destination::File:
    return settings.path + " " + std::to_string(settings.minimumLevel);
  }
  return "?";
}

} // namespace

int main(int argc, char** argv) {
  for (int i = 1; i < argc; ++i) {
    const std::string command = argv[i];
    if (command == "settings") {
      std::cout << "log=" << describe(KVLog::sinkSettings(KVLog::Channel::Log)) << '\n'
                << "trace=" << describe(KVLog::sinkSettings(KVLog::Channel::Trace)) << '\n';
    } else if ((command == "log" || command == "trace") && i + 3 < argc) {
      const int level = std::atoi(argv[i + 1]);
      const std::string category = argv[i + 2];
      const std::string text = argv[i + 3];
      i += 3;
      if (command == "log")
        KVLog::KVLogger::logLevelMessage("main", __FILE__, __LINE__, category, level, nullptr, 0,
                                         0, text);
      else
        KVLog::KVLogger::traceLevelMessage("main", __FILE__, __LINE__, category, level, nullptr,
                                           0, 0, text);
    } else if (command == "clearenv") {
      ::clearenv();
    } else {
      std::cerr << "kvlog_probe: bad command " << command << '\n';
      return 2;
    }
  }
  return 0;
}
