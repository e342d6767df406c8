#include "text_escape.h"

namespace {

const char kHexDigits[] = "0123456789abcdef";

// Which bytes each way of writing escapes. A byte's bits tell the quotings
// that escape it; the plain bytes between escapes go out in one write.
enum EscapedIn : unsigned char {
  kMessage = 1,      // \t \n \r, and \xHH below 0x20 and for 0x7F
  kScript = 2,       // as messages, and \" \\ inside the quotes
  kScriptAscii = 4,  // as script strings, and \xHH from 0x80 up
  kJson = 8,         // \" \\, and \u00XX below 0x20 and from 0x7F up
};

struct EscapeTable {
  unsigned char bits[256];
  constexpr EscapeTable() : bits() {
    for (int byte = 0; byte < 256; ++byte) {
      const bool control = byte < 0x20 || byte == 0x7F;
      const bool quoteOrBackslash = byte == '"' || byte == '\\';
      bits[byte] = static_cast<unsigned char>(
          (control ? kMessage | kScript | kScriptAscii : 0) |
          (quoteOrBackslash ? kScript | kScriptAscii : 0) | (byte >= 0x80 ? kScriptAscii : 0) |
          (control || quoteOrBackslash || byte >= 0x80 ? kJson : 0));
    }
  }
};
constexpr EscapeTable kEscapes;

// The escape of a byte that needs one, in script syntax or in JSON.
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

void writeEscaped(OutputStream& out, const char* text, EscapedIn quoting) {
  const auto* at = reinterpret_cast<const unsigned char*>(text);
  for (;;) {
    const unsigned char* run = at;
    while (*at != '\0' && (kEscapes.bits[*at] & quoting) == 0) ++at;
    out.write(reinterpret_cast<const char*>(run), static_cast<size_t>(at - run));
    if (*at == '\0') return;
    char escape[8];
    out.write(escape, escapeOf(*at++, quoting == kJson, escape));
  }
}

}  // namespace

void writeScriptString(OutputStream& out, const char* text, bool escapeHighBytes) {
  out << '"';
  writeEscaped(out, text, escapeHighBytes ? kScriptAscii : kScript);
  out << '"';
}

void writeJsonString(OutputStream& out, const char* text) {
  out << '"';
  writeEscaped(out, text, kJson);
  out << '"';
}

void writeMessageText(OutputStream& out, const char* text) {
  writeEscaped(out, text, kMessage);
}
