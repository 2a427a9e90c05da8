#include "bake/UniqueNames.h"

#include <algorithm>

#include "text/Letters.h"
#include "text/Utf8.h"

namespace bake {
namespace {

// The bytes of the longest suffix: "_" and ten digits.
constexpr std::size_t kSuffixRoom = 11;

// The importer drops a camera of this name.
constexpr std::string_view kDropped = "perspshape";

bool MayStand(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_' || c == ':' ||
         static_cast<unsigned char>(c) >= 0x80;
}

// Cuts a name so that no character of several bytes is cut in two.
std::string_view CutTo(std::string_view name, std::size_t longest) {
  if (name.size() <= longest) return name;
  std::size_t size = longest;
  while (size > 0 && text::IsContinuation(name[size])) --size;
  return name.substr(0, size != 0 ? size : longest);
}

}  // namespace

UniqueNames::UniqueNames() : taken_{std::string(kDropped)} {}

std::string UniqueNames::Take(std::string_view wanted) {
  std::string base(wanted);
  std::replace_if(
      base.begin(), base.end(), [](char c) { return !MayStand(c); }, '_');
  if (base.empty()) base = "node";
  base = CutTo(base, kLongest);
  if (taken_.insert(text::Lowered(base)).second) return base;
  // Long names with the same beginning share a counter: each alone would try all numbers of the others.
  const std::string stem(CutTo(base, kLongest - kSuffixRoom));
  std::uint64_t& number = next_.try_emplace(text::Lowered(stem), 2).first->second;
  std::string name;
  do {
    name = stem + "_" + std::to_string(number++);
  } while (!taken_.insert(text::Lowered(name)).second);
  return name;
}

}  // namespace bake
