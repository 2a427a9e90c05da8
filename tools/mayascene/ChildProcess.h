// A child process whose two output streams are caught.
#pragma once

#include <sys/types.h>

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace mayascene {

class ChildProcess {
 public:
  // One of the two streams, as far as it has come.
  struct Stream {
    int descriptor = -1;  // not blocking; -1 once it has ended
    std::string text;
  };

  // Runs the program command[0], a path, with the words. The child reads nothing, may take so many bytes of
  // address space (0: as many as this process), and ends when this process ends, in whatever way. The three
  // standard descriptors of this process must be open. Null with an errno in *failure when no child can be
  // made. Does not wait until the program runs: notRun() reports a program that could not be run.
  static std::unique_ptr<ChildProcess> start(const std::vector<std::string>& command, std::uint64_t memory,
                                             int* failure);

  // A child that has not ended is killed, and waited for.
  ~ChildProcess();
  ChildProcess(const ChildProcess&) = delete;
  ChildProcess& operator=(const ChildProcess&) = delete;

  Stream& out() { return out_; }
  Stream& err() { return err_; }

  // Takes what has come, at most some hundred kilobytes of each stream. Never waits.
  void read();

  void kill();  // by SIGKILL; the end is then seen by ended()

  // How it ended, in the form of waitpid; nothing while it runs.
  std::optional<int> ended();

  // Of a child that has ended: the errno for which it could not run the program; 0: it did.
  int notRun();

 private:
  ChildProcess() = default;

  pid_t process_ = -1;
  std::optional<int> status_;
  int starting_ = -1;  // brings the errno of a program that cannot be run
  Stream out_, err_;
};

}  // namespace mayascene
