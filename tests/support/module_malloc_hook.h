// Redirects the malloc and realloc that a loaded module imports, so that a
// test can make the module's own heap requests fail, as a host under memory
// pressure would see them. Other code keeps the real functions.
#pragma once

#include <stddef.h>

class ModuleMallocHook {
 public:
  // Patches the module loaded from a file with this name (without folder).
  explicit ModuleMallocHook(const char* moduleFileName);
  ~ModuleMallocHook();
  ModuleMallocHook(const ModuleMallocHook&) = delete;
  ModuleMallocHook& operator=(const ModuleMallocHook&) = delete;

  // Whether the module's malloc and realloc imports were found and redirected.
  bool installed() const { return m_mallocSlot != nullptr && m_reallocSlot != nullptr; }
  // The module's next malloc or realloc of exactly this many bytes returns
  // null; other requests, and later ones, succeed. (Where the module's
  // operator new calls malloc through the same import, its requests pass here too.)
  void failNextRequestOf(size_t bytes);

 private:
  void** m_mallocSlot = nullptr;
  void** m_reallocSlot = nullptr;
};
