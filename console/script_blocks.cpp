#include "script_blocks.h"

#include <string.h>

namespace {

// Whether line, without the blanks at its end, is ``` followed by info.
bool isFence(const char* line, size_t length, const char* info) {
  while (length > 0 &&
         (line[length - 1] == ' ' || line[length - 1] == '\t' || line[length - 1] == '\r')) {
    --length;
  }
  const size_t infoLength = strlen(info);
  return length >= 3 && memcmp(line, "```", 3) == 0 &&
         (infoLength == 0 || length == 3 + infoLength) && memcmp(line + 3, info, infoLength) == 0;
}

}  // namespace

bool ScriptBlocks::holdsScript(const char* line, size_t length) {
  if (m_place == Place::Prose) {
    if (isFence(line, length, "tavix")) {
      m_place = Place::ScriptBlock;
    } else if (isFence(line, length, "")) {
      m_place = Place::OtherBlock;
    }
    return false;
  }
  if (length >= 3 && memcmp(line, "```", 3) == 0) {
    m_place = Place::Prose;
    return false;
  }
  return m_place == Place::ScriptBlock;
}

bool isMarkdownName(const char* name) {
  const size_t length = strlen(name);
  return length >= 3 && strcmp(name + length - 3, ".md") == 0;
}
