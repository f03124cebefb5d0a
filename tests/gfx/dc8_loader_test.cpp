// The picture loader against real files: every refusal names its cause in the box's caption,
// ends the program with a failure code, and no file, however hostile, crashes it.
#include <gtest/gtest.h>

#include "gfx/image.h"
#include "platform/core/device.h"
#include "platform/core/utf.h"
#include "platform/headless/headless.h"
#include "support/game_run.h"
#include "support/temp_device.h"

namespace {

const std::string kFile = "\\image\\pic.dc8";

class LoaderTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.deviceDir = device.path();
        config.quiet = true;
        headless::Install(config);
        headless::SetExitHook([](int code) { throw test::ProcessExited{code}; });
        headless::Log().Clear();
    }
    void TearDown() override { platform::InjectReadFailure(-1); }

    // Loads the file; returns the caption of the box the loader showed ("" when none) and
    // sets exitCode when the loader ended the program.
    std::string Load(const std::vector<std::uint8_t>& bytes, Image& image,
                     int* exitCode = nullptr) {
        device.Write("image/pic.dc8", bytes);
        std::u16string path = platform::ToUtf16(kFile);
        try {
            result = image.LoadDC8(path.c_str());
        } catch (const test::ProcessExited& exited) {
            if (exitCode != nullptr) {
                *exitCode = exited.code;
            }
        }
        const auto& boxes = headless::Log().messageBoxes;
        return boxes.empty() ? "" : boxes.back().caption;
    }

    test::TempDevice device;
    int result = -1;
};

std::vector<std::uint8_t> Truncated(std::vector<std::uint8_t> bytes, std::size_t size) {
    bytes.resize(size);
    return bytes;
}

