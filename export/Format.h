// The formats that compositions are written in: one table, one writer a line.
#pragma once

#include <ostream>
#include <span>
#include <string>
#include <string_view>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace interchange {

// Where the outputs of a writer go. All of them appear when the writing is over, or none does.
//
// Streams live as long as the object. Null where an output cannot be made: the object keeps the reason, and
// the writer stops.
class Files {
 public:
  virtual ~Files() = default;

  // The output that the user named. Once.
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

  // Writes a composition that IsWritable() takes. What the format cannot say is reported. False after an
  // error, which is reported, or which the files keep.
  bool (*write)(const Composition& composition, const WriteOptions& options, Files& files,
                diag::Collector* diagnostics) = nullptr;
};

// All formats, in the order of help. Lives as long as the program.
std::span<const Format> Formats();

// Null where there is none: by its name, or by the end of a path, in capitals or not.
const Format* FindFormat(std::string_view name);
const Format* FormatOfPath(std::string_view path);

// Picture, pixel aspect, rate, unit, film and zoom of a composition that can be written lie between these.
inline constexpr double kSmallestMeasure = 1e-9;
inline constexpr double kLargestMeasure = 1e12;

// No frame of such a composition has a larger number, with or without its sign. Up to it a double holds every
// whole number.
inline constexpr double kLargestFrame = 0x1p53;

// Whether a writer can be given it; an error is reported for each thing that keeps it from that. Then every
// number is finite; the measures and frames are within their bounds; a channel that moves has a value for
// each frame; every camera has a lens; no parents go in a circle. Places, rotations and scales may still be
// as large as a double is.
bool IsWritable(const Composition& composition, diag::Collector* diagnostics);

// Writes it in the format, where it is writable.
bool Write(const Format& format, const Composition& composition, const WriteOptions& options, Files& files,
           diag::Collector* diagnostics);

}  // namespace interchange
