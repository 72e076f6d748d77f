//===- HX/InstrumentationError.h - Failure to read the hardware -----------===//

#ifndef HX_INSTRUMENTATIONERROR_H
#define HX_INSTRUMENTATIONERROR_H

#include <stdexcept>
#include <string>

namespace HX {

/// Thrown by Instrumentation::selectNode when the hardware cannot be read:
/// the hardware-tree file is refused (what() then names the file, the place
/// in it and what is wrong), or the tree asks for selecting that node type
/// to fail.
class InstrumentationError : public std::runtime_error {
public:
  explicit InstrumentationError(const std::string &message)
      : std::runtime_error(message) {}
};

} // namespace HX

#endif // HX_INSTRUMENTATIONERROR_H
