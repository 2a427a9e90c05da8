#include "tests/export/UsdaReader.h"

#include <charconv>
#include <cmath>
#include <map>
#include <set>
#include <utility>

namespace exporttest {
namespace {

void Ask(bool holds, const std::string& rule) {
  if (!holds) throw Broken(rule);
}

bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_'; }
bool IsWordPart(char c) { return IsLetter(c) || (c >= '0' && c <= '9') || c == ':' || c == '.'; }

// Cuts the text into words, numbers, strings and signs.
class Words {
 public:
  explicit Words(std::string_view text) : text_(text) {
    Ask(text.starts_with("#usda 1.0\n"), "first line");
    at_ = text.find('\n');
  }

  bool AtEnd() {
    Skip();
    return at_ == text_.size();
  }

  char Sign() {
    Skip();
    Ask(at_ < text_.size(), "end of the text");
    return text_[at_];
  }

  bool Takes(char sign) {
    if (Sign() != sign) return false;
    ++at_;
    return true;
  }

  void Need(char sign) { Ask(Takes(sign), std::string("a ") + sign + " at " + std::to_string(at_)); }

  std::string Word() {
    Ask(IsLetter(Sign()), "a word at " + std::to_string(at_));
    const std::size_t begin = at_;
    while (at_ < text_.size() && IsWordPart(text_[at_])) ++at_;
    return std::string(text_.substr(begin, at_ - begin));
  }

  double Number() {
    Skip();
    double number = 0;
    const std::from_chars_result read =
        std::from_chars(text_.data() + at_, text_.data() + text_.size(), number);
    Ask(read.ec == std::errc() && std::isfinite(number), "a number at " + std::to_string(at_));
    at_ = static_cast<std::size_t>(read.ptr - text_.data());
    return number;
  }

  std::string String() {
    Need('"');
    std::string value;
    while (true) {
      Ask(at_ < text_.size() && text_[at_] != '\n' && text_[at_] != '\0', "a string on one line");
      const char c = text_[at_++];
      if (c == '"') return value;
      value += c == '\\' ? Escaped() : c;
    }
  }

 private:
  void Skip() {
    while (at_ < text_.size() && (text_[at_] == ' ' || text_[at_] == '\n')) ++at_;
  }

  char Escaped() {
    Ask(at_ < text_.size(), "an escape");
    const char c = text_[at_++];
    if (c == 'n') return '\n';
    if (c != 'x') return c;
    unsigned code = 0;
    const std::from_chars_result read = std::from_chars(text_.data() + at_, text_.data() + at_ + 2, code, 16);
    Ask(read.ptr == text_.data() + at_ + 2, "two digits");
    at_ += 2;
    return static_cast<char>(code);
  }

  std::string_view text_;
  std::size_t at_ = 0;
};

using Values = std::array<double, 4>;

class Stage {
 public:
  Stage(std::string_view text, bool hostAxes) : words_(text), hostAxes_(hostAxes) {}

  SeenScene Read() {
    ReadHead();
    ReadPrim(std::nullopt, true);
    while (!open_.empty()) ReadMember();
    Ask(words_.AtEnd(), "one root prim");
    for (const auto& [prim, lens] : lenses_) PutLens(prim, lens);
    return scene_;
  }

 private:
  struct Lens {
    Track focal;
    double width = 0, height = 0;
    std::array<double, 2> offset = {};
    bool turned = false;  // about x by half a turn
  };
  struct Open {
    std::optional<std::size_t> layer;  // none: the root
    bool isLens = false;
    std::set<std::string> attributes, children;
  };

