#include "script_line.h"

#include <errno.h>
#include <limits.h>
#include <stdlib.h>
#include <string.h>

#include "owned.h"

namespace {

bool isBlank(char c) {
  return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

int hexDigit(char c) {
  if (c >= '0' && c <= '9') return c - '0';
  if (c >= 'a' && c <= 'f') return c - 'a' + 10;
  if (c >= 'A' && c <= 'F') return c - 'A' + 10;
  return -1;
}

// The character an escape letter stands for, or NUL for none.
char escapedCharacter(char letter) {
  switch (letter) {
    case '"':
      return '"';
    case '\\':
      return '\\';
    case 't':
      return '\t';
    case 'n':
      return '\n';
    case 'r':
      return '\r';
    default:
      return '\0';
  }
}

bool isLetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

// Splits a line into words, decoding them into text, a buffer at least as
// long as the line.
class WordSplitter {
 public:
  WordSplitter(const char* line, size_t length, char* text)
      : m_line(line), m_length(length), m_text(text) {}

  // Adds the line's words, up to a comment; stops with the reason in error at
  // the first word that cannot be read.
  void split(TArray<ScriptWord>& words, HString& error) {
    for (size_t pos = 0;;) {
      while (pos < m_length && isBlank(m_line[pos])) ++pos;
      if (pos == m_length || m_line[pos] == '#') return;  // the rest is a comment
      ScriptWord word;
      if (m_line[pos] == '"') {
        if (!readQuoted(pos, error)) return;
        word.text = m_text;
      } else if (!readBare(pos, word, error)) {
        return;
      }
      words.add(word);
    }
  }

 private:
  // Reads a quoted word from m_line[pos] == '"' into m_text; pos ends after
  // the closing quote.
  bool readQuoted(size_t& pos, HString& error) {
    size_t size = 0;
    for (++pos; pos < m_length;) {
      const char c = m_line[pos++];
      if (c == '"') {
        m_text[size] = '\0';
        if (pos == m_length || isBlank(m_line[pos])) return true;
        error = "a blank must follow a closing quote";
        return false;
      }
      if (c != '\\') {
        m_text[size++] = c;
        continue;
      }
      if (pos == m_length) break;
      const char letter = m_line[pos++];
      if (escapedCharacter(letter) != '\0') {
        m_text[size++] = escapedCharacter(letter);
      } else if (letter == 'x') {
        const int high = pos < m_length ? hexDigit(m_line[pos]) : -1;
        const int low = pos + 1 < m_length ? hexDigit(m_line[pos + 1]) : -1;
        if (high < 0 || low < 0) {
          error = "\\x needs two hex digits";
          return false;
        }
        if (high == 0 && low == 0) {
          error = "a string cannot hold a NUL byte";
          return false;
        }
        m_text[size++] = static_cast<char>(high * 16 + low);
        pos += 2;
      } else {
        error.Format("unknown escape \\%c", letter);
        return false;
      }
    }
    error = "unterminated string";
    return false;
  }

  // Reads a bare word from m_line[pos]: an integer, an option or a string.
  bool readBare(size_t& pos, ScriptWord& word, HString& error) {
    const size_t start = pos;
    while (pos < m_length && !isBlank(m_line[pos])) ++pos;
    const size_t size = pos - start;
    memcpy(m_text, m_line + start, size);
    m_text[size] = '\0';
    word.text = m_text;
    const size_t digits = m_text[0] == '-' ? 1 : 0;
    if (size > digits && strspn(m_text + digits, "0123456789") == size - digits) {
      errno = 0;
      const long long value = strtoll(m_text, nullptr, 10);
      if (errno == ERANGE || value < INT_MIN || value > INT_MAX) {
        error.Format("integer out of range: %s", m_text);
        return false;
      }
      word.kind = ScriptWord::Integer;
      word.number = static_cast<int>(value);
    } else if (size > 1 && m_text[0] == '-' && isLetter(m_text[1])) {
      word.kind = ScriptWord::Option;
    }
    return true;
  }

  const char* m_line;
  size_t m_length;
  char* m_text;
};

// Where a case's note may begin: the first comment outside a quoted word, or
// the first quoted word that is malformed (unterminated, or its closing quote
// not followed by a blank); the length when there is neither.
size_t noteSearchStart(const char* line, size_t length) {
  for (size_t pos = 0; pos < length;) {
    while (pos < length && isBlank(line[pos])) ++pos;
    if (pos == length || line[pos] == '#') return pos;
    const size_t start = pos;
    if (line[pos] != '"') {
      while (pos < length && !isBlank(line[pos])) ++pos;
      continue;
    }
    for (++pos; pos < length && line[pos] != '"'; ++pos) pos += line[pos] == '\\' ? 1 : 0;
    if (pos >= length || (pos + 1 < length && !isBlank(line[pos + 1]))) return start;
    ++pos;
  }
  return length;
}

// Finds the first "# =>" that begins a word from from on; sets the case's
// length and the note around it.
void findNote(const char* line, size_t length, size_t from, ScriptLine& parsed) {
  for (size_t at = from; at < length; ++at) {
    if (line[at] != '#' || (at > 0 && !isBlank(line[at - 1]))) continue;
    size_t pos = at + 1;
    while (pos < length && isBlank(line[pos])) ++pos;
    if (length - pos < 2 || line[pos] != '=' || line[pos + 1] != '>') continue;
    for (pos += 2; pos < length && isBlank(line[pos]);) ++pos;
    size_t end = length;
    while (end > pos && isBlank(line[end - 1])) --end;
    parsed.noted = true;
    parsed.note = line + pos;
    parsed.noteLength = end - pos;
    parsed.caseLength = at;
    while (parsed.caseLength > 0 && isBlank(line[parsed.caseLength - 1])) --parsed.caseLength;
    return;
  }
}

}  // namespace

void readScriptLine(const char* line, size_t length, bool cases, ScriptLine& parsed) {
  parsed.words.removeAll();
  parsed.error.Empty();
  parsed.noted = false;
  parsed.note = nullptr;
  parsed.noteLength = 0;
  parsed.caseLength = length;
  if (cases) findNote(line, length, noteSearchStart(line, length), parsed);
  if (memchr(line, '\0', parsed.caseLength) != nullptr) {
    parsed.error = "a line cannot hold a NUL byte";
    return;
  }
  const Owned<char, &deleteArray<char>> text(new char[parsed.caseLength + 1]);
  WordSplitter(line, parsed.caseLength, text.get()).split(parsed.words, parsed.error);
}
