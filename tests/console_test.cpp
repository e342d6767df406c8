// tavix-host run as a person runs it: exit status, where output goes, and the
// check mode that the script cases rely on. What a line does is in cases/.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
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
  std::string input;      // standard input
  std::string inPath;     // or this file as standard input
  std::string outPath;    // or this file as standard output
  bool closeOut = false;  // or standard output closed
  std::string folder;     // the working folder
  rlim_t addressSpace = RLIM_INFINITY;
};

// Runs tavix-host; exit status -1 when a signal ended it.
HostRun runHost(const std::vector<std::string>& args, const HostStart& start) {
  const std::string in = start.inPath.empty() ? writeFile("in", start.input) : start.inPath;
  const std::string out = start.outPath.empty() ? privateFolder() + "out" : start.outPath;
  const std::string err = privateFolder() + "err";
  const std::string host = hostFolder() + "tavix-host";
  const pid_t child = fork();
  if (child == 0) {
    std::vector<char*> argv{const_cast<char*>(host.c_str())};
    for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    dup2(open(in.c_str(), O_RDONLY), 0);
    dup2(open(out.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 1);
    dup2(open(err.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 2);
    if (start.closeOut) close(1);
    if (!start.folder.empty() && chdir(start.folder.c_str()) != 0) _exit(126);
    const rlimit limit{start.addressSpace, start.addressSpace};
    setrlimit(RLIMIT_AS, &limit);
    execv(host.c_str(), argv.data());
    _exit(127);
  }
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
  EXPECT_EQ(runHost({"-e", "strLength abc", "-e", "strMid abcdef 2 -1"}).all(), "0|3\n\"cdef\"\n|");
}

TEST(ConsoleTest, UsageAndLoadErrorsExitWithTwo) {
  EXPECT_EQ(runHost({"--module", "/nonexistent/x.hll", "-e", "x"}).all(),
            "2||tavix-host: cannot load /nonexistent/x.hll: No such file or directory\n");
  EXPECT_EQ(runHost({"--module", hostFolder() + "tavix-host", "-e", "x"}).status, 2);
  for (const std::vector<std::string>& args : {std::vector<std::string>{"--bogus"},
                                               {"-e"},
                                               {"--json", "--check"},
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

TEST(ConsoleTest, CheckModeNamesEachCaseThatDiffers) {
  const std::string cases =
      writeFile("cases.tavix",
                "# a group\n"
                "strLength \"abc\"   # => 3\n"
                "strLength \"ab\"    # => 3\n"
                "strLength \"a\"\n"
                "strTokArray \"\"  # => warning \"Couldn't find any string tokens\"\n");
  const HostRun run = runHost({"--check", cases});
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out, cases + ":3: strLength \"ab\"\n  expected: 3\n  actual:   2\n" + cases +
                         ":4: strLength \"a\"\n  expected: (no \"# =>\" note)\n  actual:   1\n" +
                         cases + ": 2 of 4 cases differ\n");

  const HostRun passing = runHost({"--check", "-e", "strLength \"a\" # => 1"});
  EXPECT_EQ(passing.status, 0);
  EXPECT_EQ(passing.out, "-e: 1 cases as expected\n");
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

  limited.addressSpace = 96 << 20;
  const std::string script =
      writeFile("long.tavix", "strLength abc\nstrLength \"" + std::string(120 << 20, 'x') + "\"\n");
  EXPECT_EQ(runHost({script}, limited).all(),
            "2|3\n|tavix-host: cannot read " + script + ": line 2 is too long to hold in memory\n");
#endif
}

TEST(ConsoleTest, InputThatCannotBeReadOrOutputWrittenIsNeverSuccess) {
  EXPECT_EQ(runHost({privateFolder()}).all(),
            "2||tavix-host: cannot read " + privateFolder() + ": Is a directory\n");
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
}

TEST(ConsoleTest, AModulePathIsAFilePath) {
  const std::string module = hostFolder() + "TavixStringCmds.hll";
  ASSERT_EQ(symlink(module.c_str(), (privateFolder() + "mine.hll").c_str()), 0);
  HostStart here;
  here.folder = privateFolder();
  EXPECT_EQ(runHost({"--module", "mine.hll", "-e", "strLength abc"}, here).all(), "0|3\n|");
  EXPECT_EQ(runHost({"--module", "libm.so.6", "-e", "strLength abc"}, here).all(),
            "2||tavix-host: cannot load libm.so.6: No such file or directory\n");
}

TEST(ConsoleTest, MessagesShowBytesThatDoNotPrintEscaped) {
  EXPECT_EQ(runHost({}, "\x1b[31mRED\tx\nstrLength \"a\x01\"\n").all(),
            "1|2\n|line 1: unknown command \\x1b[31mRED\n");
}

}  // namespace
