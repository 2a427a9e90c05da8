// Checks scenes given as text: each is imported by the module first.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "check/Check.h"
#include "tests/support/LoadedHost.h"
#include "tools/mayascene/ImportedLayers.h"

namespace check_test {

class Checked {
 public:
  explicit Checked(std::string text, const check::Options& options = {}, bool linearUnits = false)
      : text_(std::move(text)) {
    testsupport::LoadedHost host(testsupport::WithUnits(linearUnits));
    const refhost::CallbackResult result = host.Import(text_);
    cameOver_ = mayascene::whatCameOver(mayascene::lookAtScene(host.ScenePath()), result, linearUnits);
    report_ = check::Check(text_, cameOver_, options);
  }

  const check::Report& report() const { return report_; }
  const check::CameOver& cameOver() const { return cameOver_; }

  std::size_t CountOf(diag::Code code) const {
    return static_cast<std::size_t>(
        std::count_if(report_.findings.begin(), report_.findings.end(),
                      [code](const check::Finding& finding) { return finding.diagnostic.code == code; }));
  }

  // The first of the code; the test fails where there is none.
  const check::Finding& Only(diag::Code code) const {
    static const check::Finding none;
    EXPECT_EQ(CountOf(code), 1u) << diag::NameOf(code) << "\n" << All();
    const auto found =
        std::find_if(report_.findings.begin(), report_.findings.end(),
                     [code](const check::Finding& finding) { return finding.diagnostic.code == code; });
    return found == report_.findings.end() ? none : *found;
  }

  std::string SentenceOf(diag::Code code) const { return diag::SentenceOf(Only(code).diagnostic); }

  // The text that the diagnostic is about.
  std::string MarkedBy(diag::Code code) const {
    const diag::Range range = Only(code).diagnostic.range;
    return text_.substr(static_cast<std::size_t>(range.offset), static_cast<std::size_t>(range.length));
  }
  std::uint32_t LineOf(diag::Code code) const { return Only(code).diagnostic.place.line; }

  // The errors and warnings, one a line.
  std::string All() const {
    std::string all;
    for (const check::Finding& finding : report_.findings) {
      if (diag::EntryOf(finding.diagnostic.code).severity == diag::Severity::Note) continue;
      all += diag::HeadLineOf("", finding.diagnostic) + '\n';
    }
    return all;
  }

 private:
  std::string text_;
  check::CameOver cameOver_;
  check::Report report_;
};

inline const std::string kHead = "//Maya ASCII 2018 scene\ncurrentUnit -l centimeter -a degree -t film;\n";

// What the importer takes as it is: the resolution is said, with square pixels.
inline const std::string kResolution =
    "select -ne :defaultResolution;\n\tsetAttr \".w\" 960;\n\tsetAttr \".h\" 540;\n\tsetAttr \".pa\" 1;\n"
    "\tsetAttr \".dar\" 1.7777777;\n";

// The node's default aperture, said: the importer's own is rounded.
inline const std::string kLens =
    "\tsetAttr \".coi\" 10;\n\tsetAttr \".cap\" -type \"double2\" 1.41732 0.94488 ;\n";

// A camera "shotCam" with a shape, and what is said of both.
inline std::string CameraScene(std::string_view transform, std::string_view shape = "",
                               std::string_view rest = "") {
  std::string text = kHead + "createNode transform -n \"shotCam\";\n" + std::string(transform);
  text += "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" + kLens + std::string(shape);
  return text + kResolution + std::string(rest);
}

// A curve that drives a plug; keys are pairs, straight between them.
inline std::string CurveOf(std::string_view name, std::string_view keys, std::string_view plug,
                           std::string_view type = "animCurveTL", int tangents = 2) {
  const auto numbers = 1 + std::count(keys.begin(), keys.end(), ' ');
  std::string text = "createNode " + std::string(type) + " -n \"" + std::string(name) +
                     "\";\n\tsetAttr \".tan\" " + std::to_string(tangents) +
                     ";\n\tsetAttr \".wgt\" no;\n\tsetAttr \".ktv[0:" + std::to_string(numbers / 2 - 1) +
                     "]\" " + std::string(keys) + ";\n";
  return text + "connectAttr \"" + std::string(name) + ".o\" \"" + std::string(plug) + "\";\n";
}

}  // namespace check_test
