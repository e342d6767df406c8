#include "memory_reserve.h"

#include <stdlib.h>

#include <new>

namespace {

constexpr size_t kReserveSize = 64 * 1024;
void* g_reserve = nullptr;

#if !defined(_WIN32)
// operator new calls this when it finds no memory: the reserve goes, and the
// exception comes out of what it held.
void releaseReserve() {
  free(g_reserve);
  g_reserve = nullptr;
  throw std::bad_alloc();
}
#endif

}  // namespace

bool holdMemoryReserve() {
  g_reserve = malloc(kReserveSize);
  if (g_reserve == nullptr) return false;
#if !defined(_WIN32)
  std::set_new_handler(releaseReserve);  // the Windows runtime here has no handler
#endif
  return true;
}
