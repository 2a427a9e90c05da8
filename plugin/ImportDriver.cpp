#include "plugin/ImportDriver.h"

#include <cstring>
#include <string_view>

#include "hostutil/HostUtilities.h"
#include "maya/MAYA_Parse.h"
#include "maya/Words.h"
#include "plugin/Guarded.h"
#include "plugin/ReportError.h"

namespace mayaimport {

namespace {

constexpr std::string_view kHeader = "//Maya";
constexpr std::int64_t kHeaderBytes = 10;  // what is read to look at it; a shorter file is refused
constexpr std::int64_t kTerminatorBytes = 2;

// Makes the file object of a path; throws the code when there is none, which can be 0.
HostFile* MakeFile(const HostUTF16Unit* path) {
  constexpr HostUTF16Unit kEmptyPath[] = {0};
  UTF16String* text = nullptr;
  ThrowOnError(UTF16StringMakeFromUnits(path != nullptr ? path : kEmptyPath, &text));
  const UTF16Handle owned(text);
  HostFile* file = nullptr;
  const HostError code = HostFileCreate(text, &file);
  if (code != kNoError || file == nullptr) ThrowCode(code);
  return file;
}

// Reads the first `count` bytes; the file is closed in every case.
HostError ReadFromStart(HostFile* file, std::int64_t count, void* buffer) {
  HostError kept = Guarded([&] {
    const HostError code = HostFileOpen(file, HOST_FILE_READ);
    return code == kNoError ? HostFileRead(file, count, buffer) : code;
  });
  KeepFirst(&kept, HostFileClose(file));
  return kept;
}

// The scene's text in a host memory handle, NUL-terminated twice.
class FileBuffer {
 public:
  explicit FileBuffer(QZGP_SuiteHandler& suites) : suites_(suites) {}

  // Allocates, locks and fills the buffer. After a failure the text is empty, or null where there is no
  // buffer.
  HostError Read(HostFile* file, std::int64_t size) {
    HostError code = suites_.MemorySuite1().NewMemHandle(G_plugin_idL, "file buffer", size + kTerminatorBytes,
                                                         kNoFlags, &handle_);
    if (code != kNoError || handle_ == nullptr) return code;
    void* address = nullptr;
    code = suites_.MemorySuite1().LockMemHandle(handle_, &address);
    if (code != kNoError) return code;
    text_ = static_cast<char*>(address);
    code = Guarded([&] { return ReadFromStart(file, size, text_); });
    if (text_ == nullptr) return code;
    size_ = code == kNoError ? size : 0;
    std::memset(text_ + size_, 0, kTerminatorBytes);
    return code;
  }

  const char* text() const { return text_; }
  const char* end() const { return text_ != nullptr ? text_ + size_ : nullptr; }

  // Unlocks and frees the buffer; frees it also when the unlock throws.
  HostError Release() {
    if (handle_ == nullptr) return kNoError;
    HostError kept = Guarded([&] { suites_.MemorySuite1().UnlockMemHandle(handle_); });
    KeepFirst(&kept, Guarded([&] { suites_.MemorySuite1().FreeMemHandle(handle_); }));
    return kept;
  }

 private:
  static constexpr std::int32_t kNoFlags = 0;

