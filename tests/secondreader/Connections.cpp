// Which curve drives what, and how a constraint is wired.
#include "tests/secondreader/KnownWords.h"
#include "tests/secondreader/SceneReader.h"

namespace secondreader {
namespace {

bool isOutput(std::string_view attribute) { return means(kPlugs, attribute, Means::Output); }

}  // namespace

void SceneReader::connectAttr() {
  std::string source;
  std::string destination;
  for (;;) {
    Token token = inCommand();
    if (token.kind == Kind::String) {
      source = unquoted(token.text);
      token = inCommand();
      if (token.kind == Kind::String) destination = unquoted(token.text);
    }
    if (token.kind == Kind::Semicolon) break;
  }
  if (source.find('.') != std::string::npos && destination.find('.') != std::string::npos) {
    connect(source, destination);
  }
}

void SceneReader::connect(const std::string& source, const std::string& destination) {
  const std::size_t sourceDot = source.find('.');
  const std::size_t destinationDot = destination.find('.');
  const std::string sourceNode = source.substr(0, sourceDot);
  const std::string sourceAttribute = source.substr(sourceDot + 1);
  const std::string node = destination.substr(0, destinationDot);
  const std::string attribute = destination.substr(destinationDot + 1);

  const int curve = findNamed(scene_.curves, sourceNode);
  const int from = curve >= 0 ? curve : findNamed(scene_.transforms, sourceNode);
  const int transform = findNamed(scene_.transforms, node);
  if (transform >= 0) {
    connectTransform(from, curve >= 0, sourceAttribute, static_cast<std::size_t>(transform), attribute);
    return;
  }
  const int camera = findNamed(scene_.cameras, node);
  if (camera >= 0 && curve >= 0 && isOutput(sourceAttribute) &&
      means(kPlugs, attribute, Means::FocalLength)) {
    scene_.cameras[static_cast<std::size_t>(camera)].focalLengthCurve = curve;
  }
}

void SceneReader::connectTransform(int source, bool isCurve, const std::string& attribute,
                                   std::size_t destination, const std::string& destinationAttribute) {
  auto& links = scene_.transforms[destination].curve;
  if (source < 0) return;
  if (isCurve) {
    constexpr int kNone = -1;
    const int channel = codeOf(kPlugs, destinationAttribute, Means::Channel, kNone);
    if (channel != kNone && isOutput(attribute)) links[static_cast<std::size_t>(channel)] = source;
  } else if (means(kPlugs, attribute, Means::Turns)) {
    scene_.transforms[static_cast<std::size_t>(source)].curve[kConstrained] = static_cast<int>(destination);
  } else if (means(kPlugs, destinationAttribute, Means::Follows)) {
    links[kFollowed] = source;
  } else if (holds(kPlugs, destinationAttribute, Means::Target)) {
    links[kTarget] = source;
  }
}

}  // namespace secondreader
