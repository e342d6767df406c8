// tavix-host run as a person runs it: exit status, where output goes, and the
// check mode that the script cases rely on. What a line does is in cases/.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "../tools/module_loader.h"

namespace {

struct HostRun {
  int status;
  std::string out;
  std::string err;
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

// Runs tavix-host with args, input on standard input; exit status -1 when a signal ended it.
HostRun runHost(const std::vector<std::string>& args, const std::string& input = "") {
  const std::string in = writeFile("in", input);
  const std::string out = privateFolder() + "out";
  const std::string err = privateFolder() + "err";
  const std::string host = executableDirectory() + "tavix-host";
  const pid_t child = fork();
  if (child == 0) {
    std::vector<char*> argv{const_cast<char*>(host.c_str())};
    for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    dup2(open(in.c_str(), O_RDONLY), 0);
    dup2(open(out.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 1);
    dup2(open(err.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600), 2);
    execv(host.c_str(), argv.data());
    _exit(127);
  }
  int raw = 0;
  waitpid(child, &raw, 0);
  return HostRun{WIFEXITED(raw) ? WEXITSTATUS(raw) : -1, readFile(out), readFile(err)};
}

TEST(ConsoleTest, ResultsGoToStandardOutputAndMessagesToStandardError) {
  const HostRun run = runHost({},
                              "strLength abc\nstrTok -delims ; \"a;b\"\nstrTok -delims ;\n"
                              "strTokArray \" \"\nstrReverseFind abc \"\"\nstrLength \"\\t\"\n");
  EXPECT_EQ(run.status, 1) << "a failed line sets the exit status";
  EXPECT_EQ(run.out, "3\n\"a\"\n\"b\"\n1\n");
  EXPECT_EQ(run.err,
            "warning: Couldn't find any string tokens\n"
            "error: Second argument cannot be an empty string\n");
}

TEST(ConsoleTest, DashELinesRunInOrderAndRefusalsAreNumbered) {
  const HostRun ok = runHost({"-e", "strLength abc", "-e", "strMid abcdef 2 -1"});
  EXPECT_EQ(ok.status, 0) << ok.err;
  EXPECT_EQ(ok.out, "3\n\"cdef\"\n");

  const HostRun refused = runHost({"-e", "strLength a", "-e", "nope", "-e", "strLength ab"});
  EXPECT_EQ(refused.status, 1);
  EXPECT_EQ(refused.out, "1\n2\n");
  EXPECT_EQ(refused.err, "line 2: unknown command nope\n");
}

TEST(ConsoleTest, UsageAndLoadErrorsExitWithTwo) {
  const HostRun missing = runHost({"--module", "/nonexistent/TavixStringCmds.hll", "-e", "x"});
  EXPECT_EQ(missing.status, 2);
  EXPECT_EQ(missing.out, "");
  EXPECT_EQ(missing.err.rfind("tavix-host: cannot load /nonexistent/TavixStringCmds.hll", 0), 0u)
      << missing.err;
  EXPECT_EQ(runHost({"--module", executableDirectory() + "tavix-host", "-e", "x"}).status, 2);
  for (const std::vector<std::string>& args : {std::vector<std::string>{"--bogus"},
                                               {"-e"},
                                               {"--json", "--check"},
                                               {"a", "b"},
                                               {"-e", "strLength a", writeFile("script", "")}}) {
    const HostRun run = runHost(args);
    EXPECT_EQ(run.status, 2) << args[0];
    EXPECT_NE(run.err.find("usage: tavix-host"), std::string::npos) << args[0];
  }
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

}  // namespace
