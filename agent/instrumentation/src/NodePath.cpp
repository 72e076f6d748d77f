//===- NodePath.cpp - The library's internal form of a node path ----------===//

#include "NodePath.h"

namespace HX {
namespace detail {
namespace NodePath {
namespace {

constexpr std::string_view Prefix = "hxpath:";

struct Parts {
  std::string_view positions;
  std::string_view text;
};

bool isDigit(char c) { return c >= '0' && c <= '9'; }

/// Splits an internal path, checking its form strictly so that display text
/// that merely starts like one is not mistaken for one.
std::optional<Parts> split(std::string_view path) {
  if (path.substr(0, Prefix.size()) != Prefix)
    return std::nullopt;
  std::string_view rest = path.substr(Prefix.size());
  std::size_t colon = rest.find(':');
  if (colon == std::string_view::npos)
    return std::nullopt;
  std::string_view positions = rest.substr(0, colon);
  std::string_view text = rest.substr(colon + 1);
  if (positions.empty() || text.size() < 2 || text.front() != '/')
    return std::nullopt;
  bool expectDigit = true;
  for (char c : positions) {
    if (isDigit(c))
      expectDigit = false;
    else if (c == '.' && !expectDigit)
      expectDigit = true;
    else
      return std::nullopt;
  }
  if (expectDigit)
    return std::nullopt;
  return Parts{positions, text};
}

std::string assemble(std::string_view positions, std::string_view text,
                     std::string_view segment) {
  std::string path;
  path.reserve(Prefix.size() + positions.size() + 1 + text.size() + 1 +
               segment.size());
  path.append(Prefix).append(positions).append(1, ':');
  path.append(text).append(1, '/').append(segment);
  return path;
}

} // namespace

std::string forRoot(std::uint32_t position, std::string_view segment) {
  return assemble(std::to_string(position), {}, segment);
}

std::string forChild(std::string_view parent, std::uint32_t position,
                     std::string_view segment) {
  std::optional<Parts> parts = split(parent);
  if (!parts)
    return forRoot(position, segment);
  std::string positions(parts->positions);
  positions.append(1, '.').append(std::to_string(position));
  return assemble(positions, parts->text, segment);
}

std::optional<std::string_view> readableText(std::string_view path) {
  std::optional<Parts> parts = split(path);
  if (!parts)
    return std::nullopt;
  return parts->text;
}

} // namespace NodePath
} // namespace detail
} // namespace HX
