// Symbols the compiler refers to in the Microsoft C++ ABI that the static
// part of its runtime would provide.

// Referred to by every object that uses floating point.
extern "C" int _fltused = 0x9875;

// The UCRT's terminate(), which calls the handler a host installed with
// set_terminate (a crash reporter, say) before it ends the process.
extern "C" [[noreturn]] void __cdecl terminate();

// Called where an exception would leave a noexcept function.
extern "C" [[noreturn]] void __std_terminate() {
  terminate();
}

namespace {

// type_info's deleting destructor; the runtime never destroys type records.
void* __cdecl destroyTypeInfo(void* self, unsigned) {
  return self;
}

}  // namespace

// The virtual table of type_info, which every exception type record points at.
extern "C" void* const g_typeInfoVirtualTable[] __asm__("??_7type_info@@6B@") = {
    reinterpret_cast<void*>(&destroyTypeInfo)};

// Probes each page of a stack frame larger than a page, from the top down, so
// that the guard page grows the stack in order. Takes the frame size in rax
// and keeps every register but r10 and r11.
extern "C" __attribute__((naked)) void __chkstk() {
  __asm__(
      "  movq %rsp, %r10\n"
      "  addq $8, %r10\n"  // the caller's stack pointer, above the return address
      "  movq %rax, %r11\n"
      "1:\n"
      "  cmpq $0x1000, %r11\n"
      "  jb 2f\n"
      "  subq $0x1000, %r10\n"
      "  testq %r10, (%r10)\n"
      "  subq $0x1000, %r11\n"
      "  jmp 1b\n"
      "2:\n"
      "  subq %r11, %r10\n"
      "  testq %r10, (%r10)\n"
      "  ret\n");
}
