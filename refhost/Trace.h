// The call trace: one compact JSON object per line.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>

#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/HostTypes.h"
#include "hostapi/StreamSuite.h"
#include "refhost/Handles.h"
#include "text/JsonText.h"

namespace refhost {

// The text of an extension record, up to its NUL or its end.
std::string extensionText(const HostImporterExtension& extension);

// One line, built in the order of the calls. A null pointer is written as null.
class TraceLine {
 public:
  // `gave`: whether the call handed out its results. If not, every handed...() writes null.
  TraceLine(const HandleCodec& codec, const char* call, bool gave);

  TraceLine& text(const char* key, const char* bytes);
  TraceLine& text(const char* key, const std::string& bytes);
  TraceLine& units(const char* key, const HostUTF16Unit* units);
  TraceLine& integer(const char* key, std::int64_t value);
  TraceLine& truth(const char* key, bool value);
  TraceLine& number(const char* key, const double* value);
  TraceLine& numbers(const char* key, const double* values, std::size_t count);
  TraceLine& recordValues(const char* key, const StreamValueRecord* record);  // all, used or not
  TraceLine& time(const char* key, const T_Time* time);
  TraceLine& ratio(const char* key, const HostRatio* ratio);
  TraceLine& handle(const char* key, const void* handle);
  TraceLine& importer(const char* key, HostImporterId importer);
  TraceLine& types(const char* key, const HostImporterType* types, std::int32_t count);
  TraceLine& extensions(const char* key, const HostImporterExtension* extensions, std::int32_t count);

  // The results that the call handed out.
  template <typename Handle>
  TraceLine& handed(const char* key, Handle* const* out) {
    // NOLINTNEXTLINE(clang-analyzer-core.NullDereference): a call without a place for its result gave none.
    return handle(key, gave_ ? *out : nullptr);
  }
  TraceLine& handedInteger(const char* key, const std::int32_t* out);
  TraceLine& handedImporter(const char* key, const HostImporterId* out);

  const std::string& line() const { return line_; }
  void end() { line_ += "}\n"; }

 private:
  void key(const char* name);
  void appendInteger(std::int64_t value);
  void appendNumber(double value);
  void appendNull() { line_ += "null"; }
  void appendText(std::string_view bytes) { text::AppendJsonText(&line_, bytes, text::JsonForm::Utf8); }

  const HandleCodec& codec_;
  bool gave_;
  std::string line_;
};

class Trace {
 public:
  explicit Trace(std::ostream* out) : out_(out) {}

  bool on() const { return out_ != nullptr; }
  void write(const TraceLine& line);
  // Writes a line at which a callback begins or ends, and flushes the stream, so that the lines so far are
  // there even if the plug-in crashes.
  void writeBracket(const TraceLine& line);

 private:
  std::ostream* out_;
};

}  // namespace refhost
