#include "tests/check/Author.h"

#include <algorithm>
#include <cctype>

namespace check_test {
namespace {

// The node's name in an argument that may be a path or a plug: "|rig|shotCam.tx".
std::string_view NameIn(std::string_view argument) {
  const std::string_view path = argument.substr(0, argument.find('.'));
  const std::size_t bar = path.rfind('|');
  return bar == std::string_view::npos ? path : path.substr(bar + 1);
}

std::size_t EndOfText(std::string_view text, std::size_t begin) {
  std::size_t end = text.size();
  for (const std::string_view next : {"\ncreateNode", "\nselect", "\nconnectAttr"})
    end = std::min(end, text.find(next, begin));
  return end;
}

}  // namespace

bool SameWithoutCase(std::string_view a, std::string_view b) {
  return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                    [](unsigned char x, unsigned char y) { return std::tolower(x) == std::tolower(y); });
}

std::string_view Author::WrittenName(scene::NodeId node) const {
  const diag::Range place = scene.node(node).place;
  return text.substr(static_cast<std::size_t>(place.offset), static_cast<std::size_t>(place.length));
}

bool Author::CountsFrames() const {
  const std::string_view word = scene.timeUnit().word;
  if (!word.empty() && std::isdigit(static_cast<unsigned char>(word[0])) != 0) return true;
  for (const std::string_view frames : {"film", "pal", "ntsc", "show", "palf", "ntscf"}) {
    if (SameWithoutCase(word, frames)) return true;
  }
  return false;
}

bool IsSaidOf(const Author& author, const check::Report& report, const std::vector<scene::NodeId>& nodes,
              std::initializer_list<diag::Code> codes) {
  for (const check::Finding& finding : report.findings) {
    const diag::Diagnostic& one = finding.diagnostic;
    if (std::find(codes.begin(), codes.end(), one.code) == codes.end()) continue;
    for (const scene::NodeId node : nodes) {
      if (node == scene::kNoNode) continue;
      const scene::Node& named = author.scene.node(node);
      const std::string_view written = author.WrittenName(node);
      const bool argument =
          std::any_of(one.arguments.begin(), one.arguments.end(), [&](const std::string& text) {
            return text == named.name || SameWithoutCase(NameIn(text), written);
          });
      const auto begin = static_cast<std::size_t>(named.place.offset);
      const std::uint64_t at = one.range.offset;
      if (argument || (at >= begin && at < EndOfText(author.text, begin))) return true;
    }
  }
  return false;
}

}  // namespace check_test
