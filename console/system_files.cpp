#include "system_files.h"

#include <errno.h>
#include <string.h>
#include <sys/stat.h>

#include "owned.h"

#if defined(_WIN32)
#include <windows.h>

namespace {

// text (UTF-8) in UTF-16, or null when it is no valid UTF-8.
wchar_t* wideFromUtf8(const char* text) {
  const int length = MultiByteToWideChar(CP_UTF8, MB_ERR_INVALID_CHARS, text, -1, nullptr, 0);
  if (length <= 0) return nullptr;
  wchar_t* wide = new wchar_t[static_cast<size_t>(length)];
  MultiByteToWideChar(CP_UTF8, MB_ERR_INVALID_CHARS, text, -1, wide, length);
  return wide;
}

}  // namespace

wchar_t* systemPath(const char* path) {
  const OwnedWide wide(wideFromUtf8(path));
  if (!wide) return nullptr;
  const DWORD needed = GetFullPathNameW(wide.get(), 0, nullptr, nullptr);
  if (needed == 0) return nullptr;
  OwnedWide full(new wchar_t[needed]);
  if (GetFullPathNameW(wide.get(), needed, full.get(), nullptr) == 0) return nullptr;
  const wchar_t* name = full.get();
  if (needed < MAX_PATH - 12 || wcsncmp(name, L"\\\\?\\", 4) == 0) return full.release();
  // A path the system's 260-character limit would refuse gets the prefix that
  // lifts it; a network path "\\server\share" becomes "\\?\UNC\server\share".
  const bool network = wcsncmp(name, L"\\\\", 2) == 0;
  const wchar_t* prefix = network ? L"\\\\?\\UNC" : L"\\\\?\\";
  const wchar_t* rest = network ? name + 1 : name;
  wchar_t* prefixed = new wchar_t[wcslen(prefix) + wcslen(rest) + 1];
  wcscpy(prefixed, prefix);
  wcscat(prefixed, rest);
  return prefixed;
}

HString utf8FromWide(const wchar_t* text) {
  const int length = WideCharToMultiByte(CP_UTF8, 0, text, -1, nullptr, 0, nullptr, nullptr);
  if (length <= 0) return HString();
  char* utf8 = new char[static_cast<size_t>(length)];
  WideCharToMultiByte(CP_UTF8, 0, text, -1, utf8, length, nullptr, nullptr);
  const HString result(utf8);
  delete[] utf8;
  return result;
}

HString systemMessage(unsigned long code) {
  wchar_t* text = nullptr;
  const DWORD flags =
      FORMAT_MESSAGE_ALLOCATE_BUFFER | FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS;
  if (FormatMessageW(flags, nullptr, code, 0, reinterpret_cast<wchar_t*>(&text), 0, nullptr) == 0)
    return HString("unknown error");
  size_t end = wcslen(text);
  while (end > 0 && (text[end - 1] == L'\r' || text[end - 1] == L'\n' || text[end - 1] == L' '))
    --end;
  text[end] = L'\0';
  const HString message = utf8FromWide(text);
  LocalFree(text);
  return message;
}

FILE* openForReading(const char* path) {
  const OwnedWide wide(systemPath(path));
  if (!wide) {
    errno = EINVAL;
    return nullptr;
  }
  return _wfopen(wide.get(), L"rb");
}

const char* notRegularFile(const char* path) {
  const OwnedWide wide(systemPath(path));
  struct _stat64 status;
  if (!wide) return strerror(EINVAL);
  if (_wstat64(wide.get(), &status) != 0) return strerror(errno);
  return (status.st_mode & _S_IFMT) == _S_IFREG ? nullptr : "not a regular file";
}

HString executableDirectory() {
  const DWORD capacity = 32768;  // the longest path the system has
  const OwnedWide path(new wchar_t[capacity]);
  const DWORD length = GetModuleFileNameW(nullptr, path.get(), capacity);
  if (length == 0 || length >= capacity) return HString();
  wchar_t* slash = wcsrchr(path.get(), L'\\');
  if (slash == nullptr) return HString();
  slash[1] = L'\0';
  return utf8FromWide(path.get());
}

#else
#include <unistd.h>

FILE* openForReading(const char* path) {
  return fopen(path, "rb");
}

const char* notRegularFile(const char* path) {
  struct stat status;
  if (stat(path, &status) != 0) return strerror(errno);
  return S_ISREG(status.st_mode) ? nullptr : "not a regular file";
}

HString executableDirectory() {
  char path[4096];
  const ssize_t length = readlink("/proc/self/exe", path, sizeof(path) - 1);
  if (length <= 0) return HString();
  path[length] = '\0';
  char* slash = strrchr(path, '/');
  if (slash == nullptr) return HString();
  slash[1] = '\0';
  return HString(path);
}

#endif
