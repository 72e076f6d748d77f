//===- measure_command.cpp - Time and peak memory of one command ----------===//
//
// measure_command [--output FILE] COMMAND [ARGS...]
//
// Runs COMMAND with its standard output sent to /dev/null (or FILE) and
// prints one line to standard output:
//
//   wall_s=<seconds> user_s=<seconds> sys_s=<seconds> maxrss_kib=<KiB> status=<exit status>
//
// Wall time is taken with a monotonic clock around fork and wait; CPU times
// and peak resident memory are those wait4 reports for the child.
//
//===----------------------------------------------------------------------===//

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <ctime>

namespace {

double seconds(const timeval &t) { return static_cast<double>(t.tv_sec) + static_cast<double>(t.tv_usec) / 1e6; }

double now() {
  timespec t{};
  clock_gettime(CLOCK_MONOTONIC, &t);
  return static_cast<double>(t.tv_sec) + static_cast<double>(t.tv_nsec) / 1e9;
}

} // namespace

int main(int argc, char **argv) {
  int first = 1;
  const char *output = "/dev/null";
  if (argc > 2 && std::strcmp(argv[1], "--output") == 0) {
    output = argv[2];
    first = 3;
  }
  if (first >= argc) {
    std::fprintf(stderr, "usage: %s [--output FILE] COMMAND [ARGS...]\n", argv[0]);
    return 1;
  }
  const double start = now();
  const pid_t child = fork();
  if (child < 0) {
    std::perror("fork");
    return 1;
  }
  if (child == 0) {
    const int out = open(output, O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
    if (out < 0 || dup2(out, STDOUT_FILENO) < 0)
      _exit(126);
    execvp(argv[first], argv + first);
    std::fprintf(stderr, "%s: cannot run %s: %s\n", argv[0], argv[first], std::strerror(errno));
    _exit(127);
  }
  int status = 0;
  rusage usage{};
  if (wait4(child, &status, 0, &usage) < 0) {
    std::perror("wait4");
    return 1;
  }
  const double wall = now() - start;
  const int exitStatus = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
  std::printf("wall_s=%.6f user_s=%.6f sys_s=%.6f maxrss_kib=%ld status=%d\n", wall, seconds(usage.ru_utime),
              seconds(usage.ru_stime), usage.ru_maxrss, exitStatus);
  return 0;
}
