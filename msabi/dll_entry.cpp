// The entry point of a DLL: the static part of the Microsoft C++ runtime
// that runs constructors on load and destructors on unload is not here.
#include <windows.h>

#include "startup.h"

extern "C" __attribute__((no_stack_protector)) BOOL WINAPI _DllMainCRTStartup(HINSTANCE,
                                                                              DWORD reason,
                                                                              LPVOID) {
  if (reason == DLL_PROCESS_ATTACH) {
    __security_init_cookie();
    startModule();
  }
  if (reason == DLL_PROCESS_DETACH) finishModule();
  return TRUE;
}
