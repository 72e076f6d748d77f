#include "Output.h"

#include "tvr/broker/PathText.h"

#include <algorithm>

namespace tvrpa {

using tvr::broker::ResultItem;

void writeText(std::ostream& out, const tvr::broker::Response& response) {
  bool first = true;
  for (const ResultItem& item : response.items) {
    switch (item.kind) {
    case ResultItem::Kind::ObjectPath:
      out << tvr::broker::formatObjectPath(item.path) << "\n";
      break;
    case ResultItem::Kind::NullObjectPath:
      out << "(null object path)\n";
      break;
    case ResultItem::Kind::NullInstance:
      if (!first) out << "\n";
      out << "(null instance)\n";
      break;
    case ResultItem::Kind::Data:
      out << tvr::broker::formatValue(item.data) << "\n";
      break;
    case ResultItem::Kind::Instance: {
      if (!first) out << "\n";
      out << tvr::broker::formatObjectPath(item.path) << "\n";
      std::size_t width = 0;
      for (const auto& p : item.instance.properties) width = std::max(width, p.name.size());
      for (const auto& p : item.instance.properties)
        out << "    " << p.name << std::string(width - p.name.size(), ' ') << " = "
            << tvr::broker::formatValue(p.value) << "\n";
      break;
    }
    }
    first = false;
  }
}

} // namespace tvrpa
