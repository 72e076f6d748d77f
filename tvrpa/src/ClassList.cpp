#include "ClassList.h"

#include "JsonModel.h"

#include <algorithm>

namespace tvrpa {

namespace {

using tvr::broker::ClassRegistration;

std::vector<std::string> kinds(const ClassRegistration& reg) {
  std::vector<std::string> out;
  if (reg.instance) out.push_back("instance");
  if (reg.association) out.push_back("association");
  if (reg.method) out.push_back("method");
  if (reg.indication) out.push_back("indication");
  return out;
}

std::string joined(const std::vector<std::string>& words) {
  std::string out;
  for (const std::string& w : words) out += (out.empty() ? "" : " ") + w;
  return out;
}

} // namespace

void writeClassesText(std::ostream& out, const tvr::broker::RegistrationTable& registration) {
  std::vector<std::vector<std::string>> rows = {{"CLASS", "PROVIDER", "KIND", "NAMESPACES"}};
  for (const ClassRegistration& reg : registration.classes())
    rows.push_back({reg.className, reg.provider, joined(kinds(reg)), joined(reg.namespaces)});
  std::vector<std::size_t> width(4, 0);
  for (const auto& row : rows)
    for (std::size_t i = 0; i < row.size(); ++i) width[i] = std::max(width[i], row[i].size());
  for (const auto& row : rows) {
    std::string line;
    for (std::size_t i = 0; i < row.size(); ++i)
      line += row[i] + (i + 1 < row.size() ? std::string(width[i] - row[i].size() + 2, ' ') : "");
    out << line << "\n";
  }
}

void writeClassesJson(std::ostream& out, const tvr::broker::RegistrationTable& registration) {
  Json classes = Json::array();
  for (const ClassRegistration& reg : registration.classes())
    classes.push_back(Json{{"className", reg.className},
                           {"provider", reg.provider},
                           {"location", reg.location},
                           {"kinds", kinds(reg)},
                           {"namespaces", reg.namespaces}});
  out << dumped(classes) << "\n";
}

} // namespace tvrpa
