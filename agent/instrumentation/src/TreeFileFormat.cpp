//===- TreeFileFormat.cpp - Reading the hardware-tree JSON format ---------===//

#include "TreeFileFormat.h"

#include <nlohmann/json.hpp>

#include <cstdint>
#include <initializer_list>
#include <limits>

namespace HX {
namespace detail {
namespace {

using Json = nlohmann::json;
using NodeIndex = SnapshotBuilder::NodeIndex;

/// Why the tree is refused, at which JSON pointer. Thrown inside the checker
/// only, caught by readHardwareTree.
struct Refusal {
  std::string at;
  std::string what;
};

[[noreturn]] void refuse(std::string at, std::string what) {
  throw Refusal{std::move(at), std::move(what)};
}

/// Appends \p key to JSON pointer \p at, escaped as JSON pointers require.
std::string member(const std::string &at, std::string_view key) {
  std::string pointer = at;
  pointer += '/';
  for (char c : key) {
    if (c == '~')
      pointer += "~0";
    else if (c == '/')
      pointer += "~1";
    else
      pointer += c;
  }
  return pointer;
}

std::string element(const std::string &at, std::size_t index) {
  return at + "/" + std::to_string(index);
}

/// Keeps quoted text short enough for one log line without splitting a
/// UTF-8 sequence.
std::string shortened(std::string text) {
  constexpr std::size_t Limit = 60;
  if (text.size() <= Limit)
    return text;
  std::size_t cut = Limit;
  while (cut > 0 && (static_cast<unsigned char>(text[cut]) & 0xC0) == 0x80)
    --cut;
  text.resize(cut);
  return text + "...\"";
}

/// Names what was found instead of the expected value. Containers are named,
/// not printed: they may be large or deeply nested.
std::string describe(const Json &value) {
  switch (value.type()) {
  case Json::value_t::object:
    return "an object";
  case Json::value_t::array:
    return "an array";
  case Json::value_t::string:
    return shortened(value.dump(-1, ' ', false, Json::error_handler_t::replace));
  default:
    return value.dump();
  }
}

constexpr std::string_view IntegerRange = "an integer from 0 to 4294967295";

std::optional<unsigned int> asUnsigned(const Json &value) {
  if (value.is_number_unsigned()) {
    auto number = value.get<std::uint64_t>();
    if (number <= std::numeric_limits<unsigned int>::max())
      return static_cast<unsigned int>(number);
  } else if (value.is_number_integer()) {
    auto number = value.get<std::int64_t>();
    if (number >= 0 && number <= std::numeric_limits<unsigned int>::max())
      return static_cast<unsigned int>(number);
  }
  return std::nullopt;
}

unsigned int expectUnsigned(const Json &value, const std::string &at) {
  if (std::optional<unsigned int> number = asUnsigned(value))
    return *number;
  refuse(at, "expected " + std::string(IntegerRange) + ", found " +
                 describe(value));
}

const std::string &expectString(const Json &value, const std::string &at) {
  if (!value.is_string())
    refuse(at, "expected a string, found " + describe(value));
  return value.get_ref<const std::string &>();
}

const std::string &expectNonEmptyString(const Json &value,
                                        const std::string &at) {
  if (!value.is_string() || value.get_ref<const std::string &>().empty())
    refuse(at, "expected a non-empty string, found " + describe(value));
  return value.get_ref<const std::string &>();
}

void expectObject(const Json &value, const std::string &at) {
  if (!value.is_object())
    refuse(at, "expected an object, found " + describe(value));
}

void expectArray(const Json &value, const std::string &at) {
  if (!value.is_array())
    refuse(at, "expected an array, found " + describe(value));
}

void expectOnlyKeys(const Json &object, const std::string &at,
                    std::initializer_list<std::string_view> allowed) {
  for (const auto &item : object.items()) {
    bool known = false;
    for (std::string_view key : allowed)
      known = known || item.key() == key;
    if (!known)
      refuse(member(at, item.key()), "unknown key");
  }
}

const Json *optionalMember(const Json &object, const char *key) {
  auto found = object.find(key);
  return found == object.end() ? nullptr : &*found;
}

const Json &requiredMember(const Json &object, const std::string &at,
                           const char *key, const char *expected) {
  auto found = object.find(key);
  if (found == object.end())
    refuse(member(at, key), std::string("missing; expected ") + expected);
  return *found;
}

NodeLexicon::NodeType expectNodeType(const Json &value, const std::string &at) {
  const std::string &name = expectString(value, at);
  if (std::optional<NodeLexicon::NodeType> type =
          NodeLexicon::nodeTypeNamed(name))
    return *type;
  refuse(at, "unknown node type " + describe(value));
}

class TreeChecker {
public:
  std::shared_ptr<const HardwareSnapshot> check(const Json &document) {
    const std::string root;
    expectObject(document, root);
    expectOnlyKeys(document, root, {"nodes", "systemName", "faults"});
    const Json &nodes =
        requiredMember(document, root, "nodes", "an array of nodes");
    if (const Json *systemName = optionalMember(document, "systemName"))
      Builder.setSystemName(
          expectNonEmptyString(*systemName, member(root, "systemName")));
    if (const Json *faults = optionalMember(document, "faults"))
      checkFaults(*faults, member(root, "faults"));
    checkChildren(nodes, member(root, "nodes"), SnapshotBuilder::NoParent, 1);
    return Builder.finish();
  }

private:
  void checkFaults(const Json &faults, const std::string &at) {
    expectObject(faults, at);
    expectOnlyKeys(faults, at, {"throwOnSelect"});
    if (const Json *types = optionalMember(faults, "throwOnSelect")) {
      const std::string typesAt = member(at, "throwOnSelect");
      expectArray(*types, typesAt);
      for (std::size_t i = 0; i < types->size(); ++i)
        Builder.failSelectionOf(expectNodeType((*types)[i], element(typesAt, i)));
    }
  }

