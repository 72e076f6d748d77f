// What the live source promises about every text it puts into a node: valid
// UTF-8 without control characters, without blanks at either end, and not
// empty (an absent value is no text at all).
#pragma once

#include <cstdint>
#include <string_view>

namespace tvr::fuzz {

/// True when \p text is valid UTF-8 (no overlong forms, no surrogates,
/// nothing above U+10FFFF).
inline bool isValidUtf8(std::string_view text) {
  for (std::size_t i = 0; i < text.size();) {
    const auto lead = static_cast<std::uint8_t>(text[i]);
    std::size_t length = 0;
    std::uint32_t codePoint = 0;
    if (lead < 0x80) length = 1, codePoint = lead;
    else if (lead >= 0xC2 && lead <= 0xDF) length = 2, codePoint = lead & 0x1Fu;
    else if (lead >= 0xE0 && lead <= 0xEF) length = 3, codePoint = lead & 0x0Fu;
    else if (lead >= 0xF0 && lead <= 0xF4) length = 4, codePoint = lead & 0x07u;
    else return false;
    if (text.size() - i < length) return false;
    for (std::size_t k = 1; k < length; ++k) {
      const auto next = static_cast<std::uint8_t>(text[i + k]);
      if ((next & 0xC0) != 0x80) return false;
      codePoint = (codePoint << 6) | (next & 0x3Fu);
    }
    if ((length == 3 && codePoint < 0x800) || (length == 4 && codePoint < 0x10000) ||
        (codePoint >= 0xD800 && codePoint <= 0xDFFF) || codePoint > 0x10FFFF)
      return false;
    i += length;
  }
  return true;
}

inline bool isReadableText(std::string_view text) {
  if (text.empty() || text.front() == ' ' || text.back() == ' ' || !isValidUtf8(text)) return false;
  for (char c : text)
    if (static_cast<std::uint8_t>(c) < 0x20 || c == 0x7F) return false;
  return true;
}

} // namespace tvr::fuzz
