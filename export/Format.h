// The formats that compositions are written in: one table, one writer a line.
#pragma once

#include <ostream>
#include <span>
#include <string>
#include <string_view>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace interchange {

// The outputs of a writer. All of them appear when the writing ends, or none does.
//
// Streams live as long as the object. A stream is null where its output cannot be made: the object keeps the
// reason, and the writer stops.
class Files {
 public:
  virtual ~Files() = default;

  // The output that the user named. Called once.
  virtual std::ostream* Main() = 0;

  // A further output beside it. It has the name of the main output with part + suffix in place of the suffix,
  // and a number between them where the run has such a file already. The part is empty or safe
  // (export/SafeNames.h). *name becomes the name, without a folder: any bytes that the user chose.
  virtual std::ostream* Beside(std::string_view part, std::string_view suffix, std::string* name) = 0;
};

struct WriteOptions {
  bool keys = false;  // a list of keys instead of frames, in formats that have one
};

struct Format {
  std::string_view name;      // "chan", as -f takes it
  std::string_view suffix;    // ".chan"
  std::string_view sentence;  // for help
  bool ownAxes = false;       // the axes are the format's own, whatever the user says
  bool severalFiles = false;  // a composition that moves is never one file
  bool listsKeys = false;     // takes WriteOptions::keys

  // Writes a composition that IsWritable() accepts, and reports what the format cannot hold. False after an
  // error, which is reported, or which the files keep.
  bool (*write)(const Composition& composition, const WriteOptions& options, Files& files,
                diag::Collector* diagnostics) = nullptr;
};

// All formats, in the order of help. Lives as long as the program.
std::span<const Format> Formats();

// The format of a name, and that of the suffix of a path, without regard to case. Null where there is none.
const Format* FindFormat(std::string_view name);
const Format* FormatOfPath(std::string_view path);

// The bounds of picture, pixel aspect, rate, unit, film and zoom in a composition that can be written.
inline constexpr double kSmallestMeasure = 1e-9;
inline constexpr double kLargestMeasure = 1e12;

// No frame of such a composition has a number of a larger magnitude. Up to it a double holds every whole
// number.
inline constexpr double kLargestFrame = 0x1p53;

// Whether a writer can write it. Reports an error for each reason against it. In a writable composition every
// number is finite; the measures and frames are within their bounds; a channel that moves has a value for
// each frame; every camera has a lens; no parents form a circle. Places, rotations and scales may still be as
// large as a double can be.
bool IsWritable(const Composition& composition, diag::Collector* diagnostics);

// Writes it in the format. False where it is not writable, and where the writer fails.
bool Write(const Format& format, const Composition& composition, const WriteOptions& options, Files& files,
           diag::Collector* diagnostics);

}  // namespace interchange
