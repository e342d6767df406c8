// The console's way to the file system: names are UTF-8 text on every
// system, as the console takes them from its command line and shows them in
// its messages; on Windows they reach the system as UTF-16, long ones with
// the "\\?\" prefix that lifts the 260-character limit.
#pragma once

#include <stdio.h>

#include "hstring.h"

// The file at path, opened for reading bytes; null with errno set when it
// cannot be opened.
FILE* openForReading(const char* path);

// Why path names no regular file: the system's reason when it names nothing
// that can be looked at, "not a regular file" for a folder, a device, a
// pipe...; null when it names a regular file.
const char* notRegularFile(const char* path);

// The folder of the running executable, with a trailing separator.
HString executableDirectory();

#if defined(_WIN32)
#include <wchar.h>

#include "owned.h"

using OwnedWide = Owned<wchar_t, &deleteArray<wchar_t>>;

// path in UTF-16 as the system's wide functions take it: absolute, and with
// the long-path prefix when it is long. Null when path is no valid UTF-8; the
// caller owns it (an OwnedWide).
wchar_t* systemPath(const char* path);
// UTF-16 text as UTF-8.
HString utf8FromWide(const wchar_t* text);
// The system's message for an error code, as UTF-8 without its line end.
HString systemMessage(unsigned long code);
#endif
