// Hardware-tree files made up from fuzz input, for driving the providers on
// machines nobody wrote by hand: random node types, names that carry (or
// nearly carry) the marker words the associations look for, properties of
// the right and of the wrong kind, injected selection faults, and now and then
// a file the reader must refuse.
#pragma once

#include <fuzzer/FuzzedDataProvider.h>

#include <string>
#include <vector>

namespace tvr::fuzz {

struct FuzzedMachine {
  /// The hardware-tree file's text.
  std::string treeText;
  /// The name and the path text of every node, for the requests to use as
  /// key values.
  std::vector<std::string> nodeTexts;
};

/// Makes a machine of at most \p maxNodes nodes from \p input.
FuzzedMachine fuzzedMachine(FuzzedDataProvider& input, int maxNodes);

} // namespace tvr::fuzz
