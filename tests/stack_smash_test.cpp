// A stack buffer overrun in a hardened binary ends the process at once with
// the fast-fail status, STATUS_STACK_BUFFER_OVERRUN, instead of returning
// into what the overrun wrote. The program runs itself twice: overrunning a
// buffer, and writing within it.
#include <process.h>
#include <stdio.h>
#include <stdlib.h>
#include <windows.h>

namespace {

constexpr unsigned long kStackBufferOverrun = 0xC0000409;

// Writes count bytes into a 16-byte buffer on the stack.
__attribute__((noinline)) int fill(int count) {
  char buffer[16];
  volatile char* at = buffer;
  for (int i = 0; i < count; ++i) at[i] = 'x';
  return at[0];
}

}  // namespace

int main(int argc, char** argv) {
  if (argc > 1) return fill(atoi(argv[1])) == 'x' ? 0 : 1;
  char self[MAX_PATH];
  GetModuleFileNameA(nullptr, self, MAX_PATH);
  const auto within = static_cast<unsigned long>(_spawnl(_P_WAIT, self, self, "16", nullptr));
  const auto overrun = static_cast<unsigned long>(_spawnl(_P_WAIT, self, self, "64", nullptr));
  printf("writing within the buffer: exit status 0x%08lx\n", within);
  printf("overrunning it: exit status 0x%08lx (0x%08lx expected)\n", overrun, kStackBufferOverrun);
  return within == 0 && overrun == kStackBufferOverrun ? 0 : 1;
}
