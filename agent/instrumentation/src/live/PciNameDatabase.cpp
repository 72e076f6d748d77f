//===- PciNameDatabase.cpp - Vendor, device and class names of PCI ids ----===//

#include "live/PciNameDatabase.h"

extern "C" {
#include <pci/pci.h>
}

#include <csetjmp>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <sys/stat.h>

namespace HX {
namespace detail {
namespace live {
namespace {

/// Where libpci's error handler returns to. libpci's handler must not
/// return; it jumps back to the call that reached it. Only C frames of
/// libpci lie between, so no C++ object is skipped. Thread-local because
/// databases of different sources may be used on different threads.
thread_local std::jmp_buf *Escape = nullptr;
thread_local char EscapeMessage[256];

/// PCI_NONRET, not [[noreturn]]: libpci declares its handler with the GNU
/// attribute, which clang counts as part of the function's type.
PCI_NONRET void escapeFromLibpci(char *format, ...) {
  std::va_list arguments;
  va_start(arguments, format);
  std::vsnprintf(EscapeMessage, sizeof EscapeMessage, format, arguments);
  va_end(arguments);
  std::longjmp(*Escape, 1);
}

void ignoreLibpciMessage(char *, ...) {}

std::string withoutLineFeed(const char *text) {
  std::string message = text;
  while (!message.empty() && message.back() == '\n')
    message.pop_back();
  return message;
}

bool exists(const std::string &path) {
  struct stat status {};
  return ::stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

constexpr int LookupFlags = PCI_LOOKUP_NO_NUMBERS | PCI_LOOKUP_NO_HWDB;

} // namespace

PciNameDatabase::PciNameDatabase(std::vector<std::string> candidateFiles,
                                 ProblemLog &log)
    : CandidateFiles(std::move(candidateFiles)), Log(log) {}

PciNameDatabase::~PciNameDatabase() {
  if (Access)
    pci_cleanup(Access);
}

bool PciNameDatabase::ready() {
  if (Tried)
    return Access != nullptr;
  Tried = true;
  const std::string *file = nullptr;
  for (const std::string &candidate : CandidateFiles)
    if (exists(candidate)) {
      file = &candidate;
      break;
    }
  if (!file)
    return false;

  Access = pci_alloc();
  Access->error = escapeFromLibpci;
  Access->warning = ignoreLibpciMessage;
  Access->debug = ignoreLibpciMessage;
  Access->id_lookup_mode = 0;
  pci_set_name_list_path(Access, ::strdup(file->c_str()), 1);

  std::jmp_buf escape;
  Escape = &escape;
  bool loaded = false;
  if (setjmp(escape) == 0) {
    loaded = pci_load_name_list(Access) != 0;
    if (!loaded)
      Log.report(*file + ": cannot read the PCI ID database; PCI devices "
                         "are named by their numeric ids");
  } else {
    Log.report(*file + ": " + withoutLineFeed(EscapeMessage) +
               "; PCI devices are named by their numeric ids");
  }
  Escape = nullptr;
  if (!loaded) {
    pci_cleanup(Access);
    Access = nullptr;
  }
  return loaded;
}

std::optional<std::string> PciNameDatabase::lookUp(int what, unsigned first,
                                                   unsigned second) {
  std::lock_guard<std::mutex> guard(Lock);
  if (!ready())
    return std::nullopt;
  char buffer[256];
  const char *name = nullptr;
  std::jmp_buf escape;
  Escape = &escape;
  if (setjmp(escape) == 0) {
    name = pci_lookup_name(Access, buffer, sizeof buffer, what | LookupFlags,
                           first, second);
  } else {
    // Only running out of memory leads here after a successful load; the
    // name is then simply not known.
    name = nullptr;
  }
  Escape = nullptr;
  if (!name)
    return std::nullopt;
  return std::string(name);
}

std::optional<std::string> PciNameDatabase::vendorName(std::uint16_t vendor) {
  return lookUp(PCI_LOOKUP_VENDOR, vendor, 0);
}

std::optional<std::string> PciNameDatabase::deviceName(std::uint16_t vendor,
                                                       std::uint16_t device) {
  return lookUp(PCI_LOOKUP_DEVICE, vendor, device);
}

std::optional<std::string>
PciNameDatabase::subclassName(std::uint8_t baseClass, std::uint8_t subclass) {
  return lookUp(PCI_LOOKUP_CLASS, (unsigned{baseClass} << 8) | subclass, 0);
}

} // namespace live
} // namespace detail
} // namespace HX
