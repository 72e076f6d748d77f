#include "Inventory.h"

#include "tvr/broker/PathText.h"

#include <strings.h>

#include <algorithm>
#include <cctype>
#include <functional>
#include <optional>

namespace tvrpa {

namespace {

using tvr::broker::Binding;
using tvr::broker::ObjectPath;

bool sameName(const std::string& a, const char* b) { return strcasecmp(a.c_str(), b) == 0; }

std::string lower(std::string text) {
  for (char& c : text) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  return text;
}

// Keys every element of a class or system shares, which tell nothing apart.
bool isContextKey(const std::string& name) {
  return sameName(name, "CreationClassName") || sameName(name, "SystemCreationClassName") ||
         sameName(name, "SystemName");
}

// The value as it reads in a label: text bare, everything else as in a path.
std::string valueText(const tvr::broker::Value& value) {
  if (value.isText() && !value.null && !value.isArray()) return value.text;
  return tvr::broker::formatValue(value);
}

// The references of an association instance, in property order; a provider
// that sets none as properties still has them as keys.
std::vector<const Binding*> referencesOf(const tvr::broker::Instance& instance) {
  std::vector<const Binding*> refs;
  for (const Binding& p : instance.properties)
    if (p.value.type == CMPI_ref && !p.value.null && p.value.ref) refs.push_back(&p);
  if (refs.size() >= 2) return refs;
  refs.clear();
  for (const Binding& k : instance.path.keys)
    if (k.value.type == CMPI_ref && !k.value.null && k.value.ref) refs.push_back(&k);
  return refs;
}

} // namespace

bool isContainerRole(const std::string& role) {
  return sameName(role, "GroupComponent") || sameName(role, "Antecedent");
}

std::string elementLabel(const ObjectPath& path) {
  std::vector<const Binding*> identifying;
  for (const Binding& k : path.keys)
    if (!isContextKey(k.name)) identifying.push_back(&k);
  if (identifying.empty())
    for (const Binding& k : path.keys) identifying.push_back(&k);
  if (identifying.size() == 1) return valueText(identifying.front()->value);
  std::string out;
  for (const Binding* k : identifying)
    out += (out.empty() ? "" : ",") + k->name + "=" + tvr::broker::formatValue(k->value);
  return out;
}

std::string elementIdentity(const ObjectPath& path) {
  std::vector<std::string> keys;
  for (const Binding& k : path.keys) {
    const tvr::broker::Value& v = k.value;
    // Text and numbers compare by what they say, not by their CMPI type.
    std::string value = v.type == CMPI_ref && v.ref ? elementIdentity(*v.ref) : valueText(v);
    keys.push_back(lower(k.name) + "=" + value);
  }
  std::sort(keys.begin(), keys.end());
  std::string out = lower(path.className);
  for (const std::string& k : keys) {
    out += '\n';
    out += k;
  }
  return out;
}

std::uint32_t Inventory::intern(const std::string& name) {
  const auto found = nameIndex_.find(name);
  if (found != nameIndex_.end()) return found->second;
  names_.push_back(name);
  const auto index = static_cast<std::uint32_t>(names_.size() - 1);
  nameIndex_.emplace(name, index);
  return index;
}

std::string Inventory::label(const InventoryElement& element) const {
  const std::optional<ObjectPath> path = tvr::broker::parseObjectPath(element.path);
  return path ? elementLabel(*path) : std::string();
}

std::size_t Inventory::elementFor(const ObjectPath& path, bool enumerated) {
  const std::string identity = elementIdentity(path);
  const std::size_t hash = std::hash<std::string>{}(identity);
  const auto [first, last] = byIdentity_.equal_range(hash);
  for (auto it = first; it != last; ++it) {
    InventoryElement& known = elements[it->second];
    const std::optional<ObjectPath> knownPath = tvr::broker::parseObjectPath(known.path);
    if (!knownPath || elementIdentity(*knownPath) != identity) continue;
    known.enumerated = known.enumerated || enumerated;
    return it->second;
  }
  elements.push_back(InventoryElement{intern(path.className), enumerated, tvr::broker::formatObjectPath(path)});
  byIdentity_.emplace(hash, elements.size() - 1);
  return elements.size() - 1;
}

void Inventory::addElement(const ObjectPath& path) { elementFor(path, true); }

bool Inventory::addAssociation(const tvr::broker::Instance& instance) {
  const std::vector<const Binding*> refs = referencesOf(instance);
  if (refs.size() < 2) return false;
  std::size_t container = 0;
  for (std::size_t i = 0; i < refs.size(); ++i)
    if (isContainerRole(refs[i]->name)) {
      container = i;
      break;
    }
  const InventoryEnd from{intern(refs[container]->name), elementFor(*refs[container]->value.ref, false)};
  const std::uint32_t className = intern(instance.path.className);
  const std::string path = tvr::broker::formatObjectPath(instance.path);
  for (std::size_t i = 0; i < refs.size(); ++i) {
    if (i == container) continue;
    ties.push_back(InventoryTie{className, path, from,
                                InventoryEnd{intern(refs[i]->name), elementFor(*refs[i]->value.ref, false)}});
  }
  return true;
}

} // namespace tvrpa
