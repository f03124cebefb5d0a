// The device folder as the game reads it: every picture in its expected size and format on one
// palette, every cue a short clean wave, the registry and the ranking file.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <set>
#include <string>
#include <vector>

#include "pack_reader.h"
#include "tools/packgen/pack.h"

namespace packtest {
namespace {

struct Expected {
    const char* file;
    int width, height;
    bool sprite;  // loaded as a Sprite, so drawn with the key of its top-left pixel
};

// What the game draws from each picture, written down here independently of the generator.
const Expected kPictures[] = {
    {"start.dc8", 240, 293, false},       {"menu.dc8", 240, 293, false},
    {"intro.dc8", 240, 293, false},       {"end.dc8", 240, 293, false},
    {"n_set_scr.dc8", 240, 293, false},   {"p_set_scr.dc8", 240, 293, false},
    {"j_set_scr.dc8", 240, 293, false},   {"ranking.dc8", 240, 293, false},
    {"load.dc8", 120, 125, false},        {"start_flag.dc8", 132, 31, true},
    {"menu_pacific.dc8", 210, 23, false}, {"menu_south.dc8", 210, 23, false},
    {"menu_amazon.dc8", 210, 23, false},  {"menu_easy.dc8", 120, 23, false},
    {"menu_normal.dc8", 120, 23, false},  {"menu_hard.dc8", 120, 23, false},
    {"menu_back.dc8", 90, 23, false},     {"menu_go.dc8", 60, 23, false},
    {"intro_n.dc8", 400, 110, true},      {"intro_j.dc8", 200, 110, true},
    {"intro_p.dc8", 88, 54, true},        {"intro_p2.dc8", 172, 40, true},
    {"profile.dc8", 252, 75, true},       {"favorite.dc8", 192, 72, true},
    {"story.dc8", 232, 334, true},        {"n_back.dc8", 480, 293, false},
    {"nn_fisherman.dc8", 188, 49, true},  {"n_sheep.dc8", 108, 30, true},
    {"n_basket.dc8", 110, 60, true},      {"n_taken_basket.dc8", 220, 60, true},
    {"n_wave.dc8", 392, 30, true},        {"n_bottom.dc8", 900, 53, true},
    {"n_exit.dc8", 50, 25, true},         {"n_number.dc8", 90, 11, true},
    {"n_rope.dc8", 6, 3, true},           {"n_hook.dc8", 40, 20, true},
    {"n_spray.dc8", 55, 37, true},        {"n_eng_man.dc8", 42, 27, true},
    {"n_dark.dc8", 240, 145, true},       {"n_light.dc8", 50, 50, true},
    {"bar_case.dc8", 180, 10, true},      {"eng_bar.dc8", 170, 6, false},
    {"n_fish0.dc8", 252, 35, true},       {"n_fish1.dc8", 176, 34, true},
    {"n_fish2.dc8", 176, 34, true},       {"n_fish3.dc8", 256, 36, true},
    {"n_fish4.dc8", 148, 29, true},       {"n_fish5.dc8", 152, 23, true},
    {"n_shell_fish0.dc8", 284, 41, true}, {"n_shell_fish1.dc8", 112, 30, true},
    {"n_taken_fish0.dc8", 88, 68, true},  {"n_taken_fish1.dc8", 56, 37, true},
    {"n_taken_fish2.dc8", 76, 36, true},  {"n_taken_fish3.dc8", 76, 68, true},
    {"n_taken_fish4.dc8", 50, 34, true},  {"n_taken_fish5.dc8", 58, 34, true},
    {"n_taken_fish6.dc8", 132, 38, true}, {"n_taken_fish7.dc8", 44, 22, true},
};

void PrintTo(const Expected& e, std::ostream* os) {
    *os << e.file;
}

class PictureFile : public ::testing::TestWithParam<Expected> {};

TEST_P(PictureFile, HasTheSizeAndLayoutTheGameReads) {
    const Expected& e = GetParam();
    std::vector<std::uint8_t> bytes = ReadBytes(ImagePath(e.file));
    ASSERT_FALSE(bytes.empty()) << e.file << " is missing";
    Dc8 d = ParseDc8(bytes);
    ASSERT_EQ(d.error, "") << e.file;
    EXPECT_EQ(d.width, e.width) << e.file;
    EXPECT_EQ(d.height, e.height) << e.file;
    EXPECT_EQ(d.headerSize, 40u);
    EXPECT_EQ(d.planes, 1);
    EXPECT_EQ(d.compression, 0u);
    EXPECT_EQ(d.coloursUsed, 256u);
    EXPECT_EQ(d.pixelOffset, 54u + 1024u);
    const std::uint32_t stride = (std::uint32_t(e.width) + 3) & ~3u;
    EXPECT_EQ(d.imageSize, stride * std::uint32_t(e.height));
    EXPECT_EQ(d.fileSizeField, 54u + 1024u + stride * std::uint32_t(e.height));
    // The game takes the pixel byte count from the file-size field: it must be the file's size.
    EXPECT_EQ(d.fileSizeField, bytes.size());
}

TEST_P(PictureFile, SharesThePaletteOfTheTitle) {
    // Pixels are copied between pictures and shown with another picture's palette.
    Dc8 title = ParseDc8(ReadBytes(ImagePath("start.dc8")));
    Dc8 d = ParseDc8(ReadBytes(ImagePath(GetParam().file)));
    ASSERT_EQ(d.error, "");
    EXPECT_EQ(d.palette, title.palette) << GetParam().file;
}

TEST_P(PictureFile, UsesTheKeyOnlyWhereItIsTransparent) {
    const Expected& e = GetParam();
    Dc8 d = ParseDc8(ReadBytes(ImagePath(e.file)));
    ASSERT_EQ(d.error, "");
    const std::uint8_t key = 0;
    long keyPixels = std::count(d.rows.begin(), d.rows.end(), key);
    if (e.sprite) {
        EXPECT_EQ(d.at(0, 0), key) << e.file << ": a sprite takes its key from (0, 0)";
        EXPECT_LT(keyPixels, long(d.rows.size())) << e.file << " is all transparent";
    } else {
        // Drawn opaque, a key pixel would show as a magenta speck.
        EXPECT_EQ(keyPixels, 0) << e.file;
    }
}

INSTANTIATE_TEST_SUITE_P(Pack, PictureFile, ::testing::ValuesIn(kPictures),
                         [](const ::testing::TestParamInfo<Expected>& info) {
                             std::string n = info.param.file;
                             n = n.substr(0, n.find('.'));
                             return n;
                         });

TEST(Pack, HoldsNoPictureTheGameDoesNotName) {
    std::set<std::string> expected;
    for (const Expected& e : kPictures) {
        expected.insert(e.file);
    }
    std::set<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator(ImagePath(""))) {
        found.insert(entry.path().filename().string());
    }
    EXPECT_EQ(found, expected);
}

TEST(Pack, KeyIndexIsAColourNoArtUses) {
    Dc8 d = ParseDc8(ReadBytes(ImagePath("start.dc8")));
    // Magenta at index 0, and no other entry so close that the eye would mistake one for it.
    EXPECT_EQ(d.palette[2], 255);
    EXPECT_EQ(d.palette[1], 0);
    EXPECT_EQ(d.palette[0], 255);
    for (int i = 1; i < 256; ++i) {
        int dr = d.palette[i * 4 + 2] - 255, dg = d.palette[i * 4 + 1], db = d.palette[i * 4] - 255;
        EXPECT_GT(dr * dr + dg * dg + db * db, 900) << "entry " << i;
    }
}

struct ExpectedCue {
    const char* file;
    double maxSeconds;
};

const ExpectedCue kCues[] = {
    {"start.mc8", 1.5},        {"exit.mc8", 1.45},        {"menu.mc8", 1.5},
    {"intro.mc8", 1.5},        {"end.mc8", 1.5},          {"taken_fish.mc8", 1.5},
    {"p_sound.mc8", 1.5},      {"n_taken_succ.mc8", 1.5}, {"j_taken_succ.mc8", 1.5},
    {"p_taken_succ.mc8", 1.5}, {"n_taken_fail.mc8", 1.5}, {"j_taken_fail.mc8", 1.5},
    {"p_taken_fail.mc8", 1.5},
};

void PrintTo(const ExpectedCue& e, std::ostream* os) {
    *os << e.file;
}

class CueFile : public ::testing::TestWithParam<ExpectedCue> {};

TEST_P(CueFile, IsAShortCleanMonoWave) {
    const ExpectedCue& e = GetParam();
    Wav w = ParseWav(ReadBytes(SoundPath(e.file)));
    ASSERT_EQ(w.error, "") << e.file;
    EXPECT_EQ(w.format, 1);
    EXPECT_EQ(w.channels, 1);
    EXPECT_EQ(w.rate, 22050);
    EXPECT_EQ(w.bits, 16);
    EXPECT_GE(w.seconds(), 0.1) << e.file;
    EXPECT_LE(w.seconds(), e.maxSeconds) << e.file;
    int peak = 0;
    for (std::int16_t s : w.samples) {
        peak = std::max(peak, std::abs(int(s)));
    }
    // One loudness for all, about -3 dB, and never clipped.
    EXPECT_LT(peak, 32767) << e.file;
    EXPECT_GT(peak, 32767 * 0.6) << e.file;
    EXPECT_LT(peak, 32767 * 0.8) << e.file;
    // Faded ends: no click where the cue starts or stops.
    ASSERT_GT(w.samples.size(), 20u);
    EXPECT_LT(std::abs(int(w.samples.front())), 300) << e.file;
    EXPECT_LT(std::abs(int(w.samples.back())), 300) << e.file;
}

INSTANTIATE_TEST_SUITE_P(Pack, CueFile, ::testing::ValuesIn(kCues),
                         [](const ::testing::TestParamInfo<ExpectedCue>& info) {
                             std::string n = info.param.file;
                             return n.substr(0, n.find('.'));
                         });

TEST(Pack, CuesSoundDifferent) {
    // Two events sharing one sound would be a copy-and-paste slip in the cue table.
    std::set<std::vector<std::int16_t>> seen;
    for (const ExpectedCue& e : kCues) {
        Wav w = ParseWav(ReadBytes(SoundPath(e.file)));
        EXPECT_TRUE(seen.insert(w.samples).second) << e.file << " repeats another cue";
    }
}

TEST(Pack, RegistryPointsAtTheInstallFolder) {
    std::vector<std::uint8_t> b = ReadBytes(PackDir() + "/registry.txt");
    std::string text(b.begin(), b.end());
    EXPECT_EQ(text,
              "; Redizor device registry\n"
              "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Apps\\Vorn Redizor Demo]\n"
              "\"InstallDir\"=\"\\Program Files\\Redizor\"\n");
}

std::u16string Units(const std::vector<std::uint8_t>& b, std::size_t at, std::size_t n) {
    std::u16string s;
    for (std::size_t i = 0; i < n; ++i) {
        s.push_back(char16_t(U16(b, at + 2 * i)));
    }
    return s;
}

TEST(Pack, RankingHoldsTenRecordsThatExerciseTheNameCleanUp) {
    std::vector<std::uint8_t> b = ReadBytes(PackDir() + "/vorndc8/score.uc2");
    ASSERT_EQ(b.size(), 2u + 10u * 40u);
    bool inner = false, space = false, lower = false, digit = false, underscore = false;
    for (int i = 0; i < 10; ++i) {
        std::u16string name = Units(b, 2 + 40 * i, 10);
        std::u16string score = Units(b, 2 + 40 * i + 22, 8);
        for (char16_t u : score) {
            EXPECT_TRUE((u >= u'0' && u <= u'9') || u == u' ') << "record " << i;
        }
        std::size_t us = name.find(u'_');
        inner |=
            us != std::u16string::npos && us > 0 && name.find_first_not_of(u'_', us) != name.npos;
        space |= name[0] == u' ';
        lower |= name[0] >= u'a' && name[0] <= u'z';
        digit |= name[0] >= u'0' && name[0] <= u'9';
        underscore |= name[0] == u'_';
    }
    EXPECT_TRUE(inner);
    EXPECT_TRUE(space);
    EXPECT_TRUE(lower);
    EXPECT_TRUE(digit);
    EXPECT_TRUE(underscore);
}

TEST(Pack, RankingScoresAreInDescendingOrder) {
    std::vector<std::uint8_t> b = ReadBytes(PackDir() + "/vorndc8/score.uc2");
    ASSERT_EQ(b.size(), 402u);
    long last = -1;
    for (int i = 0; i < 10; ++i) {
        std::u16string score = Units(b, 2 + 40 * i + 22, 8);
        long v = std::stol(std::string(score.begin(), score.end()));
        if (last >= 0) {
            EXPECT_LE(v, last) << "record " << i;
        }
        last = v;
    }
}

TEST(Pack, ContactSheetIsAPng) {
    std::string file = PackDir() + "/../sheet.png";
    std::string error;
    ASSERT_TRUE(packgen::WriteContactSheet(file, 1, &error)) << error;
    std::vector<std::uint8_t> b = ReadBytes(file);
    ASSERT_GT(b.size(), 24u);
    EXPECT_EQ(std::string(b.begin() + 1, b.begin() + 4), "PNG");
    // Wide enough for the widest strip, the sea bottom.
    std::uint32_t w = (b[16] << 24) | (b[17] << 16) | (b[18] << 8) | b[19];
    EXPECT_GE(w, 900u);
    EXPECT_FALSE(packgen::WriteContactSheet(file, 0, &error));
}

}  // namespace
}  // namespace packtest
