// What the report says of a node.
#include <algorithm>
#include <cstdlib>
#include <sstream>

#include "tests/check/ChannelJudge.h"

namespace check_test {
namespace {

using check::Finding;
using diag::Code;

bool IsOneOf(Code code, std::initializer_list<Code> codes) {
  return std::find(codes.begin(), codes.end(), code) != codes.end();
}

// Whether a list like "translateX, rotateY" has the word.
bool Lists(std::string_view list, std::string_view word) {
  for (std::size_t at = list.find(word); at != std::string_view::npos; at = list.find(word, at + 1)) {
    const bool begins = at == 0 || list[at - 1] == ' ';
    const std::size_t end = at + word.size();
    if (begins && (end == list.size() || list[end] == ',')) return true;
  }
  return false;
}

}  // namespace

bool ChannelJudge::Lies(const Finding& finding, const std::vector<Bytes>& text) const {
  const auto offset = static_cast<std::size_t>(finding.diagnostic.range.offset);
  return !diag::IsOfWholeFile(finding.diagnostic) &&
         std::any_of(text.begin(), text.end(),
                     [offset](const Bytes& bytes) { return offset >= bytes.first && offset < bytes.second; });
}

bool ChannelJudge::Says(Codes codes, int node) const {
  const PlainNode& one = scene_.node(node);
  return std::any_of(report_.findings.begin(), report_.findings.end(), [&](const Finding& finding) {
    if (!IsOneOf(finding.diagnostic.code, codes)) return false;
    const std::vector<std::string>& words = finding.diagnostic.arguments;
    return Lies(finding, one.text) || std::find(words.begin(), words.end(), one.name) != words.end();
  });
}

// The arguments are the first ones of the diagnostic.
bool ChannelJudge::SaysWith(Codes codes, std::initializer_list<std::string_view> arguments) const {
  return std::any_of(report_.findings.begin(), report_.findings.end(), [&](const Finding& finding) {
    const std::vector<std::string>& words = finding.diagnostic.arguments;
    return IsOneOf(finding.diagnostic.code, codes) && words.size() >= arguments.size() &&
           std::equal(arguments.begin(), arguments.end(), words.begin());
  });
}

bool ChannelJudge::SaysAt(Codes codes, Bytes text) const {
  return std::any_of(report_.findings.begin(), report_.findings.end(), [&](const Finding& finding) {
    return IsOneOf(finding.diagnostic.code, codes) && Lies(finding, {text});
  });
}

bool ChannelJudge::SaysAnywhere(Codes codes) const {
  return std::any_of(report_.findings.begin(), report_.findings.end(),
                     [&](const Finding& finding) { return IsOneOf(finding.diagnostic.code, codes); });
}

bool ChannelJudge::SaysOfChannel(int node, std::string_view channel, std::string_view driver) const {
  return std::any_of(report_.findings.begin(), report_.findings.end(), [&](const Finding& finding) {
    const std::vector<std::string>& words = finding.diagnostic.arguments;
    return IsOneOf(finding.diagnostic.code, {Code::DrivenByNoCurve, Code::CurveThroughNode}) &&
           words[0] == scene_.node(node).name && Lists(words[1], channel) && words[2] == driver;
  });
}

// The number that comes over in place of the one that is stored, where the report has one.
std::optional<double> ChannelJudge::NumberInstead(int node, const std::string& attribute) const {
  const std::string wanted = PlainScene::LongName(attribute);
  for (const Finding& finding : report_.findings) {
    const std::vector<std::string>& words = finding.diagnostic.arguments;
    if (finding.diagnostic.code != Code::StoredValueSkipped || words[0] != scene_.node(node).name) continue;
    std::istringstream numbers(words[1]);
    std::istringstream components(words[2]);
    std::string number;
    for (std::string component; components >> component && numbers >> number;) {
      if (component == wanted || component == wanted + ',') return std::strtod(number.c_str(), nullptr);
    }
  }
  return std::nullopt;
}

// Which of several nodes a name means for the import is said, and no more.
bool ChannelJudge::IsAmbiguous(int node) const {
  const Codes kCodes = {Code::SameNames,        Code::NamesDifferInCase, Code::NameTooLong,
                        Code::NodeWithoutName,  Code::NameTaken,         Code::AmbiguousName,
                        Code::AlreadyConnected, Code::ParentCircle};
  if (Says(kCodes, node)) return true;
  const auto& drivers = scene_.DriversOf(node);
  return std::any_of(drivers.begin(), drivers.end(), [&](const auto& driver) {
    return driver.second.node != kNone && Says(kCodes, driver.second.node);
  });
}

}  // namespace check_test
