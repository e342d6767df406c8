// A resource with one owner, released on every way out of the scope that
// owns it: an object or an array made with new, or an open FILE.
#pragma once

#include <stdio.h>

template <class T>
void deleteObject(T* object) {
  delete object;
}

template <class T>
void deleteArray(T* array) {
  delete[] array;
}

inline void closeFile(FILE* file) {
  fclose(file);
}

template <class T, void (*Release)(T*) = &deleteObject<T>>
class Owned {
 public:
  explicit Owned(T* resource = nullptr) : m_resource(resource) {}
  ~Owned() { reset(); }
  Owned(Owned&& other) noexcept : m_resource(other.m_resource) { other.m_resource = nullptr; }
  Owned& operator=(Owned&& other) noexcept {
    if (this != &other) {
      reset();
      m_resource = other.m_resource;
      other.m_resource = nullptr;
    }
    return *this;
  }
  Owned(const Owned&) = delete;
  Owned& operator=(const Owned&) = delete;

  T* get() const { return m_resource; }
  T* operator->() const { return m_resource; }
  T& operator*() const { return *m_resource; }
  explicit operator bool() const { return m_resource != nullptr; }

  // Gives up ownership: the caller releases what is returned.
  T* release() {
    T* resource = m_resource;
    m_resource = nullptr;
    return resource;
  }
  // Releases what is owned now, if anything.
  void reset() {
    if (m_resource != nullptr) Release(m_resource);
    m_resource = nullptr;
  }

 private:
  T* m_resource;
};

using OwnedFile = Owned<FILE, &closeFile>;
