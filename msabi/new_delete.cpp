// operator new and delete in all their forms, on the UCRT's heap: the
// Microsoft C++ runtime's static part, which provides them, is not here.
#include <malloc.h>
#include <stdlib.h>

#include <new>

const std::nothrow_t std::nothrow{};

namespace {

void* allocate(size_t size) {
  void* block = malloc(size == 0 ? 1 : size);
  if (block == nullptr) throw std::bad_alloc();
  return block;
}

void* allocateAligned(size_t size, std::align_val_t alignment) {
  void* block = _aligned_malloc(size == 0 ? 1 : size, static_cast<size_t>(alignment));
  if (block == nullptr) throw std::bad_alloc();
  return block;
}

}  // namespace

void* operator new(size_t size) {
  return allocate(size);
}
void* operator new[](size_t size) {
  return allocate(size);
}
void* operator new(size_t size, const std::nothrow_t&) noexcept {
  return malloc(size == 0 ? 1 : size);
}
void* operator new[](size_t size, const std::nothrow_t&) noexcept {
  return malloc(size == 0 ? 1 : size);
}
void* operator new(size_t size, std::align_val_t alignment) {
  return allocateAligned(size, alignment);
}
void* operator new[](size_t size, std::align_val_t alignment) {
  return allocateAligned(size, alignment);
}

void operator delete(void* block) noexcept {
  free(block);
}
void operator delete[](void* block) noexcept {
  free(block);
}
void operator delete(void* block, size_t) noexcept {
  free(block);
}
void operator delete[](void* block, size_t) noexcept {
  free(block);
}
void operator delete(void* block, const std::nothrow_t&) noexcept {
  free(block);
}
void operator delete[](void* block, const std::nothrow_t&) noexcept {
  free(block);
}
void operator delete(void* block, std::align_val_t) noexcept {
  _aligned_free(block);
}
void operator delete[](void* block, std::align_val_t) noexcept {
  _aligned_free(block);
}
void operator delete(void* block, size_t, std::align_val_t) noexcept {
  _aligned_free(block);
}
void operator delete[](void* block, size_t, std::align_val_t) noexcept {
  _aligned_free(block);
}
