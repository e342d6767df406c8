// Loads a dynamic library and finds its exports by name: dlopen/dlsym here,
// LoadLibrary/GetProcAddress on Windows.
#pragma once

#include "hstring.h"
#include "owned.h"

class ModuleLibrary {
 public:
  // The library at path, a file path in UTF-8: a bare name is a file in the
  // current folder, never one found on the system's library search path, and
  // anything but a regular file is refused before it is opened ("not a
  // regular file"). Empty, with a one-line reason in error, when it cannot be loaded.
  static Owned<ModuleLibrary> open(const char* path, HString& error);
  ~ModuleLibrary();
  ModuleLibrary(const ModuleLibrary&) = delete;
  ModuleLibrary& operator=(const ModuleLibrary&) = delete;

  // The exported function of that name, or null.
  template <class Function>
  Function function(const char* name) const {
    return reinterpret_cast<Function>(symbol(name));
  }

 private:
  explicit ModuleLibrary(void* handle) : m_handle(handle) {}
  void* symbol(const char* name) const;

  void* m_handle;
};
