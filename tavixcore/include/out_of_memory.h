// Running out of memory in the framework, and in code built on it, raises the
// standard allocation exception; this is its one name for throwing and catching.
#pragma once

#include <new>

using OutOfMemory = std::bad_alloc;
