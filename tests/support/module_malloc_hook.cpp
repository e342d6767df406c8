#include "module_malloc_hook.h"

#include <stdint.h>
#include <stdlib.h>
#include <string.h>

#if defined(_WIN32)
#include <windows.h>
extern "C" void* __imp_malloc;  // this program's own import slots
extern "C" void* __imp_realloc;
#else
#include <link.h>
#include <sys/mman.h>
#include <unistd.h>
#endif

namespace {

using MallocFn = void* (*)(size_t);
using ReallocFn = void* (*)(void*, size_t);

MallocFn g_realMalloc = nullptr;
ReallocFn g_realRealloc = nullptr;
size_t g_failingSize = 0;  // 0: none fails

// Whether a request of this size is the one to fail.
bool failsNow(size_t bytes) {
  if (bytes != g_failingSize) return false;
  g_failingSize = 0;
  return true;
}

void* hookedMalloc(size_t bytes) {
  return failsNow(bytes) ? nullptr : g_realMalloc(bytes);
}

void* hookedRealloc(void* block, size_t bytes) {
  return failsNow(bytes) ? nullptr : g_realRealloc(block, bytes);
}

// The address of a function as the module's import slot holds it; on
// Windows &malloc would name this program's import thunk instead.
void* importedAddress(bool reallocation) {
#if defined(_WIN32)
  return reallocation ? __imp_realloc : __imp_malloc;
#else
  return reallocation ? reinterpret_cast<void*>(&realloc) : reinterpret_cast<void*>(&malloc);
#endif
}

// The module calls a function through one word of its image that the loader
// filled with the function's address: its import slot. Finds it in [from,
// to), which may hold the redzones AddressSanitizer puts between globals.
__attribute__((no_sanitize_address)) void** findSlot(uintptr_t from, uintptr_t to, void* target) {
  for (uintptr_t at = (from + sizeof(void*) - 1) & ~(sizeof(void*) - 1); at + sizeof(void*) <= to;
       at += sizeof(void*)) {
    if (*reinterpret_cast<void**>(at) == target) return reinterpret_cast<void**>(at);
  }
  return nullptr;
}

#if defined(_WIN32)

void** findImport(const char* moduleFileName, void* target) {
  const auto base = reinterpret_cast<uintptr_t>(GetModuleHandleA(moduleFileName));
  if (base == 0) return nullptr;
  const auto* dos = reinterpret_cast<const IMAGE_DOS_HEADER*>(base);
  const auto* nt = reinterpret_cast<const IMAGE_NT_HEADERS*>(base + dos->e_lfanew);
  return findSlot(base + nt->OptionalHeader.SizeOfHeaders, base + nt->OptionalHeader.SizeOfImage,
                  target);
}

void writeSlot(void** slot, void* value) {
  DWORD previous = 0;
  VirtualProtect(slot, sizeof(void*), PAGE_READWRITE, &previous);
  *slot = value;
  VirtualProtect(slot, sizeof(void*), previous, &previous);
}

#else

struct Search {
  const char* fileName;
  void* target;
  void** slot;
};

int searchObject(dl_phdr_info* info, size_t, void* data) {
  auto* search = static_cast<Search*>(data);
  const size_t nameLength = strlen(info->dlpi_name);
  const size_t wanted = strlen(search->fileName);
  if (nameLength < wanted || strcmp(info->dlpi_name + nameLength - wanted, search->fileName) != 0)
    return 0;
  for (int i = 0; i < info->dlpi_phnum && search->slot == nullptr; ++i) {
    const ElfW(Phdr)& segment = info->dlpi_phdr[i];
    if (segment.p_type != PT_LOAD || (segment.p_flags & PF_W) == 0) continue;
    const uintptr_t start = info->dlpi_addr + segment.p_vaddr;
    search->slot = findSlot(start, start + segment.p_memsz, search->target);
  }
  return 1;
}

void** findImport(const char* moduleFileName, void* target) {
  Search search{moduleFileName, target, nullptr};
  dl_iterate_phdr(searchObject, &search);
  return search.slot;
}

void writeSlot(void** slot, void* value) {
  const auto page = static_cast<uintptr_t>(sysconf(_SC_PAGESIZE));
  const uintptr_t start = reinterpret_cast<uintptr_t>(slot) & ~(page - 1);
  mprotect(reinterpret_cast<void*>(start), page, PROT_READ | PROT_WRITE);
  *slot = value;
}

#endif

}  // namespace

ModuleMallocHook::ModuleMallocHook(const char* moduleFileName) {
  m_mallocSlot = findImport(moduleFileName, importedAddress(false));
  m_reallocSlot = findImport(moduleFileName, importedAddress(true));
  if (!installed()) return;
  g_realMalloc = reinterpret_cast<MallocFn>(*m_mallocSlot);
  g_realRealloc = reinterpret_cast<ReallocFn>(*m_reallocSlot);
  g_failingSize = 0;
  writeSlot(m_mallocSlot, reinterpret_cast<void*>(&hookedMalloc));
  writeSlot(m_reallocSlot, reinterpret_cast<void*>(&hookedRealloc));
}

ModuleMallocHook::~ModuleMallocHook() {
  if (installed()) {
    writeSlot(m_mallocSlot, reinterpret_cast<void*>(g_realMalloc));
    writeSlot(m_reallocSlot, reinterpret_cast<void*>(g_realRealloc));
  }
  g_failingSize = 0;
}

void ModuleMallocHook::failNextRequestOf(size_t bytes) {
  g_failingSize = bytes;
}
