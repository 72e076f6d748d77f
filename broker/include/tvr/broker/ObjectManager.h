// The embedded object manager: loads CMPI provider libraries, routes the
// seven read operations to them through a registration table, serves their
// up-calls, and records everything they answer.
//
// It plays the part a CIM server plays for a provider, so that providers can
// be driven and observed without one: tests and the command-line tool talk
// to providers only through it, and it knows a provider only as a shared
// object reached through CMPI.
#pragma once

#include "tvr/broker/FaultInjector.h"
#include "tvr/broker/Registration.h"
#include "tvr/broker/Response.h"
#include "tvr/broker/Value.h"

#include <cmpift.h>

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace tvr::broker {

namespace detail {
class ObjectManagerCore;
}

/// A property list as CMPI passes it: nullopt is a null list (all
/// properties), a vector becomes a null-terminated array of its names.
using PropertyList = std::optional<std::vector<std::string>>;

/// The text arguments of the association operations, handed to the provider
/// unchanged: nullopt becomes a null pointer.
struct AssociationArgs {
  std::optional<std::string> assocClass;
  std::optional<std::string> resultClass;
  std::optional<std::string> role;
  std::optional<std::string> resultRole;
  PropertyList properties;
};

/// Sees each element of an answer as the provider returns it.
class ResultObserver {
public:
  virtual ~ResultObserver() = default;
  virtual void onItem(const ResultItem& item) = 0;
};

struct RequestOptions {
  /// Send the request to the provider registered for this class, whatever
  /// the request's own class or association class says.
  std::optional<std::string> routeTo;
  /// Association operations that name no association class go to every
  /// association provider. By default each gets the request unchanged (a null
  /// association class, as object managers pass it); with this set each gets
  /// its own association class instead.
  bool ownClassForEachProvider = false;
  /// Call the provider's entry point with a null broker before the request,
  /// and with the real broker again after it.
  bool nullBroker = false;
  /// Sees every element as it is returned.
  ResultObserver* observer = nullptr;
  /// Keep the elements in Response::items. Turn off to stream a large answer
  /// through `observer` in bounded memory.
  bool keepItems = true;
  /// Sees every broker trace call as the provider makes it.
  std::function<void(const TraceLine&)> traceObserver;
  /// Keep the broker trace calls in Response::traces. Turn off with large
  /// answers, whose providers trace per element.
  bool keepTraces = true;
};

struct ObjectManagerOptions {
  RegistrationTable registration;
  /// Searched in order for "lib<location>.so" of each registration.
  std::vector<std::string> providerDirectories;
  /// Explicit library files by location, used before the directories.
  std::map<std::string, std::string> libraryFiles;
  /// Key property names of classes, by class name. An instance of such a
  /// class whose path has no keys gets them from its properties, as an object
  /// manager that knows the class definition does.
  std::map<std::string, std::vector<std::string>> classKeys;
};

class ObjectManagerError : public std::runtime_error {
public:
  using std::runtime_error::runtime_error;
};

class ObjectManager {
public:
  explicit ObjectManager(ObjectManagerOptions options);
  ~ObjectManager();
  ObjectManager(const ObjectManager&) = delete;
  ObjectManager& operator=(const ObjectManager&) = delete;

  /// The seven read operations. `classPath` needs namespace and class only.
  /// A class with no registered provider answers CMPI_RC_ERR_INVALID_CLASS;
  /// a namespace the provider is not registered for, CMPI_RC_ERR_INVALID_NAMESPACE.
  /// Association requests that reach several providers merge their answers
  /// in registration order; the merged status is OK unless every provider failed.
  Response enumerateInstanceNames(const ObjectPath& classPath, const RequestOptions& options = {});
  Response enumerateInstances(const ObjectPath& classPath, const PropertyList& properties = std::nullopt,
                              const RequestOptions& options = {});
  Response getInstance(const ObjectPath& path, const PropertyList& properties = std::nullopt,
                       const RequestOptions& options = {});
  Response associators(const ObjectPath& source, const AssociationArgs& args,
                       const RequestOptions& options = {});
  Response associatorNames(const ObjectPath& source, const AssociationArgs& args,
                           const RequestOptions& options = {});
  Response references(const ObjectPath& source, const AssociationArgs& args,
                      const RequestOptions& options = {});
  Response referenceNames(const ObjectPath& source, const AssociationArgs& args,
                          const RequestOptions& options = {});

  /// Runs `body` as a request of its own, with the broker and a context of
  /// the namespace `nameSpace`: what the broker makes inside lives until
  /// `body` returns, and the broker trace calls made meanwhile are recorded
  /// in the returned Response. For tests that call provider functions
  /// directly.
  Response runAsRequest(const std::function<void(const CMPIBroker*, const CMPIContext*)>& body,
                        const std::string& nameSpace = "root/cimv2");
  /// As above, with a result object too: what `body` returns through it is
  /// recorded in the Response as a provider's answer would be.
  Response runAsRequest(const std::function<void(const CMPIBroker*, const CMPIContext*, const CMPIResult*)>& body,
                        const std::string& nameSpace = "root/cimv2");

  const RegistrationTable& registration() const;
  FaultInjector& faults();
  /// The broker handed to providers.
  const CMPIBroker* broker() const;

  /// The MI a provider's entry point returns, loading its library first.
  /// Null, with `error` set, when the library or the entry point is missing.
  CMPIInstanceMI* instanceMI(const std::string& provider, std::string* error = nullptr);
  CMPIAssociationMI* associationMI(const std::string& provider, std::string* error = nullptr);
  /// Looks up a symbol in the library a provider is registered with.
  void* providerSymbol(const std::string& provider, const std::string& symbol,
                       std::string* error = nullptr);
  /// Objects alive outside any request (made by providers between requests).
  std::size_t longLivedObjects() const;

private:
  Response run(Operation op, const ObjectPath& target, const AssociationArgs& args,
               const RequestOptions& options);
  std::unique_ptr<detail::ObjectManagerCore> core_;
};

} // namespace tvr::broker
