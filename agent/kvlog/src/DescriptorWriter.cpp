#include "DescriptorWriter.h"

#include <cerrno>
#include <unistd.h>

namespace KVLog::detail {

int writeWhole(int fd, std::string_view data) {
  while (!data.empty()) {
    const ssize_t written = ::write(fd, data.data(), data.size());
    if (written < 0) {
      if (errno == EINTR)
        continue;
      return errno;
    }
    if (written == 0)
      return EIO; // Not expected for files and pipes; do not spin.
    data.remove_prefix(static_cast<std::size_t>(written));
  }
  return 0;
}

} // namespace KVLog::detail
