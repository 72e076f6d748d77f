// Requests over every class the object manager serves, built from what the
// providers answer on the machine in use, so that long and concurrent runs
// send requests that reach every handler with real paths.
#pragma once

#include "tvr/broker/ObjectManager.h"

#include <string>
#include <vector>

namespace tvr::reliability {

/// One read request as a client sends it.
struct Request {
  broker::Operation operation = broker::Operation::EnumerateInstanceNames;
  /// The class path (enumerations) or the object path (all others).
  broker::ObjectPath target;
  /// Association class and texts for the association operations; the
  /// property list for every operation that takes one.
  broker::AssociationArgs args;

  /// "ai TVRHX_Chassis.Tag=... assocClass=... role=...", for failure messages.
  std::string label() const;
};

/// Sends \p request to \p om.
broker::Response send(broker::ObjectManager& om, const Request& request);

/// Requests over every class the registration of \p om serves:
///
/// - EnumerateInstanceNames and EnumerateInstances of each class, the latter
///   also with a property list;
/// - GetInstance of each instance, and of a path whose keys match nothing;
/// - Associators, AssociatorNames, References and ReferenceNames from each
///   instance through each association class, and through no association
///   class (which asks every association provider); Associators and
///   References also with result class and role texts.
///
/// The instances are those the providers enumerate on the machine in use.
std::vector<Request> requestsOverEveryClass(broker::ObjectManager& om);

} // namespace tvr::reliability
