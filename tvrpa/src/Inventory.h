// The machine as one picture: every element the element classes enumerate,
// and every tie the association classes enumerate between them.
//
// Only what the picture needs is kept of each answer (a path text per
// element; a path text and two ends per tie; class and role names once), so
// the inventory of a machine with tens of thousands of nodes stays small
// while each request's own memory is freed when it ends.
#pragma once

#include "tvr/broker/Registration.h"
#include "tvr/broker/Response.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace tvrpa {

struct InventoryElement {
  std::uint32_t className = 0; ///< index of its class name in Inventory::name()
  /// True when its own class was enumerated; false for elements only an
  /// association names (served by another provider, or by none).
  bool enumerated = false;
  std::string path; ///< object path text, as tvrpa prints paths
};

struct InventoryEnd {
  std::uint32_t role = 0;  ///< index of the reference property's name, e.g. "GroupComponent"
  std::size_t element = 0; ///< index into Inventory::elements
};

/// One association instance, drawn as an edge from `from` to `to`.
struct InventoryTie {
  std::uint32_t className = 0;
  std::string path;
  InventoryEnd from;
  InventoryEnd to;
};

/// What the enumeration of one class gave.
struct InventoryClass {
  std::string className;
  std::string provider;
  bool association = false;
  bool asked = false;           ///< false when the class could not be enumerated
  std::string whyNotAsked;      ///< e.g. "no instance provider is registered for it"
  std::size_t instances = 0;    ///< instances returned
  std::size_t unreadable = 0;   ///< association instances without two references
  bool done = false;            ///< whether the provider completed its answer
  tvr::broker::Response answer; ///< status and outcomes only; no items are kept
};

class Inventory {
public:
  std::string source; ///< the hardware source, e.g. "tree file x.json"
  std::string nameSpace;
  std::vector<InventoryClass> classes;
  std::vector<InventoryElement> elements;
  std::vector<InventoryTie> ties;

  /// Adds an instance of an element class (or marks an element already
  /// named by an association as enumerated).
  void addElement(const tvr::broker::ObjectPath& path);
  /// Adds the ties an association instance stands for. Returns false when
  /// it does not refer to two elements.
  bool addAssociation(const tvr::broker::Instance& instance);

  /// A class or role name by its index.
  const std::string& name(std::uint32_t index) const { return names_[index]; }
  /// What tells the element apart from others of its class (see elementLabel).
  std::string label(const InventoryElement& element) const;

private:
  std::size_t elementFor(const tvr::broker::ObjectPath& path, bool enumerated);
  std::uint32_t intern(const std::string& name);

  // Class and role names recur on every element and tie: each is kept once.
  std::vector<std::string> names_;
  std::unordered_map<std::string, std::uint32_t> nameIndex_;
  // Elements by the hash of their identity; a hit is confirmed against the
  // element's path, so only the path text is kept per element.
  std::unordered_multimap<std::size_t, std::size_t> byIdentity_;
};

/// The label of an element: its identifying key values (all keys but the
/// creation class and system names), e.g. "/System/Blade Chassis".
std::string elementLabel(const tvr::broker::ObjectPath& path);

/// The same text for two paths of one element, however their keys are
/// ordered or typed, and whatever host or namespace they carry.
std::string elementIdentity(const tvr::broker::ObjectPath& path);

/// True for GroupComponent and Antecedent: the end an association's edge is
/// drawn from. An association with neither is drawn from its first reference.
bool isContainerRole(const std::string& role);

} // namespace tvrpa
