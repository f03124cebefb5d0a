// The device context's one font: DejaVu Sans at about 12 pixels, rasterised once per
// character and kept. Without the font file every character is a small box.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

struct Glyph {
    float advance = 0;  // pixels from this character's pen position to the next one's
    int xoff = 0;       // bitmap's left edge from the pen position
    int yoff = 0;       // bitmap's top edge from the baseline (negative: above it)
    int width = 0;
    int height = 0;
    std::vector<std::uint8_t> alpha;  // coverage 0..255, top row first
};

// Pixels from a line's top to its baseline, and from top to the next line's top.
int FontAscent();
int FontLineHeight();
// The glyph of a Unicode character (the font's own missing-character glyph when it has none).
const Glyph& FontGlyph(char32_t codepoint);
// Pair spacing added after first when second follows it.
float FontKerning(char32_t first, char32_t second);
// False when the font file could not be read and the built-in box stands in for everything.
bool FontLoaded();

}  // namespace platform
