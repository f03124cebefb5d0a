// Lettering with DejaVu Sans, anti-aliased onto the palette.
#pragma once

#include <string>

#include "tools/packgen/canvas.h"

namespace packgen {

struct TextStyle {
    double size = 12.0;  // pixel height of the font's em
    bool bold = false;
    Rgb colour{0, 0, 0};
    // The colour the text will sit on where the canvas holds the key: anti-aliased edge pixels
    // are mixed with it, and pixels covered less than `keyCut` stay transparent.
    Rgb overKey{255, 255, 255};
    double keyCut = 0.3;
    // An optional ring of `outlineWidth` pixels around the letters.
    int outlineWidth = 0;
    Rgb outlineColour{0, 0, 0};
    // An optional drop shadow offset by (shadow, shadow).
    int shadow = 0;
    Rgb shadowColour{0, 0, 0};
};

// Extents of the inked pixels relative to the pen start on the baseline (y up is negative).
struct InkBox {
    int x0, y0, x1, y1;  // x1, y1 exclusive
    int width() const { return x1 - x0; }
    int height() const { return y1 - y0; }
};

// Fails loudly (exits) when the font files are missing: a pack without lettering is useless.
InkBox MeasureText(const std::string& text, const TextStyle& style);
int Advance(const std::string& text, const TextStyle& style);

// Draws with the pen starting at x on baseline y.
void DrawText(Canvas& c, int x, int baseline, const std::string& text, const TextStyle& style);
// Draws so the inked pixels are centred in the rectangle.
void DrawTextIn(Canvas& c, int x, int y, int w, int h, const std::string& text,
                const TextStyle& style);
// Draws with the inked pixels' left edge at x and their vertical centre in the band [y, y + h).
void DrawTextLeft(Canvas& c, int x, int y, int h, const std::string& text, const TextStyle& style);

}  // namespace packgen
