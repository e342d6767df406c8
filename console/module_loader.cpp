#include "module_loader.h"

#include <string.h>

#if defined(_WIN32)
#include <windows.h>
#else
#include <dlfcn.h>
#include <unistd.h>
#endif

#if defined(_WIN32)

ModuleLibrary* ModuleLibrary::open(const char* path, HString& error) {
  // A full path stops the system's search; the module's own imports are
  // then looked for beside it first.
  char full[MAX_PATH];
  const DWORD length = GetFullPathNameA(path, MAX_PATH, full, nullptr);
  HMODULE handle = length > 0 && length < MAX_PATH
                       ? LoadLibraryExA(full, nullptr, LOAD_WITH_ALTERED_SEARCH_PATH)
                       : nullptr;
  if (handle == nullptr) {
    error.Format("cannot load %s (error %lu)", path, GetLastError());
    return nullptr;
  }
  return new ModuleLibrary(handle);
}

ModuleLibrary::~ModuleLibrary() {
  FreeLibrary(static_cast<HMODULE>(m_handle));
}

void* ModuleLibrary::symbol(const char* name) const {
  return reinterpret_cast<void*>(GetProcAddress(static_cast<HMODULE>(m_handle), name));
}

HString executableDirectory() {
  char path[MAX_PATH];
  const DWORD length = GetModuleFileNameA(nullptr, path, MAX_PATH);
  if (length == 0 || length >= MAX_PATH) return HString();
  path[length] = '\0';
  char* slash = strrchr(path, '\\');
  if (slash == nullptr) return HString();
  slash[1] = '\0';
  return HString(path);
}

#else

ModuleLibrary* ModuleLibrary::open(const char* path, HString& error) {
  // dlopen searches the library path for a name without a slash; "./" keeps
  // a bare name in the current folder.
  HString file;
  file.Format(strchr(path, '/') == nullptr ? "./%s" : "%s", path);
  void* handle = dlopen(file.GetStr(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) {
    const char* reason = dlerror();
    error.Format("cannot load %s: %s", path, reason != nullptr ? reason : "unknown error");
    return nullptr;
  }
  return new ModuleLibrary(handle);
}

ModuleLibrary::~ModuleLibrary() {
  dlclose(m_handle);
}

void* ModuleLibrary::symbol(const char* name) const {
  return dlsym(m_handle, name);
}

HString executableDirectory() {
  char path[4096];
  const ssize_t length = readlink("/proc/self/exe", path, sizeof(path) - 1);
  if (length <= 0) return HString();
  path[length] = '\0';
  char* slash = strrchr(path, '/');
  if (slash == nullptr) return HString();
  slash[1] = '\0';
  return HString(path);
}

#endif
