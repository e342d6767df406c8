// Feeds the console's line parser, and runs what it accepts through the
// console against the loaded module.
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <string>
#include <vector>

#include "../tools/console.h"
#include "../tools/log_capture.h"
#include "../tools/plugin_session.h"
#include "../tools/script_line.h"
#include "../tools/text_escape.h"
#include "fuzz_support.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, size_t size) {
  const std::string line(reinterpret_cast<const char*>(bytes), size);
  std::vector<ScriptWord> words;
  std::string error;
  if (splitScriptLine(line, words, error)) {
    for (const ScriptWord& word : words) {
      require(word.text.find('\0') == std::string::npos, "a word holds a NUL byte");
      if (word.kind != ScriptWord::String) continue;
      // A string written back in script syntax reads as the same string.
      std::vector<ScriptWord> again;
      std::string againError;
      require(splitScriptLine(quoteScriptString(word.text), again, againError) &&
                  again.size() == 1 && again[0].kind == ScriptWord::String &&
                  again[0].text == word.text,
              "a quoted string does not read back");
    }
  } else {
    require(!error.empty(), "a refused line has a reason");
  }

  std::ostringstream out;
  std::ostringstream err;
  LogCapture quiet;
  Console console(sharedDefaultSession(), static_cast<ConsoleMode>(size % 3), out, err);
  console.runLine(1, line);
  return 0;
}
