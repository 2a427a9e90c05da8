#include "maya/ConnectionScout.h"

#include <string_view>

#include "maya/SceneRecords.h"

namespace mayaimport {

namespace {

constexpr std::string_view kCommand = "connectAttr \"";
constexpr std::string_view kBetween = "\" \"";
constexpr std::size_t kLongestName = kNameCapacity - 1;

// The node's name in the plug at the beginning of the text, which then begins after the plug. Empty where
// there is no plug.
std::string_view TakePlug(std::string_view* text) {
  const std::size_t dot = text->substr(0, kLongestName).find('.');
  if (dot == std::string_view::npos) return {};
  const std::string_view name = text->substr(0, dot);
  const std::size_t quote = text->substr(0, 2 * kLongestName).find('"', name.size());
  if (quote == std::string_view::npos) return {};
  text->remove_prefix(quote);
  return name;
}

}  // namespace

void ConnectionScout::LookAhead(const char* position, const char* end, const NameIndex& curves,
                                const NameIndex& transforms) {
  ++reached_;
  if (next_ == nullptr || next_ < position || reached_ > read_) {
    next_ = position;
    read_ = reached_;
  }
  for (Ends ends; read_ < reached_ + kFar && ReadCommand(end, &ends); ++read_) {
    ends_[read_ % kFar] = ends;
    curves.PrefetchEntry(ends.source);
    transforms.PrefetchEntry(ends.source);
    transforms.PrefetchEntry(ends.destination);
  }
  if (reached_ + kNear >= read_) return;
  const Ends& near = ends_[(reached_ + kNear) % kFar];
  curves.PrefetchName(near.source);
  transforms.PrefetchName(near.source);
  transforms.PrefetchName(near.destination);
}

// Reads the next command where it stands alone on its line as scenes are written; false where it does not.
bool ConnectionScout::ReadCommand(const char* end, Ends* ends) {
  std::string_view text(next_, static_cast<std::size_t>(end - next_));
  const std::size_t lineEnd = text.substr(0, 4 * kLongestName).find('\n');
  if (lineEnd == std::string_view::npos) return false;
  text.remove_prefix(lineEnd + 1);
  const char* const line = text.data();
  if (text.substr(0, kCommand.size()) != kCommand) return false;
  text.remove_prefix(kCommand.size());
  const std::string_view source = TakePlug(&text);
  if (text.substr(0, kBetween.size()) != kBetween) return false;
  text.remove_prefix(kBetween.size());
  const std::string_view destination = TakePlug(&text);
  ends->source = NameIndex::Hash(source);
  ends->destination = NameIndex::Hash(destination);
  next_ = line;
  return true;
}

}  // namespace mayaimport
