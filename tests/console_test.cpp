// tavix-host end to end: its line syntax, output, refusals and exit status.
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "../tools/module_loader.h"

#if !defined(_WIN32)
#include <sys/wait.h>
#endif

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

#if defined(_WIN32)
const char kHostFile[] = "tavix-host.exe";
#else
const char kHostFile[] = "tavix-host";
#endif

std::string hostPath() {
  return executableDirectory() + kHostFile;
}

// Arguments are quoted for the shell; they hold no quote or backslash, so
// the same command line works under sh and cmd. Script lines with quotes go
// through standard input.
std::string quoteArg(const std::string& arg) {
  return "\"" + arg + "\"";
}

HostRun runHost(const std::vector<std::string>& args, const std::string& input = "") {
  const std::string base = ::testing::TempDir() + "console_test_";
  std::ofstream(base + "in", std::ios::binary) << input;
  std::string commandLine = quoteArg(hostPath());
  for (const std::string& arg : args) commandLine += " " + quoteArg(arg);
  commandLine += " < " + quoteArg(base + "in") + " > " + quoteArg(base + "out") + " 2> " +
                 quoteArg(base + "err");
#if defined(_WIN32)
  const int status = std::system(("\"" + commandLine + "\"").c_str());  // cmd strips one pair
#else
  const int raw = std::system(commandLine.c_str());
  const int status = WIFEXITED(raw) ? WEXITSTATUS(raw) : -1;
#endif
  return HostRun{status, readFile(base + "out"), readFile(base + "err")};
}

TEST(ConsoleTest, LineSyntaxReachesTheCommands) {
  const HostRun run =
      runHost({"--json"},
              "strLeft \"a\\\"b\\\\c\\td\" -2\nstrMid abcdef 2 -1\n"
              "strTokArray -delims \",\" -matchAll \"x,\\x41,\"\nstrFind \"-x\" -x 0\n");
  EXPECT_EQ(
      run.out,
      "{\"line\": 1, \"command\": \"strLeft\", \"ran\": true, \"ok\": true, \"type\": 3, "
      "\"value\": \"a\\\"b\\\\c\\u0009d\", \"log\": []}\n"
      "{\"line\": 2, \"command\": \"strMid\", \"ran\": true, \"ok\": true, \"type\": 3, "
      "\"value\": \"cdef\", \"log\": []}\n"
      "{\"line\": 3, \"command\": \"strTokArray\", \"ran\": true, \"ok\": true, \"type\": 19, "
      "\"value\": [\"x\", \"A\"], \"log\": []}\n"
      "{\"line\": 4, \"command\": \"strFind\", \"ran\": false, \"ok\": false, \"type\": 0, "
      "\"value\": null, \"log\": [], \"error\": \"unknown option -x for strFind\"}\n");
  EXPECT_EQ(run.status, 1) << "a refused line sets the exit status";
}

TEST(ConsoleTest, RepeatedDashELinesRunInOrder) {
  const HostRun run =
      runHost({"-e", "strLength abc", "-e", "strMid abcdef 2 -1", "-e", "strTok x"});
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "3\n\"cdef\"\n\"x\"\n");
}

TEST(ConsoleTest, EightBitBytesRoundTripThroughJson) {
  const HostRun run = runHost({"--json"}, "strRight \"\\xe9\\x7f\\x01z\" 99\n");
  EXPECT_NE(run.out.find("\"value\": \"\\u00e9\\u007f\\u0001z\""), std::string::npos) << run.out;
}

TEST(ConsoleTest, PlainOutputQuotesAsTheLineSyntaxReads) {
  const HostRun run = runHost({}, "strRight \"\\t\\\"\\\\\\x01\\x7f\\xe9\" 99\nstrLength \"\"\n");
  EXPECT_EQ(run.status, 0) << run.err;
  EXPECT_EQ(run.out, "\"\\t\\\"\\\\\\x01\\x7f\xe9\"\n0\n");
}

TEST(ConsoleTest, StrTokWalksAcrossLinesAndMessagesAreShown) {
  const HostRun run = runHost({},
                              "# a walk\n\nstrTok -delims ; \"a;b\"\nstrTok -delims ;\nstrTok\n"
                              "strTokArray \" \"\ntestPrint\n");
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out, "\"a\"\n\"b\"\n\"\"\n");
  EXPECT_EQ(run.err,
            "warning: Couldn't find any string tokens\n"
            "info: Simple call to logInfo\n"
            "info: Call to logInfo with 2 arguments, woohoo \n"
            "info: Call to logInfo from HString::Format with 2 arguments, woohoo \n");
}

TEST(ConsoleTest, RefusalsAreNamedAndTheRunGoesOn) {
  const HostRun run = runHost({},
                              "nope 1\nstrLeft \"abc\"\nstrLength \"x\\x00\"\n"
                              "strReverseFind abc \"\"\nstrLength abc\n");
  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.out, "3\n");
  EXPECT_EQ(run.err,
            "line 1: unknown command nope\n"
            "line 2: usage: strLeft \"string\" count\n"
            "line 3: a string cannot hold a NUL byte\n"
            "error: Second argument cannot be an empty string\n");
}

TEST(ConsoleTest, LoadAndUsageErrorsExitWithTwo) {
  const HostRun missing =
      runHost({"--module", "/nonexistent/TavixStringCmds.hll", "-e", "strLength a"});
  EXPECT_EQ(missing.status, 2);
  EXPECT_EQ(missing.out, "");
  EXPECT_NE(missing.err.find("cannot load /nonexistent/TavixStringCmds.hll"), std::string::npos);
  EXPECT_EQ(std::count(missing.err.begin(), missing.err.end(), '\n'), 1);

  const HostRun notAModule = runHost({"--module", hostPath(), "-e", "strLength a"});
  EXPECT_EQ(notAModule.status, 2);
  EXPECT_EQ(runHost({"--bogus"}).status, 2);
  EXPECT_EQ(runHost({"-e"}).status, 2);
}

TEST(ConsoleTest, ListShowsEveryCommand) {
  const HostRun run = runHost({"--list", "--json"});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.out.rfind("{\"plugin\": {\"maker\": \"Orlem\", \"publisher\": \"Orlem\", ", 0), 0u);
  EXPECT_NE(run.out.find("\"name\": \"Tavix String Commands\", \"release\": \"2.00\", "
                         "\"apiVersion\": 524288}"),
            std::string::npos);
  EXPECT_NE(run.out.find("{\"position\": 9, \"name\": \"strTokArray\", \"category\": \"String\", "
                         "\"description\": \"Get HString Token Array\", \"options\": "
                         "[{\"name\": \"delims\", \"takesValue\": true}, {\"name\": \"matchAll\", "
                         "\"takesValue\": false}], \"syntax\": \"\\\"string\\\"\", "
                         "\"returnType\": 19, \"canExecuteSolo\": true}"),
            std::string::npos)
      << run.out;
  EXPECT_NE(run.out.find("\"position\": 10, \"name\": \"testPrint\""), std::string::npos);
}

}  // namespace
