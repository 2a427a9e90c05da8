// number-campaign SEED COUNT: the conversion of numbers against std::from_chars, over numbers made from the
// seed.
//
// Every number goes through ReadNumber, and once more as one of a run through ReadPlainNumber. The bits of
// the value, the status and how far a run was read are compared. Ends with 1 after the first difference.
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

#include "scan/Decimal.h"
#include "tests/scan/NumberTexts.h"

namespace scan_tests {
namespace {

using scan::NumberStatus;

constexpr int kBatch = 4096;

// A number of plain form must be taken in a run, at least up to this length.
constexpr std::size_t kPlainLength = 40;

struct Expected {
  std::size_t begin;  // in the batch's text
  std::size_t end;
  NumberStatus status;
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

// What std::from_chars says of the number. It has one code for overflow and underflow; the C
// library's answer does.
Expected Judge(const std::string& text, std::size_t begin) {
  Expected expected{begin, text.size(), NumberStatus::Ok, 0.0, true};
  const char* first = text.data() + begin;
  const char* const end = text.data() + text.size();
  const bool negative = *first == '-';
  expected.plain = *first != '+' && text.size() - begin <= kPlainLength;
  if (*first == '-' || *first == '+') ++first;
  const auto read = std::from_chars(first, end, expected.value);
  if (read.ec == std::errc::result_out_of_range) {
    expected.value = std::strtod(std::string(first, end).c_str(), nullptr);
  } else if (read.ec != std::errc()) {
    expected.status = NumberStatus::Syntax;
  }
  if (std::isinf(expected.value)) expected.status = NumberStatus::Range;
  if (negative) expected.value = -expected.value;
  expected.plain = expected.plain && expected.status == NumberStatus::Ok && read.ptr == end;
  return expected;
}

class Campaign {
 public:
  Campaign(std::uint64_t seed, std::int64_t count) : texts_(seed), separators_(~seed), left_(count) {}

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
      const std::string_view separator = kSeparators[separators_.Pick(0, 7)];
      text_ += separator;
      const std::size_t begin = text_.size();
      ++tally_.ofForm[static_cast<std::size_t>(texts_.Append(&text_))];
      numbers_.push_back(Judge(text_, begin));
      tally_.outOfRange += numbers_.back().status == NumberStatus::Range ? 1 : 0;
    }
    text_ += ';';
    // Nothing after the NUL, so that a sanitizer finds who reads there.
    memory_.assign(text_.c_str(), text_.c_str() + text_.size() + 1);
    memory_.shrink_to_fit();
    tally_.numbers += static_cast<std::int64_t>(numbers_.size());
  }

  bool CompareOneByOne() {
    for (const Expected& number : numbers_) {
      double value = kUntouched;
      const auto length = static_cast<std::int64_t>(number.end - number.begin);
      const NumberStatus status = scan::ReadNumber(memory_.data() + number.begin, length, &value);
      const double expected = number.status == NumberStatus::Ok ? number.value : kUntouched;
      if (status != number.status || !SameBits(value, expected)) {
        return Differs("ReadNumber", number, status, value);
      }
    }
    return true;
  }

  // A number that is left must not be of plain form; the run goes on after it.
  bool CompareInRuns() {
    const char* at = memory_.data();
    const char* const end = memory_.data() + text_.size();
    for (const Expected& number : numbers_) {
      double value = kUntouched;
      const char* const numberEnd = memory_.data() + number.end;
      const char* const after = scan::ReadPlainNumber(at, end, ';', &value);
      at = numberEnd;
      if (after == nullptr) {
        if (number.plain) return Differs("ReadPlainNumber, which left it,", number, number.status, value);
        continue;
      }
      if (after != numberEnd || number.status != NumberStatus::Ok || !SameBits(value, number.value)) {
        return Differs("ReadPlainNumber", number, NumberStatus::Ok, value);
      }
      ++tally_.inRuns;
    }
    return true;
  }

  bool Differs(const char* who, const Expected& number, NumberStatus status, double value) const {
    const std::string text = text_.substr(number.begin, number.end - number.begin);
    std::printf("%s differs at \"%s\": expected status %d and %.17g (%a), found status %d and %.17g (%a)\n",
                who, text.c_str(), static_cast<int>(number.status), number.value, number.value,
                static_cast<int>(status), value, value);
    return false;
  }

  static constexpr double kUntouched = 4711.25;

  NumberTexts texts_;
  SeededBits separators_;
  std::int64_t left_;
  std::string text_;
  std::vector<char> memory_;  // the text and its NUL
  std::vector<Expected> numbers_;
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
  std::printf("seed %s: %lld numbers one by one, %lld of them in runs too, %lld too large; %.1f s: %s\n",
              seed, static_cast<long long>(tally.numbers), static_cast<long long>(tally.inRuns),
              static_cast<long long>(tally.outOfRange), seconds.count(),
              same ? "no difference" : "DIFFERENCE");
  return same ? 0 : 1;
}

}  // namespace
}  // namespace scan_tests

int main(int argc, char** argv) {
  constexpr int kWrongUsage = 2;
  if (argc == 3 && std::atoll(argv[2]) > 0) return scan_tests::Main(argv[1], argv[2]);
  std::puts("usage: number-campaign SEED COUNT");
  return kWrongUsage;
}
