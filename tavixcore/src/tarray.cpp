#include "tarray.h"

#include "out_of_memory.h"

void tarrayCapacityExhausted() {
  throw OutOfMemory();
}
