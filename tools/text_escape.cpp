#include "text_escape.h"

namespace {

const char kHexDigits[] = "0123456789abcdef";

std::string hexByte(unsigned char byte) {
  return std::string{kHexDigits[byte >> 4], kHexDigits[byte & 0xF]};
}

}  // namespace

std::string quoteScriptString(const std::string& text, bool escapeHighBytes) {
  std::string out = "\"";
  for (char c : text) {
    const auto byte = static_cast<unsigned char>(c);
    switch (c) {
      case '"':
        out += "\\\"";
        break;
      case '\\':
        out += "\\\\";
        break;
      case '\t':
        out += "\\t";
        break;
      case '\n':
        out += "\\n";
        break;
      case '\r':
        out += "\\r";
        break;
      default:
        if (byte < 0x20 || byte == 0x7F || (escapeHighBytes && byte >= 0x80)) {
          out += "\\x" + hexByte(byte);
        } else {
          out += c;
        }
    }
  }
  return out + "\"";
}

std::string quoteJsonString(const std::string& text) {
  std::string out = "\"";
  for (char c : text) {
    const auto byte = static_cast<unsigned char>(c);
    if (c == '"' || c == '\\') {
      out += '\\';
      out += c;
    } else if (byte < 0x20 || byte >= 0x7F) {
      out += "\\u00" + hexByte(byte);
    } else {
      out += c;
    }
  }
  return out + "\"";
}
