// The words of a command.
#pragma once

#include <string_view>

#include "scene/Cursor.h"

namespace check {

// Moves over a string, of which the token is what stands between its quotes, or over a word. False where
// neither stands: at the end of a command, or of the text.
bool TakeToken(scene::Cursor* cursor, std::string_view* token, bool* quoted);

}  // namespace check
