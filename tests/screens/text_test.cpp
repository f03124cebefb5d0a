// Text on the window's device context, as the ranking list uses it: measuring, drawing
// clipped to a rectangle, transparent and opaque backgrounds, unprintable units, and the box
// that stands in when the font file is missing.
#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "gfx/image.h"
#include "platform/gdi.h"
#include "platform/headless/headless.h"
#include "support/images.h"
#include "support/window.h"

namespace {

constexpr BYTE kBackground = 200;  // blue 200, green 55, red 100 in the test palette
constexpr std::uint32_t kBackgroundRgb = (100u << 16) | (55u << 8) | 200u;

class TextTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.quiet = true;
        headless::Install(config);
        window = test::OpenTestWindow();
        ASSERT_NE(window, nullptr);
        auto picture = test::MakePicture(240, 293, [](int, int) { return kBackground; });
        HDC dc = GetDC(window);
        PresentImage(picture.get(), dc, 0, 0, 240, 293);
        ReleaseDC(window, dc);
        headless::Log().Clear();
    }

    // Draws text into rect on a fresh window DC in the given background mode and presents it.
    void Draw(const std::u16string& text, RECT rect, int mode = TRANSPARENT) {
        HDC dc = GetDC(window);
        SetBkMode(dc, mode);
        DrawTextW(dc, text.data(), static_cast<int>(text.size()), &rect, DT_SINGLELINE);
        ReleaseDC(window, dc);
    }

    SIZE Extent(const std::u16string& text) {
        HDC dc = GetDC(window);
        SIZE size{-1, -1};
        EXPECT_TRUE(GetTextExtentExPointW(dc, text.data(), static_cast<int>(text.size()), 0,
                                          nullptr, nullptr, &size));
        ReleaseDC(window, dc);
        return size;
    }

    HWND window = nullptr;
};

std::uint32_t At(int x, int y) {
    return headless::Screen().At(x, y);
}

// Pixels of the window that no longer show the background, inside and outside rect.
struct Changes {
    int inside = 0, outside = 0, partial = 0;
};

Changes ChangesAround(const RECT& r) {
    Changes c;
    for (int y = 0; y < 293; ++y) {
        for (int x = 0; x < 240; ++x) {
            std::uint32_t p = At(x, y);
            if (p == kBackgroundRgb) {
                continue;
            }
            bool in = x >= r.left && x < r.right && y >= r.top && y < r.bottom;
            (in ? c.inside : c.outside) += 1;
            c.partial += p != 0 ? 1 : 0;
        }
    }
    return c;
}

TEST_F(TextTest, ExtentFollowsTheText) {
    EXPECT_EQ(Extent(u"").cx, 0);
    SIZE i = Extent(u"iii"), w = Extent(u"WWW");
    EXPECT_GT(i.cx, 0);
    EXPECT_LT(i.cx, w.cx);
    EXPECT_EQ(i.cy, w.cy) << "one line height for every text";
    EXPECT_GE(w.cy, 11);
    EXPECT_LE(w.cy, 15);
}

// The ranking gives a score 50 pixels: the ink of eight digits fits, so its box cuts nothing.
TEST_F(TextTest, EightDigitsFitTheRankingsScoreBox) {
    Draw(u"00048500", RECT{165, 95, 215, 115});
    Draw(u"00048500", RECT{165, 150, 240, 170});
    for (int y = 0; y < 20; ++y) {
        for (int x = 165; x < 240; ++x) {
            ASSERT_EQ(At(x, 95 + y), At(x, 150 + y)) << "(" << x << ", " << y << ")";
        }
    }
}

TEST_F(TextTest, PartialExtentsAndFitCountEachUnit) {
    const std::u16string text = u"ab\U0001F41Fc";  // a pair counts as one character
    HDC dc = GetDC(window);
    int dx[5] = {};
    int fit = -1;
    SIZE size{};
    SIZE ab = Extent(u"ab");
    GetTextExtentExPointW(dc, text.data(), 5, ab.cx, &fit, dx, &size);
    ReleaseDC(window, dc);
    EXPECT_EQ(fit, 2);
    EXPECT_EQ(dx[1], ab.cx);
    EXPECT_EQ(dx[2], dx[3]) << "both units of the pair end at the same place";
    EXPECT_GT(dx[2], dx[1]);
    EXPECT_EQ(dx[4], size.cx);
}

TEST_F(TextTest, TransparentTextDarkensAndBlendsOnlyInsideItsRectangle) {
    const RECT r{10, 20, 60, 40};
    Draw(u"WWWWWWWWWW", r);  // wider than the rectangle
    Changes c = ChangesAround(r);
    EXPECT_GT(c.inside, 20);
    EXPECT_EQ(c.outside, 0);
    EXPECT_GT(c.partial, 0) << "anti-aliased edges blend with the background";
    // Ink reaches the clipped right edge: the text was cut, not shrunk.
    bool inkAtEdge = false;
    for (int y = r.top; y < r.bottom; ++y) {
        inkAtEdge = inkAtEdge || At(r.right - 1, y) != kBackgroundRgb;
    }
    EXPECT_TRUE(inkAtEdge);
    EXPECT_EQ(headless::Log().presents, 1) << "releasing the DC shows the text";
    ASSERT_EQ(headless::Log().texts.size(), 1u);
    EXPECT_EQ(headless::Log().texts[0].text, "WWWWWWWWWW");
}

