#include "tests/export/WrittenFiles.h"

#include <utility>

#include "tests/export/HostileCompositions.h"

namespace exporttest {
namespace {

class FailingFiles : public interchange_test::FilesInMemory {
 public:
  FailingFiles(std::size_t failing, std::string stem) : FilesInMemory(std::move(stem)), failing_(failing) {}

  std::ostream* Main() override { return Next() ? FilesInMemory::Main() : nullptr; }
  std::ostream* Beside(std::string_view part, std::string_view suffix, std::string* name) override {
    return Next() ? FilesInMemory::Beside(part, suffix, name) : nullptr;
  }

 private:
  bool Next() { return ++made_ != failing_; }

  std::size_t failing_;
  std::size_t made_ = 0;
};

}  // namespace

Written WriteAs(std::string_view format, const interchange::Composition& composition, std::size_t failing,
                std::string stem) {
  FailingFiles files(failing, std::move(stem));
  diag::Collector diagnostics("");
  Written written;
  written.done = interchange::Write(*interchange::FindFormat(format), composition, {}, files, &diagnostics);
  written.file = files.main();
  written.beside = files.beside();
  for (const diag::Diagnostic& diagnostic : diagnostics.kept()) {
    written.counts[diagnostic.code] = diagnostics.CountOf(diagnostic.code);
  }
  written.errors = diagnostics.CountOf(diag::Severity::Error);
  return written;
}

}  // namespace exporttest
