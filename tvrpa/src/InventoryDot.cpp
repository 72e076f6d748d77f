#include "InventoryOutput.h"

namespace tvrpa {

namespace {

// A DOT string: quotes and backslashes escaped, so that data never ends the
// string or starts an escape of its own.
std::string quoted(const std::string& text) {
  std::string out = "\"";
  for (char c : text) {
    if (c == '"' || c == '\\') out += '\\';
    if (c == '\n') {
      out += "\\n";
      continue;
    }
    out += c;
  }
  return out + "\"";
}

// A two-line node label: class, then what tells the element apart.
std::string label(const Inventory& inventory, const InventoryElement& e) {
  std::string text = quoted(inventory.name(e.className));
  const std::string second = inventory.label(e);
  if (second.empty()) return text;
  text.pop_back();
  return text + "\\n" + quoted(second).substr(1);
}

} // namespace

void writeInventoryDot(std::ostream& out, const Inventory& inventory) {
  out << "digraph inventory {\n"
      << "  graph [rankdir=LR, labelloc=t, label=" << quoted(inventory.source + ", " + inventory.nameSpace) << "];\n"
      << "  node [shape=box, fontname=\"Helvetica\"];\n"
      << "  edge [fontname=\"Helvetica\", fontsize=10];\n";
  for (std::size_t i = 0; i < inventory.elements.size(); ++i) {
    const InventoryElement& e = inventory.elements[i];
    out << "  e" << i << " [label=" << label(inventory, e) << ", tooltip=" << quoted(e.path);
    if (!e.enumerated) out << ", style=dashed";
    out << "];\n";
  }
  for (const InventoryTie& t : inventory.ties)
    out << "  e" << t.from.element << " -> e" << t.to.element << " [label=" << quoted(inventory.name(t.className))
        << ", tooltip=" << quoted(inventory.name(t.from.role) + " -> " + inventory.name(t.to.role)) << "];\n";
  out << "}\n";
  out.flush();
}

} // namespace tvrpa
