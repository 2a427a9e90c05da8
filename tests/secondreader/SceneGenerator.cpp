#include "tests/secondreader/SceneGenerator.h"

#include <algorithm>

namespace secondreader {
namespace {

constexpr int kOddities[] = {0, 0, 2, 6, 20};
constexpr int kDamaged = 15;  // percent of the scenes
constexpr int kBulky = 2;     // percent of the rigs that something large follows
constexpr int kLongestMessage = 1023;
constexpr const char* kMessageKeys[] = {"$$$/QZ/Maya_Import/LStr/0001", "$$$/QZ/Maya_Import/LStr/0003",
                                        "$$$/QZ/Maya_Import/LStr/0004", "$$$/QZ/Maya_Import/LStr/0005"};

}  // namespace

SceneGenerator::SceneGenerator(std::uint64_t seed) : dice_(seed) { oddity_ = dice_.oneOf(kOddities); }

GeneratedScene SceneGenerator::make() {
  GeneratedScene scene;
  scene.options = settings();
  scene.fileName = fileName();
  scene.imports = dice_.chance(8) ? 2 : 1;
  header();
  if (dice_.chance(70)) units();
  for (int count = dice_.between(0, 2); count > 0; --count) otherCommand();
  for (int count = dice_.between(1, 4); count > 0; --count) {
    rig();
    if (odd()) otherCommand();
    if (odd()) repeatedNode();
    if (odd()) units();
    if (odd()) attributesAgain();
    if (dice_.chance(kBulky)) bulk();
  }
  if (dice_.chance(60)) resolution();
  if (odd()) attributesAgain();
  for (int count = dice_.between(0, 2); count > 0; --count) strayConnection();
  if (dice_.chance(kDamaged)) damage();
  scene.bytes = text_;
  return scene;
}

refhost::HostOptions SceneGenerator::settings() {
  refhost::HostOptions options;
  options.pluginId = dice_.between(-3, 900);
  options.linearUnits = dice_.chance(50) ? 0 : dice_.between(-1, 2);
  options.permissive = dice_.chance(15);
  options.zoomKeys = dice_.chance(5) ? dice_.between(1, 3) : 0;
  if (dice_.chance(3)) options.translations.emplace_back("$$$/QZ/Maya_Import/LStr/0006", "Quadrat");
  if (dice_.chance(3)) options.translations.emplace_back("$$$/QZ/Maya_Import/LStr/0007", "^^2 (^^1, ^^2)");
  if (dice_.chance(3)) options.translations.emplace_back("$$$/QZ/Maya_Import/LStr/0003", "Lesefehler");
  if (dice_.chance(3)) {
    const auto length = static_cast<std::size_t>(dice_.between(kLongestMessage - 1, kLongestMessage + 1));
    const char* const key = dice_.oneOf(kMessageKeys);
    options.translations.emplace_back(key, std::string(length, 'm'));
  }
  return options;
}

std::string SceneGenerator::fileName() {
  static constexpr std::string_view kNames[] = {"scene.ma",
                                                "shot.v01.ma",
                                                "scene",
                                                ".ma",
                                                "two.ma.ma",
                                                "Stra\xc3\x9f"
                                                "e.ma",
                                                "blank name.MA"};
  return dice_.chance(60) ? "scene.ma" : std::string(dice_.oneOf(kNames));
}

void SceneGenerator::header() {
  static constexpr std::string_view kOdd[] = {"//mAYA scene\n",      "//MAYA\n\n\n\n",   "//Maya /* \" */\n",
                                              "//May\n\n\n\n\n\n\n", "\n//Maya ASCII\n", "//Maya"};
  text_ = odd() ? std::string(dice_.oneOf(kOdd)) : "//Maya ASCII 2020 scene\n";
}

// A cut, or a few bytes changed, dropped or put in.
void SceneGenerator::damage() {
  static constexpr std::string_view kBytes("\0\xff\";\\*/-\n:+().#_a9\x80", 20);
  for (int count = dice_.between(1, 3); count > 0 && !text_.empty(); --count) {
    const std::size_t place = dice_.below(text_.size());
    const char byte = dice_.oneOf(kBytes);
    switch (dice_.between(0, 4)) {
      case 0:
        text_.resize(std::max(place, text_.size() / 2));
        break;
      case 1:
        text_.erase(place, 1);
        break;
      case 2:
        text_.insert(place, 1, byte);
        break;
      case 3:
        text_.insert(place, text_.substr(dice_.below(text_.size()), 40));
        break;
      default:
        text_[place] = byte;
        break;
    }
  }
}

}  // namespace secondreader
