#include "FuzzedRequest.h"

#include <cctype>
#include <iterator>

namespace tvr::fuzz {

namespace {

using broker::ObjectPath;
using broker::Operation;
using broker::Value;

const Operation kOperations[] = {Operation::EnumerateInstanceNames, Operation::EnumerateInstances,
                                 Operation::GetInstance,            Operation::Associators,
                                 Operation::AssociatorNames,        Operation::References,
                                 Operation::ReferenceNames};

const char* const kRoleNames[] = {"Antecedent", "Dependent", "GroupComponent", "PartComponent", "Tag",
                                  "CreationClassName", "DeviceID", "SystemName", "SystemCreationClassName"};

/// A text long enough to overrun any fixed buffer a provider might format it
/// into.
const std::string& longText() {
  static const std::string text(10 * 1024, 'L');
  return text;
}

template <class T> const T& pickFrom(FuzzedDataProvider& input, const std::vector<T>& choices) {
  return choices[input.ConsumeIntegralInRange<std::size_t>(0, choices.size() - 1)];
}

class RequestMaker {
public:
  RequestMaker(FuzzedDataProvider& input, const RequestMaterial& material) : input_(input), material_(material) {}

  FuzzedRequest make() {
    FuzzedRequest request;
    request.operation = kOperations[input_.ConsumeIntegralInRange<std::size_t>(0, std::size(kOperations) - 1)];
    request.target = request.operation == Operation::EnumerateInstanceNames ||
                             request.operation == Operation::EnumerateInstances
                         ? ObjectPath(nameSpace(), className())
                         : instancePath();
    request.args.assocClass = optionalText();
    request.args.resultClass = optionalText();
    request.args.role = optionalText();
    request.args.resultRole = optionalText();
    request.args.properties = propertyList();
    if (input_.ConsumeIntegralInRange(0, 7) == 0) request.routeTo = pickFrom(input_, material_.classes);
    request.ownClassForEachProvider = input_.ConsumeBool();
    if (input_.ConsumeIntegralInRange(0, 3) == 0) request.faults = brokerFaults();
    return request;
  }

private:
  std::string nameSpace() {
    switch (input_.ConsumeIntegralInRange(0, 7)) {
    case 0: return "";
    case 1: return input_.ConsumeRandomLengthString(16);
    default: return "root/cimv2";
    }
  }

  /// A registered class, written as the registration has it or in another
  /// case, or a class nobody serves.
  std::string className() {
    std::string name = pickFrom(input_, material_.classes);
    switch (input_.ConsumeIntegralInRange(0, 9)) {
    case 0:
      for (char& c : name) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
      return name;
    case 1: return "CIM_" + name.substr(name.find('_') + 1);
    case 2: return text();
    default: return name;
    }
  }

  std::string text() {
    switch (input_.ConsumeIntegralInRange(0, 9)) {
    case 0: return "";
    case 1: return longText();
    case 2: return input_.ConsumeRandomLengthString(64);
    case 3: return pickFrom(input_, material_.classes);
    case 4: return kRoleNames[input_.ConsumeIntegralInRange<std::size_t>(0, std::size(kRoleNames) - 1)];
    default:
      if (material_.texts.empty()) return input_.ConsumeRandomLengthString(32);
      return pickFrom(input_, material_.texts);
    }
  }

  std::optional<std::string> optionalText() {
    if (input_.ConsumeIntegralInRange(0, 2) == 0) return std::nullopt;
    return text();
  }

  broker::PropertyList propertyList() {
    if (input_.ConsumeBool()) return std::nullopt;
    std::vector<std::string> names;
    const int count = input_.ConsumeIntegralInRange(0, 4);
    for (int i = 0; i < count; ++i) names.push_back(input_.ConsumeBool() ? std::string("Tag") : text());
    return names;
  }

