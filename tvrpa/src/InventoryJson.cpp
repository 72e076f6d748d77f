#include "InventoryOutput.h"

#include "JsonModel.h"

namespace tvrpa {

namespace {

Json classJson(const InventoryClass& c) {
  Json providers = Json::array();
  for (const tvr::broker::ProviderOutcome& o : c.answer.outcomes) providers.push_back(outcomeJson(o));
  return Json{{"className", c.className},
              {"provider", c.provider},
              {"kind", c.association ? "association" : "element"},
              {"enumerated", c.asked},
              {"whyNotEnumerated", c.asked ? Json(nullptr) : Json(c.whyNotAsked)},
              {"instances", c.instances},
              {"withoutTwoReferences", c.unreadable},
              {"status", statusJson(c.answer.rc, c.answer.message)},
              {"done", c.done},
              {"exception", exceptionJson(c.answer.exception)},
              {"providers", providers}};
}

Json endJson(const Inventory& inventory, const InventoryEnd& end) {
  return Json{{"role", inventory.name(end.role)}, {"element", end.element}};
}

} // namespace

void writeInventoryJson(std::ostream& out, const Inventory& inventory) {
  Json classes = Json::array();
  for (const InventoryClass& c : inventory.classes) classes.push_back(classJson(c));
  out << "{\n  \"source\": " << nested(Json(inventory.source), 2)
      << ",\n  \"namespace\": " << nested(Json(inventory.nameSpace), 2) << ",\n  \"classes\": " << nested(classes, 2);
  // Elements and ties are written one by one: the document of a large
  // machine is never built as a whole.
  out << ",\n  \"elements\": [";
  for (std::size_t i = 0; i < inventory.elements.size(); ++i) {
    const InventoryElement& e = inventory.elements[i];
    const Json element{{"id", i},
                       {"className", inventory.name(e.className)},
                       {"path", e.path},
                       {"label", inventory.label(e)},
                       {"enumerated", e.enumerated}};
    out << (i ? ",\n    " : "\n    ") << nested(element, 4);
  }
  out << (inventory.elements.empty() ? "]" : "\n  ]") << ",\n  \"ties\": [";
  for (std::size_t i = 0; i < inventory.ties.size(); ++i) {
    const InventoryTie& t = inventory.ties[i];
    const Json tie{{"className", inventory.name(t.className)},
                   {"path", t.path},
                   {"from", endJson(inventory, t.from)},
                   {"to", endJson(inventory, t.to)}};
    out << (i ? ",\n    " : "\n    ") << nested(tie, 4);
  }
  out << (inventory.ties.empty() ? "]" : "\n  ]") << "\n}\n";
  out.flush();
}

} // namespace tvrpa
