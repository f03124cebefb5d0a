// The file formats of the device folder: DC8 pictures, MC8 cues, the registry and the ranking.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "tools/packgen/canvas.h"

namespace packgen {

// A Windows bitmap file, 8 bits per pixel, the shared palette, rows bottom-up.
std::vector<std::uint8_t> EncodeDc8(const Canvas& c);
// A RIFF/WAVE file, 16-bit PCM mono.
std::vector<std::uint8_t> EncodeWav(const std::vector<std::int16_t>& samples, int rate);
// The registry text that points the game at its install folder.
std::string RegistryText();
// A ranking file: a header unit and ten records of name, spare unit, score, spare unit.
struct RankEntry {
    std::u16string name;   // up to 10 units, padded with underscores
    std::u16string score;  // up to 8 units, right-aligned with zeros
};
std::vector<std::uint8_t> EncodeRanking(const std::vector<RankEntry>& entries);

bool WriteFile(const std::string& path, const std::vector<std::uint8_t>& bytes);
bool WriteFile(const std::string& path, const std::string& text);

}  // namespace packgen
