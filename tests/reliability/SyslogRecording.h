// Records what the logger sends to syslog. The test executable defines
// openlog() and syslog() itself; the dynamic linker binds the logger
// library's calls to these definitions, so nothing reaches the system log.
#pragma once

#include <string>
#include <vector>

namespace tvr::reliability {

/// The texts of the syslog() calls since the process started, in order.
std::vector<std::string> syslogTexts();

} // namespace tvr::reliability
