// The device's file system. Paths are absolute device paths such as "\vorndc8\score.uc2";
// names are matched without regard to case, as on the handheld.
#pragma once

#include "platform/types.h"

constexpr DWORD GENERIC_READ = 0x80000000u;
constexpr DWORD GENERIC_WRITE = 0x40000000u;
constexpr DWORD FILE_SHARE_READ = 0x00000001;
constexpr DWORD OPEN_EXISTING = 3;
constexpr DWORD FILE_ATTRIBUTE_NORMAL = 0x00000080;
constexpr DWORD FILE_BEGIN = 0;
constexpr DWORD FILE_CURRENT = 1;
constexpr DWORD FILE_END = 2;
constexpr DWORD INVALID_SET_FILE_POINTER = 0xFFFFFFFFu;

// Opens a file; INVALID_HANDLE_VALUE when it does not exist or cannot be opened as asked.
HANDLE CreateFileW(LPCWSTR path, DWORD access, DWORD shareMode, LPVOID security, DWORD creation,
                   DWORD flags, HANDLE templateFile);
// Reads up to toRead bytes; *read says how many came. FALSE only on a failing handle:
// the end of the file is a successful short read.
BOOL ReadFile(HANDLE file, LPVOID buffer, DWORD toRead, DWORD* read, LPVOID overlapped);
// Moves the file position; returns the new position or INVALID_SET_FILE_POINTER.
DWORD SetFilePointer(HANDLE file, LONG distance, LONG* distanceHigh, DWORD method);
// The file's size in bytes, or 0xFFFFFFFF on a failing handle.
DWORD GetFileSize(HANDLE file, DWORD* sizeHigh);
BOOL CloseHandle(HANDLE object);
