"""Cuts a scene text into tokens and reads names and numbers out of them: part of the model of the importer."""

import re

SYNTAX_MESSAGE = "Error reading Maya file."
END_MESSAGE = "Unexpected end of maya file."
CODE_SYNTAX = 1289985
CODE_END = 1289986
CODE_NUMBER_SYNTAX = 2001
CODE_NUMBER_RANGE = 2002
LONGEST_TOKEN = 254

KEYWORDS = (b"file", b"requires", b"createnode", b"setattr", b"addattr", b"parent", b"connectattr",
            b"disconnectattr", b"select", b"currentunit")
WORD = re.compile(rb"[^\t\n\r ;]*")
SPACE = re.compile(rb"[\t\r\n ]*")
NUMBER = re.compile(rb"[+-]?([0-9]+\.?[0-9]*|\.[0-9]+)([eE][+-]?[0-9]+)?[A-Za-z]*\Z")
NUMBER_DIGITS = re.compile(rb"[+-]?([0-9]+\.?[0-9]*|\.[0-9]+)([eE][+-]?[0-9]+)?")


class ImportFailure(Exception):
    """The reading or building ended with a code, and perhaps with a message to the user."""

    def __init__(self, code, message=None):
        super().__init__(code)
        self.code = code
        self.message = message


class Tokens:
    """Cuts the text; a token is (kind, bytes)."""

    def __init__(self, text):
        self.text = text
        self.at = 0

    def next(self):
        text = self.text
        self.at = SPACE.match(text, self.at).end()
        if self.at >= len(text) or text[self.at] == 0:
            return "end", b""
        first = text[self.at : self.at + 1]
        if first == b'"':
            return self.quote()
        if first == b"/":
            return self.comment()
        if first in b"()+;:":
            self.at += 1
            return first.decode(), first
        after = text[self.at + 1 : self.at + 2]
        if first == b"-" and after.isalpha():
            return "option", self.word()
        if first == b"-" and not (after.isdigit() or after in (b"-", b".")):
            self.at += 1
            return "unknown", first
        if not (first.isalnum() or first in b"-."):
            raise ImportFailure(CODE_SYNTAX, SYNTAX_MESSAGE)
        word = self.word()
        if first.isdigit() or first in b"-.":
            return "number", word
        lowered = word.lower()
        if lowered in KEYWORDS:
            return lowered.decode(), word
        return "identifier", word

    def word(self):
        match = WORD.match(self.text, self.at)
        if match.end() >= len(self.text):
            raise ImportFailure(CODE_END, END_MESSAGE)
        self.at = match.end()
        return match.group()

    def until_nul(self):
        end = self.text.find(b"\0", self.at)
        return end if end >= 0 else len(self.text)

    def quote(self):
        start = self.at
        end = self.until_nul()
        close = start + 1
        while True:
            close = self.text.find(b'"', close, end)
            if close < 0:
                raise ImportFailure(CODE_END, END_MESSAGE)
            if self.text[close - 1 : close] != b"\\":
                break
            close += 1
        self.at = close + 1
        return "string", self.text[start : self.at]

    def comment(self):
        start, end, second = self.at, self.until_nul(), self.text[self.at + 1 : self.at + 2]
        if second == b"/":
            match = re.compile(rb"[\r\n]").search(self.text, start, end)
            if not match:
                raise ImportFailure(CODE_END, END_MESSAGE)
            self.at = match.end()
            return "comment", b""
        if second != b"*":
            raise ImportFailure(CODE_SYNTAX, SYNTAX_MESSAGE)
        at = start + 2
        while True:
            star = self.text.find(b"*", at, end)
            if star < 0 or star + 1 >= end:
                raise ImportFailure(CODE_END, END_MESSAGE)
            at = star + 2
            if self.text[star + 1 : at] == b"/":
                self.at = at
                return "comment", b""


def copied(token):
    """The text of a token; a token of 255 bytes or more is empty, and a NUL ends the copy."""
    return b"" if len(token) > LONGEST_TOKEN else token.split(b"\0")[0]


def unquoted(token):
    return b"" if len(token) > LONGEST_TOKEN else token[1:-1].split(b"\0")[0]


def scanned(token):
    text = copied(token)
    if not NUMBER.match(text):
        raise ImportFailure(CODE_NUMBER_SYNTAX)
    value = float(NUMBER_DIGITS.match(text).group())
    if value in (float("inf"), float("-inf")):
        raise ImportFailure(CODE_NUMBER_RANGE)
    return value


def truncated(value, low=-(2**31), high=2**31 - 1):
    return low if value <= low else high if value >= high else int(value)
