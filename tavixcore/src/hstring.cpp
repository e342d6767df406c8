#include "hstring.h"

#include <limits.h>
#include <stdarg.h>
#include <string.h>

#include "format_text.h"
#include "out_of_memory.h"

namespace {

const char kEmptyText[] = "";

size_t textLength(const char* text) {
  return text == nullptr ? 0 : strlen(text);
}

// Finds one needle in texts in time linear in text and needle. Needles of up
// to kShortNeedle bytes are compared in place after a memchr for their first
// byte (at most kShortNeedle comparisons per text byte, and no table to
// build); longer ones use Knuth-Morris-Pratt.
class Searcher {
 public:
  static constexpr size_t kShortNeedle = 16;

  Searcher(const char* needle, size_t length)
      : m_needle(needle), m_length(length), m_border(nullptr) {
    if (m_length <= kShortNeedle) return;
    m_border = new size_t[m_length]();
    size_t k = 0;
    for (size_t i = 1; i < m_length; ++i) {
      while (k > 0 && m_needle[i] != m_needle[k]) k = m_border[k - 1];
      if (m_needle[i] == m_needle[k]) ++k;
      m_border[i] = k;
    }
  }

  // First match at or after from, or npos. from must be <= textLength.
  size_t firstMatchIn(const char* text, size_t textLength, size_t from) const {
    if (m_length == 0) return from;
    if (m_length > textLength - from) return npos;
    if (m_length <= kShortNeedle) {
      const char* last = text + (textLength - m_length);  // the last possible start
      for (const char* at = text + from; at <= last; ++at) {
        at = static_cast<const char*>(memchr(at, m_needle[0], static_cast<size_t>(last - at) + 1));
        if (at == nullptr) return npos;
        size_t matched = 1;  // the first byte, found by memchr; the rest compared here
        while (matched < m_length && at[matched] == m_needle[matched]) ++matched;
        if (matched == m_length) return static_cast<size_t>(at - text);
      }
      return npos;
    }
    size_t matched = 0;
    for (size_t i = from; i < textLength; ++i) {
      while (matched > 0 && text[i] != m_needle[matched]) matched = m_border[matched - 1];
      if (text[i] == m_needle[matched]) ++matched;
      if (matched == m_length) return i + 1 - m_length;
    }
    return npos;
  }

  ~Searcher() { delete[] m_border; }
  Searcher(const Searcher&) = delete;
  Searcher& operator=(const Searcher&) = delete;

  static constexpr size_t npos = static_cast<size_t>(-1);

 private:
  const char* m_needle;
  size_t m_length;
  size_t* m_border;  // Knuth-Morris-Pratt table, for long needles only
};

// Each byte with A-Z folded to a-z, looked up rather than tested.
struct FoldTable {
  unsigned char folded[256];
  constexpr FoldTable() : folded() {
    for (int c = 0; c < 256; ++c)
      folded[c] = static_cast<unsigned char>((c >= 'A' && c <= 'Z') ? c - 'A' + 'a' : c);
  }
};
constexpr FoldTable kFold;

int foldAscii(unsigned char c) {
  return kFold.folded[c];
}

template <class Fold>
int compareTexts(const char* left, const char* right, Fold fold) {
  const auto* a = reinterpret_cast<const unsigned char*>(left);
  const auto* b = reinterpret_cast<const unsigned char*>(right == nullptr ? kEmptyText : right);
  for (;; ++a, ++b) {
    const int difference = fold(*a) - fold(*b);
    if (difference != 0 || *a == 0) return difference;
  }
}

}  // namespace

HString::HString(const char* text) : HString() {
  *this = text;
}

HString::HString(const HString& other) : HString() {
  assign(other.GetStr(), static_cast<size_t>(other.m_length));
}

int HString::heapCapacity() const {
  int capacity;
  memcpy(&capacity, m_storage + sizeof(char*), sizeof(capacity));
  return capacity;
}

void HString::setHeap(char* text, int capacity) {
  *reinterpret_cast<char**>(m_storage) = text;
  memcpy(m_storage + sizeof(char*), &capacity, sizeof(capacity));
}

char* HString::characters() {
  return isInline() ? m_storage : heapText();
}

void HString::release() {
  if (!isInline()) delete[] heapText();
  m_length = 0;
  m_storage[0] = '\0';
}

char* HString::prepare(size_t length) {
  if (length > static_cast<size_t>(INT_MAX) - 1) throw OutOfMemory();
  if (length <= kInlineLength) {
    release();
  } else if (isInline() || static_cast<size_t>(heapCapacity()) < length) {
    char* text = new char[length + 2];
    release();
    setHeap(text, static_cast<int>(length));
  }
  m_length = static_cast<int>(length);
  return characters();
}

