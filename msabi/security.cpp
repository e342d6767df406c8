// Stack protection and control-flow guard, as the Microsoft toolchain's
// runtime provides them: the stack cookie, its check and its choice at entry;
// the pointers through which guarded indirect calls go; and the
// load-configuration directory that tells the system where all of it is.
#include <stdint.h>
#include <windows.h>

#include "startup.h"  // declares __security_init_cookie

namespace {

// The value the cookie has before it is chosen; never a chosen one.
constexpr uintptr_t kUnchosenCookie = 0x00002B992DDFA232;
// What __fastfail reports for a stack buffer overrun.
constexpr unsigned kStackCookieCheckFailure = 2;

// Ends the process at once with STATUS_STACK_BUFFER_OVERRUN: no handler runs,
// so code that overran a buffer cannot be made to run on.
[[noreturn]] void failFast(unsigned code) {
  __asm__ volatile("int $0x29" : : "c"(code));
  __builtin_unreachable();
}

}  // namespace

// Every protected frame keeps a copy of the cookie beside its buffers and
// compares it before it returns.
extern "C" uintptr_t __security_cookie = kUnchosenCookie;
extern "C" uintptr_t __security_cookie_complement = ~kUnchosenCookie;

extern "C" __attribute__((no_stack_protector)) void __security_check_cookie(uintptr_t cookie) {
  if (cookie != __security_cookie) failFast(kStackCookieCheckFailure);
}

// Chooses the cookie from what differs from process to process and from run
// to run: the time, the process and thread, the performance counter and where
// the stack lies. Its top 16 bits stay clear, as the toolchain's do.
extern "C" __attribute__((no_stack_protector)) void __security_init_cookie() {
  if (__security_cookie != kUnchosenCookie) return;
  FILETIME now;
  GetSystemTimeAsFileTime(&now);
  LARGE_INTEGER counter;
  QueryPerformanceCounter(&counter);
  uintptr_t cookie = (static_cast<uintptr_t>(now.dwHighDateTime) << 32) ^ now.dwLowDateTime;
  cookie ^= static_cast<uintptr_t>(GetCurrentThreadId()) ^
            (static_cast<uintptr_t>(GetCurrentProcessId()) << 16);
  cookie ^=
      (static_cast<uintptr_t>(counter.QuadPart) << 32) ^ static_cast<uintptr_t>(counter.QuadPart);
  cookie ^= reinterpret_cast<uintptr_t>(&cookie);
  cookie &= 0x0000FFFFFFFFFFFF;
  if (cookie == kUnchosenCookie) cookie ^= 1;
  __security_cookie = cookie;
  __security_cookie_complement = ~cookie;
}

// Guarded indirect calls go through these pointers. Until the system puts
// its checks in (when the process enforces control-flow guard), a call goes
// straight to its target, whose address the dispatcher takes in rax.
extern "C" void guardCheckNothing(uintptr_t) {}
extern "C" __attribute__((naked)) void guardDispatchDirectly() {
  __asm__("rex64 jmp *%rax");
}
extern "C" __attribute__((section(".00cfg"))) void (*const __guard_check_icall_fptr)(uintptr_t) =
    &guardCheckNothing;
extern "C" __attribute__((section(".00cfg"))) void (*const __guard_dispatch_icall_fptr)() =
    &guardDispatchDirectly;

// The load-configuration directory (IMAGE_LOAD_CONFIG_DIRECTORY64, up to its
// EH-continuation fields), which the linker points the image at: it records
// the cookie, the guard's pointers and the tables of valid call targets that
// the linker makes (the __guard_* symbols, counts and flags as their values).
__asm__(R"(
  .section .rdata,"dr"
  .globl _load_config_used
  .p2align 3
_load_config_used:
  .long 280, 0                      # Size, TimeDateStamp
  .short 0, 0                       # MajorVersion, MinorVersion
  .long 0, 0, 0                     # GlobalFlagsClear, GlobalFlagsSet, CriticalSectionDefaultTimeout
  .quad 0, 0, 0, 0, 0, 0            # heap thresholds, LockPrefixTable, allocation limits, ProcessAffinityMask
  .long 0                           # ProcessHeapFlags
  .short 0, 0                       # CSDVersion, DependentLoadFlags
  .quad 0                           # EditList
  .quad __security_cookie
  .quad 0, 0                        # SEHandlerTable, SEHandlerCount
  .quad __guard_check_icall_fptr
  .quad __guard_dispatch_icall_fptr
  .quad __guard_fids_table
  .quad __guard_fids_count
  .long __guard_flags
  .short 0, 0                       # CodeIntegrity: Flags, Catalog
  .long 0, 0                        # CodeIntegrity: CatalogOffset, Reserved
  .quad __guard_iat_table
  .quad __guard_iat_count
  .quad __guard_longjmp_table
  .quad __guard_longjmp_count
  .quad 0, 0, 0, 0                  # DynamicValueRelocTable, CHPEMetadataPointer, GuardRF routines
  .long 0                           # DynamicValueRelocTableOffset
  .short 0, 0                       # DynamicValueRelocTableSection, Reserved2
  .quad 0                           # GuardRFVerifyStackPointerFunctionPointer
  .long 0, 0                        # HotPatchTableOffset, Reserved3
  .quad 0, 0                        # EnclaveConfigurationPointer, VolatileMetadataPointer
  .quad __guard_eh_cont_table
  .quad __guard_eh_cont_count
)");
