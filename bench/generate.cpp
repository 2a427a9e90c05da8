// bench-generate WORKLOAD FILE [SCALE]: writes a scene for measurements, and prints what an import makes of
// it.
#include <cstdlib>
#include <fstream>
#include <iostream>

#include "bench/SceneGenerator.h"

int main(int argc, char** argv) {
  constexpr int kWrongUsage = 2;
  constexpr int kNotWritten = 3;
  constexpr std::uint64_t kSeed = 20240229;
  const bench::Workload* workload = argc >= 3 ? bench::findWorkload(argv[1]) : nullptr;
  const double scale = argc >= 4 ? std::atof(argv[3]) : 1.0;
  if (workload == nullptr || !(scale > 0.0)) {
    std::cerr << "usage: bench-generate WORKLOAD FILE [SCALE]\n";
    for (const bench::Workload& known : bench::workloads()) {
      std::cerr << "  " << known.name << ": " << known.what << '\n';
    }
    return kWrongUsage;
  }
  std::ofstream out(argv[2], std::ios::binary);
  const bench::Built built = workload->write(out, scale, kSeed);
  out.close();
  if (!out) {
    std::cerr << "bench-generate: " << argv[2] << " could not be written\n";
    return kNotWritten;
  }
  if (workload->code != 0) {
    std::cout << workload->name << ": an import stops with " << workload->code << '\n';
  } else {
    std::cout << workload->name << ": " << built.layers << " layers, " << built.keys << " keys\n";
  }
  return 0;
}
