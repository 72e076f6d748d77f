// Requests made up from fuzz input, as a careless or hostile client might
// send them through an object manager: any of the seven read operations on
// any class, object paths whose keys are right, missing, extra, of the wrong
// type, empty or very long, association class and role texts that are null,
// empty, 10 KB long or plain wrong, odd property lists, and now and then a
// broker that fails a few of its services.
#pragma once

#include "tvr/broker/ObjectManager.h"

#include <fuzzer/FuzzedDataProvider.h>

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace tvr::fuzz {

/// Broker services that fail during one request: a bounded number, so that
/// the providers' retries of a failed service end.
struct BrokerFaults {
  broker::Fault fault = broker::Fault::NewObjectPath;
  std::uint32_t count = 1;
  broker::FailureShape shape = broker::FailureShape::Null;
  std::uint32_t skip = 0;
};

struct FuzzedRequest {
  broker::Operation operation = broker::Operation::EnumerateInstanceNames;
  broker::ObjectPath target;
  broker::AssociationArgs args;
  /// Routing as an object manager may choose it (to the provider of another
  /// class, to each association provider with its own class).
  std::optional<std::string> routeTo;
  bool ownClassForEachProvider = false;
  std::optional<BrokerFaults> faults;
};

/// What requests are made of.
struct RequestMaterial {
  /// The classes the object manager serves.
  std::vector<std::string> classes;
  /// Their key properties.
  std::map<std::string, std::vector<std::string>> classKeys;
  /// Texts of the machine in use (node names and paths).
  std::vector<std::string> texts;
  /// Paths the providers answered with so far.
  std::vector<broker::ObjectPath> paths;
};

FuzzedRequest fuzzedRequest(FuzzedDataProvider& input, const RequestMaterial& material);

/// Sends \p request to \p om with its routing and broker faults; the faults
/// are gone when it returns.
broker::Response send(broker::ObjectManager& om, const FuzzedRequest& request);

} // namespace tvr::fuzz
