// What the tvrpa tests share: running the built binary, the example tree,
// small files written for one test, and the fixture provider library with
// a registration of its classes.
#pragma once

#include "RunProgram.h"

#include <nlohmann/json.hpp>

#include <string>
#include <vector>

namespace tvr::test {

/// Runs the built tvrpa with `args`.
ProgramResult tvrpa(const std::vector<std::string>& args);

/// The example blade system shipped in examples/.
std::string bladeTree();

/// A file written for one test and removed after it.
class TextFile {
public:
  TextFile(const std::string& text, const std::string& suffix);
  ~TextFile();
  TextFile(const TextFile&) = delete;
  TextFile& operator=(const TextFile&) = delete;
  const std::string& path() const { return path_; }

private:
  std::string path_;
};

/// One class section of a registration file for the fixture library.
struct FixtureClass {
  std::string className;
  std::string provider;
  std::string type; ///< e.g. "instance" or "instance association"
};

/// The fixture machine: FIX_Rack and FIX_Card, with FIX_Holds and
/// FIX_Plugs between them (see fixture/FixtureProvider.cpp).
std::vector<FixtureClass> fixtureMachine();

/// A registration of `classes` served by the fixture library, and the
/// arguments that make tvrpa use it.
class FixtureRegistration {
public:
  explicit FixtureRegistration(const std::vector<FixtureClass>& classes);
  /// "--registration FILE --provider-library LIB".
  std::vector<std::string> args() const;
  /// "--registration FILE" alone, for commands that load no provider.
  std::vector<std::string> registrationArgs() const;

private:
  TextFile file_;
};

/// `a` followed by `b`.
std::vector<std::string> operator+(std::vector<std::string> a, const std::vector<std::string>& b);

/// The lines of a text, without their line ends.
std::vector<std::string> linesOf(const std::string& text);

/// Parses tvrpa's JSON output; fails the test on a parse error.
nlohmann::json parseJson(const std::string& text);

} // namespace tvr::test
