#include "fuzz_support.h"

#include <cstdio>
#include <cstdlib>
#include <string>

PluginSession& fuzzedModule() {
  static PluginSession* loaded = [] {
    std::string error;
    PluginSession* session = PluginSession::open(defaultModulePath(), error).release();
    if (session == nullptr) {
      std::fprintf(stderr, "%s\n", error.c_str());
      std::abort();
    }
    return session;
  }();
  return *loaded;
}

void require(bool condition, const char* what) {
  if (!condition) {
    std::fprintf(stderr, "invariant broken: %s\n", what);
    std::abort();
  }
}
