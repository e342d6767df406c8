#include "text_escape.h"

namespace {

const char kHexDigits[] = "0123456789abcdef";

// Writes text with each byte that escapeOf names replaced by its escape;
// runs of bytes that need none go out in one write.
template <class EscapeOf>
void writeEscaped(OutputStream& out, const char* text, EscapeOf escapeOf) {
  const char* run = text;
  for (const char* at = text;; ++at) {
    char escape[8];
    const size_t length = *at == '\0' ? 0 : escapeOf(static_cast<unsigned char>(*at), escape);
    if (*at != '\0' && length == 0) continue;
    out.write(run, static_cast<size_t>(at - run));
    if (*at == '\0') return;
    out.write(escape, length);
    run = at + 1;
  }
}

size_t hexEscape(const char* prefix, unsigned char byte, char* escape) {
  size_t length = 0;
  while (*prefix != '\0') escape[length++] = *prefix++;
  escape[length++] = kHexDigits[byte >> 4];
  escape[length++] = kHexDigits[byte & 0xF];
  return length;
}

// The escape of a byte in script syntax, or 0 when it stands for itself.
size_t scriptEscape(unsigned char byte, char* escape, bool quoted, bool escapeHighBytes) {
  const char* named = byte == '\t'             ? "\\t"
                      : byte == '\n'           ? "\\n"
                      : byte == '\r'           ? "\\r"
                      : quoted && byte == '"'  ? "\\\""
                      : quoted && byte == '\\' ? "\\\\"
                                               : nullptr;
  if (named != nullptr) {
    escape[0] = named[0];
    escape[1] = named[1];
    return 2;
  }
  if (byte < 0x20 || byte == 0x7F || (escapeHighBytes && byte >= 0x80)) {
    return hexEscape("\\x", byte, escape);
  }
  return 0;
}

}  // namespace

void writeScriptString(OutputStream& out, const char* text, bool escapeHighBytes) {
  out << '"';
  writeEscaped(out, text, [escapeHighBytes](unsigned char byte, char* escape) {
    return scriptEscape(byte, escape, true, escapeHighBytes);
  });
  out << '"';
}

void writeJsonString(OutputStream& out, const char* text) {
  out << '"';
  writeEscaped(out, text, [](unsigned char byte, char* escape) -> size_t {
    if (byte == '"' || byte == '\\') {
      escape[0] = '\\';
      escape[1] = static_cast<char>(byte);
      return 2;
    }
    return (byte < 0x20 || byte >= 0x7F) ? hexEscape("\\u00", byte, escape) : 0;
  });
  out << '"';
}

void writeMessageText(OutputStream& out, const char* text) {
  writeEscaped(out, text, [](unsigned char byte, char* escape) {
    return scriptEscape(byte, escape, false, false);
  });
}
