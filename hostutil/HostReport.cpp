// Translate-and-report: a standard exception becomes a message to the user and a code. Also the noted line.
#include "hostutil/HostReport.h"

#include <cstdint>
#include <cstring>

#include "hostapi/ErrorCodes.h"
#include "hostutil/BoundedTextInternal.h"
#include "hostutil/HostSetup.h"
#include "hostutil/PathsInternal.h"

namespace {

HostReporter currentReporter = nullptr;
void* currentContext = nullptr;

HostError notedCode = HOST_ERR_NONE;
std::int64_t notedLine = 0;

// The memory may be exhausted: the message is built in place, and cut after its last character that fits.
constexpr std::int64_t kMessageCapacity = 1024;

consteval const char* SentenceOf(HostError code) {
  switch (code) {
#define HOST_ERROR_SENTENCE(name, number, sentence) \
  case HOST_ERR_##name:                             \
    return sentence;
    HOST_ERROR_TABLE(HOST_ERROR_SENTENCE)
#undef HOST_ERROR_SENTENCE
    default:
      return "";
  }
}

void AppendShown(hostutil::BoundedText<char>* out, const char* text) {
  while (*text != '\0') {
    const hostutil::DecodedCharacter character = hostutil::DecodeBytes(text);
    char piece[hostutil::kMostBytes];
    out->Append(piece, hostutil::EncodeBytes(hostutil::Shown(character.codePoint), piece));
    text += character.length;
  }
}

}  // namespace

HostError HostTranslateAndReport(std::int32_t kind, const char* what) {
  const bool memory = kind == HOST_EXCEPTION_MEMORY;
  const HostError code = memory ? HOST_ERR_EXCEPTION_MEMORY : HOST_ERR_EXCEPTION_OTHER;
  if (currentReporter == nullptr) return code;
  char message[kMessageCapacity];
  hostutil::BoundedText<char> out(message, kMessageCapacity);
  AppendShown(&out, memory ? SentenceOf(HOST_ERR_EXCEPTION_MEMORY) : SentenceOf(HOST_ERR_EXCEPTION_OTHER));
  if (what != nullptr && *what != '\0') {
    AppendShown(&out, ": ");
    AppendShown(&out, what);
  }
  currentReporter(currentContext, code, message);
  return code;
}

void HostSetReporter(HostReporter reporter, void* context) {
  currentReporter = reporter;
  currentContext = context;
}

void HostNoteLine(HostError code, std::int64_t line) {
  notedCode = code;
  notedLine = line;
}

std::int64_t HostTakeNotedLine(HostError code) {
  const std::int64_t line = code == notedCode ? notedLine : 0;
  HostNoteLine(HOST_ERR_NONE, 0);
  return line;
}
