#include "refhost/Rehearsal.h"

#include <charconv>
#include <cstdint>
#include <limits>
#include <system_error>

#include "refhost/Operations.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

// A text cut in two at a separator.
struct Cut {
  std::string_view before;
  std::string_view after;
};

// Nothing when the separator is missing: its place is npos.
std::optional<Cut> cutAt(std::string_view text, std::size_t place) {
  if (place == std::string_view::npos) return std::nullopt;
  return Cut{text.substr(0, place), text.substr(place + 1)};
}

template <typename Integer>
std::optional<Integer> integerOf(std::string_view text, Integer least) {
  Integer value = 0;
  const auto result = std::from_chars(text.data(), text.data() + text.size(), value);
  const bool whole = result.ec == std::errc{} && result.ptr == text.data() + text.size();
  if (!whole || value < least) return std::nullopt;
  return value;
}

bool complain(std::string* complaint, std::string_view text, std::string_view what) {
  *complaint = '"' + std::string(text) + "\": " + std::string(what);
  return false;
}

bool setCode(Failure* failure, std::string_view code, std::string* complaint) {
  const auto value = integerOf<HostError>(code, std::numeric_limits<HostError>::min());
  if (!value) return complain(complaint, code, "a code is a 32-bit integer");
  failure->kind = Failure::Kind::Code;
  failure->code = *value;
  return true;
}

bool setKind(Failure* failure, std::string_view kind, std::string* complaint) {
  for (const Failure::Kind known :
       {Failure::Kind::BadAlloc, Failure::Kind::RuntimeError, Failure::Kind::Other}) {
    if (kind != kindName(known)) continue;
    failure->kind = known;
    return true;
  }
  return complain(complaint, kind, "an exception is bad_alloc, runtime_error or other");
}

// What stands after the equals sign.
struct Effect {
  const char* word;  // as the forms name it
  bool (*set)(Failure*, std::string_view, std::string*);
};
constexpr Effect kCodeEffect = {"CODE", setCode};
constexpr Effect kKindEffect = {"KIND", setKind};

// "OPERATION:NTH=CODE" or "OPERATION:NTH=KIND".
std::optional<Failure> parseNamed(std::string_view text, const Effect& effect, std::string* complaint) {
  const auto halves = cutAt(text, text.find('='));
  const auto call = halves ? cutAt(halves->before, halves->before.find(':')) : std::nullopt;
  if (!call) {
    complain(complaint, text, std::string("the form is OPERATION:NTH=") + effect.word);
    return std::nullopt;
  }
  if (!findOperation(call->before) && !findUtilityService(call->before)) {
    complain(complaint, call->before, "the host has no such operation");
    return std::nullopt;
  }
  const auto nth = integerOf<std::int64_t>(call->after, 0);
  if (!nth) {
    complain(complaint, call->after, "calls are numbered from 1, and 0 is every call");
    return std::nullopt;
  }
  Failure failure;
  failure.operation = call->before;
  failure.nth = *nth;
  if (!effect.set(&failure, halves->after, complaint)) return std::nullopt;
  return failure;
}

// "K=CODE" and "K+=CODE", or "K=KIND" and "K+=KIND".
std::optional<Failure> parseNumbered(std::string_view text, const Effect& effect, std::string* complaint) {
  auto halves = cutAt(text, text.find('='));
  if (!halves) {
    complain(complaint, text, std::string("the form is K=") + effect.word + " or K+=" + effect.word);
    return std::nullopt;
  }
  Failure failure;
  if (halves->before.ends_with('+')) {
    failure.onwards = true;
    halves->before.remove_suffix(1);
  }
  const auto nth = integerOf<std::int64_t>(halves->before, 1);
  if (!nth) {
    complain(complaint, halves->before, "calls are numbered from 1");
    return std::nullopt;
  }
  failure.nth = *nth;
  if (!effect.set(&failure, halves->after, complaint)) return std::nullopt;
  return failure;
}

}  // namespace

const char* kindName(Failure::Kind kind) {
  switch (kind) {
    case Failure::Kind::Code:
      break;
    case Failure::Kind::BadAlloc:
      return "bad_alloc";
    case Failure::Kind::RuntimeError:
      return "runtime_error";
    case Failure::Kind::Other:
      return "other";
  }
  return "code";
}

std::optional<Failure> parseFail(std::string_view text, std::string* complaint) {
  return parseNamed(text, kCodeEffect, complaint);
}

std::optional<Failure> parseThrow(std::string_view text, std::string* complaint) {
  return parseNamed(text, kKindEffect, complaint);
}

std::optional<Failure> parseFailAt(std::string_view text, std::string* complaint) {
  return parseNumbered(text, kCodeEffect, complaint);
}

std::optional<Failure> parseThrowAt(std::string_view text, std::string* complaint) {
  return parseNumbered(text, kKindEffect, complaint);
}

std::optional<RefusedSuite> parseRefuse(std::string_view text, std::string* complaint) {
  const auto halves = cutAt(text, text.rfind(':'));
  const auto version = halves ? integerOf<std::int32_t>(halves->after, 0) : std::nullopt;
  if (!version) {
    complain(complaint, text, "the form is SUITE:VERSION");
    return std::nullopt;
  }
  if (SuiteRegistry().find(halves->before, *version) == nullptr) {
    complain(complaint, text, "the host offers no such suite");
    return std::nullopt;
  }
  return RefusedSuite{std::string(halves->before), *version};
}

}  // namespace refhost
