#include "tvr/broker/Registration.h"

#include <strings.h>

#include <fstream>
#include <sstream>

namespace tvr::broker {

namespace {

std::string_view trim(std::string_view s) {
  while (!s.empty() && (s.front() == ' ' || s.front() == '\t' || s.front() == '\r')) s.remove_prefix(1);
  while (!s.empty() && (s.back() == ' ' || s.back() == '\t' || s.back() == '\r')) s.remove_suffix(1);
  return s;
}

std::vector<std::string> words(std::string_view s) {
  std::vector<std::string> out;
  std::string current;
  for (char c : s) {
    if (c == ' ' || c == '\t') {
      if (!current.empty()) out.push_back(std::move(current));
      current.clear();
    } else {
      current += c;
    }
  }
  if (!current.empty()) out.push_back(std::move(current));
  return out;
}

bool sameName(std::string_view a, std::string_view b) {
  return a.size() == b.size() && strncasecmp(a.data(), b.data(), a.size()) == 0;
}

std::string fail(std::string_view origin, int line, const std::string& what) {
  return std::string(origin) + ":" + std::to_string(line) + ": " + what;
}

// Applies "type: instance association" to a registration; returns an error
// text for an unknown kind.
std::optional<std::string> applyKinds(ClassRegistration& reg, std::string_view value) {
  for (const std::string& kind : words(value)) {
    if (kind == "instance") reg.instance = true;
    else if (kind == "association") reg.association = true;
    else if (kind == "method") reg.method = true;
    else if (kind == "indication") reg.indication = true;
    else return "unknown provider type '" + kind + "'";
  }
  return std::nullopt;
}

std::optional<std::string> checkComplete(const ClassRegistration& reg) {
  if (reg.provider.empty()) return "section [" + reg.className + "] has no provider";
  if (reg.location.empty()) return "section [" + reg.className + "] has no location";
  if (!reg.instance && !reg.association && !reg.method && !reg.indication)
    return "section [" + reg.className + "] has no type";
  return std::nullopt;
}

} // namespace

std::optional<RegistrationTable> RegistrationTable::parse(std::string_view text,
                                                          std::string_view origin,
                                                          std::string* error) {
  RegistrationTable table;
  std::optional<ClassRegistration> current;
  int lineNo = 0;
  auto finish = [&]() -> bool {
    if (!current) return true;
    if (auto problem = checkComplete(*current)) {
      if (error) *error = fail(origin, current->line, *problem);
      return false;
    }
    if (current->namespaces.empty()) current->namespaces.push_back("root/cimv2");
    table.add(std::move(*current));
    current.reset();
    return true;
  };

  std::size_t pos = 0;
  while (pos <= text.size()) {
    std::size_t end = text.find('\n', pos);
    if (end == std::string_view::npos) end = text.size();
    std::string_view line = trim(text.substr(pos, end - pos));
    pos = end + 1;
    ++lineNo;
    if (line.empty() || line.front() == '#') continue;

    if (line.front() == '[') {
      if (line.back() != ']' || line.size() < 3) {
        if (error) *error = fail(origin, lineNo, "malformed section header");
        return std::nullopt;
      }
      if (!finish()) return std::nullopt;
      current = ClassRegistration{};
      current->className = std::string(trim(line.substr(1, line.size() - 2)));
      current->line = lineNo;
      continue;
    }

    const std::size_t colon = line.find(':');
    if (colon == std::string_view::npos) {
      if (error) *error = fail(origin, lineNo, "expected 'key: value'");
      return std::nullopt;
    }
    if (!current) {
      if (error) *error = fail(origin, lineNo, "entry outside of a [class] section");
      return std::nullopt;
    }
    const std::string_view key = trim(line.substr(0, colon));
    const std::string_view value = trim(line.substr(colon + 1));
    if (key == "provider") {
      current->provider = std::string(value);
    } else if (key == "location") {
      current->location = std::string(value);
    } else if (key == "type") {
      if (auto problem = applyKinds(*current, value)) {
        if (error) *error = fail(origin, lineNo, *problem);
        return std::nullopt;
      }
    } else if (key == "namespace") {
      for (std::string& ns : words(value)) current->namespaces.push_back(std::move(ns));
    } else if (key == "unload" || key == "group" || key == "user" || key == "parameters") {
      // Settings of the object manager's process model; nothing to do here.
    } else {
      if (error) *error = fail(origin, lineNo, "unknown key '" + std::string(key) + "'");
      return std::nullopt;
    }
  }
  if (!finish()) return std::nullopt;
  return table;
}

std::optional<RegistrationTable> RegistrationTable::load(const std::string& path,
                                                         std::string* error) {
  std::ifstream in(path);
  if (!in) {
    if (error) *error = path + ": cannot open registration file";
    return std::nullopt;
  }
  std::ostringstream text;
  text << in.rdbuf();
  return parse(text.str(), path, error);
}

const ClassRegistration* RegistrationTable::find(std::string_view className) const {
  for (const ClassRegistration& reg : classes_)
    if (sameName(reg.className, className)) return &reg;
  return nullptr;
}

std::vector<const ClassRegistration*> RegistrationTable::associationClasses() const {
  std::vector<const ClassRegistration*> out;
  for (const ClassRegistration& reg : classes_)
    if (reg.association) out.push_back(&reg);
  return out;
}

void RegistrationTable::add(ClassRegistration registration) {
  for (ClassRegistration& reg : classes_) {
    if (sameName(reg.className, registration.className)) {
      reg = std::move(registration);
      return;
    }
  }
  classes_.push_back(std::move(registration));
}

} // namespace tvr::broker
