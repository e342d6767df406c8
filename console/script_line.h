// The console's line syntax: name [-option [value]]... [argument]...
// Words are separated by blanks. A word in double quotes is a string, with
// the escapes \" \\ \t \n \r and \xHH (a NUL byte is refused). A bare word
// that is a decimal integer, optionally with a leading minus, is an integer;
// a bare word of a dash and a letter names an option; any other bare word is
// a string. A word that begins with # starts a comment that runs to the end
// of the line.
//
// A script case is a line with its expected outcome written beside it, after
// the first "# =>" that begins a word outside a quoted word; where a quoted
// word before it is malformed, after the first one from that word on.
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

// A line read once: its words, or why it cannot be run, and for a script
// case its note. The note points into the line read.
struct ScriptLine {
  TArray<ScriptWord> words;  // none for a blank or comment line
  HString error;             // why the line cannot be run; empty when it can
  size_t caseLength = 0;     // the bytes that make the case, without blanks after them
  bool noted = false;
  const char* note = nullptr;  // the expected outcome, without blanks around it
  size_t noteLength = 0;

  // Nothing to run: a blank line or a comment.
  bool isEmpty() const { return words.count() == 0 && error.IsEmpty(); }
};

// Reads a line of length bytes into parsed, as a script case when cases is
// set. A NUL byte in what is run refuses the line; so does a bad quote,
// escape or integer, each with a one-line reason.
void readScriptLine(const char* line, size_t length, bool cases, ScriptLine& parsed);
