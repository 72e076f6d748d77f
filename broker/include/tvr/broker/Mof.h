// A reader of CIM schema files (MOF): class declarations with their
// qualifiers and properties, instance declarations, pragmas and qualifier
// type declarations.
//
// The embedded object manager learns the key properties of the classes it
// serves from the same MOF files that are installed into real object
// managers, so an instance whose path carries no keys reports the keys an
// object manager that knows the class would give it. The reader also checks
// MOF files in the test suite.
#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tvr::broker {

/// A qualifier as written: `Key`, `Description("text")`, `ValueMap {"1", "2"}`.
struct MofQualifier {
  std::string name;
  std::vector<std::string> values; ///< literal texts of the value(s); empty for a flag
};

struct MofProperty {
  std::string name;
  std::string type;      ///< data type as written, e.g. "string", "uint16"; "ref" for references
  std::string refClass;  ///< the referenced class of a reference
  bool array = false;
  std::vector<MofQualifier> qualifiers;
  int line = 0;

  bool hasQualifier(std::string_view name) const;
  bool isKey() const { return hasQualifier("Key"); }
};

struct MofMethod {
  std::string name;
  std::string returnType;
  int line = 0;
};

struct MofClass {
  std::string name;
  std::string superclass; ///< empty for a root class
  std::vector<MofQualifier> qualifiers;
  std::vector<MofProperty> properties;
  std::vector<MofMethod> methods;
  std::string file;
  int line = 0;

  bool hasQualifier(std::string_view name) const;
  bool isAssociation() const { return hasQualifier("Association"); }
  const MofProperty* property(std::string_view name) const;
};

/// `instance of Class { Property = value; ... };`
struct MofInstance {
  std::string className;
  std::vector<std::pair<std::string, std::string>> values; ///< property name and the value's text
  std::string file;
  int line = 0;
};

struct MofError {
  std::string file;
  int line = 0;
  std::string message;
  std::string str() const; ///< "file:line: message"
};

/// The declarations of one or more MOF files.
class MofSchema {
public:
  /// Reads MOF text. `#pragma include("x.mof")` is followed relative to
  /// `includeDirectory` when one is given, and ignored otherwise. Names of
  /// classes and properties are compared without regard to case.
  static std::optional<MofSchema> parse(std::string_view text, const std::string& origin, MofError* error,
                                        const std::string& includeDirectory = "");
  /// Reads a MOF file, following its includes relative to its directory.
  static std::optional<MofSchema> load(const std::string& path, MofError* error);

  const std::vector<MofClass>& classes() const { return classes_; }
  const std::vector<MofInstance>& instances() const { return instances_; }
  const MofClass* find(std::string_view className) const;
  /// Adds the declarations of another schema (a class declared again replaces the earlier one).
  void merge(const MofSchema& other);

  /// The key properties of a class in declaration order: its own properties
  /// with the Key qualifier, after those of its superclasses within this
  /// schema that it does not declare again.
  std::vector<std::string> keysOf(std::string_view className) const;
  /// The property of a class or of the nearest superclass within this schema that declares it.
  const MofProperty* findProperty(std::string_view className, std::string_view property) const;
  /// The chain of superclass names from the class up, within this schema.
  std::vector<std::string> ancestry(std::string_view className) const;

private:
  std::vector<MofClass> classes_;
  std::vector<MofInstance> instances_;
  friend class MofParser;
};

/// The keys of every class of a schema, for ObjectManagerOptions::classKeys.
std::map<std::string, std::vector<std::string>> classKeysOf(const MofSchema& schema);

} // namespace tvr::broker
