// The DC8 picture file: a device-independent bitmap file, read into a bitmap section.
#include <algorithm>
#include <cstring>

#include "gfx/image.h"
#include "platform/dialog.h"
#include "platform/files.h"
#include "platform/memory.h"
#include "platform/shell.h"

namespace {

constexpr DWORD kInfoBlockBytes = 40 + 256 * 4;
constexpr WORD kBitmapType = 0x4D42;  // "BM"
// No picture of a 240-pixel handheld comes near these; they keep a hostile header from
// making the loader ask for gigabytes.
constexpr LONG kMaxSide = 16384;
constexpr long long kMaxSectionBytes = 64LL * 1024 * 1024;

const WCHAR* const kCaptions[] = {
    u"",
    u"Can't load this image1!",
    u"Can't load this image2!",
    u"Can't load this image3!",
    u"Can't load this image4!",
    u"Can't load this image5!",
    u"Can't load this image6!",
    u"Can't load this image7!",
    u"Can't load this image8!",
    u"Can't load this image9!",
    u"Can't load this image10!",
};

// Bytes the bitmap section of this header holds, or -1 when no section can be made for it.
long long SectionBytes(const BITMAPINFOHEADER& h) {
    if (h.biWidth <= 0 || h.biHeight <= 0 || h.biWidth > kMaxSide || h.biHeight > kMaxSide ||
        h.biBitCount == 0 || h.biBitCount > 32) {
        return -1;
    }
    long long bytes = (static_cast<long long>(h.biWidth) * h.biBitCount + 31) / 32 * 4 * h.biHeight;
    return bytes > kMaxSectionBytes ? -1 : bytes;
}

// A picture the game cannot do without is unreadable: tell the user which, then end. The
// exit code says it failed.
[[noreturn]] void FailLoad(HANDLE file, BYTE* pixels, LPCWSTR path, int message) {
    if (pixels != nullptr) {
        VirtualFree(pixels, 0, MEM_RELEASE);
    }
    if (file != INVALID_HANDLE_VALUE) {
        CloseHandle(file);
    }
    MessageBoxW(nullptr, path, kCaptions[message], MB_OK);
    ExitProcess(1);
}

}  // namespace

UINT PaletteSize(WORD bitsPerPixel) {
    switch (bitsPerPixel) {
        case 1:
            return 2;
        case 2:
            return 4;
        case 4:
            return 16;
        case 8:
            return 256;
        default:
            return 0;
    }
}

int Image::LoadDC8(LPCWSTR path) {
    HANDLE file = CreateFileW(path, GENERIC_READ, FILE_SHARE_READ, nullptr, OPEN_EXISTING,
                              FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE) {
        FailLoad(file, nullptr, path, 1);
    }
    BITMAPFILEHEADER fileHeader{};
    DWORD got = 0;
    if (!ReadFile(file, &fileHeader, sizeof fileHeader, &got, nullptr)) {
        FailLoad(file, nullptr, path, 2);
    }
    if (fileHeader.bfType != kBitmapType) {
        FailLoad(file, nullptr, path, 3);
    }
    alignas(BITMAPINFOHEADER) BYTE block[kInfoBlockBytes] = {};
    auto* header = reinterpret_cast<BITMAPINFOHEADER*>(block);
    if (!ReadFile(file, header, sizeof *header, &got, nullptr)) {
        FailLoad(file, nullptr, path, 4);
    }
    if (got < sizeof *header) {
        FailLoad(file, nullptr, path, 5);
    }
    if (header->biSize != sizeof *header) {
        FailLoad(file, nullptr, path, 6);
    }
    // The palette follows the header whatever the pixel offset says; its length comes from
    // the depth alone.
    DWORD paletteBytes = PaletteSize(header->biBitCount) * 4;
    if (paletteBytes > 0) {
        if (!ReadFile(file, block + sizeof *header, paletteBytes, &got, nullptr)) {
            FailLoad(file, nullptr, path, 7);
        }
        if (got < paletteBytes) {
            FailLoad(file, nullptr, path, 8);
        }
    }
    DWORD count = fileHeader.bfSize - fileHeader.bfOffBits;

    // The header is not trusted: the pixel data it claims must be in the file and must fill
    // the rows of the section, and no more than the section holds is ever copied.
    DWORD fileSize = GetFileSize(file, nullptr);
    if (fileHeader.bfOffBits > fileSize || count > fileSize - fileHeader.bfOffBits) {
        FailLoad(file, nullptr, path, 9);
    }
    long long sectionBytes = SectionBytes(*header);
    if (sectionBytes < 0) {
        FailLoad(file, nullptr, path, 10);
    }
    if (count < sectionBytes) {
        FailLoad(file, nullptr, path, 9);
    }
    count = static_cast<DWORD>(sectionBytes);

    auto* pixels = static_cast<BYTE*>(VirtualAlloc(nullptr, count, MEM_COMMIT, PAGE_READWRITE));
    if (pixels == nullptr) {
        CloseHandle(file);
        MessageBoxW(nullptr, u"OUT OF MEMORY FOR DIB BITS", u"ERROR", MB_OK);
        return 0;
    }
    SetFilePointer(file, static_cast<LONG>(fileHeader.bfOffBits), nullptr, FILE_BEGIN);
    if (!ReadFile(file, pixels, count, &got, nullptr) || got < count) {
        FailLoad(file, pixels, path, 9);
    }
    header->biSizeImage = count;
    if (!CreateSection(header, pixels)) {
        FailLoad(file, pixels, path, 10);
    }
    VirtualFree(pixels, 0, MEM_RELEASE);
    CloseHandle(file);
    return 1;
}

int Image::CreateSection(const BITMAPINFOHEADER* header, const BYTE* pixels) {
    if (header == nullptr || pixels == nullptr) {
        return 0;
    }
    colourCount = PaletteSize(header->biBitCount);
    info = static_cast<BITMAPINFO*>(
        VirtualAlloc(nullptr, kInfoBlockBytes, MEM_COMMIT, PAGE_READWRITE));
    if (info == nullptr) {
        return 0;
    }
    std::memcpy(info, header, (colourCount + 10) * 4);
    HDC screen = GetDC(nullptr);
    if (screen == nullptr) {
        return 0;
    }
    void* sectionBits = nullptr;
    bitmap = CreateDIBSection(screen, info, colourUse, &sectionBits, nullptr, 0);
    ReleaseDC(nullptr, screen);
    if (bitmap == nullptr) {
        return 0;
    }
    bits = static_cast<BYTE*>(sectionBits);
    long long capacity = SectionBytes(info->bmiHeader);
    std::memcpy(bits, pixels,
                static_cast<std::size_t>(std::min<long long>(header->biSizeImage, capacity)));
    return 1;
}
