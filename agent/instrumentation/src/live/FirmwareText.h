//===- FirmwareText.h - Firmware strings as an administrator reads them ---===//
//
/// \file
/// Firmware strings (SMBIOS strings, /sys/class/dmi/id attributes) are
/// bytes with no promise of being text, and boards often carry a vendor's
/// filler where a value was never entered. Both are dealt with here, so that
/// every node property holds either readable UTF-8 or nothing.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_FIRMWARETEXT_H
#define HX_SRC_LIVE_FIRMWARETEXT_H

#include <optional>
#include <string>
#include <string_view>

namespace HX {
namespace detail {
namespace live {

/// \p raw as readable UTF-8: tabs become blanks, leading and trailing blanks
/// go, and every byte that is not part of a valid UTF-8 character, and every
/// other control character, becomes U+FFFD. Sets \p hadOddBytes when any
/// byte was replaced.
std::string cleanedText(std::string_view raw, bool &hadOddBytes);

/// True for a cleaned text that stands for "no value": empty; a filler a
/// firmware vendor left in, such as "To Be Filled By O.E.M.", "Default
/// string", "Not Specified" or "System Serial Number" (compared without
/// regard to case); or one filler character repeated ("00000000",
/// "XXXXXXXX", "........"), replaced bytes included.
bool isPlaceholder(std::string_view text);

/// The cleaned text of \p raw, or nullopt when it is a placeholder.
std::optional<std::string> meaningfulText(std::string_view raw,
                                          bool &hadOddBytes);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_FIRMWARETEXT_H
