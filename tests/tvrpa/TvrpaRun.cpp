#include "TvrpaRun.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <atomic>
#include <cstdio>
#include <fstream>
#include <sstream>

namespace tvr::test {

ProgramResult tvrpa(const std::vector<std::string>& args) { return runProgram(TVRPA_BINARY, args); }

std::string bladeTree() { return std::string(TVR_EXAMPLES_DIR) + "/blade-system.json"; }

TextFile::TextFile(const std::string& text, const std::string& suffix) {
  static std::atomic<int> counter{0};
  path_ = "/tmp/tvrpa-test-" + std::to_string(getpid()) + "-" + std::to_string(counter++) + suffix;
  std::ofstream out(path_, std::ios::binary | std::ios::trunc);
  out << text;
}

TextFile::~TextFile() { std::remove(path_.c_str()); }

std::vector<FixtureClass> fixtureMachine() {
  return {{"FIX_Rack", "FixRack", "instance"},
          {"FIX_Card", "FixCard", "instance"},
          {"FIX_Holds", "FixHolds", "instance association"},
          {"FIX_Plugs", "FixPlugs", "instance association"}};
}

namespace {

std::string registrationText(const std::vector<FixtureClass>& classes) {
  std::string text;
  for (const FixtureClass& c : classes)
    text += "[" + c.className + "]\n   provider: " + c.provider + "\n   location: tvrpafixture\n   type: " + c.type +
            "\n   namespace: root/cimv2\n";
  return text;
}

} // namespace

FixtureRegistration::FixtureRegistration(const std::vector<FixtureClass>& classes)
    : file_(registrationText(classes), ".reg") {}

std::vector<std::string> FixtureRegistration::args() const {
  return {"--registration", file_.path(), "--provider-library", TVRPA_FIXTURE_LIBRARY};
}

std::vector<std::string> FixtureRegistration::registrationArgs() const { return {"--registration", file_.path()}; }

std::vector<std::string> operator+(std::vector<std::string> a, const std::vector<std::string>& b) {
  a.insert(a.end(), b.begin(), b.end());
  return a;
}

std::vector<std::string> linesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream in(text);
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

nlohmann::json parseJson(const std::string& text) {
  try {
    return nlohmann::json::parse(text);
  } catch (const nlohmann::json::exception& e) {
    ADD_FAILURE() << "not JSON: " << e.what() << "\n" << text;
    return nlohmann::json();
  }
}

} // namespace tvr::test
