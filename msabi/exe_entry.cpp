// The entry point of a console program: sets up the UCRT's arguments and
// environment, runs the static constructors, calls main and exits with its
// status; exit runs the static destructors.
#include <stdlib.h>

#include "startup.h"

extern "C" int __cdecl _set_app_type(int type);
extern "C" int __cdecl _configure_narrow_argv(int mode);
extern "C" int __cdecl _initialize_narrow_environment();
extern "C" int* __cdecl __p___argc();
extern "C" char*** __cdecl __p___argv();
extern "C" int __cdecl _crt_atexit(void(__cdecl* function)());

int main(int argc, char** argv);

namespace {

constexpr int kConsoleApp = 1;
constexpr int kUnexpandedArguments = 1;

void __cdecl finishAtExit() {
  finishModule();
}

}  // namespace

extern "C" __attribute__((no_stack_protector)) void mainCRTStartup() {
  __security_init_cookie();
  _set_app_type(kConsoleApp);
  _configure_narrow_argv(kUnexpandedArguments);
  _initialize_narrow_environment();
  _crt_atexit(finishAtExit);
  startModule();
  exit(main(*__p___argc(), *__p___argv()));
}
