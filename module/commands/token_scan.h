// Tokenising shared by strTok and strTokArray. Both scan their text by
// position and take each token out once, so a whole walk costs time in
// proportion to the text.
#pragma once

#include <stdint.h>

#include "command_frame.h"
#include "command_option.h"
#include "hstring.h"
#include "tarray.h"

// Space, tab, line feed and carriage return.
constexpr const char* kDefaultDelimiters = " \t\n\r";

// The options of strTok and strTokArray, each with its declared-option index.
enum TokenOption { kDelimsOption, kMatchAllOption };
inline constexpr OptionDescription kTokenOptions[] = {{kDelimsOption, "delims", true},
                                                      {kMatchAllOption, "matchAll", false}};
static_assert(optionsInOrder(kTokenOptions), "each option's index is its place");

// The options of one run: the delimiter set (or string) and the mode. The
// delimiters are read where they stand, in the option's value or the
// default, which stay put for the whole run.
struct TokenOptions {
  const char* delims = kDefaultDelimiters;
  int delimsLength = 4;
  bool matchAll = false;
};

// Reads the options given, first to last: delims replaces the delimiters,
// matchAll sets the mode, options the commands did not declare are passed
// over. Starts from the default set in character-set mode. An empty delims
// value logs "Empty string argument for -delims option" as an error and
// returns false at once; otherwise returns true.
bool readTokenOptions(const TArray<CommandOption>& options, TokenOptions& tokenOptions);

// Membership of the 8-bit characters of a delimiter set, byte for byte.
class DelimiterSet {
 public:
  explicit DelimiterSet(const TokenOptions& options);
  bool contains(char c) const {
    if (m_single != '\0') return c == m_single;
    const auto byte = static_cast<unsigned char>(c);
    return (m_members[byte >> 6] >> (byte & 63)) & 1;
  }
  // The set's one character, when it has exactly one; NUL otherwise.
  char single() const { return m_single; }

 private:
  uint64_t m_members[4];  // one bit per byte value, for sets of more than one character
  char m_single;
};

// One token of text, starting at start: it ends before end, and the text
// after it (and after the delimiters dropped with it) begins at next. A
// delimiter followed the token exactly when end is before the text's end.
struct TokenSpan {
  int end;
  int next;
};

// Character-set mode: the token runs up to the first character of the set;
// the whole run of set characters after it is dropped. The token is empty when
// text begins with a set character at start.
TokenSpan scanCharSetToken(const HString& text, int start, const DelimiterSet& set);

// Match-all mode: the token runs up to the next whole occurrence of the
// delimiter string, which is dropped; occurrences are neither merged nor
// overlapped. Joining the tokens of a text with the delimiter string gives
// back the text, less its final delimiter string when it ends with one.
TokenSpan scanMatchAllToken(const HString& text, int start, const TokenOptions& options);
