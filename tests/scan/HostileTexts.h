// Short texts that try the lexer: harmless words in bulk, and between them whatever opens, closes, acts or is
// illegal.
#pragma once

#include <cstdint>
#include <iterator>
#include <random>
#include <string>
#include <string_view>

namespace testsupport {

class HostileTexts {
 public:
  static constexpr int kLongest = 200;

  explicit HostileTexts(std::uint64_t seed) : random_(seed) {}

  int Pick(int least, int most) {
    return least + static_cast<int>(random_() % static_cast<std::uint64_t>(most - least + 1));
  }

  // The next text; valid until the one after it.
  std::string_view Next() {
    text_.clear();
    const auto size = static_cast<std::size_t>(Pick(0, kLongest));
    const int harmless = kHarmlessPercent[Pick(0, 4)];
    const int hostile = kHostilePercent[Pick(0, 3)];
    while (text_.size() < size) {
      if (Pick(0, 99) < harmless) {
        AddHarmless();
      } else if (Pick(0, 99) < hostile) {
        AddHostile();
      } else {
        AddActing();
      }
    }
    text_.resize(size);
    // A word that is cut short here ends the reading in an error; a blank lets half of them end well.
    if (size != 0 && Pick(0, 1) == 0) text_.back() = ' ';
    return text_;
  }

 private:
  static constexpr int kHarmlessPercent[] = {0, 50, 80, 95, 99};
  static constexpr int kHostilePercent[] = {0, 0, 5, 30};  // of what is not harmless

  void AddHarmless() {
    using namespace std::string_view_literals;
    static constexpr std::string_view kPieces[] = {
        " 12.5"sv,      " -3"sv,
        " .5e-7"sv,     " -n "sv,
        " word"sv,      ";"sv,
        "\n\t\t"sv,     "\r\n"sv,
        " 0"sv,         " --1"sv,
        " fileInfo "sv, " file "sv,
        "requires "sv,  " parent;"sv,
        " addAttr "sv,  " x\"y"sv,
        " 1//2"sv,      " v\\\""sv,
        " a*/"sv,       " 7c"sv,
        " no;"sv,       "disconnectAttr "sv,
    };
    const int choice = Pick(0, 29);
    if (choice < 22) {
      text_ += kPieces[choice];
    } else {
      static constexpr std::string_view kFills = " \n;w1.-Z";
      text_.append(static_cast<std::size_t>(Pick(1, 70)), kFills[static_cast<std::size_t>(choice - 22)]);
    }
  }

  // What the main loop looks at and reads on after.
  void AddActing() {
    using namespace std::string_view_literals;
    static constexpr std::string_view kPieces[] = {
        "\"\""sv,
        "\" ; c\" "sv,
        " \"a\\\"b\" "sv,
        "\"/*\"\n"sv,
        "// c;\n"sv,
        " // s\r"sv,
        "/* c */ "sv,
        "/**/"sv,
        "/* \" */"sv,
        "createNode "sv,
        "setAttr "sv,
        "SETATTR;"sv,
        " connectAttr\n"sv,
        "currentUnit "sv,
        "select;"sv,
        "Select\t"sv,
        " cr"sv,
        " s"sv,
        " C "sv,
        " ( "sv,
        " )"sv,
        " + "sv,
        " : "sv,
        " - "sv,
        " -/"sv,
        " s\""sv,
        " c//"sv,
        " -\x80"sv,
    };
    text_ += kPieces[static_cast<std::size_t>(Pick(0, static_cast<int>(std::size(kPieces)) - 1))];
  }

  // What mostly ends the reading: left open, cut short, or illegal.
  void AddHostile() {
    using namespace std::string_view_literals;
    static constexpr std::string_view kPieces[] = {
        "\""sv,    "\\\""sv,  "\\"sv,  "\\\\\""sv, "/"sv,  "//"sv,   "/*"sv, "*/"sv, "/***/"sv, "*"sv,
        "-"sv,     "\0"sv,    " \0"sv, "\0 "sv,    "#"sv,  " @"sv,   "["sv,  " `"sv, "{"sv,     "\x80"sv,
        " \xff"sv, " \xe3"sv, "\v"sv,  "\f"sv,     " ,"sv, "\x7f"sv, ":"sv,  "("sv,
    };
    constexpr int kCount = static_cast<int>(std::size(kPieces));
    const int choice = Pick(0, kCount + kCount / 2);
    if (choice < kCount) {
      text_ += kPieces[choice];
    } else {
      text_ += static_cast<char>(Pick(0, 255));
    }
  }

  std::mt19937_64 random_;
  std::string text_;
};

}  // namespace testsupport
