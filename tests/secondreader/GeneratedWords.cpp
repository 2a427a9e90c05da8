// Names, numbers, and what stands between words.
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {
namespace {

constexpr int kShortestLong = 250;
constexpr int kLongestLong = 258;

}  // namespace

void SceneGenerator::word(std::string_view text) {
  static constexpr std::string_view kPlain[] = {" ", " ", " ", "\t", "\n\t", "  ", "\r\n"};
  static constexpr std::string_view kOdd[] = {" /* of \" ; */ ",
                                              "\n// line ;\n",
                                              " /**/",
                                              " // \r",
                                              " /* a ** b */ ",
                                              " /***/ */ ",
                                              " /* c **/ d */ ",
                                              " /* e ***/ ",
                                              " - ",
                                              " + ",
                                              " -k ",
                                              " on ",
                                              " ( ) "};
  text_ += odd() && odd() ? dice_.oneOf(kOdd) : dice_.oneOf(kPlain);
  text_ += text;
}

void SceneGenerator::words(std::string_view line) {
  while (!line.empty()) {
    const std::size_t blank = line.find(' ');
    word(line.substr(0, blank));
    line.remove_prefix(blank == std::string_view::npos ? line.size() : blank + 1);
  }
}

void SceneGenerator::end() {
  if (dice_.chance(30)) text_ += ' ';
  if (!(odd() && dice_.chance(10))) text_ += ';';
  text_ += '\n';
}

std::string SceneGenerator::anyCase(std::string_view text) {
  std::string result(text);
  if (!odd()) return result;
  for (char& letter : result) {
    const bool isLower = letter >= 'a' && letter <= 'z';
    if (isLower && dice_.chance(50)) letter = static_cast<char>(letter - 'a' + 'A');
  }
  return result;
}

std::string SceneGenerator::newName(std::string_view stem) {
  static constexpr std::string_view kOdd[] = {"",
                                              "a",
                                              "A",
                                              "a\\\"b",
                                              "perspShape",
                                              "PERSPshape",
                                              "\xe4\xf6",
                                              "ns:part|sub",
                                              "x.y",
                                              "{;}//*",
                                              "tab\there",
                                              "Null",
                                              "gr\xc3\xbc"
                                              "n"};
  if (odd()) {
    if (dice_.chance(40)) {
      return std::string(static_cast<std::size_t>(dice_.between(kShortestLong, kLongestLong)),
                         dice_.chance(50) ? 'n' : 'N');
    }
    return std::string(dice_.oneOf(kOdd));
  }
  return std::string(stem) + std::to_string(dice_.between(1, 60));
}

std::string SceneGenerator::knownName(const std::vector<std::string>& names) {
  if (names.empty() || odd()) return dice_.chance(50) ? "missing" : newName("new");
  return anyCase(dice_.oneOf(names));
}

std::string SceneGenerator::oddNumber() {
  static constexpr std::string_view kNumbers[] = {
      "0",     "-0",        "1e3",       ".5",      "5.",    "1e-3",   "-.25",
      "1e",    "23.976fps", "1e-400",    "4e-324",  "1e308", "-1e300", "2147483648",
      "-1e10", "1e9",       "0.0000001", "1e15",    "7up",   "12e+2",  "-12E-1",
      "1e200", "2",         "1.009",     "-0.0007", "1.01",  "0.99",   "180"};
  static constexpr std::string_view kBad[] = {"--x", "0x10", "1.#QNAN", "-.", "1e400", "1,5", "."};
  if (dice_.chance(6)) return std::string(dice_.oneOf(kBad));
  if (dice_.chance(4)) return std::string(static_cast<std::size_t>(dice_.between(253, 256)), '1');
  return std::string(dice_.oneOf(kNumbers));
}

std::string SceneGenerator::number() {
  if (odd()) return oddNumber();
  const int whole = dice_.between(-200, 200);
  if (dice_.chance(40)) return std::to_string(whole);
  return std::to_string(whole) + "." + std::to_string(dice_.between(0, 99999));
}

std::string SceneGenerator::angle() {
  if (dice_.chance(40)) return std::to_string(90 * dice_.between(-6, 6));
  if (dice_.chance(10)) return std::to_string(dice_.between(-9000, 9000));
  return number();
}

std::string SceneGenerator::factor() {
  static constexpr std::string_view kFactors[] = {"1", "1", "2", "0.5", "1.25", "-1", "0", "3.75", "0.001"};
  return odd() ? oddNumber() : std::string(dice_.oneOf(kFactors));
}

void SceneGenerator::triple(std::string (SceneGenerator::*part)()) {
  int count = 3;
  if (odd()) count = dice_.between(0, 4);
  if (dice_.chance(80)) words("-type \"double3\"");
  for (; count > 0; --count) word((this->*part)());
}

}  // namespace secondreader
