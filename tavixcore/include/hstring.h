// The host's 8-bit string. It always holds a NUL-terminated text without
// embedded NUL bytes; positions are 0-based ints, lengths never exceed INT_MAX.
// Every operation stays inside the string whatever position or size it is
// given. Texts of up to 10 bytes are held inside the object, without any
// allocation; longer ones on the heap. The layout is part of the host's
// binary interface (modules hold strings by value), and the few accessors
// that only read it are inline.
#pragma once

#include <stddef.h>

#include "core_export.h"
#include "relocatable.h"

class TAVIXCORE_API HString {
 public:
  HString() : m_storage(), m_length(0) {}
  // A null text gives the empty string.
  HString(const char* text);  // NOLINT(google-explicit-constructor): host API
  HString(const HString& other);
  // Takes other's text; other is left empty.
  HString(HString&& other) noexcept : m_length(other.m_length) { takeStorage(other); }
  ~HString() {
    if (!isInline()) Empty();
  }

  HString& operator=(const char* text);
  HString& operator=(const HString& other);
  HString& operator=(HString&& other) noexcept {
    if (this != &other) {
      Empty();
      m_length = other.m_length;
      takeStorage(other);
    }
    return *this;
  }

  operator const char*() const { return GetStr(); }  // NOLINT(google-explicit-constructor)
  const char* GetStr() const { return isInline() ? m_storage : heapText(); }
  int GetLength() const { return m_length; }
  bool IsEmpty() const { return m_length == 0; }
  void Empty();

  // Positions outside 0..length-1 read as NUL. For them the writable form
  // returns a spare byte of this string's own, outside its text, so that a
  // write there changes no text and no other string (nor another thread's).
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
  void Format(const char* format, ...) TAVIX_PRINTF(2, 3);

 private:
  static constexpr int kInlineLength = 10;

  bool isInline() const { return m_length <= kInlineLength; }
  static_assert(sizeof(char*) + sizeof(int) <= kInlineLength + 2, "a heap text's fields fit");
  char* characters();
  // The inline members below touch only the fields and call only the
  // string's public operations, so that code built on this header refers to
  // nothing else of the library.
  char* heapText() const { return *reinterpret_cast<char* const*>(m_storage); }
  // Takes other's storage bytes, whose length this string already has; other is left empty.
  void takeStorage(HString& other) {
    for (size_t i = 0; i < sizeof(m_storage); ++i) m_storage[i] = other.m_storage[i];
    other.m_length = 0;
    other.m_storage[0] = '\0';
  }
  int heapCapacity() const;
  void setHeap(char* text, int capacity);
  void assign(const char* text, size_t length);
  // Room for length characters and the NUL, inline or on the heap; the old
  // text is gone. Returns where the characters go.
  char* prepare(size_t length);
  void release();

  // Bytes 0-11: the text and its NUL while the length is at most 10, and a
  // spare byte at 11; otherwise the heap text's address (0-7) and capacity
  // (8-11), the characters it can hold without its NUL. A heap text has one
  // spare byte after its NUL too.
  alignas(8) char m_storage[12];
  int m_length;
};

// A string holds no pointer into itself, so its bytes may move.
template <>
struct IsRelocatable<HString> {
  static constexpr bool value = true;
};
