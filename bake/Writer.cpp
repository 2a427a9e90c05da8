#include "bake/Writer.h"

#include <algorithm>
#include <charconv>

#include "diag/ShownText.h"

namespace bake {
namespace {

constexpr std::size_t kFullBuffer = std::size_t{1} << 20;
constexpr std::size_t kKeysOnALine = 8;
constexpr std::size_t kKeysAtATime = 4096;  // in the buffer
constexpr std::size_t kAxes = 3;
constexpr std::size_t kLongestNumber = 32;  // bytes of a double's text, at most

struct ChannelText {
  const char* plug;
  const char* curve;
  const char* type;
};
constexpr ChannelText kChannels[kSlotCount] = {
    {"tx", "_translateX", "animCurveTL"}, {"ty", "_translateY", "animCurveTL"},
    {"tz", "_translateZ", "animCurveTL"}, {"rx", "_rotateX", "animCurveTA"},
    {"ry", "_rotateY", "animCurveTA"},    {"rz", "_rotateZ", "animCurveTA"},
    {"sx", "_scaleX", "animCurveTU"},     {"sy", "_scaleY", "animCurveTU"},
    {"sz", "_scaleZ", "animCurveTU"},
};

}  // namespace

Writer::Writer(std::ostream& out, const FrameRange& frames) : out_(out), frames_(frames) {}

void Writer::Number(double value) {
  char text[kLongestNumber];
  buffer_.append(text, std::to_chars(text, text + sizeof text, value).ptr);
}

void Writer::Flush() {
  out_.write(buffer_.data(), static_cast<std::streamsize>(buffer_.size()));
  buffer_.clear();
}

void Writer::Begin(const Origin& origin, const Head& head) {
  Text("//Maya ASCII 2018 scene\n// Baked by ");
  Text(origin.tool);
  Text(" from ");
  Text(diag::ShownText(origin.file));
  if (!origin.options.empty()) Text(" with " + diag::ShownText(origin.options));
  Text("\n// Frame 0 is frame ");
  Number(frames_.first);
  Text(" of that scene; its last one, ");
  Number(frames_.Last() - frames_.first);
  Text(", is frame ");
  Number(frames_.Last());
  Text(".\nrequires maya \"2018\";\ncurrentUnit -l ");
  Text(head.linearUnit);
  Text(" -a degree -t ");
  Text(head.timeUnit);
  Text(";\n");
}

void Writer::CreateNode(std::string_view type, const std::string& name, const std::string& parent,
                        std::string_view path) {
  Text("// ");
  Text(diag::ShownText(path));
  Text("\ncreateNode ");
  Text(type);
  Text(" -n \"");
  Text(name);
  if (!parent.empty()) Text("\" -p \"" + parent);
  Text("\";\n");
}

void Writer::Triple(const char* attribute, const Track& track, std::size_t firstSlot) {
  Text("\tsetAttr \".");
  Text(attribute);
  Text("\" -type \"double3\"");
  for (std::size_t slot = firstSlot; slot < firstSlot + kAxes; ++slot) {
    Text(" ");
    Number(track.channels[slot].At(0));
  }
  Text(" ;\n");
}

void Writer::Transform(const std::string& name, const std::string& parent, std::string_view path,
                       const Track& track) {
  CreateNode("transform", name, parent, path);
  Triple("t", track, kTranslateX);
  Triple("r", track, kRotateX);
  Triple("s", track, kScaleX);
  std::vector<Moving> moving;
  for (std::size_t slot = 0; slot < kSlotCount; ++slot) {
    const Channel& channel = track.channels[slot];
    if (!channel.moves()) continue;
    const ChannelText& text = kChannels[slot];
    moving.push_back({text.plug, TakeName(name + text.curve), text.type, &channel});
  }
  Curves(name, moving);
}

void Writer::Camera(const std::string& name, const std::string& parent, std::string_view path,
                    const LensTrack& lens) {
  CreateNode("camera", name, parent, path);
  Text("\tsetAttr \".cap\" -type \"double2\" ");
  Number(lens.horizontalAperture);
  Text(" ");
  Number(lens.verticalAperture);
  Text(" ;\n\tsetAttr \".ff\" ");
  Text(lens.vertical ? "2" : "1");
  Text(";\n\tsetAttr \".fl\" ");
  Number(lens.focalLength.At(0));
  Text(";\n");
  if (lens.focalLength.moves()) {
    Curves(name, {{"fl", TakeName(name + "_focalLength"), "animCurveTU", &lens.focalLength}});
  }
}

void Writer::Locator(const std::string& name, const std::string& parent, std::string_view path) {
  CreateNode("locator", name, parent, path);
}

void Writer::Curves(const std::string& node, const std::vector<Moving>& channels) {
  for (const Moving& channel : channels) {
    Text("createNode ");
    Text(channel.type);
    Text(" -n \"" + channel.curve + "\";\n\tsetAttr \".tan\" 2;\n\tsetAttr \".wgt\" no;\n");
    Keys(*channel.keys);
    connections_ += "connectAttr \"" + channel.curve + ".o\" \"" + node + "." + channel.plug + "\";\n";
    if (buffer_.size() >= kFullBuffer) Flush();
  }
}

// The times are the same on every channel: their texts are made once.
void Writer::MakeTimes() {
  timeEnds_.reserve(frames_.count);
  for (std::size_t frame = 0; frame < frames_.count; ++frame) {
    char text[kLongestNumber];
    const double time = static_cast<double>(frame) * frames_.step;
    times_ += frame % kKeysOnALine == 0 && frame != 0 ? "\n\t\t" : " ";
    times_.append(text, std::to_chars(text, text + sizeof text, time).ptr);
    times_ += ' ';
    timeEnds_.push_back(static_cast<std::uint32_t>(times_.size()));
  }
}

// The keys first to last - 1.
void Writer::AppendKeys(const Channel& channel, std::size_t first, std::size_t last) {
  const char* time = times_.data() + (first == 0 ? 0 : timeEnds_[first - 1]);
  const std::size_t start = buffer_.size();
  const auto timeBytes = static_cast<std::size_t>(times_.data() + timeEnds_[last - 1] - time);
  buffer_.resize(start + timeBytes + (last - first) * kLongestNumber);
  char* at = buffer_.data() + start;
  for (std::size_t frame = first; frame < last; ++frame) {
    const char* const timeEnd = times_.data() + timeEnds_[frame];
    at = std::copy(time, timeEnd, at);
    at = std::to_chars(at, at + kLongestNumber, channel.At(frame)).ptr;
    time = timeEnd;
  }
  buffer_.resize(static_cast<std::size_t>(at - buffer_.data()));
}

void Writer::Keys(const Channel& channel) {
  if (timeEnds_.empty()) MakeTimes();
  Text("\tsetAttr -s " + std::to_string(frames_.count) + " \".ktv[0:" + std::to_string(frames_.count - 1) +
       "]\" ");
  for (std::size_t first = 0; first < frames_.count; first += kKeysAtATime) {
    AppendKeys(channel, first, std::min(first + kKeysAtATime, frames_.count));
    if (buffer_.size() >= kFullBuffer) Flush();
  }
  Text(";\n");
}

void Writer::End(const Head& head) {
  Text("createNode script -n \"" + TakeName("sceneConfigurationScriptNode") +
       "\";\n\tsetAttr \".b\" -type \"string\" \"playbackOptions -min 0 -max ");
  const double last = static_cast<double>(frames_.count - 1) * frames_.step;
  Number(last);
  Text(" -ast 0 -aet ");
  Number(last);
  Text(" \";\n\tsetAttr \".st\" 6;\nselect -ne :defaultResolution;\n\tsetAttr \".w\" ");
  Number(head.picture.width);
  Text(";\n\tsetAttr \".h\" ");
  Number(head.picture.height);
  Text(";\n\tsetAttr \".pa\" ");
  const double pixelAspect = motion::PixelAspect(head.picture);
  Number(pixelAspect);
  Text(";\n\tsetAttr \".dar\" ");
  // Unchanged where the pixels are not square, so that the same pixel aspect follows from it again.
  Number(pixelAspect == 1.0 ? head.picture.width / head.picture.height : head.picture.deviceAspect);
  Text(";\n");
  Text(connections_);
  Text("// End of the bake\n");
  Flush();
}

}  // namespace bake
