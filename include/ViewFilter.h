// The name filter of the walking views (Slot, Connector, NetworkCard,
// DiskController, SASPortController).
//
// A view keeps `filterActive`, set by its first setFilter and never cleared,
// and `filters`, in the order set. Each filter is a pair of `type`, the
// view's own FilterType, and `value`. Only FilterByName (0) has an effect:
// it lets a node pass when the node's name equals `value` exactly, or when
// the node has no name. Filters of every other type let every node pass.
// A node must pass all filters. These templates are the one definition of
// that behaviour; each view calls them with its own Filter type.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Whether the node the cursor stands on passes every filter.
template <class Filter>
bool nodePassesFilters(const HX::Instrumentation& cursor, const std::vector<Filter>& filters) {
  std::string name;
  for (const Filter& filter : filters) {
    if (static_cast<int>(filter.type) != 0) continue; // only FilterByName looks at a node
    if (!cursor.getProperty(HX::NodeLexicon::PropNodeName, name)) continue;
    if (name != filter.value) return false;
  }
  return true;
}

/// The view's operator++: the next node; with filters active, the next node
/// that passes them, or the end.
template <class Filter>
void stepToNextPassingNode(HX::Instrumentation& cursor, bool filterActive, const std::vector<Filter>& filters) {
  for (;;) {
    ++cursor;
    if (!filterActive) return;
    if (!cursor) return;
    if (nodePassesFilters(cursor, filters)) return;
  }
}

/// The view's setFilter: records the filter and moves the cursor to the
/// first passing node at or after where it stands.
template <class Filter>
void addFilter(HX::Instrumentation& cursor, bool& filterActive, std::vector<Filter>& filters, Filter filter) {
  filterActive = true;
  filters.push_back(std::move(filter));
  while (cursor) {
    if (nodePassesFilters(cursor, filters)) return;
    ++cursor;
  }
}

} // namespace HX::PhysicalAssetProvider
