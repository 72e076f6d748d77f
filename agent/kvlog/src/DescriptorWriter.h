// Writing a whole line to a file descriptor.

#ifndef KVLOG_SRC_DESCRIPTORWRITER_H
#define KVLOG_SRC_DESCRIPTORWRITER_H

#include <string_view>

namespace KVLog::detail {

/// Writes all of \p data to \p fd, with one write(2) unless the kernel takes
/// less (then the rest follows), and retrying on EINTR.
/// \returns 0, or the errno of the write that failed.
int writeWhole(int fd, std::string_view data);

} // namespace KVLog::detail

#endif // KVLOG_SRC_DESCRIPTORWRITER_H
