// tavix-host: loads a command module through its exports and runs script
// lines against its commands.
#include <errno.h>
#include <stdio.h>
#include <string.h>

#if defined(_WIN32)
#include <fcntl.h>
#include <io.h>
#include <windows.h>
#else
#include <signal.h>
#include <unistd.h>
#endif

#include "byte_buffer.h"
#include "console.h"
#include "line_reader.h"
#include "memory_reserve.h"
#include "out_of_memory.h"
#include "output_stream.h"
#include "owned.h"
#include "plugin_session.h"
#include "script_blocks.h"
#include "system_files.h"
#include "text_escape.h"

namespace {

constexpr int kAllRan = 0;
constexpr int kSomeFailed = 1;
constexpr int kUsageOrLoadError = 2;

const char kUsage[] =
    "usage: tavix-host [--module PATH] [--json | --check] [--list] [-e LINE]... [SCRIPT]\n"
    "  Runs script lines from SCRIPT, from each -e LINE, or from standard input; from\n"
    "  a SCRIPT named *.md, the lines of its ```tavix blocks.\n"
    "  --module PATH  the module to load (default: TavixStringCmds.hll beside tavix-host,\n"
    "                 or in ../lib)\n"
    "  --json         one JSON object per executed line\n"
    "  --check        compare each line's outcome with the \"# => outcome\" beside it\n"
    "  --list         show the plug-in and its commands\n";

struct Options {
  const char* modulePath = nullptr;
  ConsoleMode mode = ConsoleMode::Plain;
  bool list = false;
  // The -e lines stay where the command line holds them: each follows an "-e"
  // among the arguments, so that however many there are, none is copied.
  int argc = 0;
  char** argv = nullptr;
  int lineCount = 0;
  const char* script = nullptr;
};

bool standardInputIsTerminal() {
#if defined(_WIN32)
  DWORD mode = 0;  // only a console has a console mode; files and pipes do not
  return GetConsoleMode(GetStdHandle(STD_INPUT_HANDLE), &mode) != 0;
#else
  return isatty(0) != 0;
#endif
}

// Writes "tavix-host: " and the message on standard error, with the bytes
// that do not print made visible; returns the exit status of a failed start.
int fail(const char* message, const char* detail = "", const char* usage = "") {
  OutputStream err(stderr);
  err << "tavix-host: ";
  writeText(err, message, Escaping::Message);
  writeText(err, detail, Escaping::Message);
  err << '\n' << usage;
  return kUsageOrLoadError;
}

int usageError(const char* message, const char* detail = "") {
  return fail(message, detail, kUsage);
}

// "cannot read NAME: reason" and the like.
int failure(const char* what, const char* name, const char* reason) {
  OutputStream err(stderr);
  err << "tavix-host: " << what << ' ';
  writeText(err, name, Escaping::Message);
  err << ": ";
  writeText(err, reason, Escaping::Message);
  err << '\n';
  return kUsageOrLoadError;
}

// Parses the command line; returns -1 when the run goes on, else the exit status.
int parseOptions(int argc, char** argv, Options& options) {
  for (int i = 1; i < argc; ++i) {
    const char* arg = argv[i];
    if (strcmp(arg, "--help") == 0 || strcmp(arg, "-h") == 0) {
      fputs(kUsage, stdout);
      return fflush(stdout) == 0 ? kAllRan : kUsageOrLoadError;
    } else if (strcmp(arg, "--json") == 0 || strcmp(arg, "--check") == 0) {
      if (options.mode != ConsoleMode::Plain) return usageError("give one of --json and --check");
      options.mode = strcmp(arg, "--json") == 0 ? ConsoleMode::Json : ConsoleMode::Check;
    } else if (strcmp(arg, "--list") == 0) {
      options.list = true;
    } else if (strcmp(arg, "--module") == 0 || strcmp(arg, "-e") == 0) {
      if (i + 1 == argc) return usageError(arg, " needs a value");
      if (arg[1] == 'e') {
        ++options.lineCount;
        ++i;
      } else if (options.modulePath == nullptr) {
        options.modulePath = argv[++i];
      } else {
        return usageError("give one --module");
      }
    } else if (arg[0] == '-' && arg[1] != '\0') {
      return usageError("unknown option ", arg);
    } else if (options.script == nullptr) {
      options.script = arg;
    } else {
      return usageError("more than one script given");
    }
  }
  options.argc = argc;
  options.argv = argv;
  if (options.script != nullptr && options.lineCount > 0) {
    return usageError("give either -e lines or a script, not both");
  }
  return -1;
}

// Runs every line of reader, or, from Markdown, the lines of its tavix blocks;
// the prompt is shown before each line when given. Stops early when standard
// output fails.
bool runLines(Console& console, LineReader& reader, OutputStream& out, const char* prompt,
              bool markdown) {
  bool allOk = true;
  ByteBuffer line;
  ScriptBlocks blocks;
  for (int lineNumber = 1;; ++lineNumber) {
    if (prompt != nullptr) {
      out << prompt;
      out.flush();
    }
    if (!reader.next(line)) break;
    if (markdown && !blocks.holdsScript(line.data(), line.size())) continue;
    allOk = console.runLine(lineNumber, line.data(), line.size()) && allOk;
    if (out.failure() != nullptr) break;
  }
  if (prompt != nullptr) out << '\n';
  return allOk;
}

int run(const Options& options) {
  const bool fromScript = options.script != nullptr && strcmp(options.script, "-") != 0;
  OwnedFile scriptFile;
  if (fromScript) {
    scriptFile = OwnedFile(openForReading(options.script));
    if (!scriptFile) return failure("cannot read", options.script, strerror(errno));
  }
  const char* source = options.lineCount > 0 ? "-e"
                       : fromScript          ? options.script
                                             : "standard input";

  HString error;
  const HString modulePath =
      options.modulePath != nullptr ? HString(options.modulePath) : defaultModulePath();
  const Owned<PluginSession> session = PluginSession::open(modulePath, error);
  if (!session) return fail(error);

  OutputStream out(stdout);
  OutputStream err(stderr);
  Console console(*session, options.mode, out, err, source);
  LineReader reader(fromScript ? fileno(scriptFile.get()) : 0);
  bool allOk = true;
  if (options.list) console.list();
  if (options.list && options.lineCount == 0 && options.script == nullptr) {
    // --list alone lists and ends.
  } else if (options.lineCount > 0) {
    for (int i = 1, lineNumber = 1; i < options.argc && out.failure() == nullptr; ++i) {
      if (strcmp(options.argv[i], "--module") == 0) {
        ++i;  // its value is no line, even if it reads "-e"
      } else if (i + 1 < options.argc && strcmp(options.argv[i], "-e") == 0) {
        const char* line = options.argv[++i];
        allOk = console.runLine(lineNumber++, line, strlen(line)) && allOk;
      }
    }
  } else {
    const bool interactive = !fromScript && standardInputIsTerminal();
    allOk = runLines(console, reader, out, interactive ? "tavix> " : nullptr,
                     fromScript && isMarkdownName(options.script));
  }
  console.summarize(reader.failure() == nullptr);
  out.flush();
  if (out.failure() != nullptr) return failure("cannot write", "standard output", out.failure());
  if (reader.failure() != nullptr) return failure("cannot read", source, reader.failure());
  return allOk ? kAllRan : kSomeFailed;
}

#if defined(_WIN32)
extern "C" int __cdecl _configure_wide_argv(int mode);
extern "C" wchar_t*** __cdecl __p___wargv();

// The command line as UTF-8, whatever the system's code page: every name a
// user types reaches the console whole. Kept for the whole run.
char** utf8Arguments(int argc, TArray<HString>& texts, TArray<char*>& pointers) {
  _configure_wide_argv(1);
  wchar_t** wide = *__p___wargv();
  for (int i = 0; i < argc; ++i) texts.add(utf8FromWide(wide[i]));
  for (int i = 0; i < argc; ++i) pointers.add(const_cast<char*>(texts[i].GetStr()));
  pointers.add(nullptr);
  return &pointers[0];
}
#endif

}  // namespace

int main(int argc, char** argv) {
  if (!holdMemoryReserve()) {
    fputs("tavix-host: out of memory\n", stderr);
    return kUsageOrLoadError;
  }
  try {
#if defined(_WIN32)
    // Byte-for-byte the same output as on other systems: no CR before each LF.
    _setmode(_fileno(stdout), _O_BINARY);
    _setmode(_fileno(stderr), _O_BINARY);
    _setmode(_fileno(stdin), _O_BINARY);
    TArray<HString> texts;
    TArray<char*> pointers;
    argv = utf8Arguments(argc, texts, pointers);
#else
    // A reader that goes away makes writing fail, which the console reports,
    // instead of ending the process silently.
    signal(SIGPIPE, SIG_IGN);
#endif
    Options options;
    const int status = parseOptions(argc, argv, options);
    return status >= 0 ? status : run(options);
  } catch (const OutOfMemory&) {
    fputs("tavix-host: out of memory\n", stderr);
    return kUsageOrLoadError;
  }
}
