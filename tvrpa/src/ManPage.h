// The manual page tvrpa(1), rendered in roff from the same HelpContent as
// --help. The build runs `tvrpa --man` to write tvrpa.1.
#pragma once

#include <string>

namespace tvrpa {

/// The whole manual page in roff (man macros). `version` goes in the footer.
std::string manPage(const std::string& version);

} // namespace tvrpa
