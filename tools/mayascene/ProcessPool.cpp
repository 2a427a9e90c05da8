#include "tools/mayascene/ProcessPool.h"

#include <poll.h>
#include <signal.h>
#include <sys/wait.h>

#include <algorithm>
#include <cerrno>
#include <map>
#include <memory>
#include <optional>
#include <utility>

#include "tools/mayascene/ChildProcess.h"
#include "tools/mayascene/Interruption.h"

namespace mayascene {
namespace {

using Seconds = std::chrono::duration<double>;
using Clock = std::chrono::steady_clock;

constexpr Seconds kLook{0.1};  // the longest time between two looks
constexpr Seconds kFirstLookAtClosed{
    0.0001};                          // at a child that has closed its streams: as a rule it ends then
constexpr Seconds kMostCounted{1.0};  // of one wait: a longer one means that this process was stopped

bool mayPass(int failure) {
  return failure == EAGAIN || failure == ENOMEM || failure == EMFILE || failure == ENFILE;
}

struct Running {
  std::size_t number = 0;
  std::unique_ptr<ChildProcess> child;
  Clock::time_point begin = Clock::now();
  Seconds since{0.0};  // of the time that counts
  std::optional<ChildEnd::Kind> killedAs;
  Seconds patience = kFirstLookAtClosed;  // doubled at each look

  bool closed() const { return child->out().descriptor < 0 && child->err().descriptor < 0; }
};

class Run {
 public:
  Run(const PoolLimits& limits, std::size_t count, const ProcessPool::Command& command,
      const ProcessPool::Take& take, const ProcessPool::Watch& watch)
      : limits_(limits), count_(count), command_(command), take_(take), watch_(watch) {
    limits_.jobs = std::clamp<std::size_t>(limits_.jobs, 1, kMostChildren);
  }

  void all() {
    while (taken_ < count_) {
      startMore();
      if (!handOut()) return;
      if (running_.empty()) continue;
      wait();
      look();
      watch_({ended_, failed_, running_.size()});
    }
  }

 private:
  // Children start in order, so the child whose result is handed out next runs or has ended. It does not need
  // another child to start, so none has to start while too many results wait.
  void startMore() {
    while (next_ < count_ && running_.size() < limits_.jobs && waitingBytes_ <= limits_.waiting &&
           !outOfMeans_) {
      int failure = 0;
      auto child = ChildProcess::start(command_(next_), limits_.memory, &failure);
      if (child == nullptr && mayPass(failure) && !running_.empty()) {
        outOfMeans_ = true;
      } else if (child == nullptr) {
        ChildEnd end;
        end.number = failure;
        keep(next_++, std::move(end));
      } else {
        running_.push_back({next_++, std::move(child), Clock::now(), now_, std::nullopt, kFirstLookAtClosed});
      }
    }
  }

  bool handOut() {
    for (auto first = results_.find(taken_); first != results_.end(); first = results_.find(taken_)) {
      ChildEnd end = std::move(first->second);
      results_.erase(first);
      waitingBytes_ -= end.out.size() + end.err.size();
      if (!take_(taken_++, std::move(end))) return false;
    }
    return true;
  }

  // Waits until a child has written something or has closed its streams, or until it is time to look.
  void wait() {
    std::vector<pollfd> polled;
    Seconds longest = kLook;
    for (Running& one : running_) {
      if (one.closed()) longest = std::min(longest, std::exchange(one.patience, 2 * one.patience));
      if (!one.killedAs)
        longest = std::min(longest, std::max(Seconds{0.0}, one.since + limits_.timeout - now_));
      // A negative descriptor is passed over.
      polled.push_back({one.child->out().descriptor, POLLIN, 0});
      polled.push_back({one.child->err().descriptor, POLLIN, 0});
    }
    const auto nanoseconds = std::chrono::ceil<std::chrono::nanoseconds>(longest);
    const timespec timeout{0, static_cast<long>(nanoseconds.count())};
    static_assert(kLook < Seconds{1.0}, "whole seconds have a field of their own");
    const Clock::time_point begin = Clock::now();
    ::ppoll(polled.data(), polled.size(), &timeout, nullptr);
    now_ += std::min<Seconds>(Clock::now() - begin, kMostCounted);
  }

