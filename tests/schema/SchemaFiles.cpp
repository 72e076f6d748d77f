#include "SchemaFiles.h"

#include <sys/stat.h>

#include <algorithm>
#include <cctype>
#include <fstream>
#include <memory>
#include <sstream>
#include <stdexcept>

namespace tvr::test {

namespace {

bool fileExists(const std::string& path) {
  struct stat st {};
  return stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode);
}

broker::MofSchema loadOrThrow(const std::string& path) {
  broker::MofError error;
  auto schema = broker::MofSchema::load(path, &error);
  if (!schema) throw std::runtime_error(error.str());
  return std::move(*schema);
}

const std::string kDmtfTop = std::string(TVR_DMTF_SCHEMA_DIR) + "/cim_schema_2.41.0.mof";
const std::string kCompanionFile = std::string(TVR_SCHEMA_DIR) + "/TVRHX_Companion.mof";

} // namespace

std::string lowerCase(std::string name) {
  std::transform(name.begin(), name.end(), name.begin(),
                 [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
  return name;
}

std::string projectSchemaFile() { return std::string(TVR_SCHEMA_DIR) + "/TVRHX_PhysicalAsset.mof"; }

const broker::MofSchema& projectSchema() {
  static const broker::MofSchema schema = loadOrThrow(projectSchemaFile());
  return schema;
}

const broker::MofSchema* companionSchema() {
  static const std::unique_ptr<broker::MofSchema> schema =
      std::make_unique<broker::MofSchema>(loadOrThrow(kCompanionFile));
  return schema.get();
}

const broker::MofSchema* dmtfSchema() {
  static const std::unique_ptr<broker::MofSchema> schema =
      fileExists(kDmtfTop) ? std::make_unique<broker::MofSchema>(loadOrThrow(kDmtfTop)) : nullptr;
  return schema.get();
}

const broker::MofSchema* combinedSchema() {
  static const std::unique_ptr<broker::MofSchema> schema = [] {
    if (!dmtfSchema()) return std::unique_ptr<broker::MofSchema>();
    auto combined = std::make_unique<broker::MofSchema>(*dmtfSchema());
    if (companionSchema()) combined->merge(*companionSchema());
    combined->merge(projectSchema());
    return combined;
  }();
  return schema.get();
}

const std::set<std::string>& dmtfQualifierNames() {
  static const std::set<std::string> names = [] {
    std::set<std::string> out;
    // Each declaration starts a line: "Qualifier Name : type ...".
    std::ifstream in(std::string(TVR_DMTF_SCHEMA_DIR) + "/qualifiers.mof");
    std::string line;
    while (std::getline(in, line)) {
      std::istringstream words(line);
      std::string keyword;
      std::string name;
      if (!(words >> keyword >> name) || lowerCase(keyword) != "qualifier") continue;
      out.insert(lowerCase(name.substr(0, name.find(':'))));
    }
    return out;
  }();
  return names;
}

} // namespace tvr::test
