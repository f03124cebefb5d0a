// Device contexts, bitmap sections, block copies and text.
// Pictures live in 8-bit bitmap sections; the window's device context is the screen the player
// sees. Everything drawn to it between GetDC and ReleaseDC is shown when the DC is released.
#pragma once

#include "platform/types.h"

struct RECT {
    LONG left;
    LONG top;
    LONG right;
    LONG bottom;
};

struct SIZE {
    LONG cx;
    LONG cy;
};

struct RGBQUAD {
    BYTE rgbBlue;
    BYTE rgbGreen;
    BYTE rgbRed;
    BYTE rgbReserved;
};

#pragma pack(push, 2)
struct BITMAPFILEHEADER {
    WORD bfType;
    DWORD bfSize;
    WORD bfReserved1;
    WORD bfReserved2;
    DWORD bfOffBits;
};
#pragma pack(pop)
static_assert(sizeof(BITMAPFILEHEADER) == 14, "file header is 14 bytes on disk");

struct BITMAPINFOHEADER {
    DWORD biSize;
    LONG biWidth;
    LONG biHeight;
    WORD biPlanes;
    WORD biBitCount;
    DWORD biCompression;
    DWORD biSizeImage;
    LONG biXPelsPerMeter;
    LONG biYPelsPerMeter;
    DWORD biClrUsed;
    DWORD biClrImportant;
};
static_assert(sizeof(BITMAPINFOHEADER) == 40, "info header is 40 bytes on disk");

struct BITMAPINFO {
    BITMAPINFOHEADER bmiHeader;
    RGBQUAD bmiColors[1];
};

constexpr UINT DIB_RGB_COLORS = 0;
constexpr DWORD SRCCOPY = 0x00CC0020;
constexpr int TRANSPARENT = 1;
constexpr int OPAQUE = 2;
constexpr UINT DT_LEFT = 0x0000;
constexpr UINT DT_TOP = 0x0000;
constexpr UINT DT_SINGLELINE = 0x0020;

// The window's device context (null window: the screen's), for drawing until ReleaseDC.
HDC GetDC(HWND window);
// Gives a device context back. Releasing the window's DC shows what was drawn to it.
int ReleaseDC(HWND window, HDC dc);
// A bitmap section of the header's size and depth with the palette that follows the header;
// *bits receives its pixel memory, bottom-up rows padded to 4 bytes. Null when it cannot be made.
HBITMAP CreateDIBSection(HDC dc, const BITMAPINFO* info, UINT usage, void** bits, HANDLE section,
                         DWORD offset);
// A memory device context into which a bitmap can be selected as the source of BitBlt.
HDC CreateCompatibleDC(HDC dc);
HGDIOBJ SelectObject(HDC dc, HGDIOBJ object);
BOOL DeleteDC(HDC dc);
// Releases a bitmap section and its pixel memory.
BOOL DeleteObject(HGDIOBJ object);
// Copies a rectangle from the bitmap selected into src to dest, translating palette indices
// to the destination's colours. Parts outside either surface are not copied.
BOOL BitBlt(HDC dest, int x, int y, int width, int height, HDC src, int srcX, int srcY, DWORD rop);
// The overlap of two rectangles; FALSE (and an empty result) when they do not overlap.
BOOL IntersectRect(RECT* result, const RECT* a, const RECT* b);

// Text keeps the device context's default font and black colour; TRANSPARENT leaves the
// background as it was.
int SetBkMode(HDC dc, int mode);
// The size of count units of text in the device context's font.
BOOL GetTextExtentExPointW(HDC dc, LPCWSTR text, int count, int maxExtent, int* fit, int* dx,
                           SIZE* size);
// Draws count units of text into rect: single line, left and top aligned, clipped to rect.
int DrawTextW(HDC dc, LPCWSTR text, int count, RECT* rect, UINT format);
