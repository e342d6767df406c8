// Picks the script lines out of a Markdown text: the lines inside fenced code
// blocks marked tavix (a line "```tavix", then the script, then a line
// "```"). Everything else is prose: the fences, the text between blocks and
// other code blocks.
#pragma once

#include <stddef.h>

class ScriptBlocks {
 public:
  // Whether a line, the next one of the text, is a script line.
  bool holdsScript(const char* line, size_t length);

 private:
  enum class Place { Prose, ScriptBlock, OtherBlock };
  Place m_place = Place::Prose;
};

// Whether a file of that name is read as Markdown: its name ends in ".md".
bool isMarkdownName(const char* name);