  void ReadHead() {
    words_.Need('(');
    std::set<std::string> seen;
    while (!words_.Takes(')')) {
      const std::string key = words_.Word();
      Ask(seen.insert(key).second, key + " twice");
      words_.Need('=');
      if (key == "customLayerData") {
        ReadDictionary();
      } else if (key == "defaultPrim") {
        defaultPrim_ = words_.String();
      } else if (key == "upAxis") {
        Ask(words_.String() == "Y", "up axis");
      } else {
        const double number = words_.Number();
        if (key == "metersPerUnit") scene_.metersPerUnit = number;
        if (key == "timeCodesPerSecond") scene_.timesPerSecond = number;
        if (key == "startTimeCode") scene_.range[0] = number;
        if (key == "endTimeCode") scene_.range[1] = number;
      }
    }
    for (const char* key :
         {"defaultPrim", "upAxis", "metersPerUnit", "timeCodesPerSecond", "startTimeCode", "endTimeCode"}) {
      Ask(seen.contains(key), std::string("no ") + key);
    }
    Ask(scene_.metersPerUnit > 0 && scene_.timesPerSecond > 0 && scene_.range[0] <= scene_.range[1], "head");
  }

  std::map<std::string, std::string> ReadDictionary() {
    std::map<std::string, std::string> texts;
    words_.Need('{');
    while (!words_.Takes('}')) {
      const std::string type = words_.Word(), key = words_.Word();
      words_.Need('=');
      Ask(type == "string" || type == "double", "type of an entry");
      if (type == "string") texts[key] = words_.String();
      if (type == "double") (void)words_.Number();
    }
    return texts;
  }

  void ReadPrim(std::optional<std::size_t> parent, bool root) {
    if (root) Ask(words_.Word() == "def", "a prim");
    const std::string type = words_.Word();
    Ask(type == "Xform" || type == "Camera", "type of a prim");
    const std::string prim = words_.String();
    Ask(!prim.empty() && IsLetter(prim[0]) && prim.find_first_of(":.") == std::string::npos,
        "name of a prim");
    for (const char c : prim) Ask(IsWordPart(c), "name of a prim");
    if (root) Ask(prim == defaultPrim_, "the default prim is the root");
    if (!root) Ask(open_.back().children.insert(prim).second, "a name twice");
    std::string name = prim;
    if (words_.Takes('(')) {
      Ask(words_.Word() == "customData", "metadata");
      words_.Need('=');
      name = ReadDictionary().at("name");
      words_.Need(')');
    }
    words_.Need('{');
    Open open;
    open.isLens = type == "Camera";
    Ask(!open.isLens || parent, "a lens of a layer");
    open.layer = parent;
    if (!root && !open.isLens) {
      SeenLayer layer;
      layer.name = name;
      layer.parent = parent;
      scene_.layers.push_back(layer);
      open.layer = scene_.layers.size() - 1;
    }
    if (type == "Camera") Ask(lenses_.try_emplace(*open.layer).second, "two lenses of a layer");
    open_.push_back(open);
  }

  void ReadMember() {
    if (words_.Takes('}')) {
      open_.pop_back();
      return;
    }
    std::string type = words_.Word();
    if (type == "def") return ReadPrim(open_.back().layer, false);
    if (type == "uniform" || type == "custom") type = words_.Word();
    if (type == "token" && words_.Takes('[')) words_.Need(']');
    std::string name = words_.Word();
    Ask(open_.back().attributes.insert(name).second, name + " twice");
    words_.Need('=');
    if (type == "token") return ReadToken(name);
    const bool sampled = name.ends_with(".timeSamples");
    if (sampled) name.erase(name.rfind('.'));
    const std::size_t count = type == "double3" ? 3 : type == "float2" ? 2 : 1;
    Ask(type == "double3" || type == "float2" || type == "float" || type == "double", "type " + type);
    Put(name, sampled ? ReadSamples(count) : Track{{}, {ReadValues(count)}}, type == "float");
  }

  void ReadToken(const std::string& name) {
    if (!words_.Takes('[')) {
      Ask(name == "projection" && words_.String() == "perspective", "projection");
      return;
    }
    std::string order;
    while (!words_.Takes(']')) {
      order += words_.String();
      order += words_.Takes(',') ? " " : "";
    }
    const std::string wanted =
        open_.back().isLens ? "xformOp:rotateX" : "xformOp:translate xformOp:rotateXYZ xformOp:scale";
    Ask(name == "xformOpOrder" && order == wanted, "order of operations: " + order);
  }

