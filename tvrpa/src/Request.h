// One CIM operation as tvrpa sends it: what the command line asked for,
// turned into the object manager's terms, and how it is routed.
#pragma once

#include "CommandLine.h"

#include "tvr/broker/ObjectManager.h"

#include <string>

namespace tvrpa {

struct Request {
  tvr::broker::Operation operation = tvr::broker::Operation::EnumerateInstances;
  /// The class (enumerations) or object path (all others) the request names.
  tvr::broker::ObjectPath target;
  /// Association class, result class, roles and property list, as the
  /// provider gets them (a null pointer where absent).
  tvr::broker::AssociationArgs args;
  /// An association request that names no association class goes to every
  /// association provider, each with its own class.
  bool everyAssociationProvider = false;
};

/// The request a CIM operation command sends.
Request requestFor(const CommandLine& commandLine);

/// Why a request is answered without asking any provider, or empty when it
/// goes out: an association request in a namespace the registration serves
/// but where no association provider is registered has nobody to ask, and
/// its answer is empty, as an object manager's is.
std::string whyNobodyIsAsked(const Request& request, const tvr::broker::RegistrationTable& registration);

/// Sends the request. `options` is completed with the routing the request
/// needs; its observer sees the answer as it comes.
tvr::broker::Response send(tvr::broker::ObjectManager& om, const Request& request, tvr::broker::RequestOptions options);

/// One line for --trace: the operation, the target and every argument,
/// "NULL" for those the provider gets as a null pointer.
std::string describe(const Request& request);

} // namespace tvrpa
