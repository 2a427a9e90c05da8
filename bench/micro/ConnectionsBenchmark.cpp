// Connections between nodes that were read before, found by name: of few nodes, which fit the cache, and of
// many, which do not. The items are connections.
#include "bench/micro/MicroBenchmark.h"
#include "maya/MAYA_Parse.h"
#include "refhost/Host.h"

using namespace mayaimport;

namespace bench {
namespace {

void connect(benchmark::State& state, double scale) {
  const refhost::Host host({});
  std::string text = sceneOf("nodes", scale);
  const std::size_t begin = text.find("connectAttr ");
  require(begin != std::string::npos);
  text.resize(text.find("select ", begin));
  std::int64_t connections = 0;
  for (std::size_t at = begin; at != std::string::npos; at = text.find("connectAttr ", at + 1)) ++connections;

  MAYA_Parse parser(host.basicSuite(), text.data(), text.data() + text.size());
  parser.Parse();
  for (auto _ : state) {
    // The nodes are known; the connections are read again.
    parser.tokenStart = parser.position = text.data() + begin;
    parser.Parse();
  }
  countWork(state, connections, static_cast<std::int64_t>(text.size() - begin));
}

BENCHMARK_CAPTURE(connect, 1200_transforms, 0.01)->Name("connections/1200_transforms");
BENCHMARK_CAPTURE(connect, 120000_transforms, 1.0)->Name("connections/120000_transforms");

}  // namespace
}  // namespace bench
