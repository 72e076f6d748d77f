#include "core/ObjectManagerCore.h"

#include "cmpi/Convert.h"
#include "cmpi/Objects.h"

#include <cxxabi.h>
#include <pwd.h>
#include <strings.h>
#include <unistd.h>

#include <cstdlib>
#include <exception>
#include <typeinfo>

namespace tvr::broker::detail {

namespace {

bool sameName(const std::string& a, const std::string& b) { return strcasecmp(a.c_str(), b.c_str()) == 0; }

bool servesNamespace(const ClassRegistration& reg, const std::string& ns) {
  for (const std::string& n : reg.namespaces)
    if (sameName(n, ns)) return true;
  return false;
}

bool isAssociationOperation(Operation op) {
  return op == Operation::Associators || op == Operation::AssociatorNames || op == Operation::References ||
         op == Operation::ReferenceNames;
}

std::string demangle(const char* name) {
  int status = 0;
  char* readable = abi::__cxa_demangle(name, nullptr, nullptr, &status);
  std::string out = status == 0 && readable ? readable : name;
  std::free(readable);
  return out;
}

// The principal of every request: the user the process runs as, looked up once.
const std::string& userName() {
  static const std::string name = [] {
    passwd entry{};
    passwd* found = nullptr;
    std::vector<char> buffer(16384);
    if (getpwuid_r(geteuid(), &entry, buffer.data(), buffer.size(), &found) == 0 && found && found->pw_name)
      return std::string(found->pw_name);
    return std::string("unknown");
  }();
  return name;
}

// Keeps a null-terminated array of C strings alive for one call.
class CStringList {
public:
  explicit CStringList(const PropertyList& names) {
    if (!names) return;
    for (const std::string& n : *names) pointers_.push_back(n.c_str());
    pointers_.push_back(nullptr);
  }
  const char** get() { return pointers_.empty() ? nullptr : pointers_.data(); }

private:
  std::vector<const char*> pointers_;
};

const char* cstr(const std::optional<std::string>& s) { return s ? s->c_str() : nullptr; }

// Collects what an up-call's provider returns, as values for an enumeration.
class CollectingSink : public ResultSink {
public:
  void onPath(const ObjectPath* path) override {
    if (path) items.push_back(Value::reference(*path));
  }
  void onInstance(const Instance* instance, const ObjectPath* path) override {
    if (!instance) return;
    Value v;
    v.type = CMPI_instance;
    v.null = false;
    Instance copy = *instance;
    copy.path = *path;
    v.instance = std::make_shared<const Instance>(std::move(copy));
    items.push_back(std::move(v));
  }
  void onData(const Value& value) override { items.push_back(value); }
  void onDone() override {}
  std::vector<Value> items;
};

constexpr int kMaxUpCallDepth = 16;

} // namespace

ObjectManagerCore::ObjectManagerCore(ObjectManagerOptions options)
    : options_(std::move(options)), libraries_(options_.providerDirectories, options_.libraryFiles) {
  broker_.hdl = this;
  broker_.bft = &brokerFT;
  broker_.eft = &brokerEncFT;
  broker_.xft = &brokerExtFT;
  broker_.mft = &brokerMemFT;
  // Kept apart from the arenas: it is the object manager's own, not one a
  // provider asked for.
  auto context = std::make_unique<ContextObject>(this, std::vector<Binding>{});
  creationContext_ = &context->shell.cmpi;
  creationContextObject_ = std::move(context);
}

ObjectManagerCore::~ObjectManagerCore() {
  libraries_.cleanupAll(creationContext_);
}

ObjectManagerCore* coreOf(const CMPIBroker* broker) {
  if (!broker || broker->bft != &brokerFT) return nullptr;
  return static_cast<ObjectManagerCore*>(broker->hdl);
}

ObjectPath ObjectManagerCore::pathOfInstance(const Instance& instance) const {
  ObjectPath path = instance.path;
  if (!path.keys.empty()) return path;
  for (const auto& [className, keys] : options_.classKeys) {
    if (!sameName(className, path.className)) continue;
    for (const std::string& key : keys)
      for (const Binding& b : instance.properties)
        if (sameName(b.name, key)) path.keys.push_back(b);
    break;
  }
  return path;
}

std::vector<Route> ObjectManagerCore::route(Operation op, const ObjectPath& target,
                                            const AssociationArgs& args, const RequestOptions& options,
                                            CallOutcome* error) const {
  auto fail = [&](CMPIrc rc, std::string message) {
    error->rc = rc;
    error->message = std::move(message);
    return std::vector<Route>{};
  };
  auto single = [&](const std::string& className) -> std::vector<Route> {
    const ClassRegistration* reg = registration().find(className);
    if (!reg) return fail(CMPI_RC_ERR_INVALID_CLASS, "no provider is registered for class " + className);
    if (!servesNamespace(*reg, target.nameSpace))
      return fail(CMPI_RC_ERR_INVALID_NAMESPACE,
                  "class " + reg->className + " is not registered in namespace " + target.nameSpace);
    return {Route{reg, args}};
  };

  if (options.routeTo) return single(*options.routeTo);
  if (!isAssociationOperation(op)) return single(target.className);

  const bool references = op == Operation::References || op == Operation::ReferenceNames;
  const std::optional<std::string>& named = references ? args.resultClass : args.assocClass;
  if (named) {
    const ClassRegistration* reg = registration().find(*named);
    if (reg && reg->association) return single(reg->className);
    if (!references) return fail(CMPI_RC_ERR_INVALID_CLASS, "no association provider is registered for class " + *named);
  }
  std::vector<Route> routes;
  for (const ClassRegistration* reg : registration().associationClasses()) {
    if (!servesNamespace(*reg, target.nameSpace)) continue;
    Route r{reg, args};
    if (options.ownClassForEachProvider) (references ? r.args.resultClass : r.args.assocClass) = reg->className;
    routes.push_back(std::move(r));
  }
  if (routes.empty())
    return fail(CMPI_RC_ERR_INVALID_NAMESPACE, "no association provider is registered in namespace " + target.nameSpace);
  return routes;
}

CMPIContext* ObjectManagerCore::newRequestContext(const ObjectPath& target) {
  std::vector<Binding> entries;
  entries.push_back(Binding{CMPIInitNameSpace, Value::string(target.nameSpace)});
  entries.push_back(Binding{CMPIInvocationFlags, Value::uint32(0)});
  entries.push_back(Binding{CMPIPrincipal, Value::string(userName())});
  return newContextObject(this, std::move(entries));
}

CallOutcome ObjectManagerCore::call(const Route& route, Operation op, const ObjectPath& target,
                                    ResultSink& sink, bool nullBroker) {
  CallOutcome outcome;
  const ClassRegistration& reg = *route.registration;
  CMPIContext* ctx = newRequestContext(target);
  std::string error;
  CMPIInstanceMI* instanceMI = nullptr;
  CMPIAssociationMI* associationMI = nullptr;
  if (isAssociationOperation(op)) {
    if (reg.association) associationMI = libraries_.associationMI(reg.location, reg.provider, &broker_, ctx, &error);
    else error = "class " + reg.className + " has no association provider";
  } else {
    if (reg.instance) instanceMI = libraries_.instanceMI(reg.location, reg.provider, &broker_, ctx, &error);
    else error = "class " + reg.className + " has no instance provider";
  }
  if (!instanceMI && !associationMI) {
    outcome.rc = CMPI_RC_ERR_FAILED;
    outcome.message = error;
    return outcome;
  }

  auto* result = arenaFor(this).make<ResultObject>(this, &sink);
  const CMPIResult* rslt = &result->shell.cmpi;
  CMPIObjectPath* cop = newPathObject(this, target);
  const AssociationArgs& a = route.args;
  CStringList properties(a.properties);

  if (nullBroker) libraries_.recreate(reg.location, reg.provider, nullptr, ctx);
  CMPIStatus st = {CMPI_RC_OK, nullptr};
  try {
    switch (op) {
    case Operation::EnumerateInstanceNames:
      st = instanceMI->ft->enumerateInstanceNames(instanceMI, ctx, rslt, cop);
      break;
    case Operation::EnumerateInstances:
      st = instanceMI->ft->enumerateInstances(instanceMI, ctx, rslt, cop, properties.get());
      break;
    case Operation::GetInstance:
      st = instanceMI->ft->getInstance(instanceMI, ctx, rslt, cop, properties.get());
      break;
    case Operation::Associators:
      st = associationMI->ft->associators(associationMI, ctx, rslt, cop, cstr(a.assocClass), cstr(a.resultClass),
                                          cstr(a.role), cstr(a.resultRole), properties.get());
      break;
    case Operation::AssociatorNames:
      st = associationMI->ft->associatorNames(associationMI, ctx, rslt, cop, cstr(a.assocClass),
                                              cstr(a.resultClass), cstr(a.role), cstr(a.resultRole));
      break;
    case Operation::References:
      st = associationMI->ft->references(associationMI, ctx, rslt, cop, cstr(a.resultClass), cstr(a.role),
                                         properties.get());
      break;
    case Operation::ReferenceNames:
      st = associationMI->ft->referenceNames(associationMI, ctx, rslt, cop, cstr(a.resultClass), cstr(a.role));
      break;
    }
  } catch (const std::exception& e) {
    outcome.exception = EscapedException{demangle(typeid(e).name()), e.what()};
  } catch (...) {
    const std::type_info* type = abi::__cxa_current_exception_type();
    outcome.exception = EscapedException{type ? demangle(type->name()) : "unknown", ""};
  }
  if (nullBroker) libraries_.recreate(reg.location, reg.provider, &broker_, ctx);

  if (outcome.exception) {
    outcome.rc = CMPI_RC_ERR_FAILED;
    return outcome;
  }
  outcome.rc = st.rc;
  if (st.msg) {
    if (StringObject* s = stringOf(st.msg); s && !s->null) outcome.message = s->text;
  }
  return outcome;
}

CMPIEnumeration* ObjectManagerCore::upCall(Operation op, const CMPIObjectPath* target,
                                           const AssociationArgs& args, CMPIStatus* rc) {
  FailureShape shape = FailureShape::Null;
  if (faults_.shouldFail(Fault::UpCall, &shape)) {
    setStatus(rc, CMPI_RC_ERR_FAILED);
    if (shape == FailureShape::Hollow)
      return &arenaFor(this).make<EnumerationObject>(this, std::vector<Value>{}, true)->shell.cmpi;
    return nullptr;
  }
  const ObjectPath* path = pathIn(target);
  if (!path) {
    setStatus(rc, CMPI_RC_ERR_INVALID_PARAMETER);
    return nullptr;
  }
  RequestFrame* outer = currentFrame();
  const int depth = outer ? outer->depth + 1 : 1;
  if (depth > kMaxUpCallDepth) {
    setStatus(rc, CMPI_RC_ERR_FAILED);
    return nullptr;
  }
  CallOutcome failure;
  const std::vector<Route> routes = route(op, *path, args, RequestOptions{}, &failure);
  if (routes.empty()) {
    setStatus(rc, failure.rc);
    return nullptr;
  }
  CollectingSink sink;
  CMPIrc worst = CMPI_RC_OK;
  {
    // Inside a request the serving provider's objects belong to it. Outside
    // one (a provider's own thread) they get an arena of their own, freed
    // here: only the enumeration, which holds copies, outlives the call.
    std::unique_ptr<Arena> own;
    if (!outer || !outer->arena) own = std::make_unique<Arena>();
    RequestFrame frame{own ? own.get() : outer->arena, outer ? outer->traces : nullptr, this, depth};
    FrameScope scope(&frame);
    for (const Route& r : routes) {
      const CallOutcome outcome = call(r, op, *path, sink, false);
      if (outcome.rc != CMPI_RC_OK && worst == CMPI_RC_OK) worst = outcome.rc;
    }
  }
  setStatus(rc, worst);
  return newEnumerationObject(this, std::move(sink.items));
}

} // namespace tvr::broker::detail
