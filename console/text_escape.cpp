#include "text_escape.h"

#include <stdint.h>

namespace {

const char kHexDigits[] = "0123456789abcdef";

// Which bytes need a look: those that do not print (controls, DEL and every
// byte from 0x80 up), and in quotes the quote and the backslash too. The bytes
// between them go out in one write.
constexpr unsigned char kNotPrinting = 1;
constexpr unsigned char kQuoting = 2;
struct LookTable {
  unsigned char bits[256];
  constexpr LookTable() : bits() {
    for (int byte = 0; byte < 256; ++byte) {
      bits[byte] = static_cast<unsigned char>((byte < 0x20 || byte >= 0x7F ? kNotPrinting : 0) |
                                              (byte == '"' || byte == '\\' ? kQuoting : 0));
    }
  }
};
constexpr LookTable kLooks;

// Characters that are valid but move or hide text on a terminal.
bool isHidingCharacter(uint32_t c) {
  return c <= 0x9F || c == 0x061C || c == 0x200E || c == 0x200F || (c >= 0x2028 && c <= 0x202E) ||
         (c >= 0x2066 && c <= 0x2069) || c == 0xFEFF;
}

// The length of the valid UTF-8 sequence of a printable character at at, or
// 0 when the bytes there are not one.
size_t printableSequence(const unsigned char* at, const unsigned char* end) {
  size_t length = 0;
  uint32_t c = 0;
  uint32_t least = 0;  // the smallest character of this length: shorter forms are invalid
  if (*at >= 0xC2 && *at <= 0xDF) {
    length = 2;
    c = *at & 0x1FU;
    least = 0x80;
  } else if (*at >= 0xE0 && *at <= 0xEF) {
    length = 3;
    c = *at & 0x0FU;
    least = 0x800;
  } else if (*at >= 0xF0 && *at <= 0xF4) {
    length = 4;
    c = *at & 0x07U;
    least = 0x10000;
  } else {
    return 0;
  }
  if (static_cast<size_t>(end - at) < length) return 0;
  for (size_t i = 1; i < length; ++i) {
    if ((at[i] & 0xC0U) != 0x80U) return 0;
    c = (c << 6) | (at[i] & 0x3FU);
  }
  const bool valid = c >= least && c <= 0x10FFFF && (c < 0xD800 || c > 0xDFFF);
  return valid && !isHidingCharacter(c) ? length : 0;
}

// The escape of a byte: \" \\, \t \n \r by name outside JSON, \xHH or \u00XX.
size_t escapeOf(unsigned char byte, bool json, char* escape) {
  const char named = byte == '\t' ? 't' : byte == '\n' ? 'n' : byte == '\r' ? 'r' : '\0';
  escape[0] = '\\';
  if (byte == '"' || byte == '\\' || (!json && named != '\0')) {
    escape[1] = byte == '"' || byte == '\\' ? static_cast<char>(byte) : named;
    return 2;
  }
  size_t length = 1;
  for (const char* prefix = json ? "u00" : "x"; *prefix != '\0'; ++prefix)
    escape[length++] = *prefix;
  escape[length++] = kHexDigits[byte >> 4];
  escape[length++] = kHexDigits[byte & 0xF];
  return length;
}

}  // namespace

void writeText(OutputStream& out, const char* text, size_t length, Escaping escaping) {
  const bool quoted = escaping != Escaping::Message;
  const bool keepsCharacters = escaping == Escaping::Message || escaping == Escaping::Script;
  const unsigned char looks = quoted ? kNotPrinting | kQuoting : kNotPrinting;
  const auto* at = reinterpret_cast<const unsigned char*>(text);
  const auto* end = at + length;
  if (quoted) out << '"';
  while (at < end) {
    const unsigned char* run = at;
    while (at < end && (kLooks.bits[*at] & looks) == 0) ++at;
    out.write(reinterpret_cast<const char*>(run), static_cast<size_t>(at - run));
    if (at == end) break;
    const size_t character = *at >= 0x80 && keepsCharacters ? printableSequence(at, end) : 0;
    if (character > 0) {
      out.write(reinterpret_cast<const char*>(at), character);
      at += character;
      continue;
    }
    char escape[8];
    out.write(escape, escapeOf(*at++, escaping == Escaping::Json, escape));
  }
  if (quoted) out << '"';
}
