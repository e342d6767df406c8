#include "token_scan.h"

#include "../host/command.h"
#include "command_frame.h"

namespace {

constexpr int kDelimsOption = 0;
constexpr int kMatchAllOption = 1;
constexpr int kTokenOptionCount = 2;

}  // namespace

bool readTokenOptions(const TArray<CommandOption>& options, TokenOptions& tokenOptions) {
  tokenOptions.delims = kDefaultDelimiters;
  tokenOptions.matchAll = false;
  for (int i = 0; i < options.count(); ++i) {
    const int declared = declaredOptionIndex(options[i], kTokenOptionCount);
    if (declared == kDelimsOption) {
      tokenOptions.delims = options[i].getValue().getStringValue(-1);
      if (tokenOptions.delims.IsEmpty()) {
        Command::logError("Empty string argument for -delims option");
        return false;
      }
    } else if (declared == kMatchAllOption) {
      tokenOptions.matchAll = true;
    }
  }
  return true;
}

DelimiterSet::DelimiterSet(const HString& delims) : m_members() {
  const char* text = delims.GetStr();
  for (int i = 0; i < delims.GetLength(); ++i)
    m_members[static_cast<unsigned char>(text[i])] = true;
}

TokenSpan scanCharSetToken(const HString& text, int start, const DelimiterSet& set) {
  const char* chars = text.GetStr();
  const int length = text.GetLength();
  int position = start;
  while (position < length && !set.contains(chars[position])) ++position;
  const int end = position;
  while (position < length && set.contains(chars[position])) ++position;
  return TokenSpan{end, position, end < length};
}

TokenSpan scanMatchAllToken(const HString& text, int start, const HString& delims) {
  const int found = text.Find(delims, start);
  if (found < 0) return TokenSpan{text.GetLength(), text.GetLength(), false};
  return TokenSpan{found, found + delims.GetLength(), true};
}
