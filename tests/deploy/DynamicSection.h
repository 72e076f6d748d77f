// The dynamic section of an ELF file as `readelf -d` shows it: what a
// system administrator checks, and what the dynamic loader goes by.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace tvr::test {

struct DynamicSection {
  std::optional<std::string> soname;
  std::optional<std::string> runpath;
  std::optional<std::string> rpath;
  std::vector<std::string> needed; ///< in file order
};

/// Runs `readelf -d` on `path`. Throws std::runtime_error when readelf fails.
DynamicSection readDynamicSection(const std::string& path);

} // namespace tvr::test
