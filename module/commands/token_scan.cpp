#include "token_scan.h"

#include <string.h>

#include "command.h"

bool readTokenOptions(const TArray<CommandOption>& options, TokenOptions& tokenOptions) {
  tokenOptions = TokenOptions();
  for (int i = 0; i < options.count(); ++i) {
    const int declared = options[i].getIndex();  // options not declared match neither
    if (declared == kDelimsOption) {
      tokenOptions.delims = options[i].getValue().getStringValue(-1);
      tokenOptions.delimsLength = static_cast<int>(strlen(tokenOptions.delims));
      if (tokenOptions.delimsLength == 0) {
        Command::logError("Empty string argument for -delims option");
        return false;
      }
    } else if (declared == kMatchAllOption) {
      tokenOptions.matchAll = true;
    }
  }
  return true;
}

DelimiterSet::DelimiterSet(const TokenOptions& options) : m_single(options.delims[0]) {
  for (int i = 1; i < options.delimsLength && m_single != '\0'; ++i) {
    if (options.delims[i] != m_single) m_single = '\0';
  }
  if (m_single != '\0') return;
  for (uint64_t& word : m_members) word = 0;
  for (int i = 0; i < options.delimsLength; ++i) {
    const auto byte = static_cast<unsigned char>(options.delims[i]);
    m_members[byte >> 6] |= uint64_t{1} << (byte & 63);
  }
}

TokenSpan scanCharSetToken(const HString& text, int start, const DelimiterSet& set) {
  const char* chars = text.GetStr();
  const int length = text.GetLength();
  int position = start;
  if (set.single() != '\0') {  // one delimiter character: found at memory speed
    const void* found = memchr(chars + start, set.single(), static_cast<size_t>(length - start));
    position =
        found == nullptr ? length : static_cast<int>(static_cast<const char*>(found) - chars);
  }
  while (position < length && !set.contains(chars[position])) ++position;
  const int end = position;
  while (position < length && set.contains(chars[position])) ++position;
  return TokenSpan{end, position};
}

TokenSpan scanMatchAllToken(const HString& text, int start, const TokenOptions& options) {
  const int found = text.Find(options.delims, start);
  if (found < 0) return TokenSpan{text.GetLength(), text.GetLength()};
  return TokenSpan{found, found + options.delimsLength};
}
