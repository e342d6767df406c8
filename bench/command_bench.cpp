// The cost of one execute of each command, beside what a C++ programmer
// would write instead, and how the token commands scale with their input.
#include <benchmark/benchmark.h>
#include <strings.h>

#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include "console.h"
#include "default_session.h"
#include "log_sink.h"
#include "plugin_session.h"
#include "script_values.h"

namespace {

// 64 bytes of ordinary text.
const char kText[] = "The quick brown fox jumps over the lazy dog, again and again!!!";
const char kOtherText[] = "The quick brown fox jumps over the lazy cat, again and again!!!";
const char kFewTokens[] = "alpha beta gamma delta epsilon zeta eta theta";
static_assert(sizeof(kText) == 64, "a 64-byte text");

PluginSession& module() {
  static PluginSession& session = []() -> PluginSession& {
    if (defaultSession() == nullptr) std::exit(2);
    return *defaultSession();
  }();
  return session;
}

Variable str(const char* text) {
  return stringValue(text);
}

Variable num(int value) {
  return integerValue(value);
}

// One command call, built once and executed per iteration.
struct Call {
  Command* command;
  TArray<Variable> args;
  TArray<CommandOption> options;

  Call(const char* name, std::initializer_list<Variable> values,
       std::initializer_list<CommandOption> given = {})
      : command(module().find(name)) {
    for (const Variable& v : values) args.add(v);
    for (const CommandOption& o : given) options.add(o);
  }
  bool run(Variable& result) { return command->execute(options, args, result); }
};

void runCall(benchmark::State& state, Call& call) {
  Variable result;
  for (auto _ : state) {
    call.run(result);
    benchmark::DoNotOptimize(result);
  }
}

// --- one execute of each command, on short inputs -------------------------

void BM_strCompare(benchmark::State& state) {
  Call call("strCompare", {str(kText), str(kOtherText)});
  runCall(state, call);
}
void BM_strCompareNoCase(benchmark::State& state) {
  Call call("strCompare", {str(kText), str(kOtherText)}, {CommandOption::given(0, Variable())});
  runCall(state, call);
}
void BM_strFind(benchmark::State& state) {
  Call call("strFind", {str(kText), str("lazy"), num(0)});
  runCall(state, call);
}
void BM_strReverseFind(benchmark::State& state) {
  Call call("strReverseFind", {str(kText), str("a")});
  runCall(state, call);
}
void BM_strLength(benchmark::State& state) {
  Call call("strLength", {str(kText)});
  runCall(state, call);
}
void BM_strLeft(benchmark::State& state) {
  Call call("strLeft", {str(kText), num(10)});
  runCall(state, call);
}
void BM_strRight(benchmark::State& state) {
  Call call("strRight", {str(kText), num(10)});
  runCall(state, call);
}
void BM_strMid(benchmark::State& state) {
  Call call("strMid", {str(kText), num(4), num(20)});
  runCall(state, call);
}
void BM_strReplace(benchmark::State& state) {
  Call call("strReplace", {str(kText), str(" "), str("_")});
  runCall(state, call);
}
void BM_strTokArray(benchmark::State& state) {
  Call call("strTokArray", {str(kFewTokens)});
  runCall(state, call);
}
void BM_testPrint(benchmark::State& state) {
  // Quiet whatever ran before: a console run leaves the log to standard error.
  setLogSink([](LogLevel, const char*, void*) {}, nullptr);
  Call call("testPrint", {});
  runCall(state, call);
}

// A whole strTok walk over the few tokens: one call with the text, then one
// per further token until the empty string comes back.
void BM_strTokWalk(benchmark::State& state) {
  Call first("strTok", {str(kFewTokens)});
  Call next("strTok", {});
  Variable result;
  for (auto _ : state) {
    first.run(result);
    while (next.run(result), result.getStringValue(-1)[0] != '\0') {
    }
    benchmark::DoNotOptimize(result);
  }
}

BENCHMARK(BM_strCompare);
BENCHMARK(BM_strCompareNoCase);
BENCHMARK(BM_strFind);
BENCHMARK(BM_strReverseFind);
BENCHMARK(BM_strLength);
BENCHMARK(BM_strLeft);
BENCHMARK(BM_strRight);
BENCHMARK(BM_strMid);
BENCHMARK(BM_strReplace);
BENCHMARK(BM_strTokWalk);
BENCHMARK(BM_strTokArray);
BENCHMARK(BM_testPrint);

// --- what a C++ programmer would write instead -----------------------------

void BM_bare_compare(benchmark::State& state) {
  const std::string a = kText, b = kOtherText;
  for (auto _ : state) benchmark::DoNotOptimize(a.compare(b));
}
void BM_bare_compareNoCase(benchmark::State& state) {
  const std::string a = kText, b = kOtherText;
  for (auto _ : state) benchmark::DoNotOptimize(strcasecmp(a.c_str(), b.c_str()));
}
void BM_bare_find(benchmark::State& state) {
  const std::string_view text = kText;
  for (auto _ : state) benchmark::DoNotOptimize(text.find("lazy", 0));
}
void BM_bare_reverseFind(benchmark::State& state) {
  const std::string_view text = kText;
  for (auto _ : state) benchmark::DoNotOptimize(text.rfind('a'));
}
void BM_bare_length(benchmark::State& state) {
  const char* text = kText;
  for (auto _ : state) {
    benchmark::DoNotOptimize(text);
    benchmark::DoNotOptimize(std::strlen(text));
  }
}
void BM_bare_left(benchmark::State& state) {
  const std::string text = kText;
  for (auto _ : state) benchmark::DoNotOptimize(text.substr(0, 10));
}
void BM_bare_right(benchmark::State& state) {
  const std::string text = kText;
  for (auto _ : state) benchmark::DoNotOptimize(text.substr(text.size() - 10));
}
void BM_bare_mid(benchmark::State& state) {
  const std::string text = kText;
  for (auto _ : state) benchmark::DoNotOptimize(text.substr(4, 20));
}
void BM_bare_replace(benchmark::State& state) {
  const std::string text = kText;
  for (auto _ : state) {
    std::string out;
    out.reserve(text.size());
    for (size_t from = 0;;) {
      const size_t hit = text.find(' ', from);
      out.append(text, from, hit == std::string::npos ? std::string::npos : hit - from);
      if (hit == std::string::npos) break;
      out += '_';
      from = hit + 1;
    }
    benchmark::DoNotOptimize(out);
  }
}
void BM_bare_strtok_r(benchmark::State& state) {
  for (auto _ : state) {
    char buffer[sizeof(kFewTokens)];
    std::memcpy(buffer, kFewTokens, sizeof(kFewTokens));
    char* save = nullptr;
    for (char* token = strtok_r(buffer, " \t\n\r", &save); token != nullptr;
         token = strtok_r(nullptr, " \t\n\r", &save)) {
      benchmark::DoNotOptimize(token);
    }
  }
}

std::vector<std::string> splitView(std::string_view text, std::string_view delims) {
  std::vector<std::string> tokens;
  size_t start = text.find_first_not_of(delims);
  while (start != std::string_view::npos) {
    const size_t end = text.find_first_of(delims, start);
    tokens.emplace_back(text.substr(start, end - start));
    start = text.find_first_not_of(delims, end);
  }
  return tokens;
}

void BM_bare_split(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(splitView(kFewTokens, " \t\n\r"));
}

BENCHMARK(BM_bare_compare);
BENCHMARK(BM_bare_compareNoCase);
BENCHMARK(BM_bare_find);
BENCHMARK(BM_bare_reverseFind);
BENCHMARK(BM_bare_length);
BENCHMARK(BM_bare_left);
BENCHMARK(BM_bare_right);
BENCHMARK(BM_bare_mid);
BENCHMARK(BM_bare_replace);
BENCHMARK(BM_bare_strtok_r);
BENCHMARK(BM_bare_split);

// --- scaling with the number of tokens -------------------------------------

// n tokens of 6 or 7 bytes, separated by delimiter.
std::string tokens(int64_t n, const char* delimiter) {
  std::string text;
  for (int64_t i = 0; i < n; ++i) {
    if (i > 0) text += delimiter;
    text += "tok" + std::to_string(i % 10000);
  }
  return text;
}

void BM_strTokArray_scaling(benchmark::State& state, bool matchAll) {
  const char* delimiter = matchAll ? "::" : ",";
  const std::string text = tokens(state.range(0), delimiter);
  Variable delims = str(delimiter);
  Call call("strTokArray", {str(text.c_str())});
  call.options.add(CommandOption::given(0, delims));
  if (matchAll) call.options.add(CommandOption::given(1, Variable()));
  runCall(state, call);
  state.SetComplexityN(state.range(0));
  state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * text.size()));
}

