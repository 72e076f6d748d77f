// The three pictures of an inventory: a tree for the terminal, JSON for
// scripts, Graphviz DOT for drawing.
#pragma once

#include "Inventory.h"

#include <ostream>

namespace tvrpa {

/// A tree: each element under the element an association draws it from,
/// the association class on the edge. Elements nothing draws an edge to
/// stand at the top, in enumeration order; an element reached again is
/// named with "(see above)". Then one line per class with its provider and
/// what it answered.
void writeInventoryText(std::ostream& out, const Inventory& inventory);

/// {"source", "namespace", "classes": [...], "elements": [...], "ties": [...]}.
void writeInventoryJson(std::ostream& out, const Inventory& inventory);

/// A digraph: one box per element, one labelled edge per tie; elements only
/// an association names are dashed.
void writeInventoryDot(std::ostream& out, const Inventory& inventory);

} // namespace tvrpa
