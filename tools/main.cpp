// tavix-host: loads a command module through its exports and runs script
// lines against its commands.
#include <cstdio>
#include <fstream>
#include <iostream>
#include <string>
#include <vector>

#if defined(_WIN32)
#include <fcntl.h>
#include <io.h>
#include <windows.h>
#else
#include <unistd.h>
#endif

#include "console.h"
#include "plugin_session.h"

namespace {

constexpr int kAllRan = 0;
constexpr int kSomeFailed = 1;
constexpr int kUsageOrLoadError = 2;

const char kUsage[] =
    "usage: tavix-host [--module PATH] [--json | --check] [--list] [-e LINE]... [SCRIPT]\n"
    "  Runs script lines from SCRIPT, from each -e LINE, or from standard input.\n"
    "  --module PATH  the module to load (default: TavixStringCmds.hll beside tavix-host)\n"
    "  --json         one JSON object per executed line\n"
    "  --check        compare each line's outcome with the \"# => outcome\" beside it\n"
    "  --list         show the plug-in and its commands\n";

struct Options {
  std::string modulePath;
  ConsoleMode mode = ConsoleMode::Plain;
  bool list = false;
  std::vector<std::string> lines;
  std::string script;
};

bool standardInputIsTerminal() {
#if defined(_WIN32)
  DWORD mode = 0;  // only a console has a console mode; files and pipes do not
  return GetConsoleMode(GetStdHandle(STD_INPUT_HANDLE), &mode) != 0;
#else
  return isatty(0) != 0;
#endif
}

int usageError(const std::string& message) {
  std::cerr << "tavix-host: " << message << "\n" << kUsage;
  return kUsageOrLoadError;
}

// Parses the command line; returns -1 when the run goes on, else the exit status.
int parseOptions(int argc, char** argv, Options& options) {
  for (int i = 1; i < argc; ++i) {
    const std::string arg = argv[i];
    if (arg == "--help" || arg == "-h") {
      std::cout << kUsage;
      return kAllRan;
    } else if (arg == "--json" || arg == "--check") {
      if (options.mode != ConsoleMode::Plain) return usageError("give one of --json and --check");
      options.mode = arg == "--json" ? ConsoleMode::Json : ConsoleMode::Check;
    } else if (arg == "--list") {
      options.list = true;
    } else if (arg == "--module" || arg == "-e") {
      if (i + 1 == argc) return usageError(arg + " needs a value");
      (arg == "-e" ? options.lines.emplace_back() : options.modulePath) = argv[++i];
    } else if (!arg.empty() && arg[0] == '-' && arg != "-") {
      return usageError("unknown option " + arg);
    } else if (options.script.empty()) {
      options.script = arg;
    } else {
      return usageError("more than one script given");
    }
  }
  if (!options.script.empty() && !options.lines.empty()) {
    return usageError("give either -e lines or a script, not both");
  }
  if (options.modulePath.empty()) options.modulePath = defaultModulePath();
  return -1;
}

// Runs every line of in; the prompt is shown before each line when given.
bool runStream(Console& console, std::istream& in, const char* prompt) {
  bool allOk = true;
  std::string line;
  int lineNumber = 0;
  while (true) {
    if (prompt != nullptr) std::cout << prompt << std::flush;
    if (!std::getline(in, line)) break;
    allOk = console.runLine(++lineNumber, line) && allOk;
  }
  if (prompt != nullptr) std::cout << "\n";
  return allOk;
}

}  // namespace

int main(int argc, char** argv) {
#if defined(_WIN32)
  // Byte-for-byte the same output as on other systems: no CR before each LF.
  _setmode(_fileno(stdout), _O_BINARY);
  _setmode(_fileno(stderr), _O_BINARY);
#endif
  Options options;
  const int status = parseOptions(argc, argv, options);
  if (status >= 0) return status;

  std::ifstream script;
  if (!options.script.empty() && options.script != "-") {
    script.open(options.script, std::ios::binary);
    if (!script) return usageError("cannot read " + options.script);
  }

  std::string error;
  std::unique_ptr<PluginSession> session = PluginSession::open(options.modulePath, error);
  if (!session) {
    std::cerr << "tavix-host: " << error << "\n";
    return kUsageOrLoadError;
  }

  const std::string source = !options.lines.empty() ? "-e"
                             : script.is_open()     ? options.script
                                                    : "standard input";
  Console console(*session, options.mode, std::cout, std::cerr, source);
  if (options.list) {
    console.list();
    if (options.lines.empty() && options.script.empty()) return kAllRan;
  }
  bool allOk = true;
  if (!options.lines.empty()) {
    for (size_t i = 0; i < options.lines.size(); ++i) {
      allOk = console.runLine(static_cast<int>(i + 1), options.lines[i]) && allOk;
    }
  } else if (script.is_open()) {
    allOk = runStream(console, script, nullptr);
  } else {
    allOk = runStream(console, std::cin, standardInputIsTerminal() ? "tavix> " : nullptr);
  }
  if (options.mode == ConsoleMode::Check) {
    std::cout << source << ": ";
    if (console.casesDiffering() == 0) {
      std::cout << console.casesRun() << " cases as expected\n";
    } else {
      std::cout << console.casesDiffering() << " of " << console.casesRun() << " cases differ\n";
    }
  }
  return allOk ? kAllRan : kSomeFailed;
}
