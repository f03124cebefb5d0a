// Copying rectangles between pictures: opaque and keyed, clipped to both pictures, and the
// Sprite operations built on it.
#include <gtest/gtest.h>

#include <random>

#include "gfx/image.h"
#include "platform/headless/headless.h"
#include "support/images.h"

namespace {

using test::MakePicture;
using test::PixelAt;

BYTE Pattern(int x, int y) {
    return static_cast<BYTE>((x * 7 + y * 13) % 251);
}

// What a copy must do, pixel by pixel: every pixel of the rectangle that lies inside both
// pictures, except source pixels equal to the key, lands at its place.
void ReferenceDraw(Image& src, Image& dst, int dx, int dy, int w, int h, int sx, int sy,
                   DWORD key) {
    for (int j = 0; j < h; ++j) {
        for (int i = 0; i < w; ++i) {
            int x = sx + i, y = sy + j, tx = dx + i, ty = dy + j;
            if (x < 0 || y < 0 || x >= src.Width() || y >= src.Height() || tx < 0 || ty < 0 ||
                tx >= dst.Width() || ty >= dst.Height()) {
                continue;
            }
            BYTE p = PixelAt(src, x, y);
            if (key == NO_KEY || p != (key & 0xFF)) {
                *dst.PixelAddress(tx, ty) = p;
            }
        }
    }
}

void ExpectSame(Image& a, Image& b) {
    for (int y = 0; y < a.Height(); ++y) {
        for (int x = 0; x < a.Width(); ++x) {
            ASSERT_EQ(PixelAt(a, x, y), PixelAt(b, x, y)) << "at (" << x << ", " << y << ")";
        }
    }
}

class DrawTest : public ::testing::Test {
protected:
    void SetUp() override { headless::Install(headless::Config{}); }
};

TEST_F(DrawTest, CopiesEveryRectangleAsThePixelRuleSaysIncludingAtEveryEdge) {
    auto src = MakePicture(23, 17, Pattern);
    struct Case {
        const char* name;
        int dx, dy, w, h, sx, sy;
    } cases[] = {
        {"inside both", 3, 4, 10, 6, 2, 1},
        {"whole source", 0, 0, 23, 17, 0, 0},
        {"past the destination's right edge", 25, 2, 10, 5, 0, 0},
        {"past the destination's bottom edge", 1, 16, 8, 9, 0, 0},
        {"before the destination's left edge", -4, 3, 10, 5, 0, 0},
        {"above the destination's top edge", 2, -6, 8, 10, 0, 0},
        {"past the source's right edge", 0, 0, 10, 5, 18, 0},
        {"past the source's bottom edge", 0, 0, 5, 10, 0, 12},
        {"negative source corner", 5, 5, 8, 8, -3, -2},
        {"wholly outside the destination", 40, 40, 5, 5, 0, 0},
        {"wholly outside the source", 0, 0, 5, 5, 30, 0},
        {"larger than both", -10, -10, 100, 100, -5, -5},
        {"one pixel at the last corner", 29, 19, 1, 1, 22, 16},
    };
    for (DWORD key : {NO_KEY, KEY_FLAG | 0x2A}) {
        for (const Case& c : cases) {
            SCOPED_TRACE(std::string(c.name) + (key == NO_KEY ? " opaque" : " keyed"));
            auto got = MakePicture(30, 20, [](int, int) { return BYTE{200}; });
            auto want = MakePicture(30, 20, [](int, int) { return BYTE{200}; });
            src->Draw(got.get(), c.dx, c.dy, c.w, c.h, c.sx, c.sy, key);
            ReferenceDraw(*src, *want, c.dx, c.dy, c.w, c.h, c.sx, c.sy, key);
            ExpectSame(*got, *want);
        }
    }
}

TEST_F(DrawTest, RandomRectanglesMatchThePixelRule) {
    std::mt19937 rng(1234);
    auto src = MakePicture(37, 29, [&](int, int) { return static_cast<BYTE>(rng() % 4); });
    for (int n = 0; n < 400; ++n) {
        auto pick = [&](int lo, int hi) { return lo + static_cast<int>(rng() % (hi - lo + 1)); };
        int dx = pick(-40, 50), dy = pick(-40, 40), w = pick(0, 60), h = pick(0, 50);
        int sx = pick(-40, 45), sy = pick(-40, 35);
        DWORD key = rng() % 2 ? NO_KEY : (KEY_FLAG | static_cast<DWORD>(rng() % 4));
        auto got = MakePicture(41, 31, [](int x, int y) { return static_cast<BYTE>(x + y + 9); });
        auto want = MakePicture(41, 31, [](int x, int y) { return static_cast<BYTE>(x + y + 9); });
        src->Draw(got.get(), dx, dy, w, h, sx, sy, key);
        ReferenceDraw(*src, *want, dx, dy, w, h, sx, sy, key);
        ExpectSame(*got, *want);
    }
}

TEST_F(DrawTest, WideKeyedCopiesMatchThePixelRuleAtEveryWidth) {
    // Wide rows go sixteen pixels at a time; every width from 1 to 80 exercises the blocks and
    // the tail, and sparse and dense key coverage both.
    std::mt19937 rng(99);
    for (int density : {2, 16}) {
        auto src = MakePicture(300, 9, [&](int, int) {
            return static_cast<BYTE>(rng() % density == 0 ? 200 : rng() % 256);
        });
        for (int w = 1; w <= 80; ++w) {
            auto got = MakePicture(300, 9, [](int x, int y) { return static_cast<BYTE>(x ^ y); });
            auto want = MakePicture(300, 9, [](int x, int y) { return static_cast<BYTE>(x ^ y); });
            int sx = static_cast<int>(rng() % 200);
            int dx = static_cast<int>(rng() % 200);
            src->Draw(got.get(), dx, 1, static_cast<UINT>(w), 7, sx, 2, KEY_FLAG | 200);
            ReferenceDraw(*src, *want, dx, 1, w, 7, sx, 2, KEY_FLAG | 200);
            ExpectSame(*got, *want);
        }
    }
}

TEST_F(DrawTest, KeySkipsOnlyItsOwnIndex) {
    auto src = MakePicture(4, 1, [](int x, int) {
        return x == 0 ? BYTE{255} : x == 1 ? BYTE{0} : BYTE{7};
    });
    auto dst = MakePicture(4, 1, [](int, int) { return BYTE{99}; });
    src->Draw(dst.get(), 0, 0, 4, 1, 0, 0, KEY_FLAG | 255);
    EXPECT_EQ(PixelAt(*dst, 0, 0), 99) << "index 255 is the key";
    EXPECT_EQ(PixelAt(*dst, 1, 0), 0) << "index 0 is an ordinary colour";
    src->Draw(dst.get(), 0, 0, 4, 1, 0, 0, NO_KEY);
    EXPECT_EQ(PixelAt(*dst, 0, 0), 255) << "NO_KEY copies key pixels too";
    src->Draw(dst.get(), 0, 0, 4, 1, 0, 0, KEY_FLAG | 0);
    EXPECT_EQ(PixelAt(*dst, 1, 0), 0);
}

TEST_F(DrawTest, EmptyRectanglesTouchNothing) {
    auto src = MakePicture(8, 8, Pattern);
    auto dst = MakePicture(8, 8, [](int, int) { return BYTE{1}; });
    src->Draw(dst.get(), 0, 0, 0, 8, 0, 0, NO_KEY);
    src->Draw(dst.get(), 0, 0, 8, 0, 0, 0, NO_KEY);
    for (int y = 0; y < 8; ++y) {
        for (int x = 0; x < 8; ++x) {
            ASSERT_EQ(PixelAt(*dst, x, y), 1);
        }
    }
}

TEST_F(DrawTest, PicturesWithoutPixelsAreNeitherReadNorWritten) {
    Image empty;
    auto dst = MakePicture(8, 8, [](int, int) { return BYTE{1}; });
    empty.Draw(dst.get(), 0, 0, 8, 8, 0, 0, NO_KEY);
    dst->Draw(&empty, 0, 0, 8, 8, 0, 0, NO_KEY);
    EXPECT_EQ(PixelAt(*dst, 3, 3), 1);
    EXPECT_EQ(PresentImage(&empty, nullptr, 0, 0, 240, 293), 0);
}

TEST_F(DrawTest, GetRectOfImagesAndSprites) {
    auto image = MakePicture(240, 293, Pattern);
    RECT r;
    image->GetRect(&r);
    EXPECT_EQ(r.left, 0);
    EXPECT_EQ(r.top, 0);
    EXPECT_EQ(r.right, 240);
    EXPECT_EQ(r.bottom, 293);
    auto sprite = MakePicture<Sprite>(10, 6, Pattern);
    sprite->SetPosition(-3, 4);
    Image* asImage = sprite.get();
    asImage->GetRect(&r);  // through the virtual slot
    EXPECT_EQ(r.left, -3);
    EXPECT_EQ(r.top, 4);
    EXPECT_EQ(r.right, 7);
    EXPECT_EQ(r.bottom, 10);
}

TEST_F(DrawTest, HitTestIsStrictAndSkipsKeyPixels) {
    // Key (index 9) in the top-left corner and at (4, 2); everything else opaque.
    auto sprite = MakePicture<Sprite>(6, 5, [](int x, int y) {
        return (x == 0 && y == 0) || (x == 4 && y == 2) ? BYTE{9} : BYTE{1};
    });
    sprite->TakeKeyFromCorner();
    ASSERT_EQ(sprite->key, 9);
    sprite->SetPosition(10, 20);
    struct {
        int x, y, hit;
    } points[] = {
        {11, 21, 1}, {10, 21, 0}, {11, 20, 0}, {16, 21, 0}, {15, 24, 1},
        {15, 25, 0}, {14, 22, 0}, {13, 22, 1}, {9, 22, 0},
    };
    for (auto p : points) {
        EXPECT_EQ(sprite->HitTest(p.x, p.y), p.hit) << p.x << ", " << p.y;
    }
}

TEST_F(DrawTest, DrawClippedKeepsInsideTheClipAndHonoursKeyed) {
    auto sprite = MakePicture<Sprite>(
        4, 4, [](int x, int y) { return x == 0 && y == 0 ? BYTE{5} : BYTE{60}; });
    sprite->TakeKeyFromCorner();
    sprite->SetPosition(2, 2);
    auto dst = MakePicture(10, 10, [](int, int) { return BYTE{1}; });
    RECT miss{7, 7, 9, 9};
    sprite->DrawClipped(dst.get(), &miss);
    for (int y = 0; y < 10; ++y) {
        for (int x = 0; x < 10; ++x) {
            ASSERT_EQ(PixelAt(*dst, x, y), 1) << "a clip that misses draws nothing";
        }
    }
    RECT half{0, 0, 4, 10};
    sprite->DrawClipped(dst.get(), &half);
    EXPECT_EQ(PixelAt(*dst, 3, 3), 60);
    EXPECT_EQ(PixelAt(*dst, 4, 3), 1) << "outside the clip";
    EXPECT_EQ(PixelAt(*dst, 2, 2), 1) << "key pixel skipped";
    sprite->SetKeyed(0);
    sprite->DrawClipped(dst.get(), nullptr);
    EXPECT_EQ(PixelAt(*dst, 2, 2), 5) << "unkeyed sprites copy their key pixels";
    EXPECT_EQ(PixelAt(*dst, 5, 5), 60) << "no clip: the whole sprite";
}

}  // namespace
