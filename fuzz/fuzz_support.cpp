#include "fuzz_support.h"

#include <cstdio>
#include <cstdlib>

void require(bool condition, const char* what) {
  if (!condition) {
    std::fprintf(stderr, "invariant broken: %s\n", what);
    std::abort();
  }
}
