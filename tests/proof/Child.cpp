#include "tests/proof/Child.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <exception>
#include <memory>
#include <vector>

#include "platform/foundation/BackgroundQueue.h"

#if defined(__SANITIZE_ADDRESS__)
#define AX_LOOKS_FOR_LEAKS 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define AX_LOOKS_FOR_LEAKS 1
#endif
#endif
#ifdef AX_LOOKS_FOR_LEAKS
#include <sanitizer/lsan_interface.h>
#endif

namespace ax::proof {

namespace {

using File = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

File temporaryFile() {
  return {std::tmpfile(), &std::fclose};
}

std::string textOf(const File& file) {
  std::string text;
  char buffer[4096];
  std::rewind(file.get());
  for (std::size_t got; (got = std::fread(buffer, 1, sizeof buffer, file.get())) > 0;)
    text.append(buffer, got);
  return text;
}

bool hasLeaked() {
#ifdef AX_LOOKS_FOR_LEAKS
  return __lsan_do_recoverable_leak_check() != 0;
#else
  return false;
#endif
}

enum End : int { ended = 0, raised = 3, leaked = 4, notWritten = 5 };

[[noreturn]] void runAndExit(const std::function<std::string()>& body, const File& result,
                             const File& errors) {
  dup2(fileno(errors.get()), STDERR_FILENO);
  std::string text;
  try {
    text = body();
    waitForBackgroundTasks();
  } catch (const std::exception& error) {
    std::fprintf(stderr, "ERROR: raised %s\n", error.what());
    _exit(raised);
  } catch (...) {
    _exit(raised);
  }
  const bool isWritten =
      std::fwrite(text.data(), 1, text.size(), result.get()) == text.size() && std::fflush(result.get()) == 0;
  _exit(!isWritten ? notWritten : hasLeaked() ? leaked : ended);
}

std::string endOf(int status) {
  if (WIFSIGNALED(status) && WTERMSIG(status) == SIGALRM) return "it takes too long";
  if (WIFSIGNALED(status)) return "it ends with signal " + std::to_string(WTERMSIG(status));
  switch (WEXITSTATUS(status)) {
    case ended:
      return "";
    case raised:
      return "something is raised out of it";
    case leaked:
      return "it leaks";
    default:
      return "it ends with " + std::to_string(WEXITSTATUS(status));
  }
}

// The lines in which a sanitizer, or a check of our own, says what is wrong and where in the project.
std::string reasonIn(const std::string& errors) {
  std::string reason;
  std::size_t frames = 0;
  for (std::size_t start = 0; start < errors.size();) {
    const std::size_t end = std::min(errors.find('\n', start), errors.size());
    const std::string line = errors.substr(start, end - start);
    start = end + 1;
    const bool isFrame = line.find(" in ax::") != line.npos && frames < 6;
    if (isFrame) ++frames;
    if (isFrame || line.find("ERROR: ") != line.npos || line.find("error: ") != line.npos)
      reason += "\n      " + line;
  }
  return reason;
}

}  // namespace

ChildEnd runInChild(const std::function<std::string()>& body, unsigned seconds) {
  const File result = temporaryFile();
  const File errors = temporaryFile();
  std::fflush(nullptr);
  const pid_t child = fork();
  if (child == 0) {
    alarm(seconds);
    runAndExit(body, result, errors);
  }
  int status = 0;
  waitpid(child, &status, 0);
  const std::string failure = endOf(status);
  return {textOf(result), failure.empty() ? "" : failure + reasonIn(textOf(errors))};
}

Tally onWorkers(std::size_t workers, const std::function<Tally(std::size_t)>& work) {
  struct Worker {
    pid_t process;
    File result;
  };
  std::vector<Worker> all;
  for (std::size_t i = 0; i < workers; ++i) {
    File result = temporaryFile();
    std::fflush(nullptr);
    const pid_t process = fork();
    if (process == 0) {
      const Tally tally = work(i);
      std::fflush(stdout);
      _exit(std::fwrite(&tally, sizeof tally, 1, result.get()) == 1 && std::fflush(result.get()) == 0 ? 0
                                                                                                      : 1);
    }
    all.push_back({process, std::move(result)});
  }
  Tally sum;
  for (const Worker& worker : all) {
    int status = 0;
    waitpid(worker.process, &status, 0);
    std::rewind(worker.result.get());
    Tally tally;
    const bool isWhole = status == 0 && std::fread(&tally, sizeof tally, 1, worker.result.get()) == 1;
    sum.questions += tally.questions;
    sum.failed += isWhole ? tally.failed : tally.failed + 1;
  }
  return sum;
}

}  // namespace ax::proof
