//===- SystemFiles.cpp - Reading sysfs and firmware files below a root ----===//

#include "live/SystemFiles.h"

#include <algorithm>
#include <cerrno>
#include <memory>
#include <system_error>

#include <dirent.h>
#include <fcntl.h>
#include <unistd.h>

namespace HX {
namespace detail {
namespace live {

FileSystemRoot::FileSystemRoot(const std::string &root) : Prefix(root) {
  while (!Prefix.empty() && Prefix.back() == '/')
    Prefix.pop_back();
}

std::string FileSystemRoot::path(std::string_view absolute) const {
  std::string joined = Prefix;
  joined.append(absolute);
  return joined;
}

namespace {

/// Closes a descriptor on every way out.
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

FileText readFileText(const std::string &path, std::size_t limit) {
  FileText result;
  Descriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
  if (file.get() < 0) {
    result.error = errno;
    return result;
  }
  // A read that returns less than asked has reached the end: sysfs
  // attributes come whole in one read, regular files short only at their
  // end. Not asking again saves a system call per attribute.
  char buffer[4096];
  for (;;) {
    const std::size_t room = limit - result.contents.size();
    if (room == 0) {
      char probe;
      result.cut = ::read(file.get(), &probe, 1) > 0;
      break;
    }
    const std::size_t wanted = std::min(room, sizeof buffer);
    ssize_t got = ::read(file.get(), buffer, wanted);
    if (got < 0) {
      if (errno == EINTR)
        continue;
      result.error = errno;
      result.contents.clear();
      return result;
    }
    result.contents.append(buffer, static_cast<std::size_t>(got));
    if (static_cast<std::size_t>(got) < wanted)
      break;
  }
  return result;
}

LinkText readLinkText(const std::string &path) {
  LinkText result;
  char buffer[4096];
  ssize_t length = ::readlink(path.c_str(), buffer, sizeof buffer);
  if (length < 0) {
    result.error = errno;
    return result;
  }
  if (static_cast<std::size_t>(length) == sizeof buffer) {
    result.error = ENAMETOOLONG;
    return result;
  }
  result.target.assign(buffer, static_cast<std::size_t>(length));
  return result;
}

DirectoryListing listDirectory(const std::string &path) {
  DirectoryListing listing;
  Descriptor directory(
      ::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (directory.get() < 0) {
    listing.error = errno;
    return listing;
  }
  // getdents64 rather than opendir: no stat and no allocation of a DIR, a
  // third of the cost of listing a small sysfs directory.
  constexpr std::size_t BufferSize = 32768;
  std::unique_ptr<char[]> buffer(new char[BufferSize]);
  for (;;) {
    ssize_t got = ::getdents64(directory.get(), buffer.get(), BufferSize);
    if (got == 0)
      break;
    if (got < 0) {
      if (errno == EINTR)
        continue;
      listing.error = errno;
      listing.entries.clear();
      break;
    }
    for (ssize_t position = 0; position < got;) {
      const auto *entry =
          reinterpret_cast<const struct dirent64 *>(buffer.get() + position);
      std::string_view name = entry->d_name;
      if (name != "." && name != "..")
        listing.entries.push_back({std::string(name), entry->d_ino});
      position += entry->d_reclen;
    }
  }
  return listing;
}

RandomAccessFile::RandomAccessFile(const std::string &path)
    : Fd(::open(path.c_str(), O_RDONLY | O_CLOEXEC)) {}

RandomAccessFile::~RandomAccessFile() {
  if (Fd >= 0)
    ::close(Fd);
}

std::string RandomAccessFile::readAt(std::uint64_t offset,
                                     std::size_t size) const {
  std::string bytes(size, '\0');
  std::size_t done = 0;
  while (Fd >= 0 && done < size) {
    ssize_t got = ::pread(Fd, bytes.data() + done, size - done,
                          static_cast<off_t>(offset + done));
    if (got < 0 && errno == EINTR)
      continue;
    if (got <= 0)
      break;
    done += static_cast<std::size_t>(got);
  }
  bytes.resize(done);
  return bytes;
}

bool isGone(int error) {
  return error == ENOENT || error == ENODEV || error == ENXIO;
}

std::string errorText(int error) {
  return std::system_category().message(error);
}

std::string_view attributeValue(std::string_view contents) {
  while (!contents.empty() &&
         (contents.back() == '\n' || contents.back() == '\0'))
    contents.remove_suffix(1);
  return contents;
}

std::optional<std::uint32_t> parseHex(std::string_view text,
                                      std::uint32_t maximum) {
  if (text.size() > 2 && text[0] == '0' && (text[1] == 'x' || text[1] == 'X'))
    text.remove_prefix(2);
  if (text.empty() || text.size() > 8)
    return std::nullopt;
  std::uint64_t value = 0;
  for (char c : text) {
    unsigned digit;
    if (c >= '0' && c <= '9')
      digit = static_cast<unsigned>(c - '0');
    else if (c >= 'a' && c <= 'f')
      digit = static_cast<unsigned>(c - 'a' + 10);
    else if (c >= 'A' && c <= 'F')
      digit = static_cast<unsigned>(c - 'A' + 10);
    else
      return std::nullopt;
    value = value * 16 + digit;
  }
  if (value > maximum)
    return std::nullopt;
  return static_cast<std::uint32_t>(value);
}

std::optional<std::uint32_t> parseDecimal(std::string_view text) {
  if (text.empty() || text.size() > 10)
    return std::nullopt;
  std::uint64_t value = 0;
  for (char c : text) {
    if (c < '0' || c > '9')
      return std::nullopt;
    value = value * 10 + static_cast<unsigned>(c - '0');
  }
  if (value > UINT32_MAX)
    return std::nullopt;
  return static_cast<std::uint32_t>(value);
}

} // namespace live
} // namespace detail
} // namespace HX
