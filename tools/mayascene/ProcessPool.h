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
  // Bytes of results that wait for an earlier one: beyond these, no further child is started. A pool never
  // holds more than these and the outputs of the children that run.
  std::size_t waiting = std::size_t{256} << 20;
};

// How a child ended. What it wrote until then is there in any case.
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
  std::size_t failed = 0;  // of these, the ones that are no exit with status 0
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

  // Runs `count` children and comes back when each has a result. No end of a child keeps the others from
  // running. One that cannot be started for want of means is tried again when another one has ended; it is
  // NotStarted only when none is left to wait for. An exception from one of the functions ends all children.
  //
  // Time counts while the pool looks at its children: not while the process is stopped, nor while a function
  // waits for a reader.
  void run(std::size_t count, const Command& command, const Take& take, const Watch& watch);

 private:
  PoolLimits limits_;
};

}  // namespace mayascene
