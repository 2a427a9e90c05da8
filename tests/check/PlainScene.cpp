#include "tests/check/PlainScene.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cstdlib>
#include <numbers>

namespace check_test {
namespace {

// Attributes that are looked at: short and long names, and those of their parts.
struct Compound {
  const char* shortName;
  const char* longName;
  std::vector<std::string> parts;  // short
  std::vector<std::string> longParts;
};

const std::vector<Compound>& Compounds() {
  static const auto* const compounds = new std::vector<Compound>{
      {"t", "translate", {"tx", "ty", "tz"}, {"translateX", "translateY", "translateZ"}},
      {"r", "rotate", {"rx", "ry", "rz"}, {"rotateX", "rotateY", "rotateZ"}},
      {"s", "scale", {"sx", "sy", "sz"}, {"scaleX", "scaleY", "scaleZ"}},
      {"rp", "rotatePivot", {"rpx", "rpy", "rpz"}, {"rotatePivotX", "rotatePivotY", "rotatePivotZ"}},
      {"sp", "scalePivot", {"spx", "spy", "spz"}, {"scalePivotX", "scalePivotY", "scalePivotZ"}},
      {"ra", "rotateAxis", {"rax", "ray", "raz"}, {"rotateAxisX", "rotateAxisY", "rotateAxisZ"}},
      {"sh", "shear", {"shxy", "shxz", "shyz"}, {"shearXY", "shearXZ", "shearYZ"}},
      {"rpt", "rotatePivotTranslate", {"rptx", "rpty", "rptz"}, {}},
      {"spt", "scalePivotTranslate", {"sptx", "spty", "sptz"}, {}},
      {"cap", "cameraAperture", {"hfa", "vfa"}, {"horizontalFilmAperture", "verticalFilmAperture"}},
  };
  return *compounds;
}

std::string ShortName(std::string_view written) {
  static const auto* const singles = new std::map<std::string, std::string, std::less<>>{
      {"focalLength", "fl"}, {"filmFit", "ff"},     {"lensSqueezeRatio", "lsr"},  {"cameraScale", "cs"},
      {"orthographic", "o"}, {"rotateOrder", "ro"}, {"inheritsTransform", "it"},  {"keyTimeValue", "ktv"},
      {"width", "w"},        {"height", "h"},       {"deviceAspectRatio", "dar"}, {"pixelAspect", "pa"},
  };
  std::string_view last = written;
  if (!last.starts_with("tg[") && !last.starts_with("target[")) {
    if (const std::size_t dot = last.rfind('.'); dot != std::string_view::npos) last.remove_prefix(dot + 1);
  }
  for (const Compound& compound : Compounds()) {
    if (last == compound.longName) return compound.shortName;
    for (std::size_t i = 0; i < compound.longParts.size(); ++i) {
      if (last == compound.longParts[i]) return compound.parts[i];
    }
  }
  const auto single = singles->find(last);
  return single != singles->end() ? single->second : std::string(last);
}

bool IsNumber(std::string_view word) {
  return !word.empty() &&
         (std::isdigit(static_cast<unsigned char>(word.back())) != 0 || word.back() == '.') &&
         word.find_first_not_of("+-.0123456789eE") == std::string_view::npos;
}

double NumberOf(std::string_view word) { return std::strtod(std::string(word).c_str(), nullptr); }

// Options of setAttr without a value.
bool StandsAlone(std::string_view option) {
  return option == "-av" || option == "-c" || option == "-clamp" || option == "-alteredValue";
}

bool IsOption(std::string_view word) {
  return word.size() > 1 && word[0] == '-' && std::isalpha(static_cast<unsigned char>(word[1])) != 0;
}

}  // namespace

PlainScene::PlainScene(std::string_view text) {
  Command command;
  std::size_t begin = 0;
  for (std::size_t i = 0; i < text.size();) {
    const char c = text[i];
    if (c == ';') {
      Take(command, {begin, ++i});
      command.clear();
    } else if (text.substr(i, 2) == "//") {
      i = std::min(text.find_first_of("\r\n", i), text.size());
    } else if (text.substr(i, 2) == "/*") {
      i = std::min(text.find("*/", i + 2), text.size() - 2) + 2;
    } else if (std::isspace(static_cast<unsigned char>(c)) != 0) {
      ++i;
    } else {
      std::size_t end = i + 1;
      const bool quoted = c == '"';
      if (quoted) {
        while (end < text.size() && text[end] != '"') end += text[end] == '\\' ? 2 : 1;
      } else {
        end = std::min(text.find_first_of(" \t\r\n;\"", i), text.size());
      }
      end = std::min(end, text.size());
      if (command.empty()) begin = i;
      command.push_back({quoted ? text.substr(i + 1, end - i - 1) : text.substr(i, end - i), quoted, end});
      i = quoted ? end + 1 : end;
    }
  }
  if (!command.empty()) openCommand_ = begin;
}

void PlainScene::Take(const Command& command, Bytes place) {
  if (command.empty() || command[0].quoted) return;
  const std::string_view verb = command[0].text;
  if (verb == "createNode") return Create(command, place);
  if (verb == "setAttr") return Set(command, place);
  if (verb == "connectAttr") return Connect(command, place);
  if (verb == "currentUnit") return Units(command);
  if (verb != "select") return;
  current_ = kNone;
  resolutionIsCurrent_ = std::any_of(command.begin(), command.end(),
                                     [](const Word& word) { return word.text == ":defaultResolution"; });
}

int PlainScene::Find(std::string_view path) const {
  const std::size_t bar = path.rfind('|');
  const auto known = byName_.find(std::string(bar == std::string_view::npos ? path : path.substr(bar + 1)));
  if (known == byName_.end()) return kNone;
  for (const int id : known->second) {
    std::string own;
    for (int one = id; one != kNone; one = node(one).parent) own.insert(0, '|' + node(one).name);
    const std::string wanted = path.starts_with('|') ? std::string(path) : '|' + std::string(path);
    if (own == wanted || (!path.starts_with('|') && own.ends_with(wanted))) return id;
  }
  return kNone;
}

void PlainScene::Create(const Command& command, Bytes place) {
  PlainNode made;
  if (command.size() > 1) made.type = command[1].text;
  for (std::size_t i = 2; i < command.size(); ++i) {
    const std::string_view option = command[i].text;
    if (command[i].quoted) continue;
    if (option == "-s" || option == "-shared") made.startup = true;
    if (i + 1 == command.size()) break;
    if (option == "-n" || option == "-name") made.name = command[i + 1].text;
    if (option == "-p" || option == "-parent") made.parentWritten = command[i + 1].text;
  }
  if (!made.parentWritten.empty()) made.parent = Find(made.parentWritten);
  made.text.push_back(place);
  current_ = static_cast<int>(nodes_.size());
  resolutionIsCurrent_ = false;
  byName_[made.name].push_back(current_);
  nodes_.push_back(std::move(made));
  drivers_.emplace_back();
}

std::string PlainScene::LongName(const std::string& attribute) {
  for (const Compound& compound : Compounds()) {
    for (std::size_t i = 0; i < compound.longParts.size(); ++i) {
      if (attribute == compound.parts[i]) return compound.longParts[i];
    }
  }
  return attribute == "fl" ? "focalLength" : attribute;
}

void PlainScene::SetNumbers(std::string_view attribute, const std::vector<double>& numbers,
                            std::map<std::string, double>* known) {
  for (const Compound& compound : Compounds()) {
    if (attribute != compound.shortName) continue;
    for (std::size_t i = 0; i < compound.parts.size() && i < numbers.size(); ++i)
      (*known)[compound.parts[i]] = numbers[i];
    return;
  }
  constexpr std::size_t kMovesAlongX = 12;  // of the sixteen numbers of a matrix
  if (attribute == "opm" && numbers.size() > kMovesAlongX) (*known)["opmx"] = numbers[kMovesAlongX];
  if (!numbers.empty()) (*known)[std::string(attribute)] = numbers[0];
}

void PlainScene::Set(const Command& command, Bytes place) {
  std::string_view plug;
  std::vector<double> numbers;
  bool usual = true;
  for (std::size_t i = 1; i < command.size(); ++i) {
    const Word& word = command[i];
    if (!word.quoted && IsOption(word.text)) {
      usual &= !plug.empty();
      if (!StandsAlone(word.text)) ++i;
    } else if (plug.empty() && word.quoted) {
      plug = word.text;
    } else if (word.text == "yes" || word.text == "on" || word.text == "no" || word.text == "off") {
      numbers.push_back(word.text == "yes" || word.text == "on" ? 1.0 : 0.0);
    } else if (IsNumber(word.text)) {
      numbers.push_back(NumberOf(word.text));
    }
  }
  const std::size_t dot = plug.find('.');
  if (dot == std::string_view::npos) return;
  std::string_view attribute = plug.substr(dot + 1);
  attribute = attribute.substr(0, attribute.find('['));
  if (dot == 0 && resolutionIsCurrent_) {
    if (!numbers.empty()) resolution_[ShortName(attribute)] = numbers[0];
    return;
  }
  const int id = dot == 0 ? current_ : Find(plug.substr(0, dot));
  if (id == kNone) return;
  PlainNode& node = nodes_[static_cast<std::size_t>(id)];
  node.text.push_back(place);
  const std::string shortName = ShortName(attribute);
  SetNumbers(shortName, numbers, &node.numbers);
  if (shortName == "ktv") node.keys.insert(node.keys.end(), numbers.begin(), numbers.end());
  const bool whole = std::any_of(Compounds().begin(), Compounds().end(),
                                 [&](const Compound& compound) { return shortName == compound.shortName; });
  if (usual && dot == 0 && (whole || shortName == "fl")) SetNumbers(shortName, numbers, &node.whole);
}

void PlainScene::Connect(const Command& command, Bytes place) {
  std::vector<std::string_view> plugs;
  for (const Word& word : command) {
    if (word.quoted) plugs.push_back(word.text);
  }
  if (plugs.size() < 2) return;
  const std::size_t from = plugs[0].find('.');
  const std::size_t to = plugs[1].find('.');
  if (from == std::string_view::npos || to == std::string_view::npos) return;
  const int destination = Find(plugs[1].substr(0, to));
  if (destination == kNone) return;
  const PlainDriver driver{Find(plugs[0].substr(0, from)), std::string(plugs[0]), place};
  nodes_[static_cast<std::size_t>(destination)].text.push_back(place);
  drivers_[static_cast<std::size_t>(destination)].emplace(ShortName(plugs[1].substr(to + 1)), driver);
}

void PlainScene::Units(const Command& command) {
  struct Rate {
    const char* word;
    double framesPerSecond;
  };
  constexpr std::array kRates = {Rate{"game", 15.0}, Rate{"film", 24.0}, Rate{"pal", 25.0},
                                 Rate{"ntsc", 30.0}, Rate{"show", 48.0}, Rate{"palf", 50.0},
                                 Rate{"ntscf", 60.0}};
  for (std::size_t i = 1; i + 1 < command.size(); ++i) {
    const std::string word(command[i + 1].text);
    if (command[i].text == "-l" || command[i].text == "-linear")
      countsCentimeters_ = word == "cm" || word == "centimeter";
    if (command[i].text == "-a" || command[i].text == "-angle")
      degrees_ = word.starts_with("rad") ? 180.0 / std::numbers::pi : 1.0;
    if (command[i].text != "-t" && command[i].text != "-time") continue;
    countsFrames_ = word != "game";
    saysRate_ = true;
    const auto* const rate =
        std::find_if(kRates.begin(), kRates.end(), [&](const Rate& one) { return word == one.word; });
    if (rate != kRates.end()) {
      framesPerSecond_ = rate->framesPerSecond;
    } else if (std::isdigit(static_cast<unsigned char>(word[0])) != 0) {
      framesPerSecond_ = NumberOf(word.substr(0, word.find_first_not_of(".0123456789")));
    } else {
      countsFrames_ = false;
      framesPerSecond_ = word == "hour"  ? 1.0 / 3600.0
                         : word == "min" ? 1.0 / 60.0
                         : word == "sec" ? 1.0
                                         : 1000.0;
    }
  }
}

double PlainScene::Number(int id, const std::string& attribute, double otherwise) const {
  const auto known = node(id).numbers.find(attribute);
  return known != node(id).numbers.end() ? known->second : otherwise;
}

double PlainScene::UsualNumber(int id, const std::string& attribute, double otherwise) const {
  const auto known = node(id).whole.find(attribute);
  return known != node(id).whole.end() ? known->second : otherwise;
}

const PlainDriver* PlainScene::DriverOf(int id, const std::string& attribute) const {
  const auto& drivers = drivers_[static_cast<std::size_t>(id)];
  if (const auto known = drivers.find(attribute); known != drivers.end()) return &known->second;
  for (const Compound& compound : Compounds()) {
    if (std::find(compound.parts.begin(), compound.parts.end(), attribute) == compound.parts.end()) continue;
    const auto known = drivers.find(compound.shortName);
    return known != drivers.end() ? &known->second : nullptr;
  }
  return nullptr;
}

double PlainScene::resolution(const std::string& attribute, double otherwise) const {
  const auto known = resolution_.find(attribute);
  return known != resolution_.end() ? known->second : otherwise;
}

}  // namespace check_test
