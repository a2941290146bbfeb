#pragma once

#include <sys/wait.h>
#include <unistd.h>

#include <functional>
#include <string>

namespace ax {

// Runs `body` in a child process, for what stays for the life of one; what it returns is empty when all is
// well.
inline std::string inChild(const std::function<std::string()>& body) {
  int ends[2];
  if (pipe(ends) != 0) return "no pipe";
  const pid_t child = fork();
  if (child == 0) {
    const std::string fault = body();
    const ssize_t written = write(ends[1], fault.data(), fault.size());
    _exit(written == static_cast<ssize_t>(fault.size()) ? 0 : 1);
  }
  close(ends[1]);
  std::string fault;
  char buffer[512];
  for (ssize_t got; (got = read(ends[0], buffer, sizeof buffer)) > 0;)
    fault.append(buffer, static_cast<std::size_t>(got));
  close(ends[0]);
  int status = 0;
  waitpid(child, &status, 0);
  return WIFEXITED(status) && WEXITSTATUS(status) == 0 ? fault : "the process ended badly: " + fault;
}

}  // namespace ax
