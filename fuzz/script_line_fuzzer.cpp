// Feeds the console's line parser, and runs what it accepts through the
// console against the loaded module.
#include <cstdint>
#include <cstring>

#include "console.h"
#include "log_capture.h"
#include "plugin_session.h"
#include "script_line.h"
#include "text_escape.h"
#include "fuzz_support.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, size_t size) {
  const char* line = reinterpret_cast<const char*>(bytes);
  TArray<ScriptWord> words;
  HString error;
  if (splitScriptLine(line, size, words, error)) {
    for (int i = 0; i < words.count(); ++i) {
      if (words[i].kind != ScriptWord::String) continue;
      // A string written back in script syntax reads as the same string.
      OutputStream quoted;
      writeScriptString(quoted, words[i].text, size % 2 == 0);
      TArray<ScriptWord> again;
      require(splitScriptLine(quoted.text(), quoted.size(), again, error) && again.count() == 1 &&
                  again[0].kind == ScriptWord::String &&
                  std::strcmp(again[0].text, words[i].text) == 0,
              "a quoted string does not read back");
    }
  } else {
    require(!error.IsEmpty(), "a refused line has a reason");
  }

  OutputStream out;
  OutputStream err;
  TArray<LogEntry> quiet;
  LogCapture capture(quiet);
  Console console(sharedDefaultSession(), static_cast<ConsoleMode>(size % 3), out, err, "fuzz");
  console.runLine(1, line, size);
  return 0;
}
