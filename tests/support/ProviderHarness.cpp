#include "ProviderHarness.h"

#include "tvr/broker/Mof.h"

#include <HX/HardwareSource.h>

#include <gtest/gtest.h>

#include <unistd.h>

#include <atomic>
#include <cctype>
#include <cstdio>
#include <fstream>
#include <stdexcept>

namespace tvr::test {

namespace {

std::string uniqueTempPath() {
  static std::atomic<int> counter{0};
  const char* dir = std::getenv("TMPDIR");
  return std::string(dir && *dir ? dir : "/tmp") + "/tvr-tree-" + std::to_string(getpid()) + "-" +
         std::to_string(counter++) + ".json";
}

void writeFile(const std::string& path, const std::string& text) {
  // Write beside and rename, so a reader never sees half a file.
  const std::string temporary = path + ".new";
  {
    std::ofstream out(temporary, std::ios::binary | std::ios::trunc);
    out << text;
    if (!out) throw std::runtime_error("cannot write " + temporary);
  }
  if (std::rename(temporary.c_str(), path.c_str()) != 0) throw std::runtime_error("cannot rename to " + path);
}

} // namespace

TreeFile::TreeFile(const std::string& json) : path_(uniqueTempPath()) { writeFile(path_, json); }

TreeFile::~TreeFile() { std::remove(path_.c_str()); }

void TreeFile::rewrite(const std::string& json) { writeFile(path_, json); }

LoggerCapture::LoggerCapture() {
  id_ = KVLog::addListener([this](const KVLog::Message& m) {
    LoggedLine line{m.channel, m.function ? m.function : "", m.file ? m.file : "", m.line, m.category, m.level,
                    m.text};
    std::lock_guard<std::mutex> lock(mutex_);
    lines_.push_back(std::move(line));
  });
}

LoggerCapture::~LoggerCapture() { KVLog::removeListener(id_); }

std::vector<LoggedLine> LoggerCapture::lines() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return lines_;
}

std::vector<std::string> LoggerCapture::texts(KVLog::Channel channel) const {
  std::vector<std::string> out;
  for (const LoggedLine& line : lines())
    if (line.channel == channel) out.push_back(line.text);
  return out;
}

void LoggerCapture::clear() {
  std::lock_guard<std::mutex> lock(mutex_);
  lines_.clear();
}

std::string registrationFile() { return TVR_TEST_REGISTRATION_FILE; }

std::string providerDirectory() { return TVR_TEST_PROVIDER_DIR; }

std::string schemaFile() { return TVR_TEST_SCHEMA_FILE; }

std::string companionRegistrationFile() { return TVR_TEST_COMPANION_REGISTRATION_FILE; }

std::string companionSchemaFile() { return TVR_TEST_COMPANION_SCHEMA_FILE; }

std::string companionProviderDirectory() { return TVR_TEST_COMPANION_DIR; }

namespace {

broker::RegistrationTable loadRegistration(const std::string& path) {
  std::string error;
  auto table = broker::RegistrationTable::load(path, &error);
  if (!table) throw std::runtime_error(error);
  return std::move(*table);
}

broker::MofSchema loadSchema(const std::string& path) {
  broker::MofError error;
  auto schema = broker::MofSchema::load(path, &error);
  if (!schema) throw std::runtime_error(error.str());
  return std::move(*schema);
}

broker::ClassRegistration standInRegistration(StandIn standIn) {
  broker::ClassRegistration reg;
  reg.className = standIn == StandIn::ComputerSystems ? "TVRHX_ComputerSystem" : "TVRHX_NetworkPort";
  reg.provider =
      standIn == StandIn::ComputerSystems ? "StandInComputerSystemProvider" : "StandInNetworkPortProvider";
  reg.location = "tvrcompanionstandins";
  reg.instance = true;
  reg.namespaces = {"root/cimv2"};
  return reg;
}

} // namespace

ProviderHarness::ProviderHarness() : ProviderHarness({}) {}

ProviderHarness::ProviderHarness(std::initializer_list<StandIn> standIns) {
  broker::RegistrationTable table = loadRegistration(registrationFile());
  const broker::RegistrationTable companion = loadRegistration(companionRegistrationFile());
  for (const broker::ClassRegistration& reg : companion.classes()) table.add(reg);
  for (StandIn standIn : standIns) table.add(standInRegistration(standIn));
  broker::MofSchema schema = loadSchema(schemaFile());
  schema.merge(loadSchema(companionSchemaFile()));
  broker::ObjectManagerOptions options;
  options.registration = std::move(table);
  options.classKeys = broker::classKeysOf(schema);
  options.providerDirectories = {providerDirectory(), companionProviderDirectory(), TVR_TEST_STAND_IN_DIR};
  om_ = std::make_unique<broker::ObjectManager>(std::move(options));
}

ProviderHarness::~ProviderHarness() {
  om_.reset();
  HX::useLiveMachine();
}

void ProviderHarness::useTree(const std::string& json) {
  tree_ = std::make_unique<TreeFile>(json);
  HX::useHardwareTree(tree_->path());
}

void ProviderHarness::useTreeFile(const std::string& path) { HX::useHardwareTree(path); }

Response ProviderHarness::enumerateInstanceNames(const std::string& className,
                                                 const broker::RequestOptions& options) {
  return om_->enumerateInstanceNames(classPath(className), options);
}

Response ProviderHarness::enumerateInstances(const std::string& className,
                                             const broker::PropertyList& properties,
                                             const broker::RequestOptions& options) {
  return om_->enumerateInstances(classPath(className), properties, options);
}

Response ProviderHarness::getInstance(const ObjectPath& path, const broker::PropertyList& properties,
                                      const broker::RequestOptions& options) {
  return om_->getInstance(path, properties, options);
}

ObjectPath classPath(const std::string& className, const std::string& nameSpace) {
  return ObjectPath(nameSpace, className);
}

ObjectPath pathWithKeys(const std::string& className, const std::vector<std::pair<std::string, std::string>>& keys,
                        const std::string& nameSpace) {
  ObjectPath path(nameSpace, className);
  for (const auto& [name, value] : keys) path.keys.push_back(broker::Binding{name, Value::chars(value)});
  return path;
}

std::vector<std::string> propertyNames(const Instance& instance) {
  std::vector<std::string> names;
  for (const broker::Binding& b : instance.properties) names.push_back(b.name);
  return names;
}

const Value& property(const Instance& instance, const std::string& name) {
  static const Value missing;
  const Value* value = instance.property(name);
  EXPECT_NE(value, nullptr) << "no property " << name;
  return value ? *value : missing;
}

std::vector<std::string> traceTexts(const Response& response) {
  std::vector<std::string> out;
  for (const broker::TraceLine& t : response.traces) out.push_back(t.text.value_or("(null)"));
  return out;
}

std::string maskedLine(const std::string& text) {
  std::string out;
  for (std::size_t i = 0; i < text.size();) {
    if (text.compare(i, 2, "0x") == 0) {
      out += "0x?";
      for (i += 2; i < text.size() && std::isxdigit(static_cast<unsigned char>(text[i])); ++i) {
      }
    } else if (text.compare(i, 7, "[Line: ") == 0) {
      out += "[Line: N";
      for (i += 7; i < text.size() && std::isdigit(static_cast<unsigned char>(text[i])); ++i) {
      }
    } else {
      out += text[i++];
    }
  }
  return out;
}

} // namespace tvr::test
