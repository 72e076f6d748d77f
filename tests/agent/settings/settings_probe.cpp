// Helper executable for the settings tests: runs the commands given as
// arguments against tvr::settings in a process of its own, so that each test
// controls the environment and configuration file seen at load.
//
//   get KEY            prints "KEY=<value>" or "KEY unset"
//   path               prints "path=<configFilePath()>"
//   setenv KEY VALUE   changes the environment
//   clearenv           empties the environment
//   truncate FILE      empties FILE

#include "TVR/Settings.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iostream>
#include <unistd.h>

int main(int argc, char** argv) {
  for (int i = 1; i < argc; ++i) {
    const std::string command = argv[i];
    const auto needs = [&](int count) {
      if (i + count >= argc) {
        std::cerr << "settings_probe: " << command << " needs " << count << " argument(s)\n";
        std::exit(2);
      }
    };
    if (command == "get") {
      needs(1);
      const std::string key = argv[++i];
      if (const auto value = tvr::settings::lookup(key))
        std::cout << key << '=' << *value << '\n';
      else
        std::cout << key << " unset\n";
    } else if (command == "path") {
      std::cout << "path=" << tvr::settings::configFilePath() << '\n';
    } else if (command == "setenv") {
      needs(2);
      ::setenv(argv[i + 1], argv[i + 2], 1);
      i += 2;
    } else if (command == "clearenv") {
      ::clearenv();
    } else if (command == "truncate") {
      needs(1);
      if (::truncate(argv[++i], 0) != 0) {
        std::perror("settings_probe: truncate");
        return 2;
      }
    } else {
      std::cerr << "settings_probe: unknown command " << command << '\n';
      return 2;
    }
  }
  return 0;
}
