#include "module_malloc_hook.h"

#include <cstdint>
#include <cstdlib>
#include <cstring>

#if defined(_WIN32)
#include <windows.h>
#else
#include <elf.h>
#include <link.h>
#include <sys/mman.h>
#include <unistd.h>
#endif

namespace {

using MallocFn = void* (*)(size_t);

MallocFn g_realMalloc = nullptr;
bool g_failNext = false;

void* hookedMalloc(size_t bytes) {
  if (g_failNext) {
    g_failNext = false;
    return nullptr;
  }
  return g_realMalloc(bytes);
}

#if defined(_WIN32)

// The import address table entry for malloc in the module's import directory.
void** findMallocImport(const char* moduleFileName) {
  auto* base = reinterpret_cast<unsigned char*>(GetModuleHandleA(moduleFileName));
  if (base == nullptr) return nullptr;
  const auto* dos = reinterpret_cast<const IMAGE_DOS_HEADER*>(base);
  const auto* nt = reinterpret_cast<const IMAGE_NT_HEADERS*>(base + dos->e_lfanew);
  const IMAGE_DATA_DIRECTORY& imports =
      nt->OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_IMPORT];
  if (imports.VirtualAddress == 0) return nullptr;
  for (auto* library = reinterpret_cast<IMAGE_IMPORT_DESCRIPTOR*>(base + imports.VirtualAddress);
       library->Name != 0; ++library) {
    auto* names = reinterpret_cast<IMAGE_THUNK_DATA*>(base + library->OriginalFirstThunk);
    auto* addresses = reinterpret_cast<IMAGE_THUNK_DATA*>(base + library->FirstThunk);
    for (; names->u1.AddressOfData != 0; ++names, ++addresses) {
      if (IMAGE_SNAP_BY_ORDINAL(names->u1.Ordinal)) continue;
      const auto* byName =
          reinterpret_cast<const IMAGE_IMPORT_BY_NAME*>(base + names->u1.AddressOfData);
      if (std::strcmp(reinterpret_cast<const char*>(byName->Name), "malloc") == 0) {
        return reinterpret_cast<void**>(&addresses->u1.Function);
      }
    }
  }
  return nullptr;
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

// The GOT entry through which the module calls malloc.
int findInObject(dl_phdr_info* info, size_t, void* data) {
  auto* search = static_cast<Search*>(data);
  const char* name = info->dlpi_name;
  const size_t nameLength = std::strlen(name);
  const size_t wanted = std::strlen(search->fileName);
  if (nameLength < wanted || std::strcmp(name + nameLength - wanted, search->fileName) != 0) {
    return 0;
  }
  const ElfW(Dyn)* dynamic = nullptr;
  for (int i = 0; i < info->dlpi_phnum; ++i) {
    if (info->dlpi_phdr[i].p_type == PT_DYNAMIC) {
      dynamic = reinterpret_cast<const ElfW(Dyn)*>(info->dlpi_addr + info->dlpi_phdr[i].p_vaddr);
    }
  }
  if (dynamic == nullptr) return 0;
  // The loader relocates these addresses in place; an unrelocated one is an offset.
  auto address = [&](ElfW(Addr) value) {
    return value < info->dlpi_addr ? value + info->dlpi_addr : value;
  };
  const ElfW(Sym)* symbols = nullptr;
  const char* strings = nullptr;
  const ElfW(Rela) * tables[2] = {nullptr, nullptr};
  size_t sizes[2] = {0, 0};
  for (const ElfW(Dyn)* d = dynamic; d->d_tag != DT_NULL; ++d) {
    switch (d->d_tag) {
      case DT_SYMTAB:
        symbols = reinterpret_cast<const ElfW(Sym)*>(address(d->d_un.d_ptr));
        break;
      case DT_STRTAB:
        strings = reinterpret_cast<const char*>(address(d->d_un.d_ptr));
        break;
      case DT_JMPREL:
        tables[0] = reinterpret_cast<const ElfW(Rela)*>(address(d->d_un.d_ptr));
        break;
      case DT_PLTRELSZ:
        sizes[0] = d->d_un.d_val;
        break;
      case DT_RELA:
        tables[1] = reinterpret_cast<const ElfW(Rela)*>(address(d->d_un.d_ptr));
        break;
      case DT_RELASZ:
        sizes[1] = d->d_un.d_val;
        break;
      default:
        break;
    }
  }
  if (symbols == nullptr || strings == nullptr) return 0;
  for (int t = 0; t < 2; ++t) {
    for (size_t i = 0; tables[t] != nullptr && i < sizes[t] / sizeof(ElfW(Rela)); ++i) {
      const ElfW(Rela)& r = tables[t][i];
      const auto type = ELF64_R_TYPE(r.r_info);
      if (type != R_X86_64_JUMP_SLOT && type != R_X86_64_GLOB_DAT) continue;
      if (std::strcmp(strings + symbols[ELF64_R_SYM(r.r_info)].st_name, "malloc") == 0) {
        search->slot = reinterpret_cast<void**>(info->dlpi_addr + r.r_offset);
        return 1;
      }
    }
  }
  return 0;
}

void** findMallocImport(const char* moduleFileName) {
  Search search{moduleFileName, nullptr};
  dl_iterate_phdr(findInObject, &search);
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
  g_failNext = false;
  writeSlot(m_slot, reinterpret_cast<void*>(&hookedMalloc));
}

ModuleMallocHook::~ModuleMallocHook() {
  if (m_slot != nullptr) writeSlot(m_slot, reinterpret_cast<void*>(g_realMalloc));
  g_failNext = false;
}

void ModuleMallocHook::failNextRequest() {
  g_failNext = true;
}
