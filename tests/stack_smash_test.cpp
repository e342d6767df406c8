// A stack buffer overrun in a hardened binary ends the process at once with
// the fast-fail status, STATUS_STACK_BUFFER_OVERRUN, instead of returning
// into what the overrun wrote. The program runs itself twice: overrunning a
// buffer, and writing within it.
#include <stdio.h>
#include <stdlib.h>
#include <windows.h>

namespace {

constexpr DWORD kStackBufferOverrun = 0xC0000409;

// Writes count bytes into a 16-byte buffer on the stack.
__attribute__((noinline)) int fill(int count) {
  char buffer[16];
  volatile char* at = buffer;
  for (int i = 0; i < count; ++i) at[i] = 'x';
  return at[0];
}

// Runs this program with argument and gives its exit status.
DWORD runSelf(const wchar_t* argument) {
  wchar_t self[MAX_PATH];
  GetModuleFileNameW(nullptr, self, MAX_PATH);
  wchar_t line[MAX_PATH + 32] = L"stack_smash_test ";
  wcscat(line, argument);
  STARTUPINFOW startup{};
  startup.cb = sizeof(startup);
  PROCESS_INFORMATION process{};
  if (!CreateProcessW(self, line, nullptr, nullptr, FALSE, 0, nullptr, nullptr, &startup,
                      &process)) {
    return 0xFFFFFFFF;
  }
  WaitForSingleObject(process.hProcess, INFINITE);
  DWORD status = 0;
  GetExitCodeProcess(process.hProcess, &status);
  CloseHandle(process.hThread);
  CloseHandle(process.hProcess);
  return status;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc > 1) {
    fill(atoi(argv[1]));
    return 0;
  }
  const DWORD within = runSelf(L"16");
  const DWORD overrun = runSelf(L"64");
  printf("writing within the buffer: exit status 0x%08lx\n", within);
  printf("overrunning it: exit status 0x%08lx (0x%08lx expected)\n", overrun, kStackBufferOverrun);
  return within == 0 && overrun == kStackBufferOverrun ? 0 : 1;
}
