// The number scanner, one by one and in runs, beside std::from_chars. The items are numbers.
#include <charconv>
#include <random>
#include <vector>

#include "bench/micro/MicroBenchmark.h"
#include "hostutil/HostNumbers.h"

namespace bench {
namespace {

constexpr std::size_t kNumbers = 4096;

struct Texts {
  std::string run;  // apart by blanks, a ";" at the end
  std::vector<std::string_view> each;
};

// Frame numbers alternate with values, as in a curve.
Texts keyTexts(double range, std::chars_format format, int precision) {
  std::mt19937_64 random(1);
  Texts texts;
  std::vector<std::size_t> ends;
  char digits[64];
  for (std::size_t i = 0; i < kNumbers; ++i) {
    constexpr double kUnit = 1.0 / 9007199254740992.0;
    const double value = (static_cast<double>(random() >> 11) * kUnit * 2.0 - 1.0) * range;
    const auto written = i % 2 == 0 ? std::to_chars(digits, digits + sizeof digits, i / 2 + 1)
                                    : std::to_chars(digits, digits + sizeof digits, value, format, precision);
    texts.run.append(" ").append(digits, written.ptr);
    ends.push_back(texts.run.size());
  }
  texts.run += ';';
  std::size_t begin = 1;
  for (const std::size_t end : ends) {
    texts.each.push_back(std::string_view(texts.run).substr(begin, end - begin));
    begin = end + 1;
  }
  return texts;
}

void oneByOne(benchmark::State& state, const Texts& texts) {
  for (auto _ : state) {
    double sum = 0.0;
    for (const std::string_view text : texts.each) {
      double value = 0.0;
      require(HostNumberScan(text.data(), static_cast<std::int64_t>(text.size()), &value) == 0);
      sum += value;
    }
    benchmark::DoNotOptimize(sum);
  }
  countWork(state, kNumbers, static_cast<std::int64_t>(texts.run.size()));
}

void inRuns(benchmark::State& state, const Texts& texts) {
  std::vector<double> numbers(kNumbers);
  const char* const end = texts.run.data() + texts.run.size();
  for (auto _ : state) {
    const char* after = nullptr;
    std::int64_t count = 0;
    require(HostNumberScanRun(texts.run.data(), end, ';', numbers.data(), kNumbers, &count, &after) == 0);
    require(count == kNumbers);
    benchmark::ClobberMemory();
  }
  countWork(state, kNumbers, static_cast<std::int64_t>(texts.run.size()));
}

void byLibrary(benchmark::State& state, const Texts& texts) {
  for (auto _ : state) {
    double sum = 0.0;
    for (const std::string_view text : texts.each) {
      double value = 0.0;
      require(std::from_chars(text.data(), text.data() + text.size(), value).ec == std::errc());
      sum += value;
    }
    benchmark::DoNotOptimize(sum);
  }
  countWork(state, kNumbers, static_cast<std::int64_t>(texts.run.size()));
}

const bool registered = [] {
  static const Texts kShort = keyTexts(100.0, std::chars_format::fixed, 6);
  static const Texts kBaked = keyTexts(100.0, std::chars_format::general, 17);
  static const Texts kSmall = keyTexts(1e-9, std::chars_format::scientific, 14);
  const struct {
    const char* name;
    const Texts& texts;
  } forms[] = {{"six_decimals", kShort}, {"17_digits", kBaked}, {"exponents", kSmall}};
  for (const auto& form : forms) {
    const std::string name = "numbers/" + std::string(form.name);
    benchmark::RegisterBenchmark((name + "/one_by_one").c_str(), oneByOne, form.texts);
    benchmark::RegisterBenchmark((name + "/run").c_str(), inRuns, form.texts);
    benchmark::RegisterBenchmark((name + "/from_chars").c_str(), byLibrary, form.texts);
  }
  return true;
}();

}  // namespace
}  // namespace bench
