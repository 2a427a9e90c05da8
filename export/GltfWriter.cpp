// glTF 2.0, in its two forms: JSON with a file of data beside it, and both in one file.
#include <array>
#include <cstdint>
#include <limits>
#include <streambuf>
#include <string>

#include "export/GltfInternal.h"
#include "export/ReportedLosses.h"
#include "export/Writers.h"

namespace interchange {
namespace {

using diag::Code;

// Counts what is written to it, and keeps nothing.
class CountingBuffer : public std::streambuf {
 public:
  std::uint64_t count() const { return count_; }

 protected:
  int_type overflow(int_type character) override {
    ++count_;
    return traits_type::not_eof(character);
  }
  std::streamsize xsputn(const char* /*text*/, std::streamsize size) override {
    count_ += static_cast<std::uint64_t>(size);
    return size;
  }

 private:
  std::uint64_t count_ = 0;
};

std::uint64_t JsonSize(const GltfPlan& plan) {
  CountingBuffer counted;
  std::ostream out(&counted);
  WriteGltfJson(plan, "", out);
  return counted.count();
}

// Whether it can be written. Reports what is lost.
bool IsTaken(const GltfPlan& plan, diag::Collector* diagnostics) {
  const Composition& composition = plan.composition();
  if (!GltfTakesStill(composition, diagnostics)) return false;
  if (!plan.TimesRise()) {
    diagnostics->Report(Code::ExportTimesTooFine, {}, {"glTF"});
    return false;
  }
  ReportCommonLosses(composition, "glTF", diagnostics);
  if (plan.tracks().empty()) return true;
  if (plan.CountsFromFirstFrame()) diagnostics->Report(Code::ExportTimesShifted, {});
  for (const GltfTrack& track : plan.tracks()) {
    if (track.path != GltfPath::Zoom) continue;
    diagnostics->Report(Code::ExportZoomByExtension, {}, {composition.layers[track.layer].name});
  }
  return true;
}

void PutWord(std::ostream& out, std::uint64_t word) {
  std::array<char, 4> bytes{};
  for (std::size_t i = 0; i < bytes.size(); ++i) bytes[i] = static_cast<char>((word >> (8 * i)) & 0xffu);
  out.write(bytes.data(), bytes.size());
}

std::uint64_t RoundedUp(std::uint64_t size) { return (size + 3) / 4 * 4; }

// A reference to a file in the same folder. Signs with a meaning in a URI are escaped, as in %3A.
std::string UriOf(std::string_view name) {
  constexpr std::string_view kPlain = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789-._~";
  constexpr std::string_view kDigits = "0123456789ABCDEF";
  std::string uri;
  for (const char c : name) {
    if (kPlain.find(c) != std::string_view::npos) {
      uri += c;
    } else {
      const auto byte = static_cast<unsigned char>(c);
      uri += {'%', kDigits[byte >> 4U], kDigits[byte & 0xfU]};
    }
  }
  return uri;
}

constexpr std::uint64_t kHeadSize = 12;
constexpr std::uint64_t kChunkHeadSize = 8;
constexpr std::uint64_t kMagic = 0x46546c67;      // "glTF"
constexpr std::uint64_t kJsonChunk = 0x4e4f534a;  // "JSON"
constexpr std::uint64_t kDataChunk = 0x004e4942;  // "BIN"

}  // namespace

bool WriteGltf(const Composition& composition, const WriteOptions& /*options*/, Files& files,
               diag::Collector* diagnostics) {
  const GltfPlan plan(composition);
  if (!IsTaken(plan, diagnostics)) return false;
  std::ostream* const out = files.Main();
  if (out == nullptr) return false;
  std::string dataName;
  if (!plan.tracks().empty()) {
    std::ostream* const data = files.Beside("", ".bin", &dataName);
    if (data == nullptr || !WriteGltfData(plan, *data, diagnostics)) return false;
  }
  WriteGltfJson(plan, UriOf(dataName), *out);
  return true;
}

// The size of the JSON comes before it in the file, so it is written twice: first only to be counted.
bool WriteGlb(const Composition& composition, const WriteOptions& /*options*/, Files& files,
              diag::Collector* diagnostics) {
  const GltfPlan plan(composition);
  if (!IsTaken(plan, diagnostics)) return false;
  const std::uint64_t jsonSize = JsonSize(plan);
  const std::uint64_t dataSize = plan.DataSize();
  std::uint64_t size = kHeadSize + kChunkHeadSize + RoundedUp(jsonSize);
  if (dataSize != 0) size += kChunkHeadSize + dataSize;
  if (size > std::numeric_limits<std::uint32_t>::max()) {
    diagnostics->Report(Code::ExportFileTooLarge, {});
    return false;
  }
  std::ostream* const out = files.Main();
  if (out == nullptr) return false;
  PutWord(*out, kMagic);
  PutWord(*out, 2);
  PutWord(*out, size);
  PutWord(*out, RoundedUp(jsonSize));
  PutWord(*out, kJsonChunk);
  WriteGltfJson(plan, "", *out);
  *out << std::string(static_cast<std::size_t>(RoundedUp(jsonSize) - jsonSize), ' ');
  if (dataSize == 0) return true;
  PutWord(*out, dataSize);
  PutWord(*out, kDataChunk);
  return WriteGltfData(plan, *out, diagnostics);
}

}  // namespace interchange
