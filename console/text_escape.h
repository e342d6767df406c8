// How the console writes text: as script strings, which its line syntax
// reads back; as JSON strings that keep every 8-bit byte; and as message
// text, with every byte that does not print made visible. Text in any
// language stays readable: a valid UTF-8 sequence of a printable character is
// written as it is. Every other byte is written as \xHH (\t \n \r by name):
// invalid UTF-8, C0 and C1 controls, DEL, the bidirectional controls (U+061C,
// U+200E, U+200F, U+202A-U+202E, U+2066-U+2069), the line and paragraph
// separators U+2028 and U+2029, and U+FEFF; for a multi-byte character, each
// of its bytes.
#pragma once

#include <stddef.h>
#include <string.h>

#include "output_stream.h"

enum class Escaping {
  Message,      // unquoted, as above
  Script,       // in double quotes, as above, with \" and \\ too
  ScriptAscii,  // as Script, with every byte from 0x80 up as \xHH: ASCII only
  Json,         // in double quotes, with \" \\ and \u00XX below 0x20 and from 0x7F up
};

// Writes length bytes of text as escaping says.
void writeText(OutputStream& out, const char* text, size_t length, Escaping escaping);

inline void writeText(OutputStream& out, const char* text, Escaping escaping) {
  writeText(out, text, strlen(text), escaping);
}
