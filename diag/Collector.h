// Gathers the diagnostics of one scene, in bounded memory.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <map>
#include <span>
#include <string_view>
#include <vector>

#include "diag/Diagnostic.h"

namespace diag {

// Keeps the first few diagnostics of each code in full and counts the rest, so that a report does not grow
// with the file. Refers to the scene's text, which must outlive it.
class Collector {
 public:
  static constexpr std::size_t kFullPerCode = 20;
  // The bytes of an argument that are kept; "..." stands for the rest.
  static constexpr std::size_t kLongestArgument = 200;

  explicit Collector(std::string_view text, std::size_t fullPerCode = kFullPerCode)
      : lines_(text), fullPerCode_(fullPerCode) {}

  // As many arguments as the row of the code has placeholders.
  void Report(Code code, Range range, std::initializer_list<std::string_view> arguments = {});

  // Adds a diagnostic that another collector of the same text kept.
  void Take(const Diagnostic& diagnostic);

  // The diagnostics that are kept in full, in the order in which they were reported.
  std::span<const Diagnostic> kept() const { return kept_; }

  // How many were reported: of one code, of one severity, of all.
  std::uint64_t CountOf(Code code) const;
  std::uint64_t CountOf(Severity severity) const;
  std::uint64_t count() const;

  // How many of each code were counted but not kept.
  std::map<Code, std::uint64_t> NotKept() const;

  // Lines and columns of the text that the diagnostics are about.
  Lines& lines() { return lines_; }

 private:
  Lines lines_;
  std::size_t fullPerCode_;
  std::vector<Diagnostic> kept_;
  std::map<Code, std::uint64_t> counts_;
};

}  // namespace diag