void BM_strTok_walk_scaling(benchmark::State& state, bool matchAll) {
  const char* delimiter = matchAll ? "::" : ",";
  const std::string text = tokens(state.range(0), delimiter);
  Call first("strTok", {str(text.c_str())});
  Call next("strTok", {});
  for (Call* call : {&first, &next}) {
    call->options.add(CommandOption::given(0, str(delimiter)));
    if (matchAll) call->options.add(CommandOption::given(1, Variable()));
  }
  Variable result;
  for (auto _ : state) {
    first.run(result);
    while (next.run(result), result.getStringValue(-1)[0] != '\0') {
    }
  }
  state.SetComplexityN(state.range(0));
  state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * text.size()));
}

// --- end to end: a console line against the bare splitter ----------------

constexpr int kConsoleTokens = 200000;

// The console running `strTokArray -delims "," "tok0,tok1,..."` whole: reading
// the line, calling the command, and writing the array as plain output.
void BM_console_strTokArray(benchmark::State& state) {
  const std::string line = "strTokArray -delims \",\" \"" + tokens(kConsoleTokens, ",") + "\"";
  FILE* sink = std::fopen("/dev/null", "wb");
  OutputStream out(sink);
  OutputStream err(sink);
  Console console(module(), ConsoleMode::Plain, out, err, "bench");
  for (auto _ : state) console.runLine(1, line.data(), line.size());
  out.flush();
  std::fclose(sink);
  state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * line.size()));
}

// The same split by the bare C++ splitter, in this binary.
void BM_bare_split_console_text(benchmark::State& state) {
  const std::string text = tokens(kConsoleTokens, ",");
  for (auto _ : state) benchmark::DoNotOptimize(splitView(text, ","));
  state.SetBytesProcessed(static_cast<int64_t>(state.iterations() * text.size()));
}

BENCHMARK(BM_console_strTokArray)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_bare_split_console_text)->Unit(benchmark::kMillisecond);

BENCHMARK_CAPTURE(BM_strTokArray_scaling, charSet, false)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Complexity(benchmark::oN)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(BM_strTokArray_scaling, matchAll, true)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Complexity(benchmark::oN)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(BM_strTok_walk_scaling, charSet, false)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Complexity(benchmark::oN)
    ->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(BM_strTok_walk_scaling, matchAll, true)
    ->RangeMultiplier(10)
    ->Range(10, 100000)
    ->Complexity(benchmark::oN)
    ->Unit(benchmark::kMicrosecond);

}  // namespace

BENCHMARK_MAIN();
