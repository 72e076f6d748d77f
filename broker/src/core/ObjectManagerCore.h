// The engine behind ObjectManager: the broker providers are given, the
// loaded provider libraries, routing and provider calls.
#pragma once

#include "cmpi/Arena.h"
#include "core/ProviderLibraries.h"
#include "core/ResultSink.h"
#include "tvr/broker/ObjectManager.h"

#include <cmpift.h>

#include <atomic>

namespace tvr::broker::detail {

/// One provider a request goes to, with the arguments it gets.
struct Route {
  const ClassRegistration* registration = nullptr;
  AssociationArgs args;
};

/// How a provider call ended.
struct CallOutcome {
  CMPIrc rc = CMPI_RC_OK;
  std::optional<std::string> message;
  std::optional<EscapedException> exception;
};

class ObjectManagerCore {
public:
  explicit ObjectManagerCore(ObjectManagerOptions options);
  ~ObjectManagerCore();

  const CMPIBroker* broker() const { return &broker_; }
  FaultInjector& faults() { return faults_; }
  Arena& longLivedArena() { return longLived_; }
  const RegistrationTable& registration() const { return options_.registration; }
  ProviderLibraries& libraries() { return libraries_; }

  /// The path an instance reports: its own, with keys taken from its
  /// properties when the path has none and the class's keys are known.
  ObjectPath pathOfInstance(const Instance& instance) const;

  /// The providers a request goes to. Sets `error` and returns nothing when
  /// the request cannot be routed.
  std::vector<Route> route(Operation op, const ObjectPath& target, const AssociationArgs& args,
                           const RequestOptions& options, CallOutcome* error) const;

  /// Calls one provider on the current thread, inside the current request
  /// frame. Exceptions that leave the handler are caught and reported.
  CallOutcome call(const Route& route, Operation op, const ObjectPath& target, ResultSink& sink,
                   bool nullBroker);

  /// Serves a provider's up-call (bft) through the same routing.
  CMPIEnumeration* upCall(Operation op, const CMPIObjectPath* target, const AssociationArgs& args,
                          CMPIStatus* rc);

  /// A context for a request on `target`'s namespace, in the current arena.
  CMPIContext* newRequestContext(const ObjectPath& target);
  /// The context entry points get when an MI is made outside a request.
  const CMPIContext* creationContext() const { return creationContext_; }

private:

  ObjectManagerOptions options_;
  FaultInjector faults_;
  Arena longLived_;
  ProviderLibraries libraries_;
  CMPIBroker broker_;
  std::unique_ptr<ArenaObject> creationContextObject_;
  CMPIContext* creationContext_ = nullptr;
};

/// The core behind a broker pointer of ours, or null.
ObjectManagerCore* coreOf(const CMPIBroker* broker);

extern CMPIBrokerFT brokerFT;
extern CMPIBrokerEncFT brokerEncFT;
extern CMPIBrokerExtFT brokerExtFT;
extern CMPIBrokerMemFT brokerMemFT;

} // namespace tvr::broker::detail
