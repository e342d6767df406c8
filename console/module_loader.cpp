#include "module_loader.h"

#include <string.h>

#include "system_files.h"

#if defined(_WIN32)
#include <windows.h>
#else
#include <dlfcn.h>
#endif

namespace {

void* loadLibrary(const char* path, HString& error) {
#if defined(_WIN32)
  // A full path stops the system's search; the module's own imports are
  // then looked for beside it first.
  const OwnedWide full(systemPath(path));
  HMODULE handle =
      full ? LoadLibraryExW(full.get(), nullptr, LOAD_WITH_ALTERED_SEARCH_PATH) : nullptr;
  if (handle == nullptr) {
    const DWORD code = full ? GetLastError() : ERROR_INVALID_NAME;
    HString reason = systemMessage(code);
    reason.Replace("%1", path);  // the system's messages name the file so
    error.Format("cannot load %s: %s (error %lu)", path, reason.GetStr(), code);
  }
  return handle;
#else
  // dlopen searches the library path for a name without a slash; "./" keeps
  // a bare name in the current folder.
  HString file;
  file.Format(strchr(path, '/') == nullptr ? "./%s" : "%s", path);
  void* handle = dlopen(file.GetStr(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) {
    const char* reason = dlerror();
    error.Format("cannot load %s: %s", path, reason != nullptr ? reason : "unknown error");
  }
  return handle;
#endif
}

}  // namespace

Owned<ModuleLibrary> ModuleLibrary::open(const char* path, HString& error) {
  // Loading a pipe or a device would wait for it, or read what it is not.
  if (const char* problem = notRegularFile(path)) {
    error.Format("cannot load %s: %s", path, problem);
    return Owned<ModuleLibrary>();
  }
  Owned<ModuleLibrary> library(new ModuleLibrary(nullptr));
  library->m_handle = loadLibrary(path, error);
  if (library->m_handle == nullptr) library.reset();
  return library;
}

ModuleLibrary::~ModuleLibrary() {
  if (m_handle == nullptr) return;
#if defined(_WIN32)
  FreeLibrary(static_cast<HMODULE>(m_handle));
#else
  dlclose(m_handle);
#endif
}

void* ModuleLibrary::symbol(const char* name) const {
#if defined(_WIN32)
  return reinterpret_cast<void*>(GetProcAddress(static_cast<HMODULE>(m_handle), name));
#else
  return dlsym(m_handle, name);
#endif
}
