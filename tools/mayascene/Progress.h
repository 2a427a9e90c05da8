// The progress of a long run, on one line of a terminal.
#pragma once

#include <chrono>
#include <cstddef>
#include <ostream>
#include <string>

namespace mayascene {

struct ProgressState {
  std::size_t all = 0;
  std::size_t done = 0;                        // of all
  std::size_t failed = 0;                      // of those done
  std::chrono::duration<double> seconds{0.0};  // since the run began
};

// "[=====>    ]  50 of 100 done, 3 failed, 12.5/s, 4 s left", at most `width` columns: where the bar does not
// fit it is left out, and then the text is cut. The time left is unknown until something is done.
std::string progressText(const ProgressState& state, std::size_t width);

// "59 s", "2 min 5 s", "3 h 20 min"
std::string durationText(std::chrono::duration<double> duration);

// The line is drawn over itself. Clear it before anything else is written to the terminal.
class Progress {
 public:
  // The stream goes to a terminal of so many columns, and outlives the object.
  Progress(std::ostream& terminal, std::size_t width) : terminal_(terminal), width_(width) {}
  ~Progress() { clear(); }
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;

  void draw(const ProgressState& state);
  void clear();  // until it is drawn again

 private:
  std::ostream& terminal_;
  std::size_t width_;
  std::string drawn_;  // the line that is on the terminal now
};

// The columns of a terminal that can draw a line over itself; 0 where the descriptor is not such a terminal.
std::size_t terminalWidth(int descriptor);

}  // namespace mayascene