  void checkChildren(const Json &nodes, const std::string &at,
                     NodeIndex parent, unsigned level) {
    expectArray(nodes, at);
    for (std::size_t i = 0; i < nodes.size(); ++i)
      checkNode(nodes[i], element(at, i), parent, level);
  }

  void checkNode(const Json &node, const std::string &at, NodeIndex parent,
                 unsigned level) {
    if (level > MaxTreeDepth)
      refuse(at, "nodes nested deeper than " + std::to_string(MaxTreeDepth) +
                     " levels");
    expectObject(node, at);
    expectOnlyKeys(node, at,
                   {"type", "name", "segment", "status", "description",
                    "properties", "children"});

    NodeDescription description;
    description.type = expectNodeType(
        requiredMember(node, at, "type", "a node type name"),
        member(at, "type"));
    if (const Json *name = optionalMember(node, "name"))
      description.name = expectNonEmptyString(*name, member(at, "name"));
    if (const Json *segment = optionalMember(node, "segment"))
      description.segment =
          expectNonEmptyString(*segment, member(at, "segment"));
    if (const Json *status = optionalMember(node, "status"))
      description.status = expectUnsigned(*status, member(at, "status"));
    if (const Json *text = optionalMember(node, "description"))
      description.description = expectString(*text, member(at, "description"));
    if (const Json *properties = optionalMember(node, "properties"))
      description.properties =
          checkProperties(*properties, member(at, "properties"));

    const Json *children = optionalMember(node, "children");
    NodeIndex placed = Builder.addNode(parent, std::move(description));
    if (children)
      checkChildren(*children, member(at, "children"), placed, level + 1);
  }

  std::vector<NodeProperty> checkProperties(const Json &properties,
                                            const std::string &at) {
    expectObject(properties, at);
    std::vector<NodeProperty> checked;
    checked.reserve(properties.size());
    for (const auto &item : properties.items()) {
      const std::string propertyAt = member(at, item.key());
      std::optional<NodeLexicon::Properties> id =
          NodeLexicon::propertyNamed(item.key());
      if (!id)
        refuse(propertyAt, "unknown property name");
      if (*id == NodeLexicon::PropNodeName)
        refuse(propertyAt, "not allowed in properties; the node's name is "
                           "given by \"name\"");
      const Json &value = item.value();
      if (value.is_string()) {
        checked.push_back({*id, value.get<std::string>()});
      } else if (std::optional<unsigned int> number = asUnsigned(value)) {
        checked.push_back({*id, *number});
      } else {
        refuse(propertyAt, "expected a string or " + std::string(IntegerRange) +
                               ", found " + describe(value));
      }
    }
    return checked;
  }

  SnapshotBuilder Builder;
};

/// nlohmann prefixes its messages with an exception id ("[json.exception.
/// parse_error.101] "); the rest says where and what.
std::string withoutExceptionId(const std::string &message) {
  if (!message.empty() && message.front() == '[') {
    std::size_t close = message.find("] ");
    if (close != std::string::npos)
      return message.substr(close + 2);
  }
  return message;
}

} // namespace

TreeReading readHardwareTree(std::string_view text,
                             const std::string &fileName) {
  Json document;
  try {
    document = Json::parse(text);
  } catch (const Json::exception &error) {
    // Mostly parse errors; also a number too large for any number type,
    // which nlohmann reports as out of range.
    return {nullptr, fileName + ": " + withoutExceptionId(error.what())};
  }
  try {
    return {TreeChecker().check(document), {}};
  } catch (const Refusal &refusal) {
    const std::string place = refusal.at.empty() ? "(root)" : refusal.at;
    return {nullptr, fileName + ": " + place + ": " + refusal.what};
  }
}

} // namespace detail
} // namespace HX