void HString::assign(const char* text, size_t length) {
  // text may lie inside this string: it is copied before anything is freed.
  if (length > static_cast<size_t>(INT_MAX) - 1) throw OutOfMemory();
  if (text == nullptr) text = kEmptyText;
  if (length <= kInlineLength) {
    if (isInline()) {
      // A short text is copied byte by byte: cheaper than a library call,
      // and safe when it lies inside this string (it never starts before it).
      for (size_t i = 0; i < length; ++i) m_storage[i] = text[i];
    } else {
      char* old = heapText();
      memcpy(m_storage, text, length);
      delete[] old;
    }
  } else if (!isInline() && length <= static_cast<size_t>(heapCapacity())) {
    memmove(heapText(), text, length);
  } else {
    char* copy = new char[length + 2];
    memcpy(copy, text, length);
    release();
    setHeap(copy, static_cast<int>(length));
  }
  m_length = static_cast<int>(length);
  characters()[length] = '\0';
}

HString& HString::operator=(const char* text) {
  assign(text, textLength(text));
  return *this;
}

HString& HString::operator=(const HString& other) {
  if (this != &other) assign(other.GetStr(), static_cast<size_t>(other.m_length));
  return *this;
}

void HString::Empty() {
  release();
}

char HString::operator[](int index) const {
  return (index >= 0 && index < m_length) ? GetStr()[index] : '\0';
}

char& HString::operator[](int index) {
  if (index >= 0 && index < m_length) return characters()[index];
  char& spare = isInline() ? m_storage[kInlineLength + 1] : heapText()[heapCapacity() + 1];
  spare = '\0';
  return spare;
}

HString& HString::operator+=(char c) {
  if (c == '\0') return *this;
  if (m_length < kInlineLength || (!isInline() && m_length < heapCapacity())) {
    char* text = characters();
    text[m_length] = c;
    text[++m_length] = '\0';
    return *this;
  }
  // Doubling keeps a run of appends linear in the final length.
  if (m_length >= INT_MAX - 1) throw OutOfMemory();
  const int capacity = m_length > INT_MAX / 2 - 1 ? INT_MAX - 1 : m_length * 2;
  char* grown = new char[static_cast<size_t>(capacity) + 2];
  memcpy(grown, GetStr(), static_cast<size_t>(m_length));
  grown[m_length] = c;
  grown[m_length + 1] = '\0';
  const int length = m_length + 1;
  release();
  setHeap(grown, capacity);
  m_length = length;
  return *this;
}

int HString::Compare(const char* other) const {
  return compareTexts(GetStr(), other, [](unsigned char c) { return static_cast<int>(c); });
}

int HString::CompareNoCase(const char* other) const {
  return compareTexts(GetStr(), other, foldAscii);
}

int HString::Find(const char* sub) const {
  return Find(sub, 0);
}

int HString::Find(const char* sub, int start) const {
  if (start < 0) start = 0;
  if (start > m_length) return -1;
  const char* needle = sub == nullptr ? kEmptyText : sub;
  const Searcher searcher(needle, strlen(needle));
  const size_t hit =
      searcher.firstMatchIn(GetStr(), static_cast<size_t>(m_length), static_cast<size_t>(start));
  return hit == Searcher::npos ? -1 : static_cast<int>(hit);
}

int HString::ReverseFind(char c) const {
  const char* text = GetStr();
  for (int i = m_length - 1; i >= 0; --i) {
    if (text[i] == c) return i;
  }
  return -1;
}

HString HString::Left(size_t count) const {
  return Mid(0, count);
}

HString HString::Right(size_t count) const {
  const size_t length = static_cast<size_t>(m_length);
  return Mid(count >= length ? 0 : length - count);
}

HString HString::Mid(size_t first) const {
  return Mid(first, static_cast<size_t>(m_length));
}

HString HString::Mid(size_t first, size_t count) const {
  HString part;
  const size_t length = static_cast<size_t>(m_length);
  if (first >= length) return part;
  const size_t available = length - first;
  part.assign(GetStr() + first, count < available ? count : available);
  return part;
}

int HString::Replace(const char* oldText, const char* newText) {
  const size_t oldLength = textLength(oldText);
  if (oldLength == 0) return 0;
  const char* replacement = newText == nullptr ? kEmptyText : newText;
  const size_t newLength = strlen(replacement);
  const Searcher searcher(oldText, oldLength);
  const char* text = GetStr();
  const size_t length = static_cast<size_t>(m_length);

  // Counting first refuses a result too long for a string before building any of it.
  size_t replaced = 0;
  for (size_t hit, from = 0; (hit = searcher.firstMatchIn(text, length, from)) != Searcher::npos;
       from = hit + oldLength) {
    ++replaced;
  }
  if (replaced == 0) return 0;
  const size_t resultLength = length - replaced * oldLength + replaced * newLength;
  HString result;
  char* out = result.prepare(resultLength);
  size_t from = 0;
  for (size_t hit; (hit = searcher.firstMatchIn(text, length, from)) != Searcher::npos;
       from = hit + oldLength) {
    memcpy(out, text + from, hit - from);
    out += hit - from;
    memcpy(out, replacement, newLength);
    out += newLength;
  }
  memcpy(out, text + from, length - from + 1);
  *this = static_cast<HString&&>(result);
  return static_cast<int>(replaced);
}

void HString::Format(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const ArgumentsEnd end(arguments);
  // The arguments may point into this string: it changes only at the end.
  *this = FormattedText(format, arguments).text();
}
