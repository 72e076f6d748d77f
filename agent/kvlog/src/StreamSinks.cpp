#include "StreamSinks.h"

#include "DescriptorWriter.h"
#include "LineFormat.h"

#include <cerrno>
#include <ctime>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace KVLog::detail {
namespace {

/// How long a failed open, or a healthy file's identity, is trusted.
constexpr std::int64_t kRecheckIntervalNs = 1'000'000'000;

constexpr int kOpenFlags = O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC;
constexpr mode_t kFileMode = 0640;

/// A coarse clock is enough to pace retries and costs no system call.
std::int64_t monotonicNowNs() {
  std::timespec now{};
  ::clock_gettime(CLOCK_MONOTONIC_COARSE, &now);
  return std::int64_t{now.tv_sec} * 1'000'000'000 + now.tv_nsec;
}

} // namespace

void StderrSink::write(int level, const std::string& category, const std::string& message) {
  const std::string line = formatLine(level, category, message);
  if (const int error = writeWhole(STDERR_FILENO, line))
    problems_.reportOnce(FailedOperation::Write, error, "cannot write to stderr");
}

FileSink::FileSink(std::string path) : path_(std::move(path)) {}

void FileSink::write(int level, const std::string& category, const std::string& message) {
  const int fd = descriptor(monotonicNowNs());
  if (fd < 0)
    return;
  const std::string line = formatLine(level, category, message);
  if (const int error = writeWhole(fd, line))
    problems_.reportOnce(FailedOperation::Write, error, "cannot write to log file " + path_);
}

int FileSink::descriptor(std::int64_t now) {
  const int fd = fd_.load(std::memory_order_acquire);
  if (fd < 0)
    return openFirstTime(now);
  if (now >= nextReplacementCheck_.load(std::memory_order_relaxed))
    reopenIfReplaced(now);
  return fd;
}

int FileSink::openFirstTime(std::int64_t now) {
  if (now < nextOpenAttempt_.load(std::memory_order_relaxed))
    return -1;
  const std::lock_guard<std::mutex> lock(openMutex_);
  if (const int fd = fd_.load(std::memory_order_relaxed); fd >= 0)
    return fd; // Another thread opened it while this one waited.
  if (now < nextOpenAttempt_.load(std::memory_order_relaxed))
    return -1; // Another thread just failed.
  const int fd = openPath(identity_);
  if (fd < 0) {
    nextOpenAttempt_.store(now + kRecheckIntervalNs, std::memory_order_relaxed);
    return -1;
  }
  nextReplacementCheck_.store(now + kRecheckIntervalNs, std::memory_order_relaxed);
  fd_.store(fd, std::memory_order_release);
  return fd;
}

void FileSink::reopenIfReplaced(std::int64_t now) {
  // A thread already checking is enough; the others keep writing.
  const std::unique_lock<std::mutex> lock(openMutex_, std::try_to_lock);
  if (!lock.owns_lock() || now < nextReplacementCheck_.load(std::memory_order_relaxed))
    return;
  nextReplacementCheck_.store(now + kRecheckIntervalNs, std::memory_order_relaxed);

  struct stat current {};
  if (::stat(path_.c_str(), &current) == 0) {
    if (FileIdentity{current.st_dev, current.st_ino} == identity_)
      return;
  } else if (errno != ENOENT) {
    return; // Cannot tell; keep the file that is open.
  }
  FileIdentity freshIdentity;
  const int fresh = openPath(freshIdentity);
  if (fresh < 0)
    return; // Keep writing to the old file; try again in a second.
  if (::dup3(fresh, fd_.load(std::memory_order_relaxed), O_CLOEXEC) == 0)
    identity_ = freshIdentity;
  else
    problems_.reportOnce(FailedOperation::Open, errno, "cannot switch to new log file " + path_);
  ::close(fresh);
}

int FileSink::openPath(FileIdentity& identity) {
  int fd;
  do
    fd = ::open(path_.c_str(), kOpenFlags, kFileMode);
  while (fd < 0 && errno == EINTR);
  if (fd < 0) {
    problems_.reportOnce(FailedOperation::Open, errno, "cannot open log file " + path_);
    return -1;
  }
  struct stat opened {};
  if (::fstat(fd, &opened) == 0)
    identity = {opened.st_dev, opened.st_ino};
  return fd;
}

} // namespace KVLog::detail
