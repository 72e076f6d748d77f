#include "InventoryOutput.h"

#include <algorithm>

namespace tvrpa {

namespace {

std::string plural(std::size_t n, const char* word) { return std::to_string(n) + " " + word + (n == 1 ? "" : "s"); }

// What the enumeration of a class gave, in a few words.
std::string classResult(const InventoryClass& c) {
  if (!c.asked) return "not enumerated: " + c.whyNotAsked;
  std::string out;
  for (const tvr::broker::ProviderOutcome& o : c.answer.outcomes) {
    if (o.exception)
      return "exception " + o.exception->type + (o.exception->what.empty() ? "" : ": " + o.exception->what);
    if (o.rc != CMPI_RC_OK) return tvr::broker::statusName(o.rc) + (o.message ? ": " + *o.message : "");
  }
  if (c.answer.outcomes.empty() && c.answer.rc != CMPI_RC_OK)
    return tvr::broker::statusName(c.answer.rc) + (c.answer.message ? ": " + *c.answer.message : "");
  out = plural(c.instances, "instance");
  if (c.unreadable) out += ", " + std::to_string(c.unreadable) + " without two references";
  if (!c.done) out += ", answer not completed";
  return out;
}

class TreePrinter {
public:
  TreePrinter(std::ostream& out, const Inventory& inventory)
      : out_(out), inv_(inventory), children_(inventory.elements.size()), hasParent_(inventory.elements.size()),
        printed_(inventory.elements.size()) {
    for (std::size_t t = 0; t < inv_.ties.size(); ++t) {
      children_[inv_.ties[t].from.element].push_back(t);
      hasParent_[inv_.ties[t].to.element] = true;
    }
  }

  void print() {
    // Tops first; then whatever only cycles reach, from its first element.
    for (std::size_t e = 0; e < inv_.elements.size(); ++e)
      if (!hasParent_[e]) tree(e);
    for (std::size_t e = 0; e < inv_.elements.size(); ++e)
      if (!printed_[e]) tree(e);
  }

private:
  std::string name(std::size_t element) const {
    const InventoryElement& e = inv_.elements[element];
    const std::string label = inv_.label(e);
    return label.empty() ? inv_.name(e.className) : inv_.name(e.className) + " \"" + label + "\"";
  }

  struct Frame {
    std::size_t element;
    std::string prefix;
    std::size_t next;
  };

  // Depth first without recursion: an association graph may be deep.
  void tree(std::size_t root) {
    out_ << name(root) << "\n";
    printed_[root] = true;
    std::vector<Frame> stack{{root, "", 0}};
    while (!stack.empty()) {
      Frame& top = stack.back();
      const std::vector<std::size_t>& edges = children_[top.element];
      if (top.next == edges.size()) {
        stack.pop_back();
        continue;
      }
      const InventoryTie& tie = inv_.ties[edges[top.next++]];
      const bool last = top.next == edges.size();
      const std::string prefix = top.prefix;
      const std::size_t child = tie.to.element;
      out_ << prefix << (last ? "└─ " : "├─ ") << inv_.name(tie.className) << " → " << name(child);
      if (printed_[child]) {
        out_ << " (see above)\n";
        continue;
      }
      out_ << "\n";
      printed_[child] = true;
      stack.push_back(Frame{child, prefix + (last ? "   " : "│  "), 0});
    }
  }

  std::ostream& out_;
  const Inventory& inv_;
  std::vector<std::vector<std::size_t>> children_;
  std::vector<bool> hasParent_;
  std::vector<bool> printed_;
};

void classTable(std::ostream& out, const Inventory& inventory) {
  std::size_t nameWidth = 0;
  std::size_t providerWidth = 0;
  for (const InventoryClass& c : inventory.classes) {
    nameWidth = std::max(nameWidth, c.className.size());
    providerWidth = std::max(providerWidth, c.provider.size());
  }
  out << "\nClasses:\n";
  for (const InventoryClass& c : inventory.classes) {
    const char* kind = c.association ? "association" : "element    ";
    out << "  " << c.className << std::string(nameWidth - c.className.size() + 2, ' ') << kind << "  " << c.provider
        << std::string(providerWidth - c.provider.size() + 2, ' ') << classResult(c) << "\n";
  }
}

} // namespace

void writeInventoryText(std::ostream& out, const Inventory& inventory) {
  out << "Inventory of " << inventory.source << ", namespace " << inventory.nameSpace << ": "
      << plural(inventory.elements.size(), "element") << ", " << plural(inventory.ties.size(), "tie") << "\n\n";
  if (inventory.elements.empty()) out << "(no elements)\n";
  TreePrinter(out, inventory).print();
  classTable(out, inventory);
  out.flush();
}

} // namespace tvrpa
