//===- SystemFiles.h - Reading sysfs and firmware files below a root ------===//
//
/// \file
/// The live source reads small system files (sysfs attributes, symbolic
/// links, directory listings, the SMBIOS table) below a file-system root, so
/// that a recorded tree of those files can stand in for a machine. Errors are
/// returned as errno values, never thrown: the callers decide whether a
/// missing file is normal (an optional attribute) or a problem (a device that
/// vanished between listing and reading).
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_SYSTEMFILES_H
#define HX_SRC_LIVE_SYSTEMFILES_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <sys/types.h>

namespace HX {
namespace detail {
namespace live {

/// Where the live machine's files are: "<root><absolute path>".
class FileSystemRoot {
public:
  /// \p root "/" or empty means the real root; trailing slashes are ignored.
  explicit FileSystemRoot(const std::string &root);

  /// The path of \p absolute ("/sys/...") below the root.
  std::string path(std::string_view absolute) const;

private:
  /// Empty for the real root, else the root without trailing slash.
  std::string Prefix;
};

/// The contents of a file, or the errno that stopped reading it.
struct FileText {
  std::string contents;
  int error = 0;
  /// True when the file held more than the reader's limit; contents then
  /// hold the first bytes only.
  bool cut = false;
  bool ok() const { return error == 0; }
};

/// Reads at most \p limit bytes of the file at \p path.
FileText readFileText(const std::string &path, std::size_t limit = 4096);

/// The target of the symbolic link at \p path, or the errno.
struct LinkText {
  std::string target;
  int error = 0;
  bool ok() const { return error == 0; }
};
LinkText readLinkText(const std::string &path);

struct DirectoryEntry {
  std::string name;
  /// The entry's inode number as the directory lists it; sysfs gives every
  /// new device entry a new one, so it tells a re-plugged device apart from
  /// the one that stood there before.
  ino_t inode = 0;
};

/// The entries of a directory other than "." and "..", in no particular
/// order, or the errno.
struct DirectoryListing {
  std::vector<DirectoryEntry> entries;
  int error = 0;
  bool ok() const { return error == 0; }
};
DirectoryListing listDirectory(const std::string &path);

/// Reads up to \p size bytes at \p offset of an open file; fewer at its end.
class RandomAccessFile {
public:
  explicit RandomAccessFile(const std::string &path);
  RandomAccessFile(const RandomAccessFile &) = delete;
  RandomAccessFile &operator=(const RandomAccessFile &) = delete;
  ~RandomAccessFile();

  bool isOpen() const { return Fd >= 0; }
  std::string readAt(std::uint64_t offset, std::size_t size) const;

private:
  int Fd;
};

/// True for the errors of a file that is not there (any more): the device or
/// attribute was removed, or never existed.
bool isGone(int error);

/// The operating system's text for \p error.
std::string errorText(int error);

/// The text of a sysfs attribute without its trailing line feed.
std::string_view attributeValue(std::string_view contents);

/// Parses "0x1a2b" or "1a2b" (hexadecimal, nothing else) into a number that
/// fits \p maximum.
std::optional<std::uint32_t> parseHex(std::string_view text,
                                      std::uint32_t maximum);

/// Parses a decimal number that fits 32 bits.
std::optional<std::uint32_t> parseDecimal(std::string_view text);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_SYSTEMFILES_H
