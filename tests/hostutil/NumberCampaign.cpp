// number-campaign SEED COUNT: the number scanner against std::from_chars, over numbers made from the seed.
//
// Every number goes through HostNumberScan, and once more as one of a run of pairs through
// HostNumberScanPairs. The bits of the value, the codes, how far a run was read and its line feeds are
// compared. Ends with 1 after the first difference.
#include <array>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include "NumberTexts.h"
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostNumbers.h"

namespace hostutil_tests {
namespace {

constexpr int kBatch = 4096;
constexpr int kMostPairs = 256;

// A number of plain form must be taken in a run, at least up to this length.
constexpr std::size_t kPlainLength = 40;

struct Expected {
  std::size_t begin;  // in the batch's text
  std::size_t end;
  int lineFeeds;  // before it
  HostError code;
  double value;
  bool plain;
};

struct Tally {
  std::int64_t numbers = 0;
  std::int64_t inRuns = 0;
  std::int64_t outOfRange = 0;
  std::array<std::int64_t, NumberTexts::kForms> ofForm{};
};

bool SameBits(double a, double b) { return std::memcmp(&a, &b, sizeof a) == 0; }

// What std::from_chars says of the number. It tells overflow from underflow by no code of its own; the C
// library's answer does.
Expected Judge(const std::string& text, std::size_t begin) {
  Expected expected{begin, text.size(), 0, HOST_ERR_NONE, 0.0, true};
  const char* first = text.data() + begin;
  const char* const end = text.data() + text.size();
  const bool negative = *first == '-';
  expected.plain = *first != '+' && text.size() - begin <= kPlainLength;
  if (*first == '-' || *first == '+') ++first;
  const auto read = std::from_chars(first, end, expected.value);
  if (read.ec == std::errc::result_out_of_range) {
    expected.value = std::strtod(std::string(first, end).c_str(), nullptr);
  } else if (read.ec != std::errc()) {
    expected.code = HOST_ERR_NUMBER_SYNTAX;
  }
  if (std::isinf(expected.value)) expected.code = HOST_ERR_NUMBER_RANGE;
  if (negative) expected.value = -expected.value;
  expected.plain = expected.plain && expected.code == HOST_ERR_NONE && read.ptr == end;
  return expected;
}

class Campaign {
 public:
  Campaign(std::uint64_t seed, std::int64_t count) : texts_(seed), random_(~seed), left_(count) {}

  bool Run() {
    for (; left_ > 0; left_ -= static_cast<std::int64_t>(numbers_.size())) {
      MakeBatch();
      if (!CompareOneByOne() || !CompareInRuns()) return false;
    }
    return true;
  }

  const Tally& tally() const { return tally_; }

 private:
  void MakeBatch() {
    constexpr std::string_view kSeparators[] = {" ", " ", " ", " ", "\n\t\t", "\t", "\r\n", "  \n "};
    text_.clear();
    numbers_.clear();
    while (numbers_.size() < kBatch && static_cast<std::int64_t>(numbers_.size()) < left_) {
      const std::string_view separator = kSeparators[random_.Pick(0, 7)];
      text_ += separator;
      const std::size_t begin = text_.size();
      ++tally_.ofForm[static_cast<std::size_t>(texts_.Append(&text_))];
      numbers_.push_back(Judge(text_, begin));
      numbers_.back().lineFeeds = separator.find('\n') != std::string_view::npos ? 1 : 0;
      tally_.outOfRange += numbers_.back().code == HOST_ERR_NUMBER_RANGE ? 1 : 0;
    }
    text_ += ';';
    // Nothing behind the NUL, so that a sanitizer finds who reads there.
    memory_.assign(text_.c_str(), text_.c_str() + text_.size() + 1);
    memory_.shrink_to_fit();
    tally_.numbers += static_cast<std::int64_t>(numbers_.size());
  }

  bool CompareOneByOne() {
    constexpr double kUntouched = 4711.25;
    for (const Expected& number : numbers_) {
      double value = kUntouched;
      const auto length = static_cast<std::int64_t>(number.end - number.begin);
      const HostError code = HostNumberScan(memory_.data() + number.begin, length, &value);
      const double expected = number.code == HOST_ERR_NONE ? number.value : kUntouched;
      if (code != number.code || !SameBits(value, expected))
        return Differs("HostNumberScan", number, code, value);
    }
    return true;
  }

