// How a fuzz target reports a finding that is no crash: a property of the
// code under test that an input broke. The target aborts, so that libFuzzer
// keeps the input as a crash artifact, after saying which property broke.
#pragma once

#include <cstdio>
#include <cstdlib>
#include <string>

namespace tvr::fuzz {

/// Aborts with \p property in the message unless \p holds.
inline void require(bool holds, const std::string& property) {
  if (holds) return;
  std::fprintf(stderr, "==fuzz== property broken: %s\n", property.c_str());
  std::abort();
}

} // namespace tvr::fuzz
