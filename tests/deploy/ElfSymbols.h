// The functions a shared object exports: what its dynamic symbol table
// defines, read from the file itself rather than through the loader, so that
// a test can list every entry point, not only look up the ones it knows.
#pragma once

#include <string>
#include <vector>

namespace tvr::test {

/// The names of the functions the 64-bit ELF shared object at `path` defines
/// and exports (global or weak binding, default or protected visibility), in
/// symbol-table order, without version suffixes. Throws std::runtime_error
/// when the file cannot be read as such an object.
std::vector<std::string> exportedFunctions(const std::string& path);

} // namespace tvr::test
