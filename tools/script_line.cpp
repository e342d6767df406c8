#include "script_line.h"

#include <cctype>
#include <cerrno>
#include <climits>
#include <cstdlib>

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

// Reads a quoted word starting at line[pos] == '"'; pos ends after the closing quote.
bool readQuoted(const std::string& line, size_t& pos, std::string& text, std::string& error) {
  for (++pos; pos < line.size(); ++pos) {
    const char c = line[pos];
    if (c == '"') {
      ++pos;
      if (pos < line.size() && !isBlank(line[pos])) {
        error = "a blank must follow a closing quote";
        return false;
      }
      return true;
    }
    if (c != '\\') {
      text += c;
      continue;
    }
    if (++pos == line.size()) break;
    switch (line[pos]) {
      case '"':
        text += '"';
        break;
      case '\\':
        text += '\\';
        break;
      case 't':
        text += '\t';
        break;
      case 'n':
        text += '\n';
        break;
      case 'r':
        text += '\r';
        break;
      case 'x': {
        const int high = pos + 1 < line.size() ? hexDigit(line[pos + 1]) : -1;
        const int low = pos + 2 < line.size() ? hexDigit(line[pos + 2]) : -1;
        if (high < 0 || low < 0) {
          error = "\\x needs two hex digits";
          return false;
        }
        if (high == 0 && low == 0) {
          error = "a string cannot hold a NUL byte";
          return false;
        }
        text += static_cast<char>(high * 16 + low);
        pos += 2;
        break;
      }
      default:
        error = std::string("unknown escape \\") + line[pos];
        return false;
    }
  }
  error = "unterminated string";
  return false;
}

bool isDecimalInteger(const std::string& word) {
  const size_t digits = (!word.empty() && word[0] == '-') ? 1 : 0;
  if (word.size() == digits) return false;
  for (size_t i = digits; i < word.size(); ++i) {
    if (!std::isdigit(static_cast<unsigned char>(word[i]))) return false;
  }
  return true;
}

}  // namespace

bool splitScriptLine(const std::string& line, std::vector<ScriptWord>& words, std::string& error) {
  words.clear();
  if (line.find('\0') != std::string::npos) {
    error = "a line cannot hold a NUL byte";
    return false;
  }
  size_t pos = 0;
  while (true) {
    while (pos < line.size() && isBlank(line[pos])) ++pos;
    if (pos == line.size() || line[pos] == '#') return true;  // the rest is a comment
    if (line[pos] == '"') {
      ScriptWord word{ScriptWord::String, std::string(), 0};
      if (!readQuoted(line, pos, word.text, error)) return false;
      words.push_back(word);
      continue;
    }
    const size_t start = pos;
    while (pos < line.size() && !isBlank(line[pos])) ++pos;
    const std::string bare = line.substr(start, pos - start);
    if (isDecimalInteger(bare)) {
      errno = 0;
      const long long value = std::strtoll(bare.c_str(), nullptr, 10);
      if (errno == ERANGE || value < INT_MIN || value > INT_MAX) {
        error = "integer out of range: " + bare;
        return false;
      }
      words.push_back(ScriptWord{ScriptWord::Integer, bare, static_cast<int>(value)});
    } else if (bare.size() > 1 && bare[0] == '-' &&
               std::isalpha(static_cast<unsigned char>(bare[1]))) {
      words.push_back(ScriptWord{ScriptWord::Option, bare.substr(1), 0});
    } else {
      words.push_back(ScriptWord{ScriptWord::String, bare, 0});
    }
  }
}

bool splitExpectation(const std::string& line, std::string& caseText, std::string& expected) {
  for (size_t at = line.rfind('#'); at != std::string::npos; at = line.rfind('#', at - 1)) {
    size_t pos = at + 1;
    while (pos < line.size() && isBlank(line[pos])) ++pos;
    if ((at == 0 || isBlank(line[at - 1])) && line.compare(pos, 2, "=>") == 0) {
      caseText = line.substr(0, at);
      pos += 2;
      size_t end = line.size();
      while (pos < end && isBlank(line[pos])) ++pos;
      while (end > pos && isBlank(line[end - 1])) --end;
      expected = line.substr(pos, end - pos);
      return true;
    }
    if (at == 0) break;
  }
  return false;
}

bool isSkippedLine(const std::string& line) {
  for (char c : line) {
    if (isBlank(c)) continue;
    return c == '#';
  }
  return true;
}
