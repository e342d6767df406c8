// Loads a dynamic library and finds its exports by name: dlopen/dlsym here,
// LoadLibrary/GetProcAddress on Windows.
#pragma once

#include <memory>
#include <string>

class ModuleLibrary {
 public:
  // The loaded library, or null with a one-line reason in error.
  static std::unique_ptr<ModuleLibrary> open(const std::string& path, std::string& error);
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
std::string executableDirectory();
