//===- FileSnapshot.cpp - A file's identity and contents, read together ---===//

#include "FileSnapshot.h"

#include <cerrno>
#include <system_error>

#include <fcntl.h>
#include <unistd.h>

namespace HX {
namespace detail {
namespace {

bool sameTime(const timespec &a, const timespec &b) {
  return a.tv_sec == b.tv_sec && a.tv_nsec == b.tv_nsec;
}

std::string errorText(int error) {
  return std::system_category().message(error);
}

/// Closes the descriptor on every way out of readFile.
class Descriptor {
public:
  explicit Descriptor(int fd) : Fd(fd) {}
  Descriptor(const Descriptor &) = delete;
  Descriptor &operator=(const Descriptor &) = delete;
  ~Descriptor() {
    if (Fd >= 0)
      ::close(Fd);
  }
  int get() const { return Fd; }

private:
  int Fd;
};

} // namespace

FileIdentity FileIdentity::of(const struct stat &status) {
  FileIdentity identity;
  identity.device = status.st_dev;
  identity.inode = status.st_ino;
  identity.size = status.st_size;
  identity.modified = status.st_mtim;
  identity.changed = status.st_ctim;
  return identity;
}

bool FileIdentity::operator==(const FileIdentity &other) const {
  return device == other.device && inode == other.inode &&
         size == other.size && sameTime(modified, other.modified) &&
         sameTime(changed, other.changed);
}

FileStatus statFile(const std::string &path) {
  struct stat status {};
  if (::stat(path.c_str(), &status) != 0)
    return {std::nullopt, errorText(errno)};
  return {FileIdentity::of(status), {}};
}

FileContents readFile(const std::string &path) {
  FileContents result;
  Descriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
  if (file.get() < 0) {
    result.error = errorText(errno);
    return result;
  }
  struct stat status {};
  if (::fstat(file.get(), &status) != 0) {
    result.error = errorText(errno);
    return result;
  }
  if (status.st_size > 0)
    result.contents.reserve(static_cast<std::size_t>(status.st_size));
  char buffer[65536];
  for (;;) {
    ssize_t got = ::read(file.get(), buffer, sizeof buffer);
    if (got == 0)
      break;
    if (got < 0) {
      if (errno == EINTR)
        continue;
      result.error = errorText(errno);
      result.contents.clear();
      return result;
    }
    result.contents.append(buffer, static_cast<std::size_t>(got));
  }
  result.identity = FileIdentity::of(status);
  return result;
}

} // namespace detail
} // namespace HX
