//===- StripSpaces.cpp - Removing blanks from text ------------------------===//

#include "HX/ProviderUtilities.h"

#include <algorithm>

namespace HX {

std::string stripSpaces(std::string text) {
  text.erase(std::remove_if(text.begin(), text.end(),
                            [](char c) { return c == ' ' || c == '\t'; }),
             text.end());
  return text;
}

} // namespace HX