  /// A key value: mostly a text, sometimes a value of another type, a null
  /// value, or a reference to a path seen before.
  Value keyValue() {
    switch (input_.ConsumeIntegralInRange(0, 11)) {
    case 0: return Value::uint64(input_.ConsumeIntegral<std::uint64_t>());
    case 1: return Value::sint32(input_.ConsumeIntegral<std::int32_t>());
    case 2: return Value::boolean(input_.ConsumeBool());
    case 3: return Value::real64(input_.ConsumeFloatingPoint<double>());
    case 4: return Value::nullOf(CMPI_chars);
    case 5: return Value::nullOf(CMPI_string);
    case 6:
      if (!material_.paths.empty()) return Value::reference(pickFrom(input_, material_.paths));
      return Value::chars(text());
    case 7: return Value::string(text());
    default: return Value::chars(text());
    }
  }

  /// A path seen in an answer, as it was or with a key dropped, added or
  /// changed; or a path made from the keys the schema gives a class.
  ObjectPath instancePath() {
    ObjectPath path;
    if (!material_.paths.empty() && input_.ConsumeIntegralInRange(0, 3) != 0) {
      path = pickFrom(input_, material_.paths);
      if (input_.ConsumeIntegralInRange(0, 2) == 0) mutateKeys(path);
      return path;
    }
    path = ObjectPath(nameSpace(), className());
    const auto keys = material_.classKeys.find(path.className);
    if (keys != material_.classKeys.end())
      for (const std::string& key : keys->second)
        if (input_.ConsumeIntegralInRange(0, 7) != 0) path.keys.push_back({key, keyValue()});
    if (input_.ConsumeIntegralInRange(0, 7) == 0) path.keys.push_back({text(), keyValue()});
    return path;
  }

  void mutateKeys(ObjectPath& path) {
    switch (input_.ConsumeIntegralInRange(0, 3)) {
    case 0:
      if (!path.keys.empty())
        path.keys.erase(path.keys.begin() + input_.ConsumeIntegralInRange<std::size_t>(0, path.keys.size() - 1));
      break;
    case 1: path.keys.push_back({text(), keyValue()}); break;
    case 2:
      if (!path.keys.empty())
        path.keys[input_.ConsumeIntegralInRange<std::size_t>(0, path.keys.size() - 1)].value = keyValue();
      break;
    default: path.className = className(); break;
    }
  }

  BrokerFaults brokerFaults() {
    static const broker::Fault kFaults[] = {broker::Fault::NewObjectPath, broker::Fault::NewInstance,
                                            broker::Fault::NewArray, broker::Fault::UpCall};
    BrokerFaults faults;
    faults.fault = kFaults[input_.ConsumeIntegralInRange<std::size_t>(0, 3)];
    faults.count = input_.ConsumeIntegralInRange<std::uint32_t>(1, 3);
    faults.shape = input_.ConsumeBool() ? broker::FailureShape::Null : broker::FailureShape::Hollow;
    faults.skip = input_.ConsumeIntegralInRange<std::uint32_t>(0, 40);
    return faults;
  }

  FuzzedDataProvider& input_;
  const RequestMaterial& material_;
};

} // namespace

FuzzedRequest fuzzedRequest(FuzzedDataProvider& input, const RequestMaterial& material) {
  return RequestMaker(input, material).make();
}

broker::Response send(broker::ObjectManager& om, const FuzzedRequest& request) {
  broker::RequestOptions options;
  options.routeTo = request.routeTo;
  options.ownClassForEachProvider = request.ownClassForEachProvider;
  if (request.faults)
    om.faults().failNext(request.faults->fault, request.faults->count, request.faults->shape, request.faults->skip);
  broker::Response answer;
  switch (request.operation) {
  case Operation::EnumerateInstanceNames: answer = om.enumerateInstanceNames(request.target, options); break;
  case Operation::EnumerateInstances:
    answer = om.enumerateInstances(request.target, request.args.properties, options);
    break;
  case Operation::GetInstance: answer = om.getInstance(request.target, request.args.properties, options); break;
  case Operation::Associators: answer = om.associators(request.target, request.args, options); break;
  case Operation::AssociatorNames: answer = om.associatorNames(request.target, request.args, options); break;
  case Operation::References: answer = om.references(request.target, request.args, options); break;
  case Operation::ReferenceNames: answer = om.referenceNames(request.target, request.args, options); break;
  }
  om.faults().reset();
  return answer;
}

} // namespace tvr::fuzz
