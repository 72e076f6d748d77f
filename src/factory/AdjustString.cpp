// A date text as a CIM date-time string.
#include "PhysicalAssetProvider.h"

#include <HX/ProviderUtilities.h>

namespace HX::PhysicalAssetProvider {

// Takes the first fourteen digits of the text, wherever they stand among
// other characters, as yyyymmddhhmmss, and adds fixed microseconds and UTC
// offset. A text with fewer digits gives an empty string.
std::string adjustString(std::string text) {
  constexpr int kDigits = 14;
  std::string result;
  int count = 0;
  for (std::size_t index = 0;; ++index) {
    if (index >= text.size()) {
      if (count < kDigits) return std::string();
      break;
    }
    if (count == kDigits) break;
    const char c = text[index];
    if (c >= '0' && c <= '9') {
      result += c;
      ++count;
    }
  }
  result += ".000000+000";
  return HX::stripSpaces(result);
}

} // namespace HX::PhysicalAssetProvider
