// tavix-host run as a person runs it: exit status, where output goes, and the
// check mode that the script cases rely on. What a line does is in cases/.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <pty.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "system_files.h"

namespace {

struct HostRun {
  int status;
  std::string out;
  std::string err;
  // Everything at once, for one comparison.
  std::string all() const { return std::to_string(status) + "|" + out + "|" + err; }
};

std::string readFile(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  std::ostringstream text;
  text << in.rdbuf();
  return text.str();
}

// A folder of this run's own, so that tests running side by side share no file.
std::string privateFolder() {
  static const std::string folder = [] {
    std::string name = ::testing::TempDir() + "console_test_XXXXXX";
    if (mkdtemp(name.data()) == nullptr) std::abort();
    return name + "/";
  }();
  return folder;
}

std::string writeFile(const std::string& name, const std::string& text) {
  const std::string path = privateFolder() + name;
  std::ofstream(path, std::ios::binary) << text;
  return path;
}

std::string hostFolder() {
  return executableDirectory().GetStr();
}

// How a run is started, beyond its arguments.
struct HostStart {
  std::string input;        // standard input
  std::string inPath;       // or this file as standard input
  bool closeIn = false;     // or standard input closed
  std::string outPath;      // or this file as standard output
  bool closeOut = false;    // or standard output closed
  bool brokenPipe = false;  // or a pipe that nobody reads
  std::string folder;       // the working folder
  rlim_t addressSpace = RLIM_INFINITY;
  unsigned seconds = 30;  // a run that takes longer is ended by a signal
};

// Runs tavix-host; exit status -1 when a signal ended it.
HostRun runHost(const std::vector<std::string>& args, const HostStart& start) {
  const std::string in = start.inPath.empty() ? writeFile("in", start.input) : start.inPath;
  const std::string out = start.outPath.empty() ? privateFolder() + "out" : start.outPath;
  const std::string err = privateFolder() + "err";
  const std::string host = hostFolder() + "tavix-host";
  int pipeEnds[2] = {-1, -1};  // the reading end is closed before anything is written
  if (start.brokenPipe && (pipe(pipeEnds) != 0 || close(pipeEnds[0]) != 0)) std::abort();
  const pid_t child = fork();
  if (child == 0) {
    std::vector<char*> argv{const_cast<char*>(host.c_str())};
    for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    dup2(open(in.c_str(), O_RDONLY), 0);
    dup2(open(out.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 1);
    dup2(open(err.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 2);
    if (start.closeIn) close(0);
    if (start.closeOut) close(1);
    if (start.brokenPipe) dup2(pipeEnds[1], 1);
    alarm(start.seconds);
    if (!start.folder.empty() && chdir(start.folder.c_str()) != 0) _exit(126);
    const rlimit limit{start.addressSpace, start.addressSpace};
    setrlimit(RLIMIT_AS, &limit);
    execv(host.c_str(), argv.data());
    _exit(127);
  }
  if (start.brokenPipe) close(pipeEnds[1]);
  int raw = 0;
  waitpid(child, &raw, 0);
  return HostRun{WIFEXITED(raw) ? WEXITSTATUS(raw) : -1, start.outPath.empty() ? readFile(out) : "",
                 readFile(err)};
}

HostRun runHost(const std::vector<std::string>& args, const std::string& input = "") {
  HostStart start;
  start.input = input;
  return runHost(args, start);
}

TEST(ConsoleTest, ResultsGoToStandardOutputMessagesToStandardErrorInOrder) {
  EXPECT_EQ(runHost({},
                    "strLength abc\nstrTok -delims ; \"a;b\"\nstrTokArray \" \"\n"
                    "strReverseFind abc \"\"\nnope\nstrLength \"\\t\"\n")
                .all(),
            "1|3\n\"a\"\n1\n|warning: Couldn't find any string tokens\n"
            "error: Second argument cannot be an empty string\nline 5: unknown command nope\n");
  const std::string longText(20000, 'x');  // a result longer than the output's buffer
  EXPECT_EQ(runHost({"-e", "strLeft " + longText + " -1"}).out, '"' + longText + "\"\n");
  const std::string help = runHost({"--help"}, "strLength abc\n").out;  // help, and nothing run
  EXPECT_EQ(help.substr(help.size() - 9), "commands\n");
  EXPECT_EQ(runHost({"-e", "strLength abc", "-e", "strMid abcdef 2 -1"}).all(), "0|3\n\"cdef\"\n|");
}

TEST(ConsoleTest, UsageAndLoadErrorsExitWithTwo) {
  EXPECT_EQ(runHost({"--module", "/nonexistent/x.hll", "-e", "x"}).all(),
            "2||tavix-host: cannot load /nonexistent/x.hll: No such file or directory\n");
  EXPECT_EQ(runHost({"--module", hostFolder() + "tavix-host", "-e", "x"}).status, 2);
  EXPECT_EQ(runHost({"/nonexistent/x.tavix"}).all(),
            "2||tavix-host: cannot read /nonexistent/x.tavix: No such file or directory\n");
  for (const std::vector<std::string>& args : {std::vector<std::string>{"--bogus"},
                                               {"-e"},
                                               {"--json", "--check"},
                                               {"--module", "a", "--module", "b"},
                                               {"a", "b"},
                                               {"-e", "strLength a", writeFile("script", "")}}) {
    const HostRun run = runHost(args);
    EXPECT_EQ(run.status, 2) << args[0];
    EXPECT_NE(run.err.find("\nusage: tavix-host"), std::string::npos) << args[0];
  }
}

TEST(ConsoleTest, PlainListingShowsEachRegistration) {
  const HostRun run = runHost({"--list"});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out.substr(0, 36), "maker: Orlem\npublisher: Orlem\nbuildD");
  EXPECT_NE(run.out.find("\n9 strTokArray (String): Get HString Token Array\n  usage: strTokArray "
                         "\"string\"\n  options: -delims VALUE -matchAll\n  returns: array of "
                         "strings (19), canExecuteSolo: true\n\n10 testPrint"),
            std::string::npos)
      << run.out;
}

// Each case that differs is named with its line, its note and what it did;
// notes are compared whole and shown escaped, as the script's name is.
TEST(ConsoleTest, CheckModeReportsEachCaseThatDiffersEscaped) {
  const char text[] =
      "# a group\nstrLength \"abc\"  # => 3\nstrLength \"ab\"  # => 3\nstrLength \"a\"\n"
      "strLength \"abc\"  # => \x1b[2J\x07\nstrLength \"abc\"  # => 3\0junk\n";
  const std::string cases = writeFile("x\x1b[7my.tavix", std::string(text, sizeof(text) - 1));
  const std::string name = privateFolder() + "x\\x1b[7my.tavix";
  EXPECT_EQ(runHost({"--check", cases}).all(),
            "1|" + name + ":3: strLength \"ab\"\n  expected: 3\n  actual:   2\n" + name +
                ":4: strLength \"a\"\n  expected: (no \"# =>\" note)\n  actual:   1\n" + name +
                ":5: strLength \"abc\"\n  expected: \\x1b[2J\\x07\n  actual:   3\n" + name +
                ":6: strLength \"abc\"\n  expected: 3\\x00junk\n  actual:   3\n" + name +
                ": 4 of 5 cases differ\n|");
  EXPECT_EQ(runHost({"--check", "-e", "strLength \"a\" # => 1"}).all(),
            "0|-e: 1 cases as expected\n|");
  // From Markdown, only the lines of ```tavix blocks are cases.
  const std::string page =
      writeFile("page.md", "```tavixx\nx # => 9\n```\n```tavix\nstrLength a # => 1\n```\n");
  EXPECT_EQ(runHost({"--check", page}).all(), "0|" + page + ": 1 cases as expected\n|");
}

TEST(ConsoleTest, CheckModeNeverCallsInputItCouldNotReadAsExpected) {
  EXPECT_EQ(runHost({"--check", privateFolder()}).all(),
            "2|" + privateFolder() + ": reading stopped after 0 cases, 0 of them differing\n" +
                "|tavix-host: cannot read " + privateFolder() + ": Is a directory\n");
  HostStart closed;
  closed.closeIn = true;
  EXPECT_EQ(runHost({"--check"}, closed).all(),
            "2|standard input: reading stopped after 0 cases, 0 of them differing\n"
            "|tavix-host: cannot read standard input: Bad file descriptor\n");
#if !defined(__SANITIZE_ADDRESS__)  // a memory limit leaves no room for the shadow memory
  HostStart limited;
  limited.addressSpace = 96 << 20;
  const std::string script = writeFile(
      "long.tavix", "strLength abc # => 3\nstrLength \"" + std::string(120 << 20, 'x') + "\"\n");
  EXPECT_EQ(runHost({"--check", script}, limited).all(),
            "2|" + script +
                ": reading stopped after 1 cases, 0 of them differing\n|tavix-host: cannot read " +
                script + ": line 2 is too long to hold in memory\n");
  // A result far larger than memory allows to describe twice is compared as it is described.
  limited.addressSpace = 256 << 20;
  const std::string huge =
      writeFile("huge.tavix", "strLeft \"" + std::string(30 << 20, '\x01') +
                                  "\" -1 # => nothing\nstrLength abc # => 3\n");
  const HostRun run = runHost({"--check", huge}, limited);
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out.substr(run.out.size() - 22), ": 1 of 2 cases differ\n");
#endif
}

// A line that runs out of memory fails alone; the run goes on.
TEST(ConsoleTest, RunningOutOfMemoryFailsTheLineAndTheRunGoesOn) {
  const auto replacing = [](size_t text, size_t replacement) {
    return "strReplace \"" + std::string(text, 'a') + "\" a \"" + std::string(replacement, 'b') +
           "\"\nstrLength abc\n";
  };
  EXPECT_EQ(runHost({}, replacing(46341, 46341)).all(), "1|3\n|line 1: out of memory\n");
#if !defined(__SANITIZE_ADDRESS__)  // a memory limit leaves no room for the shadow memory
  HostStart limited;
  limited.addressSpace = 256 << 20;
  limited.input = replacing(8192, 32768);
  EXPECT_EQ(runHost({}, limited).all(), "1|3\n|line 1: out of memory\n");
#endif
}

TEST(ConsoleTest, InputThatCannotBeReadOrOutputWrittenIsNeverSuccess) {
  HostStart start;
  start.inPath = privateFolder();
  EXPECT_EQ(runHost({}, start).all(),
            "2||tavix-host: cannot read standard input: Is a directory\n");

  start.outPath = "/dev/full";
  for (const std::vector<std::string>& args :
       {std::vector<std::string>{"-e", "strLength abc"}, {"--json", "-e", "x"}, {"--list"}}) {
    EXPECT_EQ(runHost(args, start).all(),
              "2||tavix-host: cannot write standard output: No space left on device\n");
  }
  start.closeOut = true;
  EXPECT_EQ(runHost({"-e", "strLength abc"}, start).all(),
            "2||tavix-host: cannot write standard output: Bad file descriptor\n");
  HostStart broken;
  broken.brokenPipe = true;
  EXPECT_EQ(runHost({"-e", "strLength abc"}, broken).all(),
            "2||tavix-host: cannot write standard output: Broken pipe\n");
}

// Whatever the limit on its memory, the console starts and runs, or ends
// with a message; a signal never ends it. (Not where sanitizers need shadow
// memory, or the coverage runtime memory at exit to write its counts.)
TEST(ConsoleTest, StartingUnderATightMemoryLimitEndsWithAMessage) {
#if !defined(__SANITIZE_ADDRESS__) && !defined(TAVIX_COVERAGE_BUILD)
  std::vector<std::string> args;
  for (int i = 0; i < 60000; ++i) args.insert(args.end(), {"-e", "strLength abc"});
  for (rlim_t limit = 5 << 20; limit < 12 << 20; limit += 512 << 10) {
    HostStart tight;
    tight.addressSpace = limit;
    const HostRun run = runHost(args, tight);
    SCOPED_TRACE(limit);
    EXPECT_NE(run.status, -1);
    if (run.status == 2) {
      EXPECT_EQ(run.err.substr(0, 12), "tavix-host: ");
    }
  }
#endif
}

// What a terminal shows until the text wanted arrives, or 10 seconds pass.
std::string readTerminalUntil(int terminal, const std::string& wanted) {
  std::string shown;
  pollfd readable{terminal, POLLIN, 0};
  while (shown.find(wanted) == std::string::npos && poll(&readable, 1, 10000) == 1) {
    char bytes[256];
    const ssize_t got = read(terminal, bytes, sizeof(bytes));
    if (got <= 0) break;
    shown.append(bytes, static_cast<size_t>(got));
  }
  return shown;
}

TEST(ConsoleTest, AtATerminalEachLineRunsAtEnterAndOneEndOfInputEnds) {
  const std::string host = hostFolder() + "tavix-host";
  int terminal = -1;
  const pid_t child = forkpty(&terminal, nullptr, nullptr, nullptr);
  if (child == 0) {
    alarm(30);
    execl(host.c_str(), host.c_str(), static_cast<char*>(nullptr));
    _exit(127);
  }
  EXPECT_NE(readTerminalUntil(terminal, "tavix> ").find("tavix> "), std::string::npos);
  ASSERT_EQ(write(terminal, "strLength abc\n", 14), 14);
  EXPECT_NE(readTerminalUntil(terminal, "3\r\ntavix> ").find("3\r\ntavix> "), std::string::npos);
  ASSERT_EQ(write(terminal, "\x04", 1), 1);
  int raw = 0;
  waitpid(child, &raw, 0);
  close(terminal);
  EXPECT_TRUE(WIFEXITED(raw) && WEXITSTATUS(raw) == 0) << raw;
}

TEST(ConsoleTest, AModulePathIsAFilePath) {
  const std::string module = hostFolder() + "TavixStringCmds.hll";
  ASSERT_EQ(symlink(module.c_str(), (privateFolder() + "mine.hll").c_str()), 0);
  HostStart here;
  here.folder = privateFolder();
  EXPECT_EQ(runHost({"--module", "mine.hll", "-e", "strLength abc"}, here).all(), "0|3\n|");
  EXPECT_EQ(runHost({"--module", "libm.so.6", "-e", "strLength abc"}, here).all(),
            "2||tavix-host: cannot load libm.so.6: No such file or directory\n");
  // Only a regular file is loaded: a pipe would wait for a writer forever.
  ASSERT_EQ(mkfifo((privateFolder() + "fifo").c_str(), 0600), 0);
  EXPECT_EQ(runHost({"--module", "fifo", "-e", "strLength abc"}, here).all(),
            "2||tavix-host: cannot load fifo: not a regular file\n");
}

// Printable characters in UTF-8 are shown as they are, in any language;
// controls (C0, DEL, C1), invalid UTF-8, bidirectional controls and a stray
// byte-order mark are shown byte by byte as \xHH.
TEST(ConsoleTest, MessagesAndResultsShowOnlyPrintableCharactersAsTheyAre) {
  EXPECT_EQ(
      runHost(
          {},
          "\x1b[31mRED\tx\nstrLength \"a\x01\"\n\xc2\x9b"
          "2J \xe2\x80\xae\xef\xbb\xbfx\n"
          "strLeft "
          "\"\xc3\xa9\xe6\x97\xa5\x9b\xc2\x9b\xe2\x80\xae\xef\xbb\xbf\x7f\xc0\xaf\xed\xa0\x80\" "
          "-1\nstrLeft \"\xdf\xbf\xe0\xa0\x80\xf0\x90\x80\x80\xe0\x80\x80\" -1\n")
          .all(),
      "1|2\n\"\xc3\xa9\xe6\x97\xa5\\x9b\\xc2\\x9b\\xe2\\x80\\xae\\xef\\xbb\\xbf\\x7f\\xc0\\xaf"
      "\\xed\\xa0\\x80\"\n\"\xdf\xbf\xe0\xa0\x80\xf0\x90\x80\x80\\xe0\\x80\\x80\"\n|line 1: "
      "unknown command \\x1b[31mRED\n"
      "line 3: unknown command \\xc2\\x9b2J\n");
}

}  // namespace
