#include "fuzz_support.h"

#include <cstdio>
#include <cstdlib>

#include "default_session.h"

void require(bool condition, const char* what) {
  if (!condition) {
    std::fprintf(stderr, "invariant broken: %s\n", what);
    std::abort();
  }
}

PluginSession& fuzzedSession() {
  PluginSession* session = defaultSession();
  require(session != nullptr, "the module loads");
  return *session;
}
