// How the console writes strings: as script strings, which its line syntax
// reads back, and as JSON strings that keep every 8-bit byte.
#pragma once

#include <string>

// In double quotes, with \" \\ \t \n \r, and \xHH for other bytes below 0x20
// and 0x7F; bytes from 0x80 up are written as they are, or as \xHH too when
// escapeHighBytes is set, which keeps the text ASCII.
std::string quoteScriptString(const std::string& text, bool escapeHighBytes = false);

// In double quotes, with \" and \\, and \u00XX for every byte below 0x20 or
// from 0x7F up.
std::string quoteJsonString(const std::string& text);
