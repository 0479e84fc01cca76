#pragma once

#include <cstdint>

#include "hostlibs/DexApi.h"

// The Windows types and calls that the exchange interfaces name, declared for this platform. Handles
// are plain pointers; the calls behave as their Windows namesakes for the cases the library uses.

using BOOL = int;
using BYTE = std::uint8_t;
using WORD = std::uint16_t;
using DWORD = std::uint32_t;
using LONG = std::int32_t;
using UINT = unsigned int;
using HRESULT = std::int32_t;
using __int64 = long long;  // NOLINT(bugprone-reserved-identifier): the host's name for the type

using HANDLE = void*;
using HWND = void*;
using HINSTANCE = void*;
using HMODULE = HINSTANCE;

#define INVALID_HANDLE_VALUE (reinterpret_cast<HANDLE>(~std::uintptr_t{0}))

// Message box answers and flags.
inline constexpr int IDOK = 1;
inline constexpr int IDCANCEL = 2;
inline constexpr int IDYES = 6;
inline constexpr int IDNO = 7;
inline constexpr unsigned MB_OK = 0x0;
inline constexpr unsigned MB_YESNO = 0x4;

// Results.
inline constexpr HRESULT S_OK = 0;
inline constexpr HRESULT E_INVALIDARG = static_cast<HRESULT>(0x80070057u);
inline constexpr HRESULT CO_E_CLASSSTRING = static_cast<HRESULT>(0x800401F3u);

// Threads and waits.
inline constexpr DWORD CREATE_SUSPENDED = 0x4;
inline constexpr DWORD STACK_SIZE_PARAM_IS_A_RESERVATION = 0x10000;
inline constexpr DWORD INFINITE = 0xFFFFFFFFu;
inline constexpr DWORD WAIT_OBJECT_0 = 0x0;
inline constexpr DWORD WAIT_TIMEOUT = 0x102;
inline constexpr DWORD WAIT_FAILED = 0xFFFFFFFFu;
inline constexpr DWORD STILL_ACTIVE = 259;

// Files.
inline constexpr int MAX_PATH = 260;
inline constexpr DWORD FILE_ATTRIBUTE_READONLY = 0x1;
inline constexpr DWORD FILE_ATTRIBUTE_DIRECTORY = 0x10;
inline constexpr DWORD FILE_ATTRIBUTE_NORMAL = 0x80;

struct GUID {
  std::uint32_t Data1 = 0;
  std::uint16_t Data2 = 0;
  std::uint16_t Data3 = 0;
  std::uint8_t Data4[8] = {};
};
using CLSID = GUID;

DEX_API bool operator==(const GUID& a, const GUID& b) noexcept;
inline bool operator!=(const GUID& a, const GUID& b) noexcept {
  return !(a == b);
}
inline bool IsEqualGUID(const GUID& a, const GUID& b) noexcept {
  return a == b;
}

// 100-nanosecond intervals since 1601-01-01 UTC.
struct FILETIME {
  DWORD dwLowDateTime = 0;
  DWORD dwHighDateTime = 0;
};

struct SYSTEMTIME {
  WORD wYear = 0;
  WORD wMonth = 0;
  WORD wDayOfWeek = 0;
  WORD wDay = 0;
  WORD wHour = 0;
  WORD wMinute = 0;
  WORD wSecond = 0;
  WORD wMilliseconds = 0;
};

// One entry of a folder listing.
struct WIN32_FIND_DATAW {
  DWORD dwFileAttributes = 0;
  FILETIME ftCreationTime;
  FILETIME ftLastAccessTime;
  FILETIME ftLastWriteTime;
  DWORD nFileSizeHigh = 0;
  DWORD nFileSizeLow = 0;
  wchar_t cFileName[MAX_PATH] = {};
  wchar_t cAlternateFileName[14] = {};
};

// GUID texts. CLSIDFromString accepts exactly the braced 38-character form, hexadecimal digits in
// either case, and answers S_OK or CO_E_CLASSSTRING (the GUID is then zeroed). StringFromCLSID gives
// the braced upper-case form in a block that the caller releases with CoTaskMemFree. StringFromGUID2
// writes it into a buffer and answers the characters written with the terminator, or 0 when the buffer
// is too small.
DEX_API HRESULT CLSIDFromString(const wchar_t* text, CLSID* guid);
DEX_API HRESULT StringFromCLSID(const CLSID& guid, wchar_t** text);
DEX_API int StringFromGUID2(const GUID& guid, wchar_t* buffer, int size);
DEX_API void CoTaskMemFree(void* block);

// Thread handles (see hostlibs/VynThread.h for starting a thread). ResumeThread answers the previous
// suspend count or 0xFFFFFFFF; WaitForSingleObject answers WAIT_OBJECT_0, WAIT_TIMEOUT or WAIT_FAILED;
// GetExitCodeThread gives STILL_ACTIVE while the thread runs; CloseHandle releases the handle (a
// running thread goes on).
DEX_API DWORD ResumeThread(HANDLE thread);
DEX_API DWORD WaitForSingleObject(HANDLE handle, DWORD milliseconds);
DEX_API BOOL GetExitCodeThread(HANDLE thread, DWORD* exitCode);
DEX_API BOOL CloseHandle(HANDLE handle);
DEX_API void Sleep(DWORD milliseconds);

// Time conversions (see hostlibs/VynTime.h). Each answers nonzero on success; a time outside the
// range of the target leaves it unchanged and answers 0.
DEX_API BOOL FileTimeToSystemTime(const FILETIME* fileTime, SYSTEMTIME* systemTime);
DEX_API BOOL SystemTimeToFileTime(const SYSTEMTIME* systemTime, FILETIME* fileTime);
DEX_API BOOL FileTimeToLocalFileTime(const FILETIME* utc, FILETIME* local);
DEX_API BOOL LocalFileTimeToFileTime(const FILETIME* local, FILETIME* utc);
DEX_API BOOL SystemTimeToTzSpecificLocalTime(const void* timeZone, const SYSTEMTIME* utc, SYSTEMTIME* local);
DEX_API void GetSystemTime(SYSTEMTIME* systemTime);
DEX_API void GetLocalTime(SYSTEMTIME* systemTime);

// True when a file or folder exists at the path.
DEX_API BOOL PathFileExistsW(const wchar_t* path);
