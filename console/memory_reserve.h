// A little memory held back from the start, so that running out of memory can
// still be reported: when an allocation fails, the reserve is let go and the
// allocation exception is thrown, which that memory lets the runtime raise
// even when nothing else is left. Without it, a process at the very edge of
// its memory would end in the runtime's terminate() instead of a message.
#pragma once

// Holds the reserve back; false when even the reserve cannot be had.
bool holdMemoryReserve();
