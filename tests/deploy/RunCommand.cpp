#include "RunCommand.h"

#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <stdexcept>

extern char** environ;

namespace tvr::test {

namespace {

std::string variableName(const std::string& entry) { return entry.substr(0, entry.find('=')); }

std::vector<char*> pointers(const std::vector<std::string>& strings) {
  std::vector<char*> out;
  for (const std::string& s : strings) out.push_back(const_cast<char*>(s.c_str()));
  out.push_back(nullptr);
  return out;
}

/// Reads both pipes to their ends without letting either fill up.
void drain(int outFd, int errFd, std::string& out, std::string& err) {
  pollfd fds[2] = {{outFd, POLLIN, 0}, {errFd, POLLIN, 0}};
  std::string* sinks[2] = {&out, &err};
  int open = 2;
  char buffer[4096];
  while (open > 0) {
    if (poll(fds, 2, -1) < 0) {
      if (errno == EINTR) continue;
      throw std::runtime_error(std::string("poll: ") + std::strerror(errno));
    }
    for (int i = 0; i < 2; ++i) {
      if (fds[i].fd < 0 || !(fds[i].revents & (POLLIN | POLLHUP | POLLERR))) continue;
      const ssize_t n = read(fds[i].fd, buffer, sizeof buffer);
      if (n > 0) {
        sinks[i]->append(buffer, static_cast<std::size_t>(n));
      } else if (n == 0 || errno != EINTR) {
        close(fds[i].fd);
        fds[i].fd = -1;
        --open;
      }
    }
  }
}

} // namespace

std::vector<std::string> currentEnvironment() {
  std::vector<std::string> out;
  for (char** e = environ; *e; ++e) out.emplace_back(*e);
  return out;
}

std::vector<std::string> withoutVariable(std::vector<std::string> environment, const std::string& name) {
  std::vector<std::string> out;
  for (std::string& entry : environment)
    if (variableName(entry) != name) out.push_back(std::move(entry));
  return out;
}

std::vector<std::string> withVariable(std::vector<std::string> environment, const std::string& name,
                                      const std::string& value) {
  std::vector<std::string> out = withoutVariable(std::move(environment), name);
  out.push_back(name + "=" + value);
  return out;
}

CommandResult runCommand(const std::vector<std::string>& argv, const std::vector<std::string>& environment) {
  if (argv.empty()) throw std::invalid_argument("runCommand: no program");
  int outPipe[2];
  int errPipe[2];
  if (pipe(outPipe) != 0) throw std::runtime_error("pipe failed");
  if (pipe(errPipe) != 0) {
    close(outPipe[0]);
    close(outPipe[1]);
    throw std::runtime_error("pipe failed");
  }
  std::vector<char*> args = pointers(argv);
  std::vector<char*> env = pointers(environment);
  const pid_t pid = fork();
  if (pid < 0) throw std::runtime_error(std::string("fork: ") + std::strerror(errno));
  if (pid == 0) {
    dup2(outPipe[1], STDOUT_FILENO);
    dup2(errPipe[1], STDERR_FILENO);
    close(outPipe[0]);
    close(outPipe[1]);
    close(errPipe[0]);
    close(errPipe[1]);
    execvpe(args[0], args.data(), env.data());
    const std::string message = "cannot run " + argv[0] + ": " + std::strerror(errno) + "\n";
    (void)!write(STDERR_FILENO, message.data(), message.size());
    _exit(127);
  }
  close(outPipe[1]);
  close(errPipe[1]);
  CommandResult result;
  drain(outPipe[0], errPipe[0], result.out, result.err);
  int status = 0;
  while (waitpid(pid, &status, 0) < 0 && errno == EINTR) {
  }
  result.exitStatus = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
  return result;
}

CommandResult runCommand(const std::vector<std::string>& argv) { return runCommand(argv, currentEnvironment()); }

} // namespace tvr::test
