// Peak memory of one strTokArray call on many tokens, as a whole process:
// the module loaded as a host loads it, the text handed over as a script
// value, split once. Prints the peak resident size and its share per token.
//   token_memory [TOKENS]   (default 10,000,000 tokens of 4 to 7 bytes)
#include <sys/resource.h>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "default_session.h"
#include "log_sink.h"
#include "plugin_session.h"
#include "script_values.h"

namespace {

double peakResidentKiB() {
  rusage usage{};
  getrusage(RUSAGE_SELF, &usage);
  return static_cast<double>(usage.ru_maxrss);
}

}  // namespace

int main(int argc, char** argv) {
  const long count = argc > 1 ? std::atol(argv[1]) : 10000000;
  if (defaultSession() == nullptr) return 2;
  PluginSession& session = *defaultSession();
  Variable text;
  {
    std::string built;
    for (long i = 0; i < count; ++i) {
      if (i > 0) built += ',';
      built += "tok" + std::to_string(i % 10000);
    }
    text = stringValue(built.c_str());
  }
  const double before = peakResidentKiB();
  TArray<Variable> args;
  args.add(text);
  text = Variable();
  TArray<CommandOption> options;
  options.add(CommandOption::given(0, stringValue(",")));
  Variable result;
  session.find("strTokArray")->execute(options, args, result);
  const double peak = peakResidentKiB();
  std::printf(
      "strTokArray on %ld tokens: %d elements; peak resident %.0f MiB (%.0f MiB before the "
      "call), %.1f bytes per token\n",
      count, result.getCount(), peak / 1024.0, before / 1024.0,
      peak * 1024.0 / static_cast<double>(count));
  return result.getCount() == count ? 0 : 1;
}
