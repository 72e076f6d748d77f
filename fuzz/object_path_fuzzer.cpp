// Fuzz target: the text form of CIM object paths, which tvrpa reads from its
// command line and prints every answer in. Any text is read, or refused with
// a message and a column inside the text (one past its end for text that
// stops too early). A path that is read prints as text that reads back to the
// same path, as the printed answers of tvrpa promise.
#include "FuzzCheck.h"

#include "tvr/broker/PathText.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace tvr::broker;
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  PathParseError error;
  const std::optional<ObjectPath> path = parseObjectPath(text, &error);
  if (!path) {
    tvr::fuzz::require(!error.message.empty(), "a refusal says what is wrong");
    tvr::fuzz::require(error.column >= 1 && error.column <= text.size() + 1, "a refusal points into the text");
    return 0;
  }
  const std::string printed = formatObjectPath(*path, PathFormat{true, true});
  PathParseError again;
  const std::optional<ObjectPath> reread = parseObjectPath(printed, &again);
  tvr::fuzz::require(reread.has_value(), "a printed path reads back: " + printed + " fails at column " +
                                              std::to_string(again.column) + ": " + again.message);
  tvr::fuzz::require(*reread == *path, "a printed path reads back to the same path: " + printed);
  return 0;
}
