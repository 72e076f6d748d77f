// What the provider tests stand on: the embedded object manager loaded with
// the project's registration and provider library, hardware-tree fixtures
// written for one test, and a recording of every logger call.
#pragma once

#include "tvr/broker/ObjectManager.h"

#include <KVLog/KVLogConfig.h>

#include <initializer_list>
#include <memory>
#include <mutex>
#include <string>
#include <vector>

namespace tvr::test {

using broker::Instance;
using broker::ObjectPath;
using broker::Response;
using broker::Value;

/// A hardware-tree file written for one test and removed after it.
class TreeFile {
public:
  explicit TreeFile(const std::string& json);
  ~TreeFile();
  TreeFile(const TreeFile&) = delete;
  TreeFile& operator=(const TreeFile&) = delete;
  const std::string& path() const { return path_; }
  /// Replaces the file's content (same path).
  void rewrite(const std::string& json);

private:
  std::string path_;
};

/// One call of the logger, as the provider made it.
struct LoggedLine {
  KVLog::Channel channel;
  std::string function;
  std::string file;
  int line;
  std::string category;
  int level;
  std::string text;
};

/// Records every logger call made while it lives, on any thread.
class LoggerCapture {
public:
  LoggerCapture();
  ~LoggerCapture();
  LoggerCapture(const LoggerCapture&) = delete;
  LoggerCapture& operator=(const LoggerCapture&) = delete;
  std::vector<LoggedLine> lines() const;
  /// The texts of the lines of one channel, in order.
  std::vector<std::string> texts(KVLog::Channel channel) const;
  void clear();

private:
  mutable std::mutex mutex_;
  std::vector<LoggedLine> lines_;
  int id_;
};

/// The project's registration file, schema and the build's provider library.
std::string registrationFile();
std::string schemaFile();
std::string providerDirectory();
/// The same for the companion providers (TVRHX_ComputerSystem,
/// TVRHX_NetworkPort), which the object manager loads beside them.
std::string companionRegistrationFile();
std::string companionSchemaFile();
std::string companionProviderDirectory();

/// A test provider that takes the place of a companion provider, for
/// fixtures that need computer systems or ports the companion would not
/// give. Both read their instances from the hardware tree.
enum class StandIn {
  /// TVRHX_ComputerSystem: one system for each named SystemNode, with the
  /// node's name as its Name.
  ComputerSystems,
  /// TVRHX_NetworkPort: one port for each named NetworkPortNode, with the
  /// node's name as its DeviceID.
  NetworkPorts,
};

/// An object manager over the real provider library, reading the hardware
/// from tree files the test gives it.
class ProviderHarness {
public:
  ProviderHarness();
  /// With the given companion providers replaced by their stand-ins.
  explicit ProviderHarness(std::initializer_list<StandIn> standIns);
  ~ProviderHarness();

  /// Makes the providers read this tree (written to a file for the test).
  void useTree(const std::string& json);
  /// Makes the providers read an existing tree file.
  void useTreeFile(const std::string& path);

  broker::ObjectManager& om() { return *om_; }

  Response enumerateInstanceNames(const std::string& className, const broker::RequestOptions& options = {});
  Response enumerateInstances(const std::string& className, const broker::PropertyList& properties = std::nullopt,
                              const broker::RequestOptions& options = {});
  Response getInstance(const ObjectPath& path, const broker::PropertyList& properties = std::nullopt,
                       const broker::RequestOptions& options = {});

private:
  std::unique_ptr<broker::ObjectManager> om_;
  std::unique_ptr<TreeFile> tree_;
};

/// A path of `className` in root/cimv2 without keys.
ObjectPath classPath(const std::string& className, const std::string& nameSpace = "root/cimv2");
/// A path with string keys, given as name/value pairs in order.
ObjectPath pathWithKeys(const std::string& className,
                        const std::vector<std::pair<std::string, std::string>>& keys,
                        const std::string& nameSpace = "root/cimv2");

/// The names of an instance's properties, in order.
std::vector<std::string> propertyNames(const Instance& instance);
/// A property's value; fails the test (and returns a null value) when absent.
const Value& property(const Instance& instance, const std::string& name);
/// The texts of a response's broker trace lines, in order.
std::vector<std::string> traceTexts(const Response& response);

/// A logger line with its addresses written "0x?" and its line numbers
/// "[Line: N", so that the rest of it can be compared exactly.
std::string maskedLine(const std::string& text);

} // namespace tvr::test
