#include "tests/secondreader/PlayedCall.h"

#include <charconv>
#include <cmath>

#include "tests/secondreader/JsonText.h"

namespace secondreader {

PlayedLine::PlayedLine(const char* call) { line_ = "{\"call\":" + jsonText(call); }

PlayedLine& PlayedLine::plain(const char* key, const std::string& json) {
  line_ += std::string(",\"") + key + "\":" + json;
  return *this;
}

PlayedLine& PlayedLine::text(const char* key, const std::string& bytes) {
  return plain(key, jsonText(bytes));
}

PlayedLine& PlayedLine::integer(const char* key, std::int64_t value) {
  return plain(key, std::to_string(value));
}

void PlayedLine::appendNumber(double value) {
  constexpr std::size_t kLongestNumber = 32;
  if (std::isnan(value)) {
    line_ += "\"nan\"";
  } else if (std::isinf(value)) {
    line_ += value > 0.0 ? "\"inf\"" : "\"-inf\"";
  } else {
    char digits[kLongestNumber];
    line_.append(digits, std::to_chars(digits, digits + kLongestNumber, value).ptr);
  }
}

PlayedLine& PlayedLine::number(const char* key, double value) {
  plain(key, "");
  appendNumber(value);
  return *this;
}

PlayedLine& PlayedLine::numbers(const char* key, const std::vector<double>& values) {
  plain(key, "[");
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (i > 0) line_ += ',';
    appendNumber(values[i]);
  }
  line_ += ']';
  return *this;
}

PlayedLine& PlayedLine::pair(const char* key, std::int64_t first, std::int64_t second) {
  return plain(key, '[' + std::to_string(first) + ',' + std::to_string(second) + ']');
}

PlayedLine& PlayedLine::handle(const char* key, const char* kind, Handle number) {
  return plain(key, number == 0 ? "null" : '"' + std::string(kind) + ':' + std::to_string(number) + '"');
}

PlayedCall::PlayedCall(PlayedHost& host, const char* operation, SuiteName suite)
    : host_(host), operation_(operation), line_(operation) {
  host_.failBetweenCalls();
  failure_ = host_.plan.suiteCall(operation_);
  if (failure_ && failure_->kind == refhost::Failure::Kind::Code) error_ = failure_->code;
  line_.text("suite", suite.name).integer("version", suite.version);
}

bool PlayedCall::demand(bool condition, HostError code) {
  if (!condition) refuse(code);
  return condition;
}

void PlayedCall::handedInteger(const char* key, std::int64_t value) {
  if (goesOn()) {
    line_.integer(key, value);
  } else {
    line_.plain(key, "null");
  }
}

HostError PlayedCall::finish() {
  const bool throws = failure_ && failure_->kind != refhost::Failure::Kind::Code;
  if (throws) {
    line_.text("error", wordOf(failure_->kind));
  } else {
    line_.integer("error", error_);
  }
  host_.lines.push_back({line_.ended(), rounding_});
  if (throws) throwPlanned(*failure_, "rehearsed failure of " + operation_);
  return error_;
}

}  // namespace secondreader
