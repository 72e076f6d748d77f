//===- SystemName.cpp - Name of the managed computer system ---------------===//

#include "HX/SystemName.h"

#include "HX/HardwareSource.h"

#include <climits>
#include <cstring>

#include <netdb.h>
#include <sys/socket.h>
#include <unistd.h>

namespace HX {
namespace {

std::string plainHostName() {
  char name[HOST_NAME_MAX + 1] = {};
  if (::gethostname(name, sizeof name - 1) != 0 || name[0] == '\0')
    return "localhost";
  return name;
}

/// The canonical name the resolver gives for this host, or the plain host
/// name when it gives none.
std::string fullyQualifiedHostName() {
  const std::string host = plainHostName();
  addrinfo hints{};
  hints.ai_family = AF_UNSPEC;
  hints.ai_flags = AI_CANONNAME;
  addrinfo *found = nullptr;
  if (::getaddrinfo(host.c_str(), nullptr, &hints, &found) != 0 || !found)
    return host;
  std::string canonical =
      found->ai_canonname ? std::string(found->ai_canonname) : std::string();
  ::freeaddrinfo(found);
  return canonical.empty() ? host : canonical;
}

const std::string &thisHostName() {
  // Resolving may ask the network; once per process is enough.
  static const std::string Name = fullyQualifiedHostName();
  return Name;
}

} // namespace

std::string getSystemName() {
  try {
    if (std::optional<std::string> fromTree = hardwareTreeSystemName())
      return *fromTree;
    return thisHostName();
  } catch (...) {
    // Only allocation can fail here; a name is still better than a throw
    // across the provider's C interface.
    return "localhost";
  }
}

} // namespace HX
