#include "RequestCatalogue.h"

#include "tvr/broker/PathText.h"

#include <stdexcept>

namespace tvr::reliability {

using broker::AssociationArgs;
using broker::ObjectPath;
using broker::Operation;

namespace {

const char* const kNameSpace = "root/cimv2";

/// Instances per class whose paths serve as request targets: enough to meet
/// every kind of element of the machines, few enough to keep the catalogue
/// small.
constexpr std::size_t kTargetsPerClass = 4;

const char* operationWord(Operation op) {
  switch (op) {
  case Operation::EnumerateInstanceNames: return "ein";
  case Operation::EnumerateInstances: return "ei";
  case Operation::GetInstance: return "gi";
  case Operation::Associators: return "ai";
  case Operation::AssociatorNames: return "ain";
  case Operation::References: return "ri";
  case Operation::ReferenceNames: return "rin";
  }
  return "?";
}

Request enumeration(Operation op, const std::string& className, broker::PropertyList properties = std::nullopt) {
  Request request;
  request.operation = op;
  request.target = ObjectPath(kNameSpace, className);
  request.args.properties = std::move(properties);
  return request;
}

Request onPath(Operation op, const ObjectPath& path, AssociationArgs args = {}) {
  Request request;
  request.operation = op;
  request.target = path;
  request.args = std::move(args);
  return request;
}

/// The association class goes where the operation expects it: in
/// assocClass for Associators and AssociatorNames, in resultClass for
/// References and ReferenceNames.
AssociationArgs throughAssociation(Operation op, const std::optional<std::string>& associationClass) {
  AssociationArgs args;
  if (op == Operation::References || op == Operation::ReferenceNames) args.resultClass = associationClass;
  else args.assocClass = associationClass;
  return args;
}

/// The paths of the instances of \p className, from its instance names, or
/// from its instances where the provider enumerates no names (the IDE
/// classes, which DiskController_EnumInstances alone serves).
std::vector<ObjectPath> pathsOf(broker::ObjectManager& om, const std::string& className) {
  std::vector<ObjectPath> paths = om.enumerateInstanceNames(ObjectPath(kNameSpace, className)).paths();
  if (paths.empty()) paths = om.enumerateInstances(ObjectPath(kNameSpace, className)).paths();
  if (paths.size() > kTargetsPerClass) paths.resize(kTargetsPerClass);
  return paths;
}

} // namespace

std::string Request::label() const {
  std::string text = std::string(operationWord(operation)) + " " + broker::formatObjectPath(target);
  const auto add = [&text](const char* name, const std::optional<std::string>& value) {
    if (value) text += std::string(" ") + name + "=" + *value;
  };
  add("assocClass", args.assocClass);
  add("resultClass", args.resultClass);
  add("role", args.role);
  add("resultRole", args.resultRole);
  if (args.properties) {
    text += " properties=";
    for (const std::string& name : *args.properties) text += name + ",";
  }
  return text;
}

broker::Response send(broker::ObjectManager& om, const Request& request) {
  switch (request.operation) {
  case Operation::EnumerateInstanceNames: return om.enumerateInstanceNames(request.target);
  case Operation::EnumerateInstances: return om.enumerateInstances(request.target, request.args.properties);
  case Operation::GetInstance: return om.getInstance(request.target, request.args.properties);
  case Operation::Associators: return om.associators(request.target, request.args);
  case Operation::AssociatorNames: return om.associatorNames(request.target, request.args);
  case Operation::References: return om.references(request.target, request.args);
  case Operation::ReferenceNames: return om.referenceNames(request.target, request.args);
  }
  throw std::logic_error("unknown operation");
}

std::vector<Request> requestsOverEveryClass(broker::ObjectManager& om) {
  std::vector<std::string> classes;
  std::vector<std::optional<std::string>> associationClasses = {std::nullopt};
  for (const broker::ClassRegistration& reg : om.registration().classes()) {
    classes.push_back(reg.className);
    if (reg.association) associationClasses.push_back(reg.className);
  }

  std::vector<Request> requests;
  for (const std::string& className : classes) {
    requests.push_back(enumeration(Operation::EnumerateInstanceNames, className));
    requests.push_back(enumeration(Operation::EnumerateInstances, className));
    requests.push_back(enumeration(Operation::EnumerateInstances, className,
                                   std::vector<std::string>{"Tag", "ElementName", "Antecedent"}));
  }

  for (const std::string& className : classes) {
    const std::vector<ObjectPath> paths = pathsOf(om, className);
    if (!paths.empty()) {
      ObjectPath unknown = paths.front();
      for (broker::Binding& key : unknown.keys)
        if (key.value.isText()) key.value = broker::Value::chars("no such " + key.name);
      requests.push_back(onPath(Operation::GetInstance, unknown));
    }
    for (const ObjectPath& path : paths) {
      requests.push_back(onPath(Operation::GetInstance, path));
      for (const std::optional<std::string>& association : associationClasses) {
        for (Operation op : {Operation::Associators, Operation::AssociatorNames, Operation::References,
                             Operation::ReferenceNames})
          requests.push_back(onPath(op, path, throughAssociation(op, association)));
      }
      AssociationArgs withTexts = throughAssociation(Operation::Associators, std::nullopt);
      withTexts.resultClass = "TVRHX_Chassis";
      withTexts.role = "GroupComponent";
      withTexts.resultRole = "PartComponent";
      withTexts.properties = std::vector<std::string>{"Tag"};
      requests.push_back(onPath(Operation::Associators, path, withTexts));
      AssociationArgs referenceTexts;
      referenceTexts.role = "Antecedent";
      requests.push_back(onPath(Operation::References, path, referenceTexts));
    }
  }
  return requests;
}

} // namespace tvr::reliability
