#include "refhost/Trace.h"

#include <charconv>
#include <cmath>
#include <cstring>
#include <ostream>
#include <type_traits>

#include "refhost/ShownText.h"

namespace refhost {
namespace {

constexpr std::size_t kTypicalLine = 256;
constexpr std::size_t kLongestNumber = 32;  // no double or 64-bit integer is longer in its shortest form

// The four characters of a type or creator code, the first in the highest byte.
std::string fourCharacters(std::uint32_t code) {
  std::string characters;
  for (int shift = 24; shift >= 0; shift -= 8) {
    characters += static_cast<char>(static_cast<unsigned char>((code >> shift) & 0xff));
  }
  return characters;
}

}  // namespace

std::string extensionText(const HostImporterExtension& extension) {
  return std::string(extension.text, strnlen(extension.text, sizeof(extension.text)));
}

TraceLine::TraceLine(const HandleCodec& codec, const char* call, bool gave) : codec_(codec), gave_(gave) {
  line_.reserve(kTypicalLine);
  line_ += "{\"call\":";
  appendText(call);
}

void TraceLine::key(const char* name) {
  line_ += ",\"";
  line_ += name;
  line_ += "\":";
}

void TraceLine::appendInteger(std::int64_t value) {
  char digits[kLongestNumber];
  const auto result = std::to_chars(digits, digits + kLongestNumber, value);
  line_.append(digits, result.ptr);
}

void TraceLine::appendNumber(double value) {
  if (std::isnan(value)) {
    line_ += "\"nan\"";
  } else if (std::isinf(value)) {
    line_ += value > 0 ? "\"inf\"" : "\"-inf\"";
  } else {
    char digits[kLongestNumber];
    const auto result = std::to_chars(digits, digits + kLongestNumber, value);
    line_.append(digits, result.ptr);
  }
}

TraceLine& TraceLine::text(const char* name, const char* bytes) {
  key(name);
  if (bytes == nullptr) {
    appendNull();
  } else {
    appendText(bytes);
  }
  return *this;
}

TraceLine& TraceLine::text(const char* name, const std::string& bytes) {
  key(name);
  appendText(bytes);
  return *this;
}

TraceLine& TraceLine::units(const char* name, const HostUTF16Unit* units) {
  return units == nullptr ? text(name, nullptr) : text(name, shownUnits(units));
}

TraceLine& TraceLine::integer(const char* name, std::int64_t value) {
  key(name);
  appendInteger(value);
  return *this;
}

TraceLine& TraceLine::truth(const char* name, bool value) {
  key(name);
  line_ += value ? "true" : "false";
  return *this;
}

TraceLine& TraceLine::number(const char* name, const double* value) {
  key(name);
  if (value == nullptr) {
    appendNull();
  } else {
    appendNumber(*value);
  }
  return *this;
}

TraceLine& TraceLine::numbers(const char* name, const double* values, std::size_t count) {
  key(name);
  if (values == nullptr) {
    appendNull();
    return *this;
  }
  for (std::size_t i = 0; i < count; ++i) {
    line_ += i == 0 ? '[' : ',';
    appendNumber(values[i]);
  }
  line_ += ']';
  return *this;
}

TraceLine& TraceLine::recordValues(const char* name, const StreamValueRecord* record) {
  constexpr std::size_t kCount = std::extent_v<decltype(StreamValueRecord::value)>;
  return numbers(name, record == nullptr ? nullptr : record->value, kCount);
}

TraceLine& TraceLine::time(const char* name, const T_Time* time) {
  key(name);
  if (time == nullptr) {
    appendNull();
    return *this;
  }
  line_ += '[';
  appendInteger(time->value);
  line_ += ',';
  appendInteger(time->scale);
  line_ += ']';
  return *this;
}

TraceLine& TraceLine::ratio(const char* name, const HostRatio* ratio) {
  if (ratio == nullptr) return time(name, nullptr);
  const T_Time pair{ratio->numerator, ratio->denominator};
  return time(name, &pair);
}

TraceLine& TraceLine::handle(const char* name, const void* handle) {
  key(name);
  if (handle == nullptr) {
    appendNull();
  } else {
    line_ += '"';
    line_ += codec_.describe(handle);
    line_ += '"';
  }
  return *this;
}

TraceLine& TraceLine::importer(const char* name, HostImporterId importer) {
  key(name);
  if (importer == 0) {
    appendNull();
  } else {
    line_ += "\"importer:";
    appendInteger(importer);
    line_ += '"';
  }
  return *this;
}

TraceLine& TraceLine::types(const char* name, const HostImporterType* types, std::int32_t count) {
  key(name);
  if (types == nullptr) {
    appendNull();
    return *this;
  }
  line_ += '[';
  for (std::int32_t i = 0; i < count; ++i) {
    line_ += i == 0 ? "{\"type\":" : ",{\"type\":";
    appendText(fourCharacters(types[i].type));
    line_ += ",\"creator\":";
    appendText(fourCharacters(types[i].creator));
    line_ += '}';
  }
  line_ += ']';
  return *this;
}

TraceLine& TraceLine::extensions(const char* name, const HostImporterExtension* extensions,
                                 std::int32_t count) {
  key(name);
  if (extensions == nullptr) {
    appendNull();
    return *this;
  }
  line_ += '[';
  for (std::int32_t i = 0; i < count; ++i) {
    if (i != 0) line_ += ',';
    appendText(extensionText(extensions[i]));
  }
  line_ += ']';
  return *this;
}

TraceLine& TraceLine::handedInteger(const char* name, const std::int32_t* out) {
  if (gave_) return integer(name, *out);
  return handle(name, nullptr);
}

TraceLine& TraceLine::handedImporter(const char* name, const HostImporterId* out) {
  return importer(name, gave_ ? *out : 0);
}

void Trace::write(const TraceLine& line) {
  out_->write(line.line().data(), static_cast<std::streamsize>(line.line().size()));
}

void Trace::writeBracket(const TraceLine& line) {
  write(line);
  out_->flush();
}

}  // namespace refhost
