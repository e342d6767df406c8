// The host's 8-bit string. It always holds a NUL-terminated text without
// embedded NUL bytes; positions are 0-based ints, lengths never exceed INT_MAX.
// Every operation stays inside the string whatever position or size it is
// given.
#pragma once

#include <stddef.h>

#include "core_export.h"

class TAVIXCORE_API HString {
 public:
  HString();
  // A null text gives the empty string.
  HString(const char* text);  // NOLINT(google-explicit-constructor): host API
  HString(const HString& other);
  ~HString();

  HString& operator=(const char* text);
  HString& operator=(const HString& other);

  operator const char*() const;  // NOLINT(google-explicit-constructor): host API
  const char* GetStr() const;
  int GetLength() const;
  bool IsEmpty() const;
  void Empty();

  // Positions outside 0..length-1 read as NUL. The writable form returns a
  // scratch byte for them, so a write there changes no string.
  char operator[](int index) const;
  char& operator[](int index);

  // Appends one character; a NUL character is ignored, as a string cannot hold it.
  HString& operator+=(char c);

  // Orders as strcmp does, bytes taken as unsigned: returns the difference of
  // the first two bytes that differ (the shorter string's NUL counts as 0),
  // 0 when equal. A null text compares as the empty string.
  int Compare(const char* other) const;
  // As Compare, with the ASCII letters A-Z folded to a-z; no locale is used.
  int CompareNoCase(const char* other) const;

  // First position of sub at or after start, or -1. A negative start searches
  // from 0; a start past the end finds nothing. An empty (or null) sub is
  // found at the start itself. Linear in length + sub length.
  int Find(const char* sub) const;
  int Find(const char* sub, int start) const;
  // Last position of c, or -1; NUL is never found.
  int ReverseFind(char c) const;

  // New strings; sizes and positions past the end (sizes near 2^64 included)
  // are clamped to what the string holds, so these never read past the end.
  HString Left(size_t count) const;   // first count characters
  HString Right(size_t count) const;  // last count characters
  HString Mid(size_t first) const;    // from first to the end; empty when first >= length
  HString Mid(size_t first, size_t count) const;

  // Replaces every occurrence of oldText, left to right and without overlaps,
  // by newText (null counts as empty); inserted text is not searched again.
  // Returns the number of replacements. An empty oldText changes nothing and
  // returns 0. Linear in the lengths of the text and the result.
  int Replace(const char* oldText, const char* newText);

  // printf-style; the string becomes the formatted text. A format that fails
  // to expand leaves the string empty.
  void Format(const char* format, ...);

 private:
  void assign(const char* text, size_t length);

  char* m_data;
  int m_length;
  int m_capacity;  // bytes usable for characters in m_data, NUL not counted
};
