// Small text helpers of the factory module.
#include "PhysicalAssetProvider.h"

#include <cctype>
#include <cstring>

namespace HX::PhysicalAssetProvider {

std::string lcase(char* text, std::string& out) {
  // A missing text reads as an empty one, so it equals no class name.
  out = text ? text : "";
  for (std::size_t index = 0; index < std::strlen(out.c_str()); ++index) {
    const unsigned char c = static_cast<unsigned char>(out[index]);
    if (std::isupper(c)) out[index] = static_cast<char>(c + 32);
  }
  return out;
}

} // namespace HX::PhysicalAssetProvider
