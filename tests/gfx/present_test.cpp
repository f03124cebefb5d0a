// Presenting a picture to the window: a plain copy, or the interleaved reveal of fifteen
// passes of every fifteenth row.
#include <gtest/gtest.h>

#include "gfx/image.h"
#include "platform/headless/headless.h"
#include "support/images.h"
#include "support/window.h"

namespace {

class PresentTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.quiet = true;
        headless::Install(config);
        window = test::OpenTestWindow();
        ASSERT_NE(window, nullptr);
        headless::Log().Clear();
    }
    HWND window = nullptr;
};

std::uint32_t PaletteRgb(int i) {
    // the palette test::MakePicture gives its pictures
    return (static_cast<std::uint32_t>(i / 2) << 16) | (static_cast<std::uint32_t>(255 - i) << 8) |
           static_cast<std::uint32_t>(i);
}

TEST_F(PresentTest, PlainCopyIsOneBlockFromTheTopLeftCorner) {
    auto image =
        test::MakePicture(240, 293, [](int x, int y) { return static_cast<BYTE>((x + y) % 200); });
    HDC dc = GetDC(window);
    EXPECT_EQ(PresentImage(image.get(), dc, 0, 0, 240, 293), 1);
    ReleaseDC(window, dc);
    const auto& blits = headless::Log().windowBlits;
    ASSERT_EQ(blits.size(), 1u);
    EXPECT_EQ(blits[0].width, 240);
    EXPECT_EQ(blits[0].height, 293);
    EXPECT_EQ(blits[0].srcX, 0);
    EXPECT_EQ(blits[0].srcY, 0);
    EXPECT_EQ(headless::Log().presents, 1);
    EXPECT_EQ(headless::Screen().At(10, 20), PaletteRgb(30)) << "indices shown through the palette";
    EXPECT_EQ(headless::Screen().At(239, 292), PaletteRgb((239 + 292) % 200));
}

TEST_F(PresentTest, RevealCopiesThreeHundredStripsInPassOrder) {
    auto image = test::MakePicture(240, 293, [](int, int y) { return static_cast<BYTE>(y % 250); });
    HDC dc = GetDC(window);
    EXPECT_EQ(PresentImage(image.get(), dc, 0, 77, 240, 1), 1);
    ReleaseDC(window, dc);
    const auto& blits = headless::Log().windowBlits;
    ASSERT_EQ(blits.size(), 300u);
    int atRow293 = 0;
    for (int pass = 0; pass < 15; ++pass) {
        for (int k = 0; k < 20; ++k) {
            const auto& b = blits[static_cast<std::size_t>(pass * 20 + k)];
            int row = std::min(pass + 15 * k, 293);
            ASSERT_EQ(b.y, row) << "pass " << pass << " strip " << k;
            ASSERT_EQ(b.srcY, row);
            ASSERT_EQ(b.height, 1);
            ASSERT_EQ(b.x, 0);
            atRow293 += row == 293;
        }
    }
    EXPECT_EQ(atRow293, 7) << "the twentieth strip of passes 8 to 14 falls below the picture";
    for (int y : {0, 14, 15, 146, 292}) {
        EXPECT_EQ(headless::Screen().At(5, y), PaletteRgb(y % 250)) << "row " << y;
    }
}

TEST_F(PresentTest, NoBitmapPresentsNothing) {
    Image empty;
    HDC dc = GetDC(window);
    EXPECT_EQ(PresentImage(&empty, dc, 0, 0, 240, 293), 0);
    ReleaseDC(window, dc);
    EXPECT_TRUE(headless::Log().windowBlits.empty());
    EXPECT_EQ(headless::Log().presents, 0) << "nothing drawn, nothing shown";
}

}  // namespace