TEST_F(TextTest, TextStartsAtTheRectanglesTopLeft) {
    const RECT r{100, 200, 200, 230};
    Draw(u"H", r);
    int minX = 999, minY = 999;
    for (int y = 0; y < 293; ++y) {
        for (int x = 0; x < 240; ++x) {
            if (At(x, y) != kBackgroundRgb) {
                minX = std::min(minX, x);
                minY = std::min(minY, y);
            }
        }
    }
    EXPECT_GE(minX, 100);
    EXPECT_LE(minX, 102);
    EXPECT_GE(minY, 200);
    EXPECT_LE(minY, 203);
}

TEST_F(TextTest, OpaqueModeFillsTheTextsCellsWhiteFirst) {
    const RECT r{10, 20, 200, 60};
    Draw(u"i i", r, OPAQUE);
    SIZE size = Extent(u"i i");
    EXPECT_EQ(At(10 + size.cx / 2, 20 + 1), 0x00FFFFFFu) << "the space between the letters";
    EXPECT_EQ(At(10 + size.cx + 2, 25), kBackgroundRgb) << "past the text";
    EXPECT_EQ(At(12, 20 + size.cy + 2), kBackgroundRgb) << "below the line";
    Draw(u"i i", RECT{10, 100, 200, 140}, TRANSPARENT);
    EXPECT_EQ(At(10 + size.cx / 2, 101), kBackgroundRgb);
}

// Control units and lone surrogates look like U+FFFD, which is not nothing.
TEST_F(TextTest, UnprintableUnitsDrawTheReplacementGlyph) {
    auto rowPixels = [](int top) {
        std::vector<std::uint32_t> row;
        for (int y = top; y < top + 16; ++y) {
            for (int x = 10; x < 40; ++x) {
                row.push_back(At(x, y));
            }
        }
        return row;
    };
    Draw(std::u16string(1, u'\uFFFD'), RECT{10, 10, 40, 26});
    Draw(std::u16string(1, u'\u0001'), RECT{10, 40, 40, 56});
    Draw(std::u16string(1, char16_t(0xD800)), RECT{10, 70, 40, 86});
    Draw(std::u16string(1, char16_t(0xDC00)), RECT{10, 100, 40, 116});
    std::vector<std::uint32_t> replacement = rowPixels(10);
    EXPECT_NE(replacement, std::vector<std::uint32_t>(replacement.size(), kBackgroundRgb));
    EXPECT_EQ(rowPixels(40), replacement);
    EXPECT_EQ(rowPixels(70), replacement);
    EXPECT_EQ(rowPixels(100), replacement);
    for (const auto& t : headless::Log().texts) {
        EXPECT_EQ(t.text, "\uFFFD");
    }
}

// Only count units are read: a terminator-less buffer followed by more text draws no more.
TEST_F(TextTest, DrawsExactlyCountUnits) {
    const char16_t units[] =
        u"AB"
        u"CDEF";
    RECT r{10, 10, 200, 30};
    HDC dc = GetDC(window);
    DrawTextW(dc, units, 2, &r, DT_SINGLELINE);
    ReleaseDC(window, dc);
    ASSERT_EQ(headless::Log().texts.size(), 1u);
    EXPECT_EQ(headless::Log().texts[0].text, "AB");
    EXPECT_EQ(ChangesAround(RECT{10, 10, 10 + Extent(u"AB").cx + 1, 30}).outside, 0);
}

// Without the font every visible character is a hollow box and nothing fails.
TEST_F(TextTest, MissingFontFallsBackToBoxes) {
    ::setenv("REDIZOR_FONT", "/nonexistent/font.ttf", 1);  // read once, on first use
    SIZE two = Extent(u"ab");
    EXPECT_EQ(two.cx, 2 * Extent(u"a").cx);
    EXPECT_GT(two.cx, 0);
    Draw(u"a", RECT{10, 10, 100, 40});
    SIZE one = Extent(u"a");
    // The box's outline is solid ink, its middle untouched.
    int ink = 0, left = 999, right = -1, top = 999, bottom = -1;
    for (int y = 10; y < 40; ++y) {
        for (int x = 10; x < 10 + one.cx; ++x) {
            if (At(x, y) == 0) {
                ++ink;
                left = std::min(left, x), right = std::max(right, x);
                top = std::min(top, y), bottom = std::max(bottom, y);
            }
        }
    }
    ASSERT_GT(ink, 0);
    EXPECT_EQ(At((left + right) / 2, (top + bottom) / 2), kBackgroundRgb);
    EXPECT_EQ(ink, 2 * (right - left + 1) + 2 * (bottom - top - 1));
}

}  // namespace
