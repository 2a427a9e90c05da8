#include "tests/secondreader/PlayedHost.h"

#include <iterator>
#include <new>
#include <string_view>

#include "tests/secondreader/Numbers.h"

namespace secondreader {
namespace {

struct LocalizedEntry {
  const char* key;
  const char* text;
};
constexpr LocalizedEntry kTable[] = {
    {"$$$/QZ/Maya_Import/LStr/0000", "Maya Scene"},
    {"$$$/QZ/Maya_Import/LStr/0001", "Only Baked Maya Ascii files are supported."},
    {"$$$/QZ/Maya_Import/LStr/0002", "^^1: ^^2"},
    {"$$$/QZ/Maya_Import/LStr/0003", "Error reading Maya file."},
    {"$$$/QZ/Maya_Import/LStr/0004", "Unexpected end of maya file."},
    {"$$$/QZ/Maya_Import/LStr/0005", "Inconsistant number of keyframes for Maya camera."},
    {"$$$/QZ/Maya_Import/LStr/0006", "Square"},
    {"$$$/QZ/Maya_Import/LStr/0007", "^^1 ^^2"},
};

std::string_view sentenceOf(HostError code) {
  switch (code) {
#define SENTENCE(name, number, sentence) \
  case HOST_ERR_##name:                  \
    return sentence;
    HOST_ERROR_TABLE(SENTENCE)
#undef SENTENCE
    default:
      return "";
  }
}

}  // namespace

HostError PlayedHost::translateAndReport(const std::exception& exception) {
  const bool memory = dynamic_cast<const std::bad_alloc*>(&exception) != nullptr;
  const HostError code = memory ? HOST_ERR_EXCEPTION_MEMORY : HOST_ERR_EXCEPTION_OTHER;
  if (!silent) messages.push_back(std::string(sentenceOf(code)) + ": " + exception.what());
  return code;
}

std::vector<std::string> PlayedHost::leftOpen() const {
  std::vector<std::string> names;
  for (const HeldStream& held : heldStreams) {
    if (!held.excused) names.push_back("stream:" + std::to_string(held.number));
  }
  for (const OpenBatch& open : openBatches) {
    if (!open.excused) names.push_back("batch:" + std::to_string(open.number));
  }
  if (heldMemory != 0) names.push_back("mem:" + std::to_string(heldMemory));
  return names;
}

bool PlayedHost::serviceFails(const char* name, HostError* code) {
  const auto failure = plan.service(name);
  if (!failure) return false;
  throwPlanned(*failure, "rehearsed failure");
  *code = failure->code;
  return true;
}

void PlayedHost::failBetweenCalls() {
  const auto failure = plan.betweenCalls();
  if (!failure) return;
  throwPlanned(*failure, "rehearsed failure");
  throw int{failure->code};
}

std::string PlayedHost::localized(int id) const {
  if (!stringTable) return {};
  const LocalizedEntry& entry = kTable[static_cast<std::size_t>(id)];
  std::string text = entry.text;
  for (const auto& [key, translation] : options.translations) {
    if (key == entry.key) text = translation;
  }
  return text;
}

double PlayedHost::scanNumber(const std::string& text) {
  HostError code = HOST_ERR_NONE;
  double value = 0.0;
  if (!serviceFails("NumberScan", &code)) {
    code = readNumber(text, &value);
  }
  check(code);
  return value;
}

}  // namespace secondreader
