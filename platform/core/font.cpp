#include "platform/core/font.h"

#include <stb/stb_truetype.h>

#include <cmath>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <map>

namespace platform {

namespace {

constexpr const char* kFontFile = "/usr/share/fonts/truetype/dejavu/DejaVuSans.ttf";
// Line height in pixels, about the handheld system font's: the ink of a score's eight digits
// fits the 50 pixels the ranking gives them.
constexpr float kPixelHeight = 11.5f;

// Stand-in metrics when there is no font: a hollow box for every visible character.
constexpr int kBoxAscent = 11;
constexpr int kBoxLineHeight = 14;
constexpr int kBoxWidth = 5;
constexpr int kBoxHeight = 9;
constexpr float kBoxAdvance = 7;
constexpr float kBoxSpaceAdvance = 4;

struct Font {
    bool tried = false;
    bool loaded = false;
    std::vector<unsigned char> data;
    stbtt_fontinfo info{};
    float scale = 0;
    int ascent = kBoxAscent;
    int lineHeight = kBoxLineHeight;
    std::map<char32_t, Glyph> glyphs;
};

Font g_font;

// The file can be pointed elsewhere, so that the stand-in can be seen and tested.
const char* FontFile() {
    const char* chosen = std::getenv("REDIZOR_FONT");
    return chosen != nullptr && *chosen != '\0' ? chosen : kFontFile;
}

Font& LoadedFont() {
    Font& f = g_font;
    if (f.tried) {
        return f;
    }
    f.tried = true;
    std::ifstream in(FontFile(), std::ios::binary);
    f.data.assign(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
    if (f.data.empty() || stbtt_InitFont(&f.info, f.data.data(),
                                         stbtt_GetFontOffsetForIndex(f.data.data(), 0)) == 0) {
        f.data.clear();
        return f;
    }
    f.loaded = true;
    f.scale = stbtt_ScaleForPixelHeight(&f.info, kPixelHeight);
    int ascent = 0, descent = 0, gap = 0;
    stbtt_GetFontVMetrics(&f.info, &ascent, &descent, &gap);
    f.ascent = static_cast<int>(std::lround(ascent * f.scale));
    f.lineHeight = static_cast<int>(std::lround((ascent - descent) * f.scale));
    return f;
}

Glyph BoxGlyph(char32_t codepoint) {
    Glyph g;
    if (codepoint == U' ') {
        g.advance = kBoxSpaceAdvance;
        return g;
    }
    g.advance = kBoxAdvance;
    g.xoff = 1;
    g.yoff = -kBoxHeight;
    g.width = kBoxWidth;
    g.height = kBoxHeight;
    g.alpha.assign(kBoxWidth * kBoxHeight, 0);
    for (int y = 0; y < kBoxHeight; ++y) {
        for (int x = 0; x < kBoxWidth; ++x) {
            bool edge = x == 0 || y == 0 || x == kBoxWidth - 1 || y == kBoxHeight - 1;
            g.alpha[y * kBoxWidth + x] = edge ? 255 : 0;
        }
    }
    return g;
}

Glyph Rasterise(Font& f, char32_t codepoint) {
    Glyph g;
    int cp = static_cast<int>(codepoint);
    int advance = 0, bearing = 0;
    stbtt_GetCodepointHMetrics(&f.info, cp, &advance, &bearing);
    g.advance = advance * f.scale;
    unsigned char* bitmap = stbtt_GetCodepointBitmap(&f.info, f.scale, f.scale, cp, &g.width,
                                                     &g.height, &g.xoff, &g.yoff);
    if (bitmap != nullptr) {
        g.alpha.assign(bitmap, bitmap + static_cast<std::size_t>(g.width) * g.height);
        stbtt_FreeBitmap(bitmap, nullptr);
    } else {
        g.width = g.height = 0;
    }
    return g;
}

}  // namespace

int FontAscent() {
    return LoadedFont().ascent;
}

int FontLineHeight() {
    return LoadedFont().lineHeight;
}

bool FontLoaded() {
    return LoadedFont().loaded;
}

const Glyph& FontGlyph(char32_t codepoint) {
    Font& f = LoadedFont();
    auto found = f.glyphs.find(codepoint);
    if (found != f.glyphs.end()) {
        return found->second;
    }
    Glyph g = f.loaded ? Rasterise(f, codepoint) : BoxGlyph(codepoint);
    return f.glyphs.emplace(codepoint, std::move(g)).first->second;
}

float FontKerning(char32_t first, char32_t second) {
    Font& f = LoadedFont();
    if (!f.loaded) {
        return 0;
    }
    return stbtt_GetCodepointKernAdvance(&f.info, static_cast<int>(first),
                                         static_cast<int>(second)) *
           f.scale;
}

}  // namespace platform
