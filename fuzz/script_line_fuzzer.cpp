// Feeds the console's line reader, and runs what it accepts through the
// console against the loaded module, in every mode.
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "console.h"
#include "fuzz_support.h"
#include "log_capture.h"
#include "script_line.h"
#include "text_escape.h"

namespace {

// What writing text escaped as a script string gives, in memory.
char* quote(const char* text, Escaping escaping, size_t& size) {
  char* quoted = nullptr;
  FILE* memory = open_memstream(&quoted, &size);
  {
    OutputStream out(memory);
    writeText(out, text, escaping);
  }
  std::fclose(memory);
  return quoted;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, size_t size) {
  const char* line = reinterpret_cast<const char*>(bytes);
  ScriptLine read;
  readScriptLine(line, size, size % 3 == 2, read);
  require(read.caseLength <= size && (!read.noted || read.note + read.noteLength <= line + size),
          "the case and its note lie within the line");
  for (int i = 0; read.error.IsEmpty() && i < read.words.count(); ++i) {
    if (read.words[i].kind != ScriptWord::String) continue;
    // A string written back in script syntax reads as the same string.
    size_t quotedSize = 0;
    char* quoted = quote(read.words[i].text,
                         size % 2 == 0 ? Escaping::Script : Escaping::ScriptAscii, quotedSize);
    ScriptLine again;
    readScriptLine(quoted, quotedSize, false, again);
    require(again.error.IsEmpty() && again.words.count() == 1 &&
                again.words[0].kind == ScriptWord::String &&
                std::strcmp(again.words[0].text, read.words[i].text) == 0,
            "a quoted string does not read back");
    std::free(quoted);
  }

  static FILE* const sink = std::fopen("/dev/null", "wb");
  OutputStream out(sink);
  OutputStream err(sink);
  TArray<LogEntry> quiet;
  LogCapture capture(quiet);
  Console console(fuzzedSession(), static_cast<ConsoleMode>(size % 3), out, err, "fuzz");
  console.runLine(1, line, size);
  return 0;
}