  QZGP_SuiteHandler& suites_;
  HostMemHandle* handle_ = nullptr;
  char* text_ = nullptr;
  std::int64_t size_ = 0;
};

// The header test, the file's size, and its text.
//
// Deliberate: a file that is no scene is read with size 0 and goes through the rest as an empty text, which
// builds nothing and is no failure.
HostError ReadScene(HostFile* file, QZGP_SuiteHandler& suites, FileBuffer* buffer) {
  std::uint8_t isMaya = 0;
  std::int64_t size = 0;
  HostError code = CheckMayaHeader(file, suites, false, &isMaya);
  if (code == kNoError && isMaya != 0) code = HostFileSize(file, &size);
  return code == kNoError ? buffer->Read(file, size) : code;
}

// The composition's name: the file's without its extension.
UTF16Handle StripExtension(const UTF16String* fileName) {
  constexpr std::int32_t kRemove = 1;
  UTF16String* name = nullptr;
  ThrowOnError(HostStripExtension(fileName, kRemove, &name));
  return UTF16Handle(name);
}

void ParseAndBuild(const FileBuffer& buffer, HostFile* file, VOR_Item* folder) {
  MAYA_Parse parser(G_basic_suiteP, buffer.text(), buffer.end());
  UTF16String* fileName = nullptr;
  if (file != nullptr) ThrowOnError(HostFileName(file, &fileName));
  const UTF16Handle ownedFileName(fileName);
  parser.Parse();
  const UTF16Handle name = StripExtension(fileName);
  parser.MakeComp(folder, name.get());
}

// After an exception that Guarded does not catch, the parser and the suites are released, but the buffer
// stays allocated. The callback turns the exception into a code.
HostError Import(const HostUTF16Unit* path, VOR_Item* folder) {
  QZGP_SuiteHandler suites(G_basic_suiteP);
  FileBuffer buffer(suites);
  // Deliberate: the file object is not disposed of.
  HostFile* file = nullptr;
  HostError fileCode = Guarded([&] { file = MakeFile(path); });
  if (fileCode == kNoError) fileCode = Guarded([&] { return ReadScene(file, suites, &buffer); });
  HostError kept = Guarded([&] { ParseAndBuild(buffer, file, folder); });
  KeepFirst(&kept, fileCode);
  KeepFirst(&kept, buffer.Release());
  return kept;
}

// The header test without messages, between the two ends of the host's silence. Whatever is thrown on the
// way, the silence ends and the file is disposed of.
HostError VerifySilently(const HostUTF16Unit* path, QZGP_SuiteHandler& suites, std::uint8_t* canImport) {
  constexpr std::int32_t kNoReport = 0;
  HostSilentErrorState state{};
  const HostError code = suites.UtilitySuite7().BeginSilentErrors(&state);
  if (code != kNoError) return code;
  HostFile* file = nullptr;
  HostError kept = GuardedAtBorder([&] {
    file = MakeFile(path);
    return CheckMayaHeader(file, suites, true, canImport);
  });
  KeepFirst(&kept,
            GuardedAtBorder([&] { return suites.UtilitySuite7().EndSilentErrors(kNoReport, &state); }));
  if (file != nullptr) KeepFirst(&kept, GuardedAtBorder([&] { return HostFileDispose(file); }));
  return kept;
}

}  // namespace

HostError ImportFileCallback(const HostUTF16Unit* path, void*, void*, VOR_Item* folder) {
  return GuardedAtBorder([&] { return Import(path, folder); });
}

HostError VerifyFileCallback(const HostUTF16Unit* path, void*, std::uint8_t* canImport) {
  if (canImport == nullptr) return kNullArgument;
  *canImport = 0;
  if (path == nullptr || path[0] == 0) return kNoError;
  return GuardedAtBorder([&] {
    QZGP_SuiteHandler suites(G_basic_suiteP);
    return VerifySilently(path, suites, canImport);
  });
}

HostError CheckMayaHeader(HostFile* file, QZGP_SuiteHandler& suites, bool quiet, std::uint8_t* isMaya) {
  if (file == nullptr || isMaya == nullptr) return kNullArgument;
  *isMaya = 0;
  char header[kHeaderBytes] = {};
  const HostError code = ReadFromStart(file, kHeaderBytes, header);
  if (code != kNoError) return code;
  *isMaya = SameWord(std::string_view(header, kHeader.size()), kHeader) ? 1 : 0;
  if (*isMaya == 0 && !quiet) ReportError(suites, nullptr, kOnlyMayaAscii);
  return kNoError;
}

}  // namespace mayaimport