TEST_F(LoaderTest, EachMalformedFileIsRefusedWithItsOwnCaption) {
    test::Dc8 valid;
    auto withHeader = [](std::uint32_t size) {
        test::Dc8 d;
        d.headerSize = size;
        return d.Bytes();
    };
    auto badType = valid;
    badType.type = 0x4D43;
    auto shortPalette = valid.Bytes();
    auto oneByteShort = valid.Bytes();
    oneByteShort.pop_back();
    test::Dc8 negativeWidth;
    negativeWidth.width = -4;
    test::Dc8 hugeRows;
    hugeRows.width = 100000;
    hugeRows.height = 100000;
    hugeRows.pixels = std::vector<std::uint8_t>(64, 1);
    hugeRows.fileSizeField = 54 + 1024 + 64;
    test::Dc8 rowsNotFilled;
    rowsNotFilled.pixels = std::vector<std::uint8_t>(5, 1);  // three rows of four need twelve
    test::Dc8 claimsGigabytes;
    claimsGigabytes.fileSizeField = 0x7FFFFFF0;

    struct Case {
        const char* name;
        std::vector<std::uint8_t> bytes;
        long long failReadsFrom;
        const char* caption;
    } cases[] = {
        {"empty file", {}, -1, "Can't load this image3!"},
        {"file header cannot be read", valid.Bytes(), 0, "Can't load this image2!"},
        {"not a bitmap", badType.Bytes(), -1, "Can't load this image3!"},
        {"info header cannot be read", valid.Bytes(), 14, "Can't load this image4!"},
        {"info header cut short", Truncated(valid.Bytes(), 30), -1, "Can't load this image5!"},
        {"core header of 12 bytes", withHeader(12), -1, "Can't load this image6!"},
        {"v5 header of 108 bytes", withHeader(108), -1, "Can't load this image6!"},
        {"palette cannot be read", valid.Bytes(), 54, "Can't load this image7!"},
        {"palette cut short", Truncated(shortPalette, 54 + 100), -1, "Can't load this image8!"},
        {"one byte shorter than its size field", oneByteShort, -1, "Can't load this image9!"},
        {"pixel data cannot fill the rows", rowsNotFilled.Bytes(), -1, "Can't load this image9!"},
        {"size field claims gigabytes", claimsGigabytes.Bytes(), -1, "Can't load this image9!"},
        {"negative width", negativeWidth.Bytes(), -1, "Can't load this image10!"},
        {"absurdly large", hugeRows.Bytes(), -1, "Can't load this image10!"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        headless::Log().Clear();
        platform::InjectReadFailure(c.failReadsFrom);
        Image image;
        int exitCode = -1;
        EXPECT_EQ(Load(c.bytes, image, &exitCode), c.caption);
        EXPECT_EQ(exitCode, 1) << "a picture that cannot be read must not end as a success";
        ASSERT_EQ(headless::Log().messageBoxes.size(), 1u);
        EXPECT_EQ(headless::Log().messageBoxes[0].text, kFile) << "the box names the file";
        EXPECT_EQ(image.bitmap, nullptr);
        platform::InjectReadFailure(-1);
    }
}

TEST_F(LoaderTest, MissingFileIsMessageOne) {
    Image image;
    int exitCode = -1;
    std::u16string path = u"\\image\\none.dc8";
    try {
        image.LoadDC8(path.c_str());
    } catch (const test::ProcessExited& exited) {
        exitCode = exited.code;
    }
    ASSERT_EQ(headless::Log().messageBoxes.size(), 1u);
    EXPECT_EQ(headless::Log().messageBoxes[0].caption, "Can't load this image1!");
    EXPECT_EQ(headless::Log().messageBoxes[0].text, "\\image\\none.dc8");
    EXPECT_EQ(exitCode, 1);
}

TEST_F(LoaderTest, GoodPictureKeepsHeaderPaletteAndBottomUpPixels) {
    test::Dc8 d;
    d.coloursUsed = 3;  // never shortens the palette read
    Image image;
    EXPECT_EQ(Load(d.Bytes(), image), "");
    EXPECT_EQ(result, 1);
    EXPECT_EQ(image.Width(), 4);
    EXPECT_EQ(image.Height(), 3);
    EXPECT_EQ(image.colourCount, 256u);
    EXPECT_EQ(image.info->bmiHeader.biSizeImage, 12u) << "holds the pixel byte count";
    const RGBQUAD& last = image.info->bmiColors[255];
    EXPECT_EQ((last.rgbRed << 16) | (last.rgbGreen << 8) | last.rgbBlue, test::Dc8PaletteRgb(255));
    // Stored row 0 is the picture's bottom row: picture (c, r) holds (2 - r) * 16 + c.
    EXPECT_EQ(*image.PixelAddress(0, 0), 2 * 16 + 0);
    EXPECT_EQ(*image.PixelAddress(3, 2), 0 * 16 + 3);
    EXPECT_EQ(image.PixelAddress(4, 0), nullptr);
    EXPECT_EQ(image.PixelAddress(0, 3), nullptr);
}

TEST_F(LoaderTest, PixelOffsetIsHonouredAndPaletteAlwaysReadFromItsPlace) {
    // A 16-entry palette in an 8-bit file: 256 entries are read from offset 54, running into
    // the pixels, and the pixels still come from the pixel offset (118).
    test::Dc8 shortPalette;
    shortPalette.paletteEntries = 16;
    shortPalette.width = 40;
    shortPalette.height = 30;  // enough bytes after the palette for 256 entries
    Image a;
    EXPECT_EQ(Load(shortPalette.Bytes(), a), "");
    EXPECT_EQ(*a.PixelAddress(5, 29), 5);

    test::Dc8 farPixels;
    farPixels.pixelOffset = 2000;
    Image b;
    EXPECT_EQ(Load(farPixels.Bytes(), b), "");
    EXPECT_EQ(*b.PixelAddress(1, 2), 1) << "pixels are read from the pixel offset";
}

TEST_F(LoaderTest, TwentyFourBitFileReadsNoPaletteButCopiesItsPixels) {
    test::Dc8 d;
    d.bitsPerPixel = 24;
    d.pixels = std::vector<std::uint8_t>(12 * 3, 0);
    d.pixels[12 * 2] = 77;  // first byte of the top row
    Image image;
    EXPECT_EQ(Load(d.Bytes(), image), "");
    EXPECT_EQ(image.colourCount, 0u);
    EXPECT_EQ(image.bits[12 * 2], 77);
}

TEST_F(LoaderTest, SpriteTakesItsKeyFromTheTopLeftPixel) {
    test::Dc8 d;
    Sprite sprite;
    device.Write("image/pic.dc8", d.Bytes());
    std::u16string path = platform::ToUtf16(kFile);
    ASSERT_EQ(sprite.Load(path.c_str()), 1);
    EXPECT_EQ(sprite.key, 2 * 16) << "top-left pixel of a bottom-up file is in its last row";
}

TEST(PaletteSizeTest, FollowsTheDepthAlone) {
    const std::pair<WORD, UINT> table[] = {{1, 2},  {2, 4},  {4, 16}, {8, 256}, {0, 0},
                                           {16, 0}, {24, 0}, {32, 0}, {3, 0}};
    for (auto [bits, entries] : table) {
        EXPECT_EQ(PaletteSize(bits), entries) << bits << " bits per pixel";
    }
}

}  // namespace
