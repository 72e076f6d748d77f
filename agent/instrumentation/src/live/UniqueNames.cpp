//===- UniqueNames.cpp - Names and segments that siblings do not share ----===//

#include "live/UniqueNames.h"

namespace HX {
namespace detail {
namespace live {

void makeUnique(std::vector<std::optional<std::string>> &texts,
                std::unordered_set<std::string> &taken) {
  // A renamed text must not take the text a later sibling has of its own.
  std::unordered_set<std::string> originals;
  for (const std::optional<std::string> &text : texts)
    if (text)
      originals.insert(*text);
  for (std::optional<std::string> &text : texts) {
    if (!text)
      continue;
    if (taken.insert(*text).second)
      continue;
    for (unsigned number = 2;; ++number) {
      std::string candidate = *text + " (" + std::to_string(number) + ")";
      if (originals.count(candidate) == 0 && taken.insert(candidate).second) {
        *text = std::move(candidate);
        break;
      }
    }
  }
}

} // namespace live
} // namespace detail
} // namespace HX
