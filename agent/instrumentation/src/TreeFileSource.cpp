//===- TreeFileSource.cpp - Hardware described by a tree file -------------===//

#include "TreeFileSource.h"

#include <atomic>
#include <cstdint>

#include "RefusalLog.h"

#include "HX/InstrumentationError.h"

namespace HX {
namespace detail {
namespace {

std::string unreadable(const std::string &path, const std::string &error) {
  return path + ": cannot read: " + error;
}

TreeReading readContents(const std::string &path, const FileContents &file) {
  if (!file.identity)
    return {nullptr, unreadable(path, file.error)};
  return readHardwareTree(file.contents, path);
}

} // namespace

TreeReading readHardwareTreeFile(const std::string &path) {
  return readContents(path, readFile(path));
}

namespace {
std::atomic<std::uint64_t> FileReads{0};
} // namespace

std::uint64_t treeFileReads() { return FileReads.load(std::memory_order_relaxed); }

TreeFileSource::TreeFileSource(std::string path) : Path(std::move(path)) {}

TreeReading TreeFileSource::currentReading() {
  FileStatus status = statFile(Path);
  if (!status.identity)
    return {nullptr, unreadable(Path, status.error)};

  std::lock_guard<std::mutex> guard(Lock);
  if (CachedIdentity && *CachedIdentity == *status.identity)
    return Cached;
  // Parsing under the lock keeps concurrent selections from parsing the
  // same new file twice; they wait and share the result.
  FileContents file = readFile(Path);
  FileReads.fetch_add(1, std::memory_order_relaxed);
  CachedIdentity = file.identity ? file.identity : status.identity;
  Cached = readContents(Path, file);
  return Cached;
}

std::shared_ptr<const HardwareSnapshot> TreeFileSource::current() {
  TreeReading reading = currentReading();
  if (reading.snapshot) {
    clearRefusal();
    return std::move(reading.snapshot);
  }
  reportRefusal(reading.refusal);
  throw InstrumentationError(reading.refusal);
}

std::shared_ptr<const HardwareSnapshot>
TreeFileSource::snapshotFor(NodeLexicon::NodeType) {
  return current();
}

std::string TreeFileSource::describe() const { return "tree file " + Path; }

std::optional<std::string> TreeFileSource::systemName() {
  try {
    return current()->systemName();
  } catch (const InstrumentationError &) {
    return std::nullopt;
  }
}

} // namespace detail
} // namespace HX
