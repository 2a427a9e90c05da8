// One output of the tool: a file that appears under its name whole or not at all, a log, or standard output.
#pragma once

#include <memory>
#include <ostream>
#include <string>
#include <vector>

namespace mayascene {

// What stands for standard output as the name of an output.
inline constexpr const char* kStandardOutput = "-";

class OutputFile {
 public:
  // Opens an output for writing. A regular file is written beside its place and takes the place on commit();
  // until then an existing file stays. A device or a FIFO is written in place. Null with a sentence in
  // *failure when it cannot be written.
  static std::unique_ptr<OutputFile> open(const std::string& target, std::string* failure);

  // Opens a log, which is wanted most when a run is cut short: it is written under its own name from the
  // start, over an existing file, and may end anywhere. It is flushed when std::terminate ends the process.
  // One at a time. Null with a sentence in *failure when it cannot be written.
  static std::unique_ptr<OutputFile> openLog(const std::string& target, std::string* failure);

  // Removes an output that was not committed. A log stays.
  ~OutputFile();
  OutputFile(const OutputFile&) = delete;
  OutputFile& operator=(const OutputFile&) = delete;

  // Lives as long as the output. Its badbit is set once a write has failed.
  std::ostream& stream();

  // Puts everything written where it belongs; call it once, at the end. False with a sentence in *failure
  // when a write has failed or the file cannot take its place.
  bool commit(std::string* failure) { return finish(failure) && place(failure); }

  // The same for several outputs, all or none: where one cannot take its place, those before it are removed
  // and the files that were there are back. Signals that end the run wait meanwhile.
  static bool commitAll(const std::vector<OutputFile*>& outputs, std::string* failure);

 private:
  // Writes everything out and closes the file.
  bool finish(std::string* failure);
  bool place(std::string* failure);

  struct State;
  explicit OutputFile(std::unique_ptr<State> state);
  std::unique_ptr<State> state_;
};

}  // namespace mayascene
