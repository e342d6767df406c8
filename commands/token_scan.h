// Tokenising shared by strTok and strTokArray. Both scan their text by
// position and take each token out once, so a whole walk costs time in
// proportion to the text.
#pragma once

#include "../host/command_option.h"
#include "../host/hstring.h"
#include "../host/tarray.h"

// Space, tab, line feed and carriage return.
constexpr const char* kDefaultDelimiters = " \t\n\r";

// The options of one run: the delimiter set (or string) and the mode.
struct TokenOptions {
  HString delims;
  bool matchAll = false;
};

// Reads the options given, first to last: delims (declared index 0) replaces
// the delimiters, matchAll (index 1) sets the mode, other indexes are passed
// over. Starts from the default set in character-set mode. An empty delims
// value logs "Empty string argument for -delims option" as an error and
// returns false at once; otherwise returns true.
bool readTokenOptions(const TArray<CommandOption>& options, TokenOptions& tokenOptions);

// Membership of the 8-bit characters of a delimiter set, byte for byte.
class DelimiterSet {
 public:
  explicit DelimiterSet(const HString& delims);
  bool contains(char c) const { return m_members[static_cast<unsigned char>(c)]; }

 private:
  bool m_members[256];
};

// One token of text, starting at start: it ends before end, and the text
// after it (and after the delimiters dropped with it) begins at next.
// delimited tells whether a delimiter followed the token.
struct TokenSpan {
  int end;
  int next;
  bool delimited;
};

// Character-set mode: the token runs up to the first character of the set;
// the whole run of set characters after it is dropped. The token is empty when
// text begins with a set character at start.
TokenSpan scanCharSetToken(const HString& text, int start, const DelimiterSet& set);

// Match-all mode: the token runs up to the next whole occurrence of delims,
// which is dropped; occurrences are neither merged nor overlapped. Joining the
// tokens of a text with delims gives back the text, less its final delimiter
// string when it ends with one.
TokenSpan scanMatchAllToken(const HString& text, int start, const HString& delims);
