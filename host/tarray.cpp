#include "tarray.h"

#include <new>

void tarrayCapacityExhausted() {
  throw std::bad_alloc();
}
