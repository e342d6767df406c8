// The console's line syntax: name [-option [value]]... [argument]...
// Words are separated by blanks. A word in double quotes is a string, with
// the escapes \" \\ \t \n \r and \xHH (a NUL byte is refused). A bare word
// that is a decimal integer, optionally with a leading minus, is an integer;
// a bare word of a dash and a letter names an option; any other bare word is
// a string. A word that begins with # starts a comment that runs to the end
// of the line.
#pragma once

#include <stddef.h>

#include "hstring.h"
#include "tarray.h"

struct ScriptWord {
  enum Kind { String, Integer, Option };
  Kind kind = String;
  HString text;    // the string; an integer or an option as written, its dash included
  int number = 0;  // the value of an Integer word
};

// Splits a line of length bytes into words. Returns false with a one-line
// reason on a bad quote, escape or integer, or a NUL byte anywhere.
bool splitScriptLine(const char* line, size_t length, TArray<ScriptWord>& words, HString& error);

// A script case: a line with its expected outcome beside it, after the last
// "# =>" that begins a word. Gives the length of the line to run and the
// expected outcome (without surrounding blanks); false when there is no such note.
bool splitExpectation(const char* line, size_t length, size_t& caseLength, HString& expected);

// True for a line with nothing to run: blank, or a comment starting with #.
bool isSkippedLine(const char* line, size_t length);
