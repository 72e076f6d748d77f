#include "DynamicSection.h"

#include "RunCommand.h"

#include <sstream>
#include <stdexcept>

namespace tvr::test {

DynamicSection readDynamicSection(const std::string& path) {
  const CommandResult r = runCommand({"readelf", "-d", "-W", path});
  if (r.exitStatus != 0) throw std::runtime_error("readelf -d " + path + ": " + r.err);
  // e.g. " 0x000000000000000e (SONAME)   Library soname: [libx.so.1]"
  DynamicSection section;
  std::istringstream lines(r.out);
  std::string line;
  while (std::getline(lines, line)) {
    const std::size_t open = line.find('(');
    const std::size_t close = line.find(')', open);
    const std::size_t valueOpen = line.find('[', close);
    const std::size_t valueClose = line.rfind(']');
    if (open == std::string::npos || close == std::string::npos || valueOpen == std::string::npos ||
        valueClose == std::string::npos || valueClose < valueOpen)
      continue;
    const std::string tag = line.substr(open + 1, close - open - 1);
    const std::string value = line.substr(valueOpen + 1, valueClose - valueOpen - 1);
    if (tag == "NEEDED") section.needed.push_back(value);
    if (tag == "SONAME") section.soname = value;
    if (tag == "RUNPATH") section.runpath = value;
    if (tag == "RPATH") section.rpath = value;
  }
  return section;
}

} // namespace tvr::test
