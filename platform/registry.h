// The registry, where the installer records the install directory. Off the handheld it is a
// small text file, "registry.txt", at the root of the device folder.
#pragma once

#include "platform/types.h"

inline HKEY const HKEY_LOCAL_MACHINE =
    reinterpret_cast<HKEY>(static_cast<std::uintptr_t>(0x80000002u));
constexpr DWORD KEY_ALL_ACCESS = 0xF003F;
constexpr DWORD KEY_READ = 0x20019;
constexpr LONG ERROR_SUCCESS = 0;
constexpr LONG ERROR_FILE_NOT_FOUND = 2;
constexpr LONG ERROR_MORE_DATA = 234;
constexpr DWORD REG_SZ = 1;

// Opens a key below root; ERROR_SUCCESS and *result, or an error when the key is missing.
LONG RegOpenKeyExW(HKEY root, LPCWSTR subKey, DWORD options, DWORD access, HKEY* result);
// Copies a value into data (with its terminator); ERROR_MORE_DATA when *dataSize is too small,
// ERROR_FILE_NOT_FOUND when the value is missing. *dataSize is in bytes.
LONG RegQueryValueExW(HKEY key, LPCWSTR valueName, DWORD* reserved, DWORD* type, BYTE* data,
                      DWORD* dataSize);
LONG RegCloseKey(HKEY key);
