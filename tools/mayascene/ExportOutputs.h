// The files of one exported scene.
#pragma once

#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "export/Format.h"
#include "tools/mayascene/FileSet.h"
#include "tools/mayascene/OutputFile.h"

namespace mayascene {

// The files that an output of the run must not be: scenes, the report, and other outputs.
struct TakenFiles {
  FileSet untouchable;
  std::set<std::string> outputs;  // without regard to case
};

class ExportFiles : public interchange::Files {
 public:
  // `place` is the main output's, or "-". The taken files outlive the object.
  ExportFiles(std::string place, TakenFiles* taken) : place_(std::move(place)), taken_(taken) {}

  std::ostream* Main() override;
  std::ostream* Beside(std::string_view part, std::string_view suffix, std::string* name) override;

  // Puts all of them where they belong, the main one last. Outputs that are not committed leave no file.
  bool commit();

  const std::string& failure() const { return failure_; }  // why an output cannot be made or committed
  const std::vector<std::string>& written() const { return written_; }

 private:
  std::string place_;
  TakenFiles* taken_;
  std::unique_ptr<OutputFile> main_;
  std::vector<std::unique_ptr<OutputFile>> beside_;
  std::vector<std::string> written_;
  std::string failure_;
};

}  // namespace mayascene
