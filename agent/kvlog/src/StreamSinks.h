// Destinations that write formatted lines: stderr and files.

#ifndef KVLOG_SRC_STREAMSINKS_H
#define KVLOG_SRC_STREAMSINKS_H

#include "ProblemReports.h"
#include "Sink.h"

#include <atomic>
#include <cstdint>
#include <mutex>
#include <sys/types.h>

namespace KVLog::detail {

/// Writes lines to the process's standard error.
class StderrSink final : public Sink {
public:
  void write(int level, const std::string& category, const std::string& message) override;

private:
  ProblemReports problems_;
};

/// Appends lines to a file, opened on the first message.
///
/// The descriptor number, once opened, never changes and is never closed:
/// a new file after rotation is moved onto it with dup3(). Writers therefore
/// read it without a lock and can never write into an unrelated file that
/// reused a closed number. The mutex only serialises opening.
class FileSink final : public Sink {
public:
  explicit FileSink(std::string path);
  void write(int level, const std::string& category, const std::string& message) override;

private:
  /// Returns the descriptor, opening the file if that is due; -1 if the
  /// file cannot be opened now.
  int descriptor(std::int64_t now);
  int openFirstTime(std::int64_t now);
  void reopenIfReplaced(std::int64_t now);
  /// Which file a path or descriptor refers to.
  struct FileIdentity {
    dev_t device = 0;
    ino_t inode = 0;
    bool operator==(const FileIdentity& other) const {
      return device == other.device && inode == other.inode;
    }
  };
  /// Opens the path and sets \p identity; -1 on failure (reported).
  int openPath(FileIdentity& identity);

  const std::string path_;
  std::atomic<int> fd_{-1};
  /// Monotonic times (ns) before which no open is tried / no check is made.
  std::atomic<std::int64_t> nextOpenAttempt_{0};
  std::atomic<std::int64_t> nextReplacementCheck_{0};
  std::mutex openMutex_;
  FileIdentity identity_; ///< Of the open file; guarded by openMutex_.
  ProblemReports problems_;
};

} // namespace KVLog::detail

#endif // KVLOG_SRC_STREAMSINKS_H
