// The connector view: a forward walk over the connector nodes of the machine.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Walks the ConnectorNode nodes and reads what a TVRHX_Connector instance
/// publishes.
///
/// The walk may be narrowed by name filters (see ViewFilter.h). Copying a
/// view copies its filters and its cursor, standing on the same node, so a
/// copy handed to makeConnectorInstance names the node the walk stands on
/// while the original goes on.
class Connector {
public:
  /// What a filter compares. Only FilterByName looks at a node; every other
  /// value of the type is accepted and kept, and lets every node pass.
  enum FilterType : int {
    /// The node name (PropNodeName) must equal the filter's value exactly;
    /// a node without a name passes.
    FilterByName = 0,
  };

  /// One filter of the walk, kept in the order it was set.
  struct Filter {
    FilterType type;
    std::string value;
  };

  /// Selects the connector nodes. A cursor that cannot select leaves the
  /// view empty; nothing is thrown.
  Connector();
  ~Connector();
  Connector(const Connector&) = default;
  Connector& operator=(const Connector&) = default;

  /// True while the view stands on a node.
  explicit operator bool() const;
  /// Steps to the next node; with filters set, to the next node that passes
  /// them, or to the end.
  void operator++();
  /// Adds a filter to those already set and moves the view to the first
  /// passing node at or after where it stands. Nodes already passed are not
  /// seen again.
  void setFilter(FilterType type, const std::string& value);

  /// The node name. False, with `text` untouched, for a node without one.
  bool getElementName(std::string& text);
  /// The node name, the key of the instance; as getElementName.
  bool getTag(std::string& text);
  /// 1 for every connector, whatever the node holds; always true.
  bool getConnectorLayout(unsigned short& value);
  /// "TVRHX_Connector"; always true.
  bool getCreationClassName(std::string& text);

  /// Set by the first setFilter, never cleared.
  bool filterActive;
  /// The filters in the order they were set.
  std::vector<Filter> filters;
  HX::Instrumentation cursor;
};

} // namespace HX::PhysicalAssetProvider
