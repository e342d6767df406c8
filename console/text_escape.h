// How the console writes text: as script strings, which its line syntax
// reads back; as JSON strings that keep every 8-bit byte; and as message
// text, with the bytes that do not print made visible.
#pragma once

#include <stddef.h>

#include "output_stream.h"

// In double quotes, with \" \\ \t \n \r, and \xHH for other bytes below 0x20
// and 0x7F; bytes from 0x80 up are written as they are, or as \xHH too when
// escapeHighBytes is set, which keeps the text ASCII.
void writeScriptString(OutputStream& out, const char* text, bool escapeHighBytes = false);

// In double quotes, with \" and \\, and \u00XX for every byte below 0x20 or
// from 0x7F up.
void writeJsonString(OutputStream& out, const char* text);

// Unquoted, with \t \n \r and \xHH for the other bytes below 0x20 and 0x7F,
// as in script strings; everything else as it is.
void writeMessageText(OutputStream& out, const char* text);
