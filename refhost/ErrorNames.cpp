// Codes in words, from the one table of codes.
#include "hostapi/ErrorCodes.h"
#include "refhost/Host.h"

namespace refhost {
namespace {

struct ErrorWords {
  HostError code;
  std::string_view name;
  std::string_view sentence;
};

constexpr ErrorWords kWords[] = {
#define REFHOST_ERROR_WORDS(name, number, sentence) {number, #name, sentence},
    HOST_ERROR_TABLE(REFHOST_ERROR_WORDS)
#undef REFHOST_ERROR_WORDS
};

const ErrorWords* findWords(HostError code) {
  for (const ErrorWords& words : kWords) {
    if (words.code == code) return &words;
  }
  return nullptr;
}

}  // namespace

std::string_view errorName(HostError code) {
  const ErrorWords* words = findWords(code);
  return words == nullptr ? std::string_view() : words->name;
}

std::string_view errorSentence(HostError code) {
  const ErrorWords* words = findWords(code);
  return words == nullptr ? std::string_view() : words->sentence;
}

}  // namespace refhost
