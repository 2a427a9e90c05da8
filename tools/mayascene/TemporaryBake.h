// A bake that exists only for an import.
#pragma once

#include <memory>
#include <ostream>
#include <string>

namespace mayascene {

// A file in a folder of its own that only this user can enter. Both are removed at the end, and when a signal
// ends the run.
class TemporaryBake {
 public:
  // Opens the file `name`, which has no folder. Null with a sentence in *failure when it cannot be made.
  static std::unique_ptr<TemporaryBake> make(const std::string& name, std::string* failure);
  ~TemporaryBake();
  TemporaryBake(const TemporaryBake&) = delete;
  TemporaryBake& operator=(const TemporaryBake&) = delete;

  std::ostream& stream();

  // Ends the writing. False with a sentence in *failure when a write has failed.
  bool finish(std::string* failure);

  const std::string& path() const { return file_; }

 private:
  TemporaryBake() = default;

  struct Output;
  std::string folder_;
  std::string file_;
  std::unique_ptr<Output> output_;
};

}  // namespace mayascene
