// Writes JSON value by value, so that a million keys need no tree in memory.
#pragma once

#include <cstdint>
#include <ostream>
#include <string_view>
#include <vector>

namespace text {

// The caller keeps begin and end in pairs, and gives a key before each value of an object. Objects and arrays
// are spread over lines, except those that begin with beginRow() and all within them.
class JsonWriter {
 public:
  explicit JsonWriter(std::ostream& out) : out_(out) {}  // the stream outlives the writer

  void beginObject() { begin('{', false); }
  void endObject() { end('}'); }
  void beginArray() { begin('[', false); }
  void beginRow() { begin('[', true); }  // an array on one line
  void endArray() { end(']'); }

  void key(std::string_view name);

  void text(std::string_view bytes);  // bytes that are not valid UTF-8 become U+FFFD
  void number(double value);  // the shortest digits that give the same bits; as texts "inf", "-inf", "nan"
  void integer(std::int64_t value);
  void boolean(bool value);
  void null();

  // A whole document of another writer, as a value. Its lines are indented to this level.
  void written(std::string_view value);

 private:
  struct Level {
    bool oneLine;
    bool empty;
  };

  void literal(std::string_view word);
  void begin(char bracket, bool oneLine);
  void end(char bracket);
  void separate();  // from the value before
  void newLine();

  std::ostream& out_;
  std::vector<Level> levels_;
  bool afterKey_ = false;
};

}  // namespace text
