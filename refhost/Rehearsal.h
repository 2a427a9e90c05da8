// The forms in which a user asks for a rehearsed failure.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "refhost/Host.h"

namespace refhost {

// "OPERATION:NTH=CODE" and "OPERATION:NTH=KIND". Nothing when the text has another form, names no operation
// of the host, or a number is out of range; *complaint then says which.
std::optional<Failure> parseFail(std::string_view text, std::string* complaint);
std::optional<Failure> parseThrow(std::string_view text, std::string* complaint);

// "K=CODE", "K+=CODE" and "K=KIND", "K+=KIND".
std::optional<Failure> parseFailAt(std::string_view text, std::string* complaint);
std::optional<Failure> parseThrowAt(std::string_view text, std::string* complaint);

// The word for a kind of exception, in these forms and in a trace.
const char* kindName(Failure::Kind kind);

// "SUITE:VERSION".
std::optional<RefusedSuite> parseRefuse(std::string_view text, std::string* complaint);

}  // namespace refhost
