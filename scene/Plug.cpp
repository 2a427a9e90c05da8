#include "scene/Plug.h"

#include <charconv>
#include <cstddef>
#include <limits>
#include <system_error>

namespace scene {
namespace {

// Reads an index from the front of the text and takes it off. False where there is none.
bool TakeIndex(std::string_view* text, std::int32_t* index) {
  std::int32_t value = 0;
  const auto [end, error] = std::from_chars(text->data(), text->data() + text->size(), value);
  if (error != std::errc() || value < 0) return false;
  text->remove_prefix(static_cast<std::size_t>(end - text->data()));
  *index = value;
  return true;
}

// "3" or "3:5". False for anything else.
bool ParseRange(std::string_view text, std::int32_t* first, std::int32_t* last) {
  if (!TakeIndex(&text, first)) return false;
  *last = *first;
  if (text.empty()) return true;
  if (text[0] != ':') return false;
  text.remove_prefix(1);
  return TakeIndex(&text, last) && text.empty() && *last >= *first;
}

}  // namespace

AttributePath ParseAttributePath(std::string_view text) {
  if (!text.empty() && text[0] == '.') text.remove_prefix(1);
  const AttributePath whole{.name = text};
  AttributePath path;
  for (std::string_view rest = text;;) {
    const std::size_t dot = rest.find('.');
    std::string_view part = rest.substr(0, dot);
    if (const std::size_t bracket = part.find('['); bracket != std::string_view::npos) {
      if (path.first != kNoIndex || part.back() != ']') return whole;
      const std::string_view range = part.substr(bracket + 1, part.size() - bracket - 2);
      if (!ParseRange(range, &path.first, &path.last)) return whole;
      part = part.substr(0, bracket);
    }
    path.name = part;
    if (dot == std::string_view::npos) return path;
    rest = rest.substr(dot + 1);
  }
}

PlugText SplitPlug(std::string_view text) {
  const std::size_t dot = text.find('.');
  if (dot == std::string_view::npos) return {text, {}};
  return {text.substr(0, dot), text.substr(dot + 1)};
}

}  // namespace scene
