// 8-bit palettised pictures: Image, held in a bitmap section, and Sprite, an Image with a
// colour key taken from its top-left pixel and a position.
#pragma once

#include "platform/gdi.h"
#include "platform/types.h"

constexpr DWORD NO_KEY = 0xFFFFFFFFu;  // Image::Draw copies every pixel
constexpr DWORD KEY_FLAG = 0x1000000;  // ORed into a sprite's key so that key 0 is not NO_KEY

// Number of palette entries a file of this depth carries (0 for depths without a palette).
UINT PaletteSize(WORD bitsPerPixel);

class Image {
public:
    Image() = default;
    virtual ~Image();
    Image(const Image&) = delete;
    Image& operator=(const Image&) = delete;

    // Copies the width x height rectangle at (sx, sy) of this image to (dx, dy) of dest; with a
    // key other than NO_KEY, source pixels equal to its low 8 bits are skipped. The rectangle
    // is clipped to both images: nothing outside either is read or written.
    virtual void Draw(Image* dest, INT dx, INT dy, UINT width, UINT height, INT sx, INT sy,
                      DWORD key);
    virtual void GetRect(RECT* rect);

    // Reads a DC8 file. 1 on success; 0 when memory for the pixels ran out (after a message
    // box). Every other failure ends the program after a message box naming the file.
    int LoadDC8(LPCWSTR path);
    // Makes the bitmap section from an info header (palette behind it) and its pixel bytes.
    int CreateSection(const BITMAPINFOHEADER* header, const BYTE* pixels);
    // Address of pixel (px, py), or null past the right or bottom edge.
    BYTE* PixelAddress(INT px, INT py);

    INT Width() const { return info != nullptr ? info->bmiHeader.biWidth : 0; }
    INT Height() const { return info != nullptr ? info->bmiHeader.biHeight : 0; }
    INT Stride() const { return (Width() + 3) & ~3; }

    HBITMAP bitmap = nullptr;
    BYTE* bits = nullptr;
    DWORD colourUse = DIB_RGB_COLORS;
    DWORD colourCount = 0;
    BITMAPINFO* info = nullptr;  // 40-byte header and room for 256 palette entries
};

class Sprite : public Image {
public:
    Sprite() = default;
    ~Sprite() override = default;

    void GetRect(RECT* rect) override;
    virtual INT GetX();
    virtual INT GetY();
    virtual INT GetExtra();
    // Draws the whole sprite at its position into dest, limited to clip when clip is not null.
    virtual void DrawClipped(Image* dest, const RECT* clip);
    virtual int Load(LPCWSTR path);
    // 1 when (px, py) lies strictly inside the sprite's rectangle on a pixel that is not the key.
    virtual int HitTest(INT px, INT py);
    virtual void SetPosition(INT newX, INT newY);
    virtual void TakeKeyFromCorner();
    void SetKeyed(INT flag) { keyed = flag; }

    BYTE key = 0;
    INT x = 0;
    INT y = 0;
    INT extra = 0;
    INT keyed = 1;
};

// Copies image to the device context: a plain copy when height is 293, otherwise the
// interleaved reveal of strips of that height. 0 when the image has no bitmap.
int PresentImage(Image* image, HDC hdc, INT x, INT y, INT width, INT height);
