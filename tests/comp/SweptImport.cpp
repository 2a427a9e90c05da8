#include "tests/comp/SweptImport.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <set>
#include <stdexcept>
#include <utility>

#include "tests/support/BuilderRun.h"
#include "tests/support/WideTests.h"

namespace testsupport {
namespace {

// The one example whose import does not succeed: it has to be baked.
constexpr char kRefused[] = "harbour_walk";

// A share is divided by it.
constexpr Share kDivisor = {.quick = 10, .wide = 1, .sanitized = 10};

}  // namespace

std::vector<std::string> ExampleNames() {
  std::vector<std::string> names;
  for (const auto& entry : std::filesystem::directory_iterator(MAYASCENE_SOURCE_DIR "/examples")) {
    const std::string name = entry.path().stem().string();
    if (entry.path().extension() == ".ma" && name != kRefused) names.push_back(name);
  }
  std::sort(names.begin(), names.end());
  return names;
}

std::filesystem::path ExampleScene(const std::string& name) {
  return std::filesystem::path(MAYASCENE_SOURCE_DIR "/examples") / (name + ".ma");
}

std::size_t SweepStride(std::size_t calls, std::size_t share) {
  if (AllTestsWanted()) return 1;
  share /= HowMany(kDivisor);
  return ((calls + share - 1) / share) | 1;
}

std::vector<bool> WalkedCalls(const std::vector<std::string>& calls, std::size_t share) {
  const std::size_t stride = SweepStride(calls.size(), share);
  std::set<std::string> met;
  std::vector<bool> walked;
  for (const std::string& call : calls) {
    const bool first = met.insert(CallName(call)).second;
    walked.push_back(first || walked.size() % stride == 0);
  }
  return walked;
}

SweptImport::SweptImport(std::filesystem::path scene) : scene_(std::move(scene)) {
  const SweptRun run = Run({});
  if (run.result.code != 0) throw std::runtime_error(scene_.string() + " cannot be imported");
  text_ = run.calls;
  good_ = LinesOf(text_);
  ends_.push_back(0);
  for (const std::string& line : good_) {
    facts_.emplace_back(line);
    ends_.push_back(ends_.back() + line.size() + 1);
  }
}

SweptRun SweptImport::Run(refhost::HostOptions options) const {
  SweptRun run;
  run.written = std::make_unique<std::ostringstream>();
  options.trace = run.written.get();
  run.host = std::make_unique<refhost::Host>(std::move(options));
  run.result = MakeCallback(*run.host, refhost::Callback::Import, scene_);
  run.calls = std::move(*run.written).str();
  run.calls.erase(run.calls.rfind("{\"call\":\"leave\""));
  run.calls.erase(0, run.calls.find('\n', run.calls.rfind("{\"call\":\"enter\"")) + 1);
  return run;
}

Made SweptImport::MadeWithout(std::size_t index) const {
  MadeCount count;
  for (std::size_t i = 0; i < facts_.size(); ++i) {
    if (i != index) count.Take(facts_[i]);
  }
  return count.made();
}

void SweepCursor::Next() {
  held_.Take(line(), false);
  made_.Take(import_.facts_[index_]);
  ++index_;
}

Made SweepCursor::madeAfter(const std::vector<std::string>& cleanUp) const {
  MadeCount count = made_;
  for (const std::string& call : cleanUp) count.Take(CallFacts(call));
  return count.made();
}

std::string WithErrors(const std::vector<std::string>& calls, std::string_view error) {
  std::string text;
  for (const std::string& call : calls) text.append(call).append(",\"error\":").append(error).append("}\n");
  return text;
}

void ExpectMade(const SweptRun& run, const Made& made, std::size_t reports, std::size_t leftOpen) {
  const refhost::Project& project = run.host->project();
  Made there;
  there.compositions = project.compositions().size();
  there.layers = project.layers().size();
  for (const refhost::Layer& layer : project.layers()) {
    for (const refhost::Stream& stream : layer.streams) there.keys += stream.keyCount();
  }
  there.leftovers = run.result.leftovers.size();
  EXPECT_EQ(there.compositions, made.compositions);
  EXPECT_EQ(there.layers, made.layers);
  EXPECT_EQ(there.keys, made.keys);
  EXPECT_EQ(there.leftovers, made.leftovers);
  EXPECT_EQ(LeftOpen(run.result), leftOpen);
  EXPECT_EQ(run.result.messages.size(), reports);
  for (const std::string& message : run.result.messages) {
    EXPECT_TRUE(message.starts_with(refhost::errorSentence(run.result.code))) << message;
  }
  EXPECT_THAT(run.result.refusals, ::testing::Each(::testing::Not(::testing::HasSubstr("exception"))));
}

}  // namespace testsupport
