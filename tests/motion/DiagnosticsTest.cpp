// The examples of the table of codes give the diagnostics that they are examples of.
#include <algorithm>

#include "diag/Codes.h"
#include "tests/motion/EvaluatorFixture.h"

namespace {

constexpr int kFirstOfMotion = 300;
constexpr int kEndOfMotion = 500;

class MotionDiagnosticsTest : public testmotion::EvaluatorTest {};

// Asks for every channel that is driven, and every curve.
void AskForAll(const scene::Scene& scene, motion::Evaluator* evaluator) {
  for (scene::NodeId node = 0; node < scene.nodes().size(); ++node) {
    if (scene.node(node).type.starts_with("animCurve")) (void)evaluator->Number(node, "output");
    for (const scene::Connection* const connection : scene.ConnectionsInto(node)) {
      const scene::Plug& plug = connection->destination;
      (void)evaluator->Number(plug.node, plug.attribute, plug.index);
      if (plug.attribute == "rotate") (void)evaluator->World(node);
    }
  }
}

TEST_F(MotionDiagnosticsTest, TheExampleOfEveryCodeGivesIt) {
  int looked = 0;
  for (const diag::Entry& entry : diag::Table()) {
    const int number = static_cast<int>(entry.code);
    if (number < kFirstOfMotion || number >= kEndOfMotion) continue;
    ++looked;
    Read(entry.example);
    AskForAll(scene(), &evaluator());
    evaluator().MoveTo(1.0);
    EXPECT_THAT(Diagnostics(), testing::Contains(testing::HasSubstr(diag::NameOf(entry.code))))
        << entry.symbol;
  }
  EXPECT_GE(looked, 16);
}

}  // namespace
