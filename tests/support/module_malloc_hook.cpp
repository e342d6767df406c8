#include "module_malloc_hook.h"

#include <stdint.h>
#include <stdlib.h>
#include <string.h>

#if defined(_WIN32)
#include <windows.h>
extern "C" void* __imp_malloc;  // this program's own import slot for malloc
#else
#include <link.h>
#include <sys/mman.h>
#include <unistd.h>
#endif

namespace {

using MallocFn = void* (*)(size_t);

MallocFn g_realMalloc = nullptr;
size_t g_failingSize = 0;  // 0: none fails

void* hookedMalloc(size_t bytes) {
  if (bytes == g_failingSize) {
    g_failingSize = 0;
    return nullptr;
  }
  return g_realMalloc(bytes);
}

// The module calls malloc through one word of its image that the loader
// filled with malloc's address: its import slot. Finds it in [from, to),
// which may hold the redzones AddressSanitizer puts between globals.
__attribute__((no_sanitize_address)) void** findSlot(uintptr_t from, uintptr_t to) {
#if defined(_WIN32)
  void* const target = __imp_malloc;  // &malloc would name this program's import thunk
#else
  void* const target = reinterpret_cast<void*>(&malloc);
#endif
  for (uintptr_t at = (from + sizeof(void*) - 1) & ~(sizeof(void*) - 1); at + sizeof(void*) <= to;
       at += sizeof(void*)) {
    if (*reinterpret_cast<void**>(at) == target) return reinterpret_cast<void**>(at);
  }
  return nullptr;
}

#if defined(_WIN32)

void** findMallocImport(const char* moduleFileName) {
  const auto base = reinterpret_cast<uintptr_t>(GetModuleHandleA(moduleFileName));
  if (base == 0) return nullptr;
  const auto* dos = reinterpret_cast<const IMAGE_DOS_HEADER*>(base);
  const auto* nt = reinterpret_cast<const IMAGE_NT_HEADERS*>(base + dos->e_lfanew);
  return findSlot(base + nt->OptionalHeader.SizeOfHeaders, base + nt->OptionalHeader.SizeOfImage);
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
    search->slot = findSlot(start, start + segment.p_memsz);
  }
  return 1;
}

void** findMallocImport(const char* moduleFileName) {
  Search search{moduleFileName, nullptr};
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
  m_slot = findMallocImport(moduleFileName);
  if (m_slot == nullptr) return;
  g_realMalloc = reinterpret_cast<MallocFn>(*m_slot);
  g_failingSize = 0;
  writeSlot(m_slot, reinterpret_cast<void*>(&hookedMalloc));
}

ModuleMallocHook::~ModuleMallocHook() {
  if (m_slot != nullptr) writeSlot(m_slot, reinterpret_cast<void*>(g_realMalloc));
  g_failingSize = 0;
}

void ModuleMallocHook::failNextRequestOf(size_t bytes) {
  g_failingSize = bytes;
}
