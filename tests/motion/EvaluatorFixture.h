// Reads texts as scenes and evaluates them.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "motion/Evaluator.h"
#include "scene/Scene.h"
#include "tests/motion/Near.h"

namespace testmotion {

// A straight line from 0 at frame 0 to 24 at frame 24, whatever a channel measures.
inline constexpr char kLine[] =
    "createNode animCurveTL -n \"line\";\n"
    "setAttr \".tan\" 2;\nsetAttr \".wgt\" no;\nsetAttr -s 2 \".ktv[0:1]\"  0 0 24 24;\n";

class EvaluatorTest : public testing::Test {
 protected:
  void Read(std::string_view text) {
    evaluator_.reset();
    text_ = text;
    diagnostics_ = std::make_unique<diag::Collector>(text_);
    scene_ = scene::Read(text_, *diagnostics_);
    evaluator_ = std::make_unique<motion::Evaluator>(scene_, diagnostics_.get());
  }

  scene::NodeId At(std::string_view name) const {
    const scene::NodeId node = scene_.Find(name);
    EXPECT_NE(node, scene::kNoNode) << name;
    return node;
  }

  // The number at a frame.
  double Number(std::string_view node, std::string_view attribute, double frame = 1.0) {
    const motion::NumberId id = evaluator_->Number(At(node), attribute);
    evaluator_->MoveTo(frame);
    return evaluator_->Value(id);
  }
  motion::Vector Point(std::string_view node, const std::string& attribute, double frame = 1.0) {
    return {Number(node, attribute + 'X', frame), Number(node, attribute + 'Y', frame),
            Number(node, attribute + 'Z', frame)};
  }
  motion::Matrix World(std::string_view node, double frame = 1.0) {
    const motion::MatrixId id = evaluator_->World(At(node));
    evaluator_->MoveTo(frame);
    return evaluator_->Value(id);
  }
  motion::Matrix Local(std::string_view node, double frame = 1.0) {
    const motion::MatrixId id = evaluator_->Local(At(node));
    evaluator_->MoveTo(frame);
    return evaluator_->Value(id);
  }

  // "line: sentence [code]" of every diagnostic.
  std::vector<std::string> Diagnostics() const {
    std::vector<std::string> shown;
    for (const diag::Diagnostic& diagnostic : diagnostics_->kept()) {
      shown.push_back(std::to_string(diagnostic.place.line) + ": " + diag::SentenceOf(diagnostic) + " [" +
                      diag::NameOf(diagnostic.code) + ']');
    }
    return shown;
  }

  const scene::Scene& scene() const { return scene_; }
  motion::Evaluator& evaluator() { return *evaluator_; }

 private:
  std::string text_;
  std::unique_ptr<diag::Collector> diagnostics_;
  scene::Scene scene_;
  std::unique_ptr<motion::Evaluator> evaluator_;
};

}  // namespace testmotion
