// Readers for the files of a generated pack, written apart from the generator so that a fault
// in its encoders is not mirrored here.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace packtest {

std::vector<std::uint8_t> ReadBytes(const std::string& path);

std::uint32_t U32(const std::vector<std::uint8_t>& b, std::size_t at);
std::uint16_t U16(const std::vector<std::uint8_t>& b, std::size_t at);

// An 8-bit bitmap file with its headers as stored.
struct Dc8 {
    std::string error;  // empty when the file parsed
    std::uint32_t fileSizeField = 0, pixelOffset = 0, headerSize = 0, imageSize = 0,
                  compression = 0, coloursUsed = 0;
    std::int32_t width = 0, height = 0;
    std::uint16_t planes = 0, bitsPerPixel = 0;
    std::size_t bytesOnDisk = 0;
    std::vector<std::uint8_t> palette;  // 1024 bytes, B G R 0
    std::vector<std::uint8_t> rows;     // top row first, `width` bytes per row
    std::uint8_t at(int x, int y) const { return rows[std::size_t(y) * width + x]; }
    // Luminance 0..255 of the pixel's palette colour.
    int lum(int x, int y) const;
    int red(int x, int y) const { return palette[at(x, y) * 4 + 2]; }
    int green(int x, int y) const { return palette[at(x, y) * 4 + 1]; }
    int blue(int x, int y) const { return palette[at(x, y) * 4]; }
};

Dc8 ParseDc8(const std::vector<std::uint8_t>& bytes);

// A PCM wave file.
struct Wav {
    std::string error;
    int format = 0, channels = 0, rate = 0, bits = 0;
    std::vector<std::int16_t> samples;
    double seconds() const { return rate ? double(samples.size()) / rate : 0.0; }
};

Wav ParseWav(const std::vector<std::uint8_t>& bytes);

// The folder a pack was generated into for this test process.
const std::string& PackDir();
std::string ImagePath(const std::string& file);
std::string SoundPath(const std::string& file);

}  // namespace packtest
