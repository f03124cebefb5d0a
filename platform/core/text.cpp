// Text on the window's device context: one default font, black, single line, left and top
// aligned, clipped to the rectangle, blended onto the window's surface.
#include <algorithm>
#include <cmath>
#include <vector>

#include "platform/core/font.h"
#include "platform/core/gdi_objects.h"
#include "platform/core/record.h"
#include "platform/core/window_state.h"

namespace {

constexpr char32_t kReplacement = 0xFFFD;

struct Placed {
    char32_t codepoint;
    float penX;
    int lastUnit;  // index of the character's last UTF-16 unit
};

struct Layout {
    std::vector<Placed> chars;
    float width = 0;
};

bool IsHigh(WCHAR c) {
    return c >= 0xD800 && c <= 0xDBFF;
}

bool IsLow(WCHAR c) {
    return c >= 0xDC00 && c <= 0xDFFF;
}

bool IsControl(char32_t c) {
    return c < 0x20 || (c >= 0x7F && c <= 0x9F);
}

int UnitCount(LPCWSTR text, int count) {
    if (text == nullptr) {
        return 0;
    }
    if (count >= 0) {
        return count;
    }
    int n = 0;
    while (text[n] != 0) {
        ++n;
    }
    return n;
}

// Reads exactly count units; control units and unpaired surrogates become U+FFFD.
Layout LayOut(LPCWSTR text, int count) {
    Layout layout;
    float pen = 0;
    char32_t previous = 0;
    for (int i = 0; i < count; ++i) {
        char32_t cp = text[i];
        if (IsHigh(text[i]) && i + 1 < count && IsLow(text[i + 1])) {
            cp = 0x10000 + ((static_cast<char32_t>(text[i]) - 0xD800) << 10) +
                 (static_cast<char32_t>(text[i + 1]) - 0xDC00);
            ++i;
        } else if (IsHigh(text[i]) || IsLow(text[i]) || IsControl(cp)) {
            cp = kReplacement;
        }
        if (previous != 0) {
            pen += platform::FontKerning(previous, cp);
        }
        layout.chars.push_back({cp, pen, i});
        pen += platform::FontGlyph(cp).advance;
        previous = cp;
    }
    layout.width = pen;
    return layout;
}

int WidthOf(float extent) {
    return static_cast<int>(std::ceil(extent - 0.01f));
}

std::string Utf8(const Layout& layout) {
    std::string out;
    for (const Placed& p : layout.chars) {
        char32_t c = p.codepoint;
        if (c < 0x80) {
            out += static_cast<char>(c);
        } else if (c < 0x800) {
            out += static_cast<char>(0xC0 | (c >> 6));
            out += static_cast<char>(0x80 | (c & 0x3F));
        } else if (c < 0x10000) {
            out += static_cast<char>(0xE0 | (c >> 12));
            out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
            out += static_cast<char>(0x80 | (c & 0x3F));
        } else {
            out += static_cast<char>(0xF0 | (c >> 18));
            out += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
            out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
            out += static_cast<char>(0x80 | (c & 0x3F));
        }
    }
    return out;
}

// The part of rect that lies on the surface.
RECT Clip(const RECT& rect, const platform::Surface& s) {
    return RECT{std::max<LONG>(rect.left, 0), std::max<LONG>(rect.top, 0),
                std::min<LONG>(rect.right, s.width), std::min<LONG>(rect.bottom, s.height)};
}

// Darkens each pixel towards black by the glyph's coverage.
void Blend(std::uint32_t& pixel, int alpha) {
    std::uint32_t keep = 255 - static_cast<std::uint32_t>(alpha);
    std::uint32_t r = ((pixel >> 16) & 0xFF) * keep / 255;
    std::uint32_t g = ((pixel >> 8) & 0xFF) * keep / 255;
    std::uint32_t b = (pixel & 0xFF) * keep / 255;
    pixel = (r << 16) | (g << 8) | b;
}

void FillWhite(platform::Surface& s, const RECT& clip, int left, int top, int width, int height) {
    int x0 = std::max<int>(clip.left, left), x1 = std::min<int>(clip.right, left + width);
    int y0 = std::max<int>(clip.top, top), y1 = std::min<int>(clip.bottom, top + height);
    for (int y = y0; y < y1; ++y) {
        for (int x = x0; x < x1; ++x) {
            s.pixels[static_cast<std::size_t>(y) * s.width + x] = 0x00FFFFFFu;
        }
    }
}

void DrawGlyph(platform::Surface& s, const RECT& clip, const platform::Glyph& g, int originX,
               int baseline) {
    for (int gy = 0; gy < g.height; ++gy) {
        int y = baseline + g.yoff + gy;
        if (y < clip.top || y >= clip.bottom) {
            continue;
        }
        for (int gx = 0; gx < g.width; ++gx) {
            int x = originX + g.xoff + gx;
            int a = g.alpha[static_cast<std::size_t>(gy) * g.width + gx];
            if (a != 0 && x >= clip.left && x < clip.right) {
                Blend(s.pixels[static_cast<std::size_t>(y) * s.width + x], a);
            }
        }
    }
}

}  // namespace

BOOL GetTextExtentExPointW(HDC dc, LPCWSTR text, int count, int maxExtent, int* fit, int* dx,
                           SIZE* size) {
    if (dc == nullptr) {
        return FALSE;
    }
    int units = UnitCount(text, count);
    Layout layout = LayOut(text, units);
    if (dx != nullptr || fit != nullptr) {
        int fitting = 0;
        int unit = 0;
        for (std::size_t i = 0; i < layout.chars.size(); ++i) {
            float end = i + 1 < layout.chars.size() ? layout.chars[i + 1].penX : layout.width;
            int extent = WidthOf(end);
            if (extent <= maxExtent) {
                fitting = layout.chars[i].lastUnit + 1;
            }
            for (; unit <= layout.chars[i].lastUnit; ++unit) {
                if (dx != nullptr) {
                    dx[unit] = extent;
                }
            }
        }
        if (fit != nullptr) {
            *fit = fitting;
        }
    }
    if (size != nullptr) {
        *size = SIZE{WidthOf(layout.width), platform::FontLineHeight()};
    }
    return TRUE;
}

int DrawTextW(HDC dc, LPCWSTR text, int count, RECT* rect, UINT format) {
    (void)format;  // the one layout there is: single line, left and top
    HWND__* window = platform::GameWindow();
    if (dc == nullptr || rect == nullptr || dc->kind != HDC__::Kind::kWindow || window == nullptr) {
        return 0;
    }
    Layout layout = LayOut(text, UnitCount(text, count));
    platform::Record& record = platform::CallRecord();
    if (record.enabled) {
        record.texts.push_back({Utf8(layout), static_cast<int>(rect->left),
                                static_cast<int>(rect->top), static_cast<int>(rect->right),
                                static_cast<int>(rect->bottom)});
    }
    platform::Surface& surface = window->surface;
    RECT clip = Clip(*rect, surface);
    const int lineHeight = platform::FontLineHeight();
    dc->drawn = true;
    if (clip.left >= clip.right || clip.top >= clip.bottom) {
        return lineHeight;
    }
    if (dc->bkMode != TRANSPARENT) {
        FillWhite(surface, clip, rect->left, rect->top, WidthOf(layout.width), lineHeight);
    }
    const int baseline = rect->top + platform::FontAscent();
    for (const Placed& p : layout.chars) {
        DrawGlyph(surface, clip, platform::FontGlyph(p.codepoint),
                  rect->left + static_cast<int>(std::lround(p.penX)), baseline);
    }
    return lineHeight;
}
