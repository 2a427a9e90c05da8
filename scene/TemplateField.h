// Fields of a template that nobody filled in: "{{FPS}}", "${FPS}", "<FPS>", "%FPS%", "@FPS@", "$FPS".
#pragma once

#include <cstddef>
#include <string_view>

namespace scene {

// How many bytes the field takes at the front of the text, which is not empty; 0 where none stands there. A
// field lies on one line and is at most 60 bytes long.
std::size_t TemplateFieldLength(std::string_view text);

}  // namespace scene
