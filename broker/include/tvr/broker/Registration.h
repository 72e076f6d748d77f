// The registration table: which provider serves which class.
//
// The table is read from a provider registration file in the format one
// widely deployed object manager stages its providers with, so the file the
// tests and the command-line tool use is the file customers install:
//
//   [TVRHX_Chassis]
//      provider: ChassisProvider
//      location: tvrkvphysicalassetprofileprovider
//      type: instance
//      namespace: root/cimv2
//
// `provider` is the part of the entry point before `_Create_...`,
// `location` the library name without "lib" and ".so", `type` the MI kinds
// ("instance", "association", ...) separated by blanks, `namespace` one or
// more namespaces separated by blanks. Lines starting with '#' are comments.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tvr::broker {

/// One class section of a registration file.
struct ClassRegistration {
  std::string className;
  std::string provider;
  std::string location;
  bool instance = false;
  bool association = false;
  bool method = false;
  bool indication = false;
  std::vector<std::string> namespaces;
  int line = 0; ///< where the section starts, for messages
};

/// All sections of a registration file, in file order.
class RegistrationTable {
public:
  /// Parses registration text. On error returns nullopt and sets `error` to
  /// "<origin>:<line>: <what is wrong>".
  static std::optional<RegistrationTable> parse(std::string_view text, std::string_view origin,
                                                std::string* error);
  /// Reads and parses a registration file.
  static std::optional<RegistrationTable> load(const std::string& path, std::string* error);

  const std::vector<ClassRegistration>& classes() const { return classes_; }
  /// The registration of a class (name compared without regard to case).
  const ClassRegistration* find(std::string_view className) const;
  /// Every registration that lists the association kind, in file order.
  std::vector<const ClassRegistration*> associationClasses() const;
  /// Adds or replaces (by class name) a registration.
  void add(ClassRegistration registration);

private:
  std::vector<ClassRegistration> classes_;
};

} // namespace tvr::broker
