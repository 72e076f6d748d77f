#include "Request.h"

#include "tvr/broker/PathText.h"

#include <strings.h>

namespace tvrpa {

namespace {

using tvr::broker::Operation;

bool isReferences(Operation op) { return op == Operation::References || op == Operation::ReferenceNames; }

bool isAssociation(Operation op) {
  return op == Operation::Associators || op == Operation::AssociatorNames || isReferences(op);
}

bool serves(const tvr::broker::ClassRegistration& reg, const std::string& nameSpace) {
  for (const std::string& ns : reg.namespaces)
    if (strcasecmp(ns.c_str(), nameSpace.c_str()) == 0) return true;
  return false;
}

// The association class a request names, in the argument the operation
// carries it in.
const std::optional<std::string>& namedClass(const Request& request) {
  return isReferences(request.operation) ? request.args.resultClass : request.args.assocClass;
}

std::string text(const std::optional<std::string>& value) { return value ? "\"" + *value + "\"" : "NULL"; }

std::string text(const tvr::broker::PropertyList& list) {
  if (!list) return "NULL";
  std::string out = "{";
  for (std::size_t i = 0; i < list->size(); ++i) out += (i ? "," : "") + ("\"" + (*list)[i] + "\"");
  return out + "}";
}

} // namespace

Request requestFor(const CommandLine& cl) {
  Request request;
  request.operation = brokerOperation(cl.command);
  request.target = cl.target;
  request.args.assocClass = cl.assocClass;
  request.args.resultClass = cl.resultClass;
  request.args.role = cl.role;
  request.args.resultRole = cl.resultRole;
  request.args.properties = cl.properties;
  request.everyAssociationProvider = isAssociation(request.operation) && !namedClass(request);
  return request;
}

std::string whyNobodyIsAsked(const Request& request, const tvr::broker::RegistrationTable& registration) {
  if (!isAssociation(request.operation)) return std::string();
  const std::string& nameSpace = request.target.nameSpace;
  bool namespaceServed = false;
  for (const tvr::broker::ClassRegistration& reg : registration.classes()) {
    if (!serves(reg, nameSpace)) continue;
    namespaceServed = true;
    if (reg.association) return std::string();
  }
  // An unknown namespace is the object manager's to refuse.
  if (!namespaceServed) return std::string();
  const std::optional<std::string>& named = namedClass(request);
  // A References result class that is no association class of ours narrows
  // every association provider's answer; ai and ain naming a class nobody
  // serves are refused by the object manager.
  if (named && !isReferences(request.operation)) return std::string();
  return "no association provider is registered in namespace " + nameSpace + ", so the answer is empty";
}

tvr::broker::Response send(tvr::broker::ObjectManager& om, const Request& request,
                           tvr::broker::RequestOptions options) {
  options.ownClassForEachProvider = request.everyAssociationProvider;
  const tvr::broker::ObjectPath& target = request.target;
  const tvr::broker::AssociationArgs& args = request.args;
  switch (request.operation) {
  case Operation::EnumerateInstanceNames: return om.enumerateInstanceNames(target, options);
  case Operation::EnumerateInstances: return om.enumerateInstances(target, args.properties, options);
  case Operation::GetInstance: return om.getInstance(target, args.properties, options);
  case Operation::Associators: return om.associators(target, args, options);
  case Operation::AssociatorNames: return om.associatorNames(target, args, options);
  case Operation::References: return om.references(target, args, options);
  case Operation::ReferenceNames: return om.referenceNames(target, args, options);
  }
  return tvr::broker::Response{};
}

std::string describe(const Request& request) {
  std::string out =
      std::string(tvr::broker::operationName(request.operation)) + " " + tvr::broker::formatObjectPath(request.target);
  const tvr::broker::AssociationArgs& a = request.args;
  switch (request.operation) {
  case Operation::EnumerateInstanceNames: break;
  case Operation::EnumerateInstances:
  case Operation::GetInstance: out += " properties=" + text(a.properties); break;
  case Operation::Associators:
  case Operation::AssociatorNames:
    out += " assocClass=" + text(a.assocClass) + " resultClass=" + text(a.resultClass) + " role=" + text(a.role) +
           " resultRole=" + text(a.resultRole);
    if (request.operation == Operation::Associators) out += " properties=" + text(a.properties);
    break;
  case Operation::References:
  case Operation::ReferenceNames:
    out += " resultClass=" + text(a.resultClass) + " role=" + text(a.role);
    if (request.operation == Operation::References) out += " properties=" + text(a.properties);
    break;
  }
  if (request.everyAssociationProvider) out += " (every association provider, each with its own class)";
  return out;
}

} // namespace tvrpa