  Values ReadValues(std::size_t count) {
    Values values{};
    if (count > 1) words_.Need('(');
    for (std::size_t i = 0; i < count; ++i) {
      if (i != 0) words_.Need(',');
      values[i] = words_.Number();
    }
    if (count > 1) words_.Need(')');
    return values;
  }

  Track ReadSamples(std::size_t count) {
    Track track;
    words_.Need('{');
    while (!words_.Takes('}')) {
      const double time = words_.Number();
      Ask(track.times.empty() || time > track.times.back(), "times rise");
      track.times.push_back(time);
      words_.Need(':');
      track.values.push_back(ReadValues(count));
      words_.Need(',');
    }
    Ask(!track.times.empty() && track.times.front() == scene_.range[0] &&
            track.times.back() == scene_.range[1],
        "samples from the first to the last frame");
    return track;
  }

  void Put(const std::string& name, const Track& track, bool isFloat) {
    Ask(open_.back().layer.has_value(), "the root has no attributes");
    if (isFloat) {
      for (const Values& value : track.values)
        Ask(std::isfinite(static_cast<float>(value[0])), "beyond a float");
    }
    SeenLayer& layer = scene_.layers[*open_.back().layer];
    if (open_.back().isLens && name == "xformOp:rotateX") {
      Ask(track.values.size() == 1 && track.values[0][0] == 180, "half a turn");
      lenses_.at(*open_.back().layer).turned = true;
    } else if (name.starts_with("xformOp:")) {
      Ask(!open_.back().isLens, "operations of a lens");
      Track& own = name == "xformOp:translate"   ? layer.position
                   : name == "xformOp:rotateXYZ" ? layer.rotation
                                                 : layer.scale;
      Ask(name == "xformOp:translate" || name == "xformOp:rotateXYZ" || name == "xformOp:scale", name);
      own = track;
    } else {
      PutLensValue(lenses_.at(*open_.back().layer), name, track);
    }
  }

  static void PutLensValue(Lens& lens, const std::string& name, const Track& track) {
    const double value = track.values.front()[0];
    if (name == "focalLength") lens.focal = track;
    if (name == "horizontalAperture") lens.width = value;
    if (name == "verticalAperture") lens.height = value;
    if (name == "horizontalApertureOffset") lens.offset[0] = value;
    if (name == "verticalApertureOffset") lens.offset[1] = value;
    if (name == "clippingRange") Ask(value > 0 && track.values.front()[1] > value, "clipping range");
  }

  void PutLens(std::size_t prim, const Lens& lens) {
    SeenLayer& layer = scene_.layers[prim];
    Ask(lens.turned == hostAxes_, "cameras are turned in the axes of the host");
    Ask(lens.width > 0 && lens.height > 0 && !lens.focal.values.empty(), "apertures");
    layer.camera = true;
    layer.aspect = lens.width / lens.height;
    layer.offset = {lens.offset[0] / lens.width, lens.offset[1] / lens.height};
    layer.lens = lens.focal;
    for (Values& value : layer.lens.values) {
      Ask(static_cast<float>(value[0]) > 0, "focal length");
      value[0] = lens.height / 2 / value[0];
    }
  }

  Words words_;
  bool hostAxes_;
  SeenScene scene_;
  std::string defaultPrim_;
  std::vector<Open> open_;
  std::map<std::size_t, Lens> lenses_;
};

}  // namespace

SeenScene ReadUsda(std::string_view text, bool hostAxes) {
  try {
    return Stage(text, hostAxes).Read();
  } catch (const std::out_of_range& missing) {
    throw Broken(missing.what());
  }
}

}  // namespace exporttest
