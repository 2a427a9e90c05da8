#include "tools/mayascene/TemporaryBake.h"

#include <fcntl.h>
#include <stdlib.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <system_error>

#include "tools/mayascene/DescriptorBuffer.h"
#include "tools/mayascene/Interruption.h"

namespace mayascene {
namespace {

constexpr mode_t kOwnerOnly = 0600;

std::string sentence(const std::string& what, int number) {
  return what + " cannot be written: " + std::strerror(number);
}

}  // namespace

struct TemporaryBake::Output {
  explicit Output(int opened) : descriptor(opened), buffer(opened), stream(&buffer) {}
  ~Output() {
    if (descriptor >= 0) ::close(descriptor);
  }
  Output(const Output&) = delete;
  Output& operator=(const Output&) = delete;

  int descriptor;
  DescriptorBuffer buffer;
  std::ostream stream;
};

std::unique_ptr<TemporaryBake> TemporaryBake::make(const std::string& name, std::string* failure) {
  std::error_code error;
  const std::filesystem::path place = std::filesystem::temp_directory_path(error);
  std::unique_ptr<TemporaryBake> bake(new TemporaryBake);
  std::string folder = (place / "mayascene-XXXXXX").string();
  {
    const HeldSignals held;
    if (error || ::mkdtemp(folder.data()) == nullptr) {
      *failure = sentence("a temporary folder", error ? error.value() : errno);
      return nullptr;
    }
    bake->folder_ = std::move(folder);
    rememberUnfinished(bake->folder_.c_str());
  }
  bake->file_ = (std::filesystem::path(bake->folder_) / name).string();
  rememberUnfinished(bake->file_.c_str());
  const int descriptor = ::open(bake->file_.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kOwnerOnly);
  if (descriptor < 0) {
    *failure = sentence("the temporary bake", errno);
    return nullptr;
  }
  bake->output_ = std::make_unique<Output>(descriptor);
  return bake;
}

TemporaryBake::~TemporaryBake() {
  output_.reset();
  if (!file_.empty()) {
    ::unlink(file_.c_str());
    forgetUnfinished(file_.c_str());
  }
  if (!folder_.empty()) {
    ::rmdir(folder_.c_str());
    forgetUnfinished(folder_.c_str());
  }
}

std::ostream& TemporaryBake::stream() { return output_->stream; }

bool TemporaryBake::finish(std::string* failure) {
  output_->stream.flush();
  int number = output_->buffer.failure();
  const int descriptor = output_->descriptor;
  output_->descriptor = -1;
  if (::close(descriptor) != 0 && number == 0) number = errno;
  if (number != 0) *failure = sentence("the temporary bake", number);
  return number == 0;
}

}  // namespace mayascene
