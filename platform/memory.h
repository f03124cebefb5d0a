// Page allocations: the picture loader's pixel buffers and info blocks.
#pragma once

#include "platform/types.h"

constexpr DWORD MEM_COMMIT = 0x1000;
constexpr DWORD MEM_RESERVE = 0x2000;
constexpr DWORD MEM_RELEASE = 0x8000;
constexpr DWORD PAGE_READWRITE = 0x04;

// Zero-filled memory of size bytes, or null when it cannot be had.
LPVOID VirtualAlloc(LPVOID address, std::size_t size, DWORD allocationType, DWORD protect);
// Releases a block from VirtualAlloc (size 0 with MEM_RELEASE).
BOOL VirtualFree(LPVOID address, std::size_t size, DWORD freeType);
