#include "diag/Collector.h"

#include <string>
#include <utility>

namespace diag {
namespace {

std::string Shortened(std::string_view argument) {
  if (argument.size() <= Collector::kLongestArgument) return std::string(argument);
  return std::string(argument.substr(0, Collector::kLongestArgument)) + "...";
}

}  // namespace

void Collector::Report(Code code, Range range, std::initializer_list<std::string_view> arguments) {
  if (++counts_[code] > fullPerCode_) return;
  Diagnostic diagnostic{.code = code, .range = range, .place = lines_.At(range.offset), .arguments = {}};
  for (const std::string_view argument : arguments) diagnostic.arguments.push_back(Shortened(argument));
  kept_.push_back(std::move(diagnostic));
}

void Collector::Take(const Diagnostic& diagnostic) {
  if (++counts_[diagnostic.code] <= fullPerCode_) kept_.push_back(diagnostic);
}

std::uint64_t Collector::CountOf(Code code) const {
  const auto found = counts_.find(code);
  return found == counts_.end() ? 0 : found->second;
}

std::uint64_t Collector::CountOf(Severity severity) const {
  std::uint64_t count = 0;
  for (const auto& [code, times] : counts_) {
    if (EntryOf(code).severity == severity) count += times;
  }
  return count;
}

std::uint64_t Collector::count() const {
  std::uint64_t count = 0;
  for (const auto& [code, times] : counts_) count += times;
  return count;
}

std::map<Code, std::uint64_t> Collector::NotKept() const {
  std::map<Code, std::uint64_t> rest;
  for (const auto& [code, times] : counts_) {
    if (times > fullPerCode_) rest[code] = times - fullPerCode_;
  }
  return rest;
}

}  // namespace diag
