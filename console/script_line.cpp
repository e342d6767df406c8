#include "script_line.h"

#include <errno.h>
#include <limits.h>
#include <stdlib.h>
#include <string.h>

#include "byte_buffer.h"

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

// Reads a quoted word from line[pos] == '"' into text; pos ends after the
// closing quote. Runs without escapes are copied whole.
bool readQuoted(const char* line, size_t length, size_t& pos, ByteBuffer& text, HString& error) {
  for (++pos; pos < length;) {
    size_t run = pos;
    while (run < length && line[run] != '"' && line[run] != '\\') ++run;
    text.append(line + pos, run - pos);
    pos = run;
    if (pos == length) break;
    if (line[pos] == '"') {
      ++pos;
      if (pos < length && !isBlank(line[pos])) {
        error = "a blank must follow a closing quote";
        return false;
      }
      return true;
    }
    if (++pos == length) break;
    const char letter = line[pos++];
    if (escapedCharacter(letter) != '\0') {
      text.append(escapedCharacter(letter));
    } else if (letter == 'x') {
      const int high = pos < length ? hexDigit(line[pos]) : -1;
      const int low = pos + 1 < length ? hexDigit(line[pos + 1]) : -1;
      if (high < 0 || low < 0) {
        error = "\\x needs two hex digits";
        return false;
      }
      if (high == 0 && low == 0) {
        error = "a string cannot hold a NUL byte";
        return false;
      }
      text.append(static_cast<char>(high * 16 + low));
      pos += 2;
    } else {
      error.Format("unknown escape \\%c", letter);
      return false;
    }
  }
  error = "unterminated string";
  return false;
}

bool isDecimalInteger(const char* word, size_t length) {
  const size_t digits = (length > 0 && word[0] == '-') ? 1 : 0;
  if (length == digits) return false;
  for (size_t i = digits; i < length; ++i) {
    if (word[i] < '0' || word[i] > '9') return false;
  }
  return true;
}

bool isLetter(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

}  // namespace

bool splitScriptLine(const char* line, size_t length, TArray<ScriptWord>& words, HString& error) {
  words.removeAll();
  if (memchr(line, '\0', length) != nullptr) {
    error = "a line cannot hold a NUL byte";
    return false;
  }
  ByteBuffer text;
  for (size_t pos = 0;;) {
    while (pos < length && isBlank(line[pos])) ++pos;
    if (pos == length || line[pos] == '#') return true;  // the rest is a comment
    ScriptWord word;
    text.clear();
    if (line[pos] == '"') {
      if (!readQuoted(line, length, pos, text, error)) return false;
      word.text = text.data();
      words.add(word);
      continue;
    }
    const size_t start = pos;
    while (pos < length && !isBlank(line[pos])) ++pos;
    text.append(line + start, pos - start);
    word.text = text.data();
    if (isDecimalInteger(text.data(), text.size())) {
      errno = 0;
      const long long value = strtoll(text.data(), nullptr, 10);
      if (errno == ERANGE || value < INT_MIN || value > INT_MAX) {
        error.Format("integer out of range: %s", text.data());
        return false;
      }
      word.kind = ScriptWord::Integer;
      word.number = static_cast<int>(value);
    } else if (text.size() > 1 && text.data()[0] == '-' && isLetter(text.data()[1])) {
      word.kind = ScriptWord::Option;
    }
    words.add(word);
  }
}

bool splitExpectation(const char* line, size_t length, size_t& caseLength, HString& expected) {
  for (size_t at = length; at-- > 0;) {
    if (line[at] != '#' || (at > 0 && !isBlank(line[at - 1]))) continue;
    size_t pos = at + 1;
    while (pos < length && isBlank(line[pos])) ++pos;
    if (length - pos < 2 || line[pos] != '=' || line[pos + 1] != '>') continue;
    size_t end = length;
    for (pos += 2; pos < end && isBlank(line[pos]);) ++pos;
    while (end > pos && isBlank(line[end - 1])) --end;
    ByteBuffer note;
    note.append(line + pos, end - pos);
    expected = note.data();
    caseLength = at;
    return true;
  }
  return false;
}

bool isSkippedLine(const char* line, size_t length) {
  for (size_t i = 0; i < length; ++i) {
    if (isBlank(line[i])) continue;
    return line[i] == '#';
  }
  return true;
}
