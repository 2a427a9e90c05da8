// What a file is that is no Maya ASCII scene.
#include <algorithm>
#include <array>
#include <string>

#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;

struct Signature {
  std::string_view bytes;
  Code code;
  std::string_view name;
};

constexpr std::array kSignatures = {
    Signature{"FOR4", Code::MayaBinary, ""},
    Signature{"FOR8", Code::MayaBinary, ""},
    Signature{"\x1f\x8b", Code::CompressedFile, "gzip"},
    Signature{"PK\x03\x04", Code::CompressedFile, "zip"},
    Signature{"BZh", Code::CompressedFile, "bzip2"},
    Signature{"\xfd"
              "7zXZ",
              Code::CompressedFile, "xz"},
    Signature{"7z\xbc\xaf", Code::CompressedFile, "7z"},
    Signature{"\x28\xb5\x2f\xfd", Code::CompressedFile, "zstd"},
    Signature{"\xef\xbb\xbf", Code::MarkBeforeHeader, "UTF-8"},
    Signature{"\xff\xfe", Code::MarkBeforeHeader, "UTF-16"},
    Signature{"\xfe\xff", Code::MarkBeforeHeader, "UTF-16"},
};

bool IsBlank(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\0'; }

}  // namespace

void ReportFileKind(std::string_view text, diag::Collector* diagnostics) {
  if (std::all_of(text.begin(), text.end(), IsBlank)) return diagnostics->Report(Code::EmptyFile, {});
  const auto* const signature =
      std::find_if(kSignatures.begin(), kSignatures.end(),
                   [&](const Signature& one) { return text.starts_with(one.bytes); });
  if (signature == kSignatures.end()) {
    diagnostics->Report(Code::NotMayaAscii, {});
  } else if (signature->code == Code::MayaBinary) {
    diagnostics->Report(Code::MayaBinary, {});
  } else {
    diagnostics->Report(signature->code, {}, {signature->name});
  }
}

}  // namespace check
