#include "tvr/broker/ObjectManager.h"

#include "cmpi/Arena.h"
#include "cmpi/Objects.h"
#include "core/ObjectManagerCore.h"
#include "core/ResultSink.h"

namespace tvr::broker {

namespace {

// Records what a provider returns into the Response, and shows each element
// to the caller's observer as it comes.
class Recorder : public detail::ResultSink {
public:
  Recorder(Response& response, const RequestOptions& options) : response_(response), options_(options) {}

  void onPath(const ObjectPath* path) override {
    ResultItem item;
    item.kind = path ? ResultItem::Kind::ObjectPath : ResultItem::Kind::NullObjectPath;
    if (path) item.path = *path;
    push(std::move(item));
  }
  void onInstance(const Instance* instance, const ObjectPath* path) override {
    ResultItem item;
    item.kind = instance ? ResultItem::Kind::Instance : ResultItem::Kind::NullInstance;
    if (instance) {
      item.instance = *instance;
      item.instance.path = *path;
      item.path = *path;
    }
    push(std::move(item));
  }
  void onData(const Value& value) override {
    ResultItem item;
    item.kind = ResultItem::Kind::Data;
    item.data = value;
    push(std::move(item));
  }
  void onDone() override { ++response_.doneCount; }

private:
  void push(ResultItem item) {
    if (options_.observer) options_.observer->onItem(item);
    if (options_.keepItems) response_.items.push_back(std::move(item));
  }
  Response& response_;
  const RequestOptions& options_;
};

// The overall status of a request that reached several providers: OK unless
// every one of them failed, then the first failure.
void settleStatus(Response& response) {
  bool anyOk = false;
  for (const ProviderOutcome& o : response.outcomes) {
    if (o.exception && !response.exception) response.exception = o.exception;
    if (o.rc == CMPI_RC_OK && !o.exception) anyOk = true;
  }
  if (response.outcomes.size() == 1) {
    response.rc = response.outcomes.front().rc;
    response.message = response.outcomes.front().message;
    return;
  }
  if (anyOk || response.outcomes.empty()) return;
  response.rc = response.outcomes.front().rc;
  response.message = response.outcomes.front().message;
}

} // namespace

ObjectManager::ObjectManager(ObjectManagerOptions options)
    : core_(std::make_unique<detail::ObjectManagerCore>(std::move(options))) {}

ObjectManager::~ObjectManager() = default;

Response ObjectManager::run(Operation op, const ObjectPath& target, const AssociationArgs& args,
                            const RequestOptions& options) {
  Response response;
  response.operation = op;
  detail::Arena arena;
  detail::TraceSink traces{options.keepTraces ? &response.traces : nullptr, &options.traceObserver};
  detail::RequestFrame frame{&arena, &traces, core_.get(), 0};
  detail::FrameScope scope(&frame);

  detail::CallOutcome failure;
  const std::vector<detail::Route> routes = core_->route(op, target, args, options, &failure);
  if (routes.empty()) {
    response.rc = failure.rc;
    response.message = failure.message;
    return response;
  }
  Recorder recorder(response, options);
  for (const detail::Route& route : routes) {
    detail::CallOutcome outcome = core_->call(route, op, target, recorder, options.nullBroker);
    response.outcomes.push_back(ProviderOutcome{route.registration->provider, route.registration->className,
                                                outcome.rc, std::move(outcome.message),
                                                std::move(outcome.exception)});
  }
  settleStatus(response);
  return response;
}

Response ObjectManager::enumerateInstanceNames(const ObjectPath& classPath, const RequestOptions& options) {
  return run(Operation::EnumerateInstanceNames, classPath, AssociationArgs{}, options);
}

Response ObjectManager::enumerateInstances(const ObjectPath& classPath, const PropertyList& properties,
                                           const RequestOptions& options) {
  AssociationArgs args;
  args.properties = properties;
  return run(Operation::EnumerateInstances, classPath, args, options);
}

Response ObjectManager::getInstance(const ObjectPath& path, const PropertyList& properties,
                                    const RequestOptions& options) {
  AssociationArgs args;
  args.properties = properties;
  return run(Operation::GetInstance, path, args, options);
}

Response ObjectManager::associators(const ObjectPath& source, const AssociationArgs& args,
                                    const RequestOptions& options) {
  return run(Operation::Associators, source, args, options);
}

Response ObjectManager::associatorNames(const ObjectPath& source, const AssociationArgs& args,
                                        const RequestOptions& options) {
  return run(Operation::AssociatorNames, source, args, options);
}

Response ObjectManager::references(const ObjectPath& source, const AssociationArgs& args,
                                   const RequestOptions& options) {
  return run(Operation::References, source, args, options);
}

Response ObjectManager::referenceNames(const ObjectPath& source, const AssociationArgs& args,
                                       const RequestOptions& options) {
  return run(Operation::ReferenceNames, source, args, options);
}

Response ObjectManager::runAsRequest(const std::function<void(const CMPIBroker*, const CMPIContext*)>& body,
                                     const std::string& nameSpace) {
  Response response;
  detail::Arena arena;
  detail::TraceSink traces{&response.traces, nullptr};
  detail::RequestFrame frame{&arena, &traces, core_.get(), 0};
  detail::FrameScope scope(&frame);
  body(core_->broker(), core_->newRequestContext(ObjectPath(nameSpace, "")));
  return response;
}

Response ObjectManager::runAsRequest(
    const std::function<void(const CMPIBroker*, const CMPIContext*, const CMPIResult*)>& body,
    const std::string& nameSpace) {
  Response response;
  const RequestOptions options;
  Recorder recorder(response, options);
  Response traced = runAsRequest(
      [&](const CMPIBroker* broker, const CMPIContext* ctx) {
        auto* result = detail::arenaFor(core_.get()).make<detail::ResultObject>(core_.get(), &recorder);
        body(broker, ctx, &result->shell.cmpi);
      },
      nameSpace);
  response.traces = std::move(traced.traces);
  return response;
}

const RegistrationTable& ObjectManager::registration() const { return core_->registration(); }

FaultInjector& ObjectManager::faults() { return core_->faults(); }

const CMPIBroker* ObjectManager::broker() const { return core_->broker(); }

namespace {
const ClassRegistration* registrationOf(const RegistrationTable& table, const std::string& provider) {
  for (const ClassRegistration& reg : table.classes())
    if (reg.provider == provider) return &reg;
  return nullptr;
}
} // namespace

CMPIInstanceMI* ObjectManager::instanceMI(const std::string& provider, std::string* error) {
  const ClassRegistration* reg = registrationOf(registration(), provider);
  if (!reg) {
    if (error) *error = "provider " + provider + " is not registered";
    return nullptr;
  }
  return core_->libraries().instanceMI(reg->location, provider, core_->broker(), core_->creationContext(), error);
}

CMPIAssociationMI* ObjectManager::associationMI(const std::string& provider, std::string* error) {
  const ClassRegistration* reg = registrationOf(registration(), provider);
  if (!reg) {
    if (error) *error = "provider " + provider + " is not registered";
    return nullptr;
  }
  return core_->libraries().associationMI(reg->location, provider, core_->broker(), core_->creationContext(),
                                          error);
}

void* ObjectManager::providerSymbol(const std::string& provider, const std::string& symbol, std::string* error) {
  const ClassRegistration* reg = registrationOf(registration(), provider);
  if (!reg) {
    if (error) *error = "provider " + provider + " is not registered";
    return nullptr;
  }
  return core_->libraries().symbol(reg->location, symbol, error);
}

std::size_t ObjectManager::longLivedObjects() const { return core_->longLivedArena().liveObjects(); }

} // namespace tvr::broker
