// A scratch device folder for one test, removed when the test ends.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace test {

class TempDevice {
public:
    TempDevice();
    ~TempDevice();
    TempDevice(const TempDevice&) = delete;
    TempDevice& operator=(const TempDevice&) = delete;

    const std::string& path() const { return path_; }
    // Writes a file at a device-relative path such as "Program Files/x/image/a.dc8".
    void Write(const std::string& relative, const std::vector<std::uint8_t>& bytes) const;
    void WriteText(const std::string& relative, const std::string& text) const;
    void Remove(const std::string& relative) const;
    // The registry file naming installDir (written exactly as given) as the install directory.
    void WriteRegistry(const std::string& installDir) const;

private:
    std::string path_;
};

// The fields of a DC8 picture file, starting as a valid 8-bit picture.
struct Dc8 {
    std::int32_t width = 4;
    std::int32_t height = 3;
    std::uint16_t bitsPerPixel = 8;
    std::uint32_t headerSize = 40;
    std::uint16_t type = 0x4D42;
    int paletteEntries = -1;  // entries written; -1: as the depth demands
    long pixelOffset = -1;    // -1: right after the palette
    long fileSizeField = -1;  // -1: the real size
    std::uint32_t coloursUsed = 0;
    std::vector<std::uint8_t> pixels;  // bottom-up rows; empty: row r, column c holds r*16+c

    std::vector<std::uint8_t> Bytes() const;
};

// Palette entry i of the pictures Dc8 writes: blue i, green 255 - i, red i / 2.
std::uint32_t Dc8PaletteRgb(int index);

}  // namespace test
