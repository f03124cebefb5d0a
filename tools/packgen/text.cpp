#include "tools/packgen/text.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <vector>

#define STB_TRUETYPE_IMPLEMENTATION
#include <stb/stb_truetype.h>

namespace packgen {

namespace {

struct Font {
    std::vector<unsigned char> data;
    stbtt_fontinfo info{};
};

const Font& GetFont(bool bold) {
    static Font fonts[2];
    static bool loaded[2] = {false, false};
    int i = bold ? 1 : 0;
    if (!loaded[i]) {
        const char* path = bold ? "/usr/share/fonts/truetype/dejavu/DejaVuSans-Bold.ttf"
                                : "/usr/share/fonts/truetype/dejavu/DejaVuSans.ttf";
        std::ifstream in(path, std::ios::binary);
        fonts[i].data.assign(std::istreambuf_iterator<char>(in), {});
        if (fonts[i].data.empty() || !stbtt_InitFont(&fonts[i].info, fonts[i].data.data(), 0)) {
            std::fprintf(stderr, "redizor-pack: cannot read the font %s\n", path);
            std::exit(2);
        }
        loaded[i] = true;
    }
    return fonts[i];
}

std::vector<int> Codepoints(const std::string& s) {
    std::vector<int> out;
    for (std::size_t i = 0; i < s.size();) {
        unsigned char c = static_cast<unsigned char>(s[i]);
        int cp = c, extra = 0;
        if (c >= 0xF0) {
            cp = c & 0x07;
            extra = 3;
        } else if (c >= 0xE0) {
            cp = c & 0x0F;
            extra = 2;
        } else if (c >= 0xC0) {
            cp = c & 0x1F;
            extra = 1;
        }
        ++i;
        for (int k = 0; k < extra && i < s.size(); ++k, ++i) {
            cp = (cp << 6) | (static_cast<unsigned char>(s[i]) & 0x3F);
        }
        out.push_back(cp);
    }
    return out;
}

// Coverage of the whole string, with its origin (pen start, baseline) at (ox, oy) of the mask.
struct Mask {
    int w = 0, h = 0, ox = 0, oy = 0;
    std::vector<float> a;
    float at(int x, int y) const {
        return x < 0 || y < 0 || x >= w || y >= h ? 0.0f : a[std::size_t(y) * w + x];
    }
};

Mask Render(const std::string& text, const TextStyle& st, int* advanceOut = nullptr) {
    const Font& f = GetFont(st.bold);
    float scale = stbtt_ScaleForPixelHeight(&f.info, float(st.size));
    int ascent, descent, gap;
    stbtt_GetFontVMetrics(&f.info, &ascent, &descent, &gap);
    std::vector<int> cps = Codepoints(text);
    Mask m;
    int pad = 2 + st.outlineWidth + st.shadow;
    m.ox = pad;
    m.oy = int(std::ceil(ascent * scale)) + pad;
    double pen = 0;
    for (std::size_t k = 0; k < cps.size(); ++k) {
        int adv, lsb;
        stbtt_GetCodepointHMetrics(&f.info, cps[k], &adv, &lsb);
        pen += adv * scale;
        if (k + 1 < cps.size()) {
            pen += scale * stbtt_GetCodepointKernAdvance(&f.info, cps[k], cps[k + 1]);
        }
    }
    if (advanceOut) {
        *advanceOut = int(std::lround(pen));
    }
    m.w = int(std::ceil(pen)) + 2 * pad + 2;
    m.h = int(std::ceil((ascent - descent) * scale)) + 2 * pad + 2;
    m.a.assign(std::size_t(m.w) * m.h, 0.0f);
    pen = 0;
    for (std::size_t k = 0; k < cps.size(); ++k) {
        int adv, lsb;
        stbtt_GetCodepointHMetrics(&f.info, cps[k], &adv, &lsb);
        float shift = float(pen - std::floor(pen));
        int x0, y0, x1, y1;
        stbtt_GetCodepointBitmapBoxSubpixel(&f.info, cps[k], scale, scale, shift, 0, &x0, &y0, &x1,
                                            &y1);
        int gw = x1 - x0, gh = y1 - y0;
        if (gw > 0 && gh > 0) {
            std::vector<unsigned char> g(std::size_t(gw) * gh);
            stbtt_MakeCodepointBitmapSubpixel(&f.info, g.data(), gw, gh, gw, scale, scale, shift, 0,
                                              cps[k]);
            int bx = m.ox + int(std::floor(pen)) + x0, by = m.oy + y0;
            for (int j = 0; j < gh; ++j) {
                for (int i = 0; i < gw; ++i) {
                    int X = bx + i, Y = by + j;
                    if (X >= 0 && Y >= 0 && X < m.w && Y < m.h) {
                        float& d = m.a[std::size_t(Y) * m.w + X];
                        d = std::min(1.0f, d + g[std::size_t(j) * gw + i] / 255.0f);
                    }
                }
            }
        }
        pen += adv * scale;
        if (k + 1 < cps.size()) {
            pen += scale * stbtt_GetCodepointKernAdvance(&f.info, cps[k], cps[k + 1]);
        }
    }
    return m;
}

void Stamp(Canvas& c, const Mask& m, int x, int y, Rgb colour, const TextStyle& st,
           const std::function<float(int, int)>& cover) {
    for (int j = 0; j < m.h; ++j) {
        for (int i = 0; i < m.w; ++i) {
            float a = cover(i, j);
            if (a <= 0.02f) {
                continue;
            }
            int X = x - m.ox + i, Y = y - m.oy + j;
            if (!c.inside(X, Y)) {
                continue;
            }
            if (c.get(X, Y) == kKey && a < st.keyCut) {
                continue;
            }
            c.blend(X, Y, colour, a > 0.92f ? 1.0 : a, st.overKey);
        }
    }
}

}  // namespace

InkBox MeasureText(const std::string& text, const TextStyle& style) {
    TextStyle plain = style;
    plain.outlineWidth = 0;
    plain.shadow = 0;
    Mask m = Render(text, plain);
    InkBox b{1 << 20, 1 << 20, -(1 << 20), -(1 << 20)};
    for (int j = 0; j < m.h; ++j) {
        for (int i = 0; i < m.w; ++i) {
            if (m.at(i, j) >= 0.3f) {
                b.x0 = std::min(b.x0, i - m.ox);
                b.y0 = std::min(b.y0, j - m.oy);
                b.x1 = std::max(b.x1, i - m.ox + 1);
                b.y1 = std::max(b.y1, j - m.oy + 1);
            }
        }
    }
    if (b.x1 < b.x0) {
        b = {0, 0, 0, 0};
    }
    return b;
}

int Advance(const std::string& text, const TextStyle& style) {
    int adv = 0;
    Render(text, style, &adv);
    return adv;
}

void DrawText(Canvas& c, int x, int baseline, const std::string& text, const TextStyle& st) {
    Mask m = Render(text, st);
    if (st.shadow > 0) {
        int s = st.shadow;
        Stamp(c, m, x, baseline, st.shadowColour, st,
              [&](int i, int j) { return m.at(i - s, j - s); });
    }
    if (st.outlineWidth > 0) {
        int r = st.outlineWidth;
        Stamp(c, m, x, baseline, st.outlineColour, st, [&](int i, int j) {
            float best = 0;
            for (int dy = -r; dy <= r; ++dy) {
                for (int dx = -r; dx <= r; ++dx) {
                    if (dx * dx + dy * dy <= r * r + r) {
                        best = std::max(best, m.at(i + dx, j + dy));
                    }
                }
            }
            return std::min(1.0f, best * 1.6f);
        });
    }
    Stamp(c, m, x, baseline, st.colour, st, [&](int i, int j) { return m.at(i, j); });
}

void DrawTextIn(Canvas& c, int x, int y, int w, int h, const std::string& text,
                const TextStyle& st) {
    InkBox b = MeasureText(text, st);
    int px = x + (w - b.width()) / 2 - b.x0;
    int py = y + (h - b.height()) / 2 - b.y0;
    DrawText(c, px, py, text, st);
}

void DrawTextLeft(Canvas& c, int x, int y, int h, const std::string& text, const TextStyle& st) {
    InkBox b = MeasureText(text, st);
    DrawText(c, x - b.x0, y + (h - b.height()) / 2 - b.y0, text, st);
}

}  // namespace packgen
