#include "BrokerTestSupport.h"

#include <sstream>

namespace tvr::broker::test {

std::string testRegistrationFile() { return TVR_BROKER_TEST_REGISTRATION_FILE; }

std::string testProviderDirectory() { return TVR_BROKER_TEST_PROVIDER_DIR; }

ObjectManagerOptions testProviderOptions() {
  std::string error;
  std::optional<RegistrationTable> table = RegistrationTable::load(testRegistrationFile(), &error);
  if (!table) throw ObjectManagerError(error);
  ObjectManagerOptions options;
  options.registration = std::move(*table);
  options.providerDirectories = {testProviderDirectory()};
  return options;
}

ObjectPath classPath(const std::string& className, const std::string& nameSpace) {
  return ObjectPath(nameSpace, className);
}

ObjectPath keyedPath(const std::string& className, const std::vector<std::pair<std::string, std::string>>& keys,
                     const std::string& nameSpace) {
  ObjectPath path(nameSpace, className);
  for (const auto& [name, value] : keys) path.setKey(name, Value::chars(value));
  return path;
}

std::vector<std::string> dataTexts(const Response& response) {
  std::vector<std::string> out;
  for (const ResultItem& item : response.items)
    if (item.kind == ResultItem::Kind::Data && item.data.isText()) out.push_back(item.data.text);
  return out;
}

std::map<std::string, CMPIrc> probeStatuses(const Response& response) {
  std::map<std::string, CMPIrc> out;
  for (const std::string& text : dataTexts(response)) {
    const std::size_t space = text.rfind(' ');
    std::istringstream number(text.substr(space + 1));
    int rc = -1;
    if (space == std::string::npos || !(number >> rc)) {
      ADD_FAILURE() << "not a probe status: " << text;
      continue;
    }
    out[text.substr(0, space)] = static_cast<CMPIrc>(rc);
  }
  return out;
}

std::vector<ResultItem::Kind> kindsOf(const Response& response) {
  std::vector<ResultItem::Kind> out;
  for (const ResultItem& item : response.items) out.push_back(item.kind);
  return out;
}

} // namespace tvr::broker::test
