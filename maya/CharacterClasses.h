// Classes of bytes. Bytes of 128 and above belong to none, whatever the locale.
#pragma once

inline constexpr bool IsWhiteSpace(char c) { return c == ' ' || c == '\n' || c == '\t' || c == '\r'; }

inline constexpr bool IsWordTerminator(char c) { return IsWhiteSpace(c) || c == ';'; }

inline constexpr bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }

inline constexpr bool IsDigit(char c) { return c >= '0' && c <= '9'; }

inline constexpr bool IsNumberStart(char c) { return IsDigit(c) || c == '-' || c == '.'; }
