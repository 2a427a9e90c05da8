// The table of formats: a writer is a line here, and a file of its own.
#include <algorithm>
#include <array>

#include "export/Format.h"
#include "export/Writers.h"
#include "text/Letters.h"

namespace interchange {
namespace {

constexpr std::array kFormats = {
    Format{.name = "gltf",
           .suffix = ".gltf",
           .sentence = "glTF 2.0, with a .bin beside it: always metres, y up",
           .ownAxes = true,
           .severalFiles = true,
           .write = WriteGltf},
    Format{.name = "glb",
           .suffix = ".glb",
           .sentence = "glTF 2.0 in one file: always metres, y up",
           .ownAxes = true,
           .write = WriteGlb},
    Format{.name = "usda", .suffix = ".usda", .sentence = "USD as text, in doubles", .write = WriteUsda},
    Format{.name = "chan",
           .suffix = ".chan",
           .sentence = "a text file for each camera: a line a frame",
           .ownAxes = true,
           .write = WriteChan},
    Format{.name = "csv",
           .suffix = ".csv",
           .sentence = "a row a frame and layer; with --keys a row a key",
           .listsKeys = true,
           .write = WriteCsv},
};

}  // namespace

std::span<const Format> Formats() { return kFormats; }

const Format* FindFormat(std::string_view name) {
  const auto found = std::find_if(kFormats.begin(), kFormats.end(),
                                  [&](const Format& format) { return format.name == name; });
  return found == kFormats.end() ? nullptr : &*found;
}

const Format* FormatOfPath(std::string_view path) {
  const std::string lowered = text::Lowered(path);
  const auto found = std::find_if(kFormats.begin(), kFormats.end(),
                                  [&](const Format& format) { return lowered.ends_with(format.suffix); });
  return found == kFormats.end() ? nullptr : &*found;
}

bool Write(const Format& format, const Composition& composition, const WriteOptions& options, Files& files,
           diag::Collector* diagnostics) {
  return IsWritable(composition, diagnostics) && format.write(composition, options, files, diagnostics);
}

}  // namespace interchange
