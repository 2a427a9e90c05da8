// The lexer over the text of meshes and of nodes: token by token, and in bulk as the main loop does it. The
// items are tokens; in bulk, those that are still handed out.
#include "bench/micro/MicroBenchmark.h"
#include "maya/MAYA_Lex.h"
#include "refhost/Host.h"
#include "scan/SkipText.h"

using namespace mayaimport;

namespace bench {
namespace {

constexpr double kMeshScale = 0.05;
constexpr double kNodesScale = 0.02;

const std::string& textOf(std::string_view workload) {
  static const std::string mesh = sceneOf("mesh", kMeshScale);
  static const std::string nodes = sceneOf("nodes", kNodesScale);
  return workload == "mesh" ? mesh : nodes;
}

// The tokens up to the end; `beforeEach` may move the lexer on.
template <typename BeforeEach>
std::int64_t tokens(MAYA_Lex& lexer, BeforeEach&& beforeEach) {
  std::int64_t count = 0;
  for (MayaToken kind = Unknown; kind != EndOfFile; ++count) {
    const char* first = nullptr;
    const char* last = nullptr;
    beforeEach();
    kind = lexer.GetNextToken(&first, &last);
    benchmark::DoNotOptimize(first);
  }
  return count;
}

void lex(benchmark::State& state, std::string_view workload) {
  const refhost::Host host({});
  const std::string& text = textOf(workload);
  std::int64_t count = 0;
  for (auto _ : state) {
    MAYA_Lex lexer(host.basicSuite(), text.data(), text.data() + text.size());
    count = tokens(lexer, [] {});
  }
  countWork(state, count, static_cast<std::int64_t>(text.size()));
}

void lexInBulk(benchmark::State& state, std::string_view workload, scan::SkipText skip) {
  const refhost::Host host({});
  const std::string& text = textOf(workload);
  const char* const end = text.data() + text.size();
  std::int64_t count = 0;
  for (auto _ : state) {
    MAYA_Lex lexer(host.basicSuite(), text.data(), end);
    count = tokens(lexer, [&] {
      if (lexer.position < end) lexer.tokenStart = lexer.position = skip(lexer.position, end, &lexer.line);
    });
  }
  countWork(state, count, static_cast<std::int64_t>(text.size()));
}

const bool registered = [] {
  for (const char* const workload : {"mesh", "nodes"}) {
    const std::string name = "lexer/" + std::string(workload);
    benchmark::RegisterBenchmark((name + "/tokens").c_str(), lex, workload);
    for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
      benchmark::RegisterBenchmark((name + "/bulk/" + skipper.name).c_str(), lexInBulk, workload,
                                   skipper.betweenCommands);
    }
  }
  return true;
}();

}  // namespace
}  // namespace bench
