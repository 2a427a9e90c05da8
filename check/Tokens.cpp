#include "check/Tokens.h"

#include <cstdint>

namespace check {

bool TakeToken(scene::Cursor* cursor, std::string_view* token, bool* quoted) {
  std::uint32_t openComment = scene::Cursor::kNone;
  cursor->SkipBlank(&openComment);
  *quoted = cursor->Peek() == '"';
  bool closed = true;
  bool escaped = false;
  *token = *quoted ? cursor->TakeString(&closed, &escaped) : cursor->TakeWord();
  return closed && (*quoted || !token->empty());
}

}  // namespace check