  bool CompareInRuns() {
    std::size_t next = 0;
    const char* at = memory_.data();
    const char* const end = memory_.data() + text_.size();
    while (next + 1 < numbers_.size()) {
      const int capacity = random_.Pick(1, kMostPairs);
      const char* behind = nullptr;
      std::int32_t lineFeeds = 0;
      const std::int64_t count = HostNumberScanPairs(at, end, pairs_, capacity, &behind, &lineFeeds);
      if (count < 0 || count > capacity || !CompareRun(next, count, at, behind, lineFeeds)) return false;
      next += 2 * static_cast<std::size_t>(count);
      at = behind;
      if (count == capacity || next + 1 >= numbers_.size()) continue;
      if (numbers_[next].plain && numbers_[next + 1].plain) {
        return Differs("HostNumberScanPairs, which left it,", numbers_[next], 0, 0.0);
      }
      next += 2;
      at = memory_.data() + numbers_[next - 1].end;
    }
    return true;
  }

  bool CompareRun(std::size_t first, std::int64_t count, const char* begin, const char* behind,
                  std::int32_t lineFeeds) {
    const auto numbers = static_cast<std::size_t>(2 * count);
    if (first + numbers > numbers_.size())
      return Differs("HostNumberScanPairs' count", numbers_.back(), 0, 0.0);
    std::int32_t expectedLineFeeds = 0;
    for (std::size_t i = 0; i < numbers; ++i) {
      const Expected& number = numbers_[first + i];
      const double value = pairs_[i / 2][i % 2];
      expectedLineFeeds += number.lineFeeds;
      if (number.code != HOST_ERR_NONE || !SameBits(value, number.value)) {
        return Differs("HostNumberScanPairs", number, 0, value);
      }
    }
    const char* const expectedBehind =
        numbers == 0 ? begin : memory_.data() + numbers_[first + numbers - 1].end;
    if (behind != expectedBehind || lineFeeds != expectedLineFeeds) {
      return Differs("HostNumberScanPairs' position or lines", numbers_[first], 0, 0.0);
    }
    tally_.inRuns += static_cast<std::int64_t>(numbers);
    return true;
  }

  bool Differs(const char* who, const Expected& number, HostError code, double value) const {
    const std::string text = text_.substr(number.begin, number.end - number.begin);
    std::printf("%s differs at \"%s\": expected code %d and %.17g (%a), found code %d and %.17g (%a)\n", who,
                text.c_str(), number.code, number.value, number.value, code, value, value);
    return false;
  }

  NumberTexts texts_;
  SeededBits random_;
  std::int64_t left_;
  std::string text_;
  std::vector<char> memory_;  // the text and its NUL
  std::vector<Expected> numbers_;
  double pairs_[kMostPairs][2] = {};
  Tally tally_;
};

int Main(const char* seed, const char* count) {
  Campaign campaign(std::strtoull(seed, nullptr, 10), std::strtoll(count, nullptr, 10));
  const auto begin = std::chrono::steady_clock::now();
  const bool same = campaign.Run();
  const std::chrono::duration<double> seconds = std::chrono::steady_clock::now() - begin;
  const Tally& tally = campaign.tally();
  for (int form = 0; form < NumberTexts::kForms; ++form) {
    const std::string name(NumberTexts::FormName(form));
    std::printf("%12lld  %s\n", static_cast<long long>(tally.ofForm[static_cast<std::size_t>(form)]),
                name.c_str());
  }
  std::printf(
      "seed %s: %lld numbers one by one, %lld of them in runs of pairs too, %lld too large; %.1f s: %s\n",
      seed, static_cast<long long>(tally.numbers), static_cast<long long>(tally.inRuns),
      static_cast<long long>(tally.outOfRange), seconds.count(), same ? "no difference" : "DIFFERENCE");
  return same ? 0 : 1;
}

}  // namespace
}  // namespace hostutil_tests

int main(int argc, char** argv) {
  constexpr int kWrongUsage = 2;
  if (argc == 3 && std::atoll(argv[2]) > 0) return hostutil_tests::Main(argv[1], argv[2]);
  std::puts("usage: number-campaign SEED COUNT");
  return kWrongUsage;
}
