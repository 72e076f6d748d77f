//===- FirmwareText.cpp - Firmware strings as an administrator reads them -===//

#include "live/FirmwareText.h"

#include <cstdint>

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::string_view Replacement = "\xEF\xBF\xBD";

/// The length of the valid UTF-8 character at the start of \p text, or 0.
std::size_t validCharacterLength(std::string_view text) {
  const auto byte = [&](std::size_t i) {
    return static_cast<std::uint8_t>(text[i]);
  };
  const std::uint8_t lead = byte(0);
  std::size_t length;
  std::uint32_t codePoint;
  if (lead < 0x80)
    return 1;
  if (lead >= 0xC2 && lead <= 0xDF) {
    length = 2;
    codePoint = lead & 0x1Fu;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    length = 3;
    codePoint = lead & 0x0Fu;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    length = 4;
    codePoint = lead & 0x07u;
  } else {
    return 0;
  }
  if (text.size() < length)
    return 0;
  for (std::size_t i = 1; i < length; ++i) {
    if ((byte(i) & 0xC0) != 0x80)
      return 0;
    codePoint = (codePoint << 6) | (byte(i) & 0x3Fu);
  }
  const bool overlong = (length == 3 && codePoint < 0x800) ||
                        (length == 4 && codePoint < 0x10000);
  const bool surrogate = codePoint >= 0xD800 && codePoint <= 0xDFFF;
  if (overlong || surrogate || codePoint > 0x10FFFF)
    return 0;
  return length;
}

std::string_view trimmedBlanks(std::string_view text) {
  while (!text.empty() && text.front() == ' ')
    text.remove_prefix(1);
  while (!text.empty() && text.back() == ' ')
    text.remove_suffix(1);
  return text;
}

bool equalIgnoringCase(std::string_view a, std::string_view b) {
  if (a.size() != b.size())
    return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    char x = a[i], y = b[i];
    if (x >= 'A' && x <= 'Z')
      x = static_cast<char>(x - 'A' + 'a');
    if (y >= 'A' && y <= 'Z')
      y = static_cast<char>(y - 'A' + 'a');
    if (x != y)
      return false;
  }
  return true;
}

/// Fillers seen in the field, in lower case.
// clang-format off
constexpr std::string_view Fillers[] = {
    "to be filled by o.e.m.",  "to be filled by o.e.m",
    "to be filled by oem",     "default string",
    "default",                 "not specified",
    "not applicable",          "not available",
    "not present",             "not provided",
    "none",                    "n/a",
    "na",                      "unknown",
    "undefined",               "invalid",
    "empty",                   "oem",
    "o.e.m.",                  "system serial number",
    "system product name",     "system manufacturer",
    "system version",          "system name",
    "system sku",              "system sku number",
    "chassis serial number",   "chassis manufacturer",
    "chassis manufacture",     "chassis version",
    "chassis asset tag",       "asset tag",
    "no asset tag",            "asset-1234567890",
    "base board serial number", "sku",
    "sku number",              "default sku",
    "type1productconfigid",    "type1family",
    "serial number",           "product name",
    "0123456789",              "1234567890",
    "123456789",               "manufacturer",
};
// clang-format on

/// Characters that firmware repeats to fill a field it has no value for.
bool isFillerCharacter(char c) {
  switch (c) {
  case '0':
  case 'x':
  case 'X':
  case 'f':
  case 'F':
  case '.':
  case '-':
  case '*':
  case '#':
  case '?':
  case '_':
    return true;
  default:
    return false;
  }
}

bool isRepeatedFiller(std::string_view text) {
  if (isFillerCharacter(text.front()))
    return text.find_first_not_of(text.front()) == std::string_view::npos;
  while (text.substr(0, Replacement.size()) == Replacement)
    text.remove_prefix(Replacement.size());
  return text.empty();
}

} // namespace

std::string cleanedText(std::string_view raw, bool &hadOddBytes) {
  std::string text;
  text.reserve(raw.size());
  while (!raw.empty()) {
    const char c = raw.front();
    if (c == '\t') {
      text += ' ';
      raw.remove_prefix(1);
      continue;
    }
    const std::size_t length = validCharacterLength(raw);
    const bool control =
        length == 1 && (static_cast<unsigned char>(c) < 0x20 || c == 0x7F);
    if (length == 0 || control) {
      text += Replacement;
      hadOddBytes = true;
      raw.remove_prefix(1);
      continue;
    }
    text.append(raw.substr(0, length));
    raw.remove_prefix(length);
  }
  return std::string(trimmedBlanks(text));
}

bool isPlaceholder(std::string_view text) {
  if (text.empty())
    return true;
  for (std::string_view filler : Fillers)
    if (equalIgnoringCase(text, filler))
      return true;
  return isRepeatedFiller(text);
}

std::optional<std::string> meaningfulText(std::string_view raw,
                                          bool &hadOddBytes) {
  std::string text = cleanedText(raw, hadOddBytes);
  if (isPlaceholder(text))
    return std::nullopt;
  return text;
}

} // namespace live
} // namespace detail
} // namespace HX
