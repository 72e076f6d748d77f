//===- FileSnapshot.h - A file's identity and contents, read together -----===//
//
/// \file
/// A file is "the same" while its identity is: device, inode, size and the
/// modification and change times to the nanosecond. Replacing the file
/// (new inode), rewriting it (new times, usually a new size) or touching it
/// changes the identity, so a cache keyed by it notices with one stat.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_FILESNAPSHOT_H
#define HX_SRC_FILESNAPSHOT_H

#include <optional>
#include <string>

#include <sys/stat.h>

namespace HX {
namespace detail {

struct FileIdentity {
  dev_t device = 0;
  ino_t inode = 0;
  off_t size = 0;
  timespec modified{};
  timespec changed{};

  static FileIdentity of(const struct stat &status);
  bool operator==(const FileIdentity &other) const;
  bool operator!=(const FileIdentity &other) const { return !(*this == other); }
};

/// The identity of the file at \p path, or the OS error text.
struct FileStatus {
  std::optional<FileIdentity> identity;
  std::string error;
};
FileStatus statFile(const std::string &path);

/// A file's contents with the identity of the very file they were read
/// from (taken from the open descriptor, so a replacement racing the read
/// cannot pair old contents with a new identity).
struct FileContents {
  std::optional<FileIdentity> identity;
  std::string contents;
  /// The OS error text when the file could not be read.
  std::string error;
};
FileContents readFile(const std::string &path);

} // namespace detail
} // namespace HX

#endif // HX_SRC_FILESNAPSHOT_H
