#include "bench/WordCount.h"

#include <gtest/gtest.h>
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <new>
#include <random>
#include <sstream>
#include <string>
#include <string_view>

namespace bench {
namespace {

// As the standard library cuts a text at white space.
std::size_t WordsOf(const std::string& text) {
  std::istringstream words(text);
  std::size_t count = 0;
  for (std::string word; words >> word;) ++count;
  return count;
}

void ExpectWords(std::string_view text, std::size_t expected) {
  for (const WordCounter& counter : wordCounters()) {
    EXPECT_EQ(counter.count(text.data(), text.size()), expected) << counter.name << ": " << text;
  }
  EXPECT_EQ(countWords(text.data(), text.size()), expected);
}

TEST(WordCountTest, AnEmptyTextHasNone) { ExpectWords("", 0); }

TEST(WordCountTest, WordsAreApartByAnyWhiteSpace) {
  ExpectWords("setAttr \".t\" 1\t2\n3\v4\f5\r6 ;", 9);
  ExpectWords("  \n\t ", 0);
}

TEST(WordCountTest, ControlCharactersAndBytesAbove127AreNoWhiteSpace) {
  using namespace std::string_view_literals;
  ExpectWords("a\0b a\x08z \x0e \x1f \x7f \x85 \xa0\xff"sv, 7);
}

TEST(WordCountTest, AWordOverTheEndOfABlockCountsOnce) {
  for (std::size_t before = 60; before <= 70; ++before) {
    ExpectWords(std::string(before, ' ') + "createNode", 1);
    ExpectWords(std::string(before, 'a') + " b", 2);
    ExpectWords(std::string(before, 'a') + "\n", 1);
  }
}

TEST(WordCountTest, EveryCounterAgreesWithTheLibrary) {
  std::mt19937 random(7);
  constexpr std::string_view kBytes = " \t\n\v\f\r\b\x0e\x80xyz;\"";
  for (std::size_t size = 0; size < 400; ++size) {
    std::string text(size, ' ');
    std::ranges::generate(text, [&] { return kBytes[random() % kBytes.size()]; });
    ExpectWords(text, WordsOf(text));
  }
}

// A page between two that nobody may read.
class LonePage {
 public:
  LonePage() : size_(static_cast<std::size_t>(sysconf(_SC_PAGESIZE))) {
    region_ = mmap(nullptr, 3 * size_, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (region_ == MAP_FAILED) throw std::bad_alloc();
    if (mprotect(begin(), size_, PROT_READ | PROT_WRITE) != 0) std::abort();
  }
  ~LonePage() { munmap(region_, 3 * size_); }
  LonePage(const LonePage&) = delete;
  LonePage& operator=(const LonePage&) = delete;

  char* begin() const { return static_cast<char*>(region_) + size_; }
  char* end() const { return begin() + size_; }

 private:
  std::size_t size_;
  void* region_ = nullptr;
};

TEST(WordCountTest, NothingIsReadBesideTheText) {
  const LonePage page;
  std::fill(page.begin(), page.end(), 'a');
  for (std::size_t size = 1; size < 200; ++size) {
    ExpectWords({page.begin(), size}, 1);
    ExpectWords({page.end() - size, size}, 1);
  }
}

}  // namespace
}  // namespace bench