  void look() {
    for (Running& one : running_) {
      // Its last output can be read after its end.
      const bool hasEnded = one.child->ended().has_value();
      one.child->read();
      if (hasEnded) {
        finish(&one);
      } else if (!one.killedAs) {
        judge(&one);
      }
    }
    std::erase_if(running_, [](const Running& one) { return one.child == nullptr; });
  }

  void judge(Running* one) {
    if (tooMuch(*one->child)) {
      one->killedAs = ChildEnd::Kind::TooMuchOutput;
    } else if (now_ - one->since >= limits_.timeout) {
      one->killedAs = ChildEnd::Kind::TimedOut;
    } else {
      return;
    }
    one->child->kill();
  }

  bool tooMuch(ChildProcess& child) const {
    return std::max(child.out().text.size(), child.err().text.size()) > limits_.output;
  }

  void finish(Running* one) {
    readToEnd(one->child.get());
    const int status = *one->child->ended();
    ChildEnd end;
    end.kind = WIFSIGNALED(status) ? ChildEnd::Kind::Signalled : ChildEnd::Kind::Exited;
    end.number = WIFSIGNALED(status) ? WTERMSIG(status) : WEXITSTATUS(status);
    if (tooMuch(*one->child)) end.kind = ChildEnd::Kind::TooMuchOutput;
    if (const int failure = one->child->notRun(); failure != 0) {
      end.kind = ChildEnd::Kind::NotStarted;
      end.number = failure;
    }
    // A child that ended just before the kill keeps its own end.
    if (one->killedAs && WIFSIGNALED(status)) end.kind = *one->killedAs;
    end.out = std::move(one->child->out().text);
    end.err = std::move(one->child->err().text);
    for (std::string* text : {&end.out, &end.err}) {
      text->resize(std::min(text->size(), limits_.output));
      text->shrink_to_fit();
    }
    end.seconds = Clock::now() - one->begin;
    one->child.reset();
    outOfMeans_ = false;
    keep(one->number, std::move(end));
  }

  // Takes what can be read now. A process that the child started may outlive it and hold the streams open.
  void readToEnd(ChildProcess* child) const {
    for (std::size_t before = ~std::size_t{0}; !tooMuch(*child);) {
      const std::size_t size = child->out().text.size() + child->err().text.size();
      if (size == std::exchange(before, size)) return;
      child->read();
    }
  }

  void keep(std::size_t number, ChildEnd end) {
    ++ended_;
    if (end.kind != ChildEnd::Kind::Exited || end.number != 0) ++failed_;
    waitingBytes_ += end.out.size() + end.err.size();
    results_.emplace(number, std::move(end));
  }

  PoolLimits limits_;
  std::size_t count_;
  const ProcessPool::Command& command_;
  const ProcessPool::Take& take_;
  const ProcessPool::Watch& watch_;

  std::vector<Running> running_;
  std::map<std::size_t, ChildEnd> results_;  // those that wait for an earlier one
  std::size_t waitingBytes_ = 0;             // in them
  std::size_t next_ = 0;                     // to be started
  std::size_t taken_ = 0;                    // handed out
  std::size_t ended_ = 0, failed_ = 0;
  bool outOfMeans_ = false;  // a child could not be started, and none has ended since
  Seconds now_{0.0};         // the time that counts
};

}  // namespace

void ProcessPool::run(std::size_t count, const Command& command, const Take& take, const Watch& watch) {
  // The process may have been started with SIGCHLD ignored. No child could then be waited for.
  ::signal(SIGCHLD, SIG_DFL);
  Run(limits_, count, command, take, watch).all();
}

}  // namespace mayascene
