// Child processes, several at a time, whose results come in the order of their numbers.
#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace mayascene {

struct PoolLimits {
  std::size_t jobs = 1;                         // children at a time; at least 1, at most kMostChildren
  std::chrono::duration<double> timeout{60.0};  // for each child
  std::uint64_t memory = 0;                     // bytes of address space for each child; 0: no limit
  std::size_t output = std::size_t{64} << 20;   // bytes of each of a child's two streams
  // Bytes of results that wait for an earlier one. Beyond these no further child is started. A pool never
  // holds more than these and the outputs of the running children.
  std::size_t waiting = std::size_t{256} << 20;
};

// How a child ended, and what it wrote until then.
struct ChildEnd {
  enum class Kind {
    Exited,         // number: its exit status
    Signalled,      // number: the signal that ended it
    TimedOut,       // it was killed after the timeout
    TooMuchOutput,  // it was killed when it had written more than it may
    NotStarted,     // number: an errno
  };
  Kind kind = Kind::NotStarted;
  int number = 0;
  std::string out, err;
  std::chrono::duration<double> seconds{0.0};
};

struct PoolState {
  std::size_t ended = 0;   // all that have a result, handed out or not
  std::size_t failed = 0;  // of these, the ones that did not exit with status 0
  std::size_t running = 0;
};

class ProcessPool {
 public:
  // The words of a child; the first is the path of the program.
  using Command = std::function<std::vector<std::string>(std::size_t number)>;
  // Gets each result, from child 0 on. False: no more, all children are ended.
  using Take = std::function<bool(std::size_t number, ChildEnd end)>;
  // Is called about ten times a second, and when a child has ended.
  using Watch = std::function<void(const PoolState& state)>;

  explicit ProcessPool(const PoolLimits& limits) : limits_(limits) {}

  // Runs `count` children and returns when each has a result. However a child ends, the others run. A child
  // that cannot be started for lack of resources is tried again when another one has ended; it is NotStarted
  // only when no other child runs. An exception from one of the functions ends all children.
  //
  // Timeouts count only the time in which the pool waits for its children: not the time in which the process
  // is stopped, or in which one of the functions runs.
  void run(std::size_t count, const Command& command, const Take& take, const Watch& watch);

 private:
  PoolLimits limits_;
};

}  // namespace mayascene
