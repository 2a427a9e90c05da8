// Where the importer's reading of a text ends, byte by byte as the importer reads.
#pragma once

#include <cstddef>
#include <string_view>

namespace check {

struct ReadingEnd {
  enum class Kind {
    Text,         // at the end of the text, in good order or inside a command
    Nul,          // at a zero byte between words: what follows is not read
    RefusedByte,  // at a byte that begins nothing
    OpenString,   // in a string that is never closed
    OpenComment,  // in a comment without an end
    LastComment,  // in a comment to the end of its line, and the line does not end
    OpenWord,     // in a word that runs into the end of the text
  };

  Kind kind = Kind::Text;
  std::size_t offset = 0;      // of what is named above, at its beginning
  std::size_t command = 0;     // where the last command begins
  bool insideCommand = false;  // the last command has no ";"
};

// One pass over the text.
ReadingEnd FindReadingEnd(std::string_view text);

}  // namespace check
