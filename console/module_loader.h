// Loads a dynamic library and finds its exports by name: dlopen/dlsym here,
// LoadLibrary/GetProcAddress on Windows.
#pragma once

#include "hstring.h"

class ModuleLibrary {
 public:
  // The library at path, a file path: a bare name is a file in the current
  // folder, never one found on the system's library search path. Null with a
  // one-line reason in error when it cannot be loaded. The caller deletes it.
  static ModuleLibrary* open(const char* path, HString& error);
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

// The folder of the running executable, with a trailing separator.
HString executableDirectory();
