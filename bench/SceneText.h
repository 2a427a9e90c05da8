// Maya ASCII commands with random numbers.
#pragma once

#include <charconv>
#include <cmath>
#include <cstdint>
#include <ostream>
#include <random>
#include <string>
#include <string_view>
#include <utility>

namespace bench {

class SceneText {
 public:
  SceneText(std::ostream& out, std::uint64_t seed) : out_(out), random_(seed) {
    buffer_.reserve(kBufferBytes * 2);
  }
  ~SceneText() { flush(); }
  SceneText(const SceneText&) = delete;
  SceneText& operator=(const SceneText&) = delete;

  SceneText& text(std::string_view part) {
    buffer_.append(part);
    if (buffer_.size() >= kBufferBytes) flush();
    return *this;
  }

  SceneText& integer(std::int64_t value) {
    char digits[32];
    return text({digits, std::to_chars(digits, digits + sizeof digits, value).ptr});
  }

  SceneText& real(double value, int decimals) {
    char digits[64];
    return text(
        {digits,
         std::to_chars(digits, digits + sizeof digits, value, std::chars_format::fixed, decimals).ptr});
  }

  // Between -range and range; the same on every machine.
  double number(double range) {
    constexpr double kUnit = 1.0 / 9007199254740992.0;
    return (static_cast<double>(random_() >> 11) * kUnit * 2.0 - 1.0) * range;
  }

  std::int64_t below(std::int64_t limit) {
    return static_cast<std::int64_t>(random_() % static_cast<std::uint64_t>(limit));
  }

  void header(std::string_view timeUnit) {
    text("//Maya ASCII 2024 scene\n//Name: measured.ma\nrequires maya \"2024\";\n");
    text("currentUnit -l centimeter -a degree -t ").text(timeUnit).text(";\n");
    text("fileInfo \"application\" \"bench\";\n");
  }

  void renderSettings() {
    text("select -ne :defaultResolution;\n\tsetAttr \".w\" 1920;\n\tsetAttr \".h\" 1080;\n");
    text("\tsetAttr \".dar\" 1.7777777910232544;\n\tsetAttr \".pa\" 1;\n");
  }

  void footer() {
    renderSettings();
    text("// End of measured.ma\n");
  }

  // A node, and its unique identifier. Without a parent it is at the top.
  SceneText& node(std::string_view type, std::string_view name, std::string_view parent = {}) {
    text("createNode ").text(type).text(" -n \"").text(name);
    if (!parent.empty()) text("\" -p \"").text(parent);
    text("\";\n\trename -uid \"");
    const std::uint64_t first = random_();
    const std::uint64_t second = random_();
    hex(first >> 32, 8).text("-").hex(first >> 16, 4).text("-").hex(first, 4).text("-");
    return hex(second >> 48, 4).text("-").hex(second, 12).text("\";\n");
  }

  // Three numbers in the form of most attributes of a transform.
  SceneText& triple(std::string_view attribute, double x, double y, double z, int decimals) {
    text("\tsetAttr \"").text(attribute).text("\" -type \"double3\" ");
    return real(x, decimals).text(" ").real(y, decimals).text(" ").real(z, decimals).text(" ;\n");
  }

  // A curve of baked keys from frame 1 on: a motion that changes its speed a little from frame to frame, and
  // begins within the range of the middle.
  void curve(std::string_view type, const std::string& name, int keys, int decimals, double range,
             double middle = 0.0) {
    node(type, name)
        .text("\tsetAttr \".tan\" 18;\n\tsetAttr -s ")
        .integer(keys)
        .text(" \".ktv[0:")
        .integer(keys - 1)
        .text("]\" ");
    constexpr double kDrag = 0.9;
    constexpr double kPush = 0.01;
    double value = middle + number(range);
    double speed = 0.0;
    for (int k = 0; k < keys; ++k) {
      text(k % 8 == 7 ? "\n\t\t" : " ").integer(k + 1).text(" ").real(value, decimals);
      speed = speed * kDrag + number(range * kPush);
      value += speed;
    }
    text(";\n");
  }

  // The commands for each key that a curve has when it was edited after baking.
  void tangents(int keys) {
    for (const auto& [attribute, word] :
         {std::pair{".kit", " 18"}, {".kot", " 18"}, {".ktl", " no"}, {".kwl", " no"}}) {
      text("\tsetAttr -s ")
          .integer(keys)
          .text(" \"")
          .text(attribute)
          .text("[0:")
          .integer(keys - 1)
          .text("]\" ");
      for (int k = 0; k < keys; ++k) text(word);
      text(";\n");
    }
  }

  void connect(std::string_view source, std::string_view destination) {
    text("connectAttr \"").text(source).text("\" \"").text(destination).text("\";\n");
  }

 private:
  static constexpr std::size_t kBufferBytes = 1 << 20;

  // The last `count` digits of a number to the base of 16.
  SceneText& hex(std::uint64_t value, int count) {
    char digits[16];
    for (int i = count - 1; i >= 0; --i, value >>= 4) digits[i] = "0123456789ABCDEF"[value & 15];
    return text({digits, static_cast<std::size_t>(count)});
  }

  void flush() {
    out_.write(buffer_.data(), static_cast<std::streamsize>(buffer_.size()));
    buffer_.clear();
  }

  std::ostream& out_;
  std::mt19937_64 random_;
  std::string buffer_;
};

}  // namespace bench
