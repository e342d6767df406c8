// The console's line syntax: name [-option [value]]... [argument]...
// Words are separated by blanks. A word in double quotes is a string, with
// the escapes \" \\ \t \n \r and \xHH (a NUL byte is refused). A bare word
// that is a decimal integer, optionally with a leading minus, is an integer;
// a bare word of a dash and a letter names an option; any other bare word is
// a string. A word that begins with # starts a comment that runs to the end
// of the line.
#pragma once

#include <string>
#include <vector>

struct ScriptWord {
  enum Kind { String, Integer, Option };
  Kind kind;
  std::string text;  // the string, the integer as written, or the option name without its dash
  int number;        // the value of an Integer word
};

// Splits a line into words. Returns false with a one-line reason on a bad
// quote, escape or integer.
bool splitScriptLine(const std::string& line, std::vector<ScriptWord>& words, std::string& error);

// A script case: a line with its expected outcome beside it, after the last
// "# =>" that begins a word. Splits it into the line to run and the expected
// outcome (without surrounding blanks); false when the line has no such note.
bool splitExpectation(const std::string& line, std::string& caseText, std::string& expected);

// True for a line with nothing to run: blank, or a comment starting with #.
bool isSkippedLine(const std::string& line);
