// Work in a process of its own, for what may end the process.
#pragma once

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <stdexcept>

namespace testsupport {

// Forks, and runs the work there; what it writes on standard error is dropped. The signal that ended the
// process, or 0 when the work came to its end. Throws when there is no such process, or the work threw.
template <typename Work>
int SignalOfOwnProcess(Work work) {
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process < 0) throw std::runtime_error("no process of its own");
  if (process == 0) {
    const rlimit none{0, 0};
    setrlimit(RLIMIT_CORE, &none);
    if (std::freopen("/dev/null", "w", stderr) == nullptr) _exit(EXIT_FAILURE);
    // The process ends here in any case: what the test holds is given back where the test runs.
    try {
      work();
    } catch (...) {
      _exit(EXIT_FAILURE);
    }
    _exit(EXIT_SUCCESS);
  }
  int status = 0;
  if (waitpid(process, &status, 0) != process) throw std::runtime_error("a process of its own got lost");
  if (WIFSIGNALED(status)) return WTERMSIG(status);
  if (WEXITSTATUS(status) != EXIT_SUCCESS)
    throw std::runtime_error("a process of its own could not do its work");
  return 0;
}

}  // namespace testsupport
