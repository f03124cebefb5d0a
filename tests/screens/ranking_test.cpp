// The ranking screen after a round (the round ended by running its energy out): the list
// growing line by line from the ranking file, the rows' text and boxes, the back area, and the
// file's troubles: missing, short, unwritable, or holding units that cannot be printed.
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <string>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/core/utf.h"
#include "platform/gdi.h"
#include "platform/headless/headless.h"
#include "screen_driver.h"
#include "screens/options.h"
#include "screens/ranking.h"

namespace {

using screens_test::DeviceCopy;
using screens_test::RankingFile;
using screens_test::RankingRecord;
using screens_test::Route;

std::size_t TextCount() {
    return headless::Log().texts.size();
}

int OpenFiles() {
    int n = 0;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        (void)entry;
        ++n;
    }
    return n;
}

// Texts drawn on each pass of a stay on the ranking screen, in lines (name and score).
std::vector<std::size_t> LinesPerPass(const std::string& device, long passes) {
    std::vector<std::size_t> lines;
    Route run;
    run.legs = {{SCREEN_RANKING, passes}};
    run.deviceDir = device;
    screens_test::Walk(run, [&](int, long k) {
        if (k > 0) {
            EXPECT_EQ(TextCount() % 2, 0u);
            lines.push_back(TextCount() / 2);
        }
        headless::Log().Clear();
    });
    return lines;
}

const std::vector<std::size_t> kGrowth = {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 0, 0};

// The background is presented once with the reveal; then one more line per pass, each line
// followed by 50 ms, and one opening of the file per growing pass.
TEST(RankingTest, ListGrowsOneLinePerPassAfterTheReveal) {
    std::vector<std::size_t> lines, blits, opened;
    std::vector<DWORD> elapsed;
    DWORD last = 0;
    Route run;
    run.legs = {{SCREEN_RANKING, 13}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 0) {
            EXPECT_EQ(g_rankingShown, 0);
            EXPECT_EQ(g_rankingPass, 0);
            EXPECT_EQ(screens_test::OpenedCount("\\image\\end.dc8"), 1);
            EXPECT_EQ(screens_test::CueCount("\\end.mc8"), 1);
        } else {
            lines.push_back(TextCount() / 2);
            blits.push_back(screens_test::BlitCount());
            opened.push_back(screens_test::OpenedCount("\\vorndc8\\score.uc2"));
            elapsed.push_back(headless::Now() - last);
        }
        if (k == 1) {
            EXPECT_EQ(g_rankingShown, 1);
            EXPECT_TRUE(screens_test::ScreenShowsFrame());
        }
        last = headless::Now();
        headless::Log().Clear();
    });
    EXPECT_EQ(lines, kGrowth);
    EXPECT_EQ(blits, (std::vector<std::size_t>{300, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(opened, (std::vector<std::size_t>{1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 0, 0}));
    for (std::size_t i = 0; i < elapsed.size(); ++i) {
        EXPECT_EQ(elapsed[i], 40 + 50 * lines[i]) << "pass " << i + 1;
    }
}

// Name clean-up: underscores become spaces, a leading space three full stops, a lower-case
// first letter upper case. Scores are drawn as they are. Rows are 18 apart; the name's box
// ends 10 pixels short of the text's width, the score's box is fixed.
TEST(RankingTest, RowsShowCleanedNamesAndScoresInTheirBoxes) {
    struct Row {
        std::u16string name, score;
        std::string shownName;
    };
    const Row rows[] = {
        {u"abc", u"00012345", "Abc       "},
        {u"__________", u"00_12_45", "...       "},
        {u" xyzabcdef", u"00000300", "...zabcdef"},
        {u"_Qrs", u"00000200", "...s      "},
        {u"zed", u"00000100", "Zed       "},
        {u"\u00e9t\u00e9", u"00000090", "\u00e9t\u00e9       "},
        {u"7seas", u"00000080", "7seas     "},
        {u"Kelp", u"00000070", "Kelp      "},
        {u"a", u"00000060", "A         "},
        {u"b_c", u"00000050", "B c       "},
        {u"eleventh", u"00000001", ""},  // past the tenth record: never shown
    };
    std::vector<std::vector<std::uint8_t>> records;
    for (const Row& r : rows) {
        records.push_back(RankingRecord(r.name, r.score));
    }
    DeviceCopy device;
    auto file = RankingFile(records);
    device.WriteRanking(&file);

    std::vector<platform::TextRecord> drawn;
    std::vector<LONG> widths;
    Route run;
    run.legs = {{SCREEN_RANKING, 14}};
    run.deviceDir = device.path();
    screens_test::Walk(run, [&](int, long k) {
        if (k == 11) {
            drawn = headless::Log().texts;
            HDC dc = GetDC(g_hWnd);
            for (int i = 0; i < 10; ++i) {
                std::u16string name = platform::ToUtf16(rows[i].shownName);
                SIZE size{};
                GetTextExtentExPointW(dc, name.data(), static_cast<int>(name.size()), 0, nullptr,
                                      nullptr, &size);
                widths.push_back(size.cx);
            }
            ReleaseDC(g_hWnd, dc);
        }
        headless::Log().Clear();
    });
    ASSERT_EQ(drawn.size(), 20u);
    for (int i = 0; i < 10; ++i) {
        const platform::TextRecord& name = drawn[2 * i];
        const platform::TextRecord& score = drawn[2 * i + 1];
        const int top = 95 + 18 * i;
        EXPECT_EQ(name.text, rows[i].shownName) << "row " << i;
        EXPECT_EQ(score.text, platform::ToUtf8(rows[i].score.data(), 8)) << "row " << i;
        EXPECT_EQ((std::vector<int>{name.left, name.top, name.right, name.bottom}),
                  (std::vector<int>{100, top, 90 + widths[i], top + 20}))
            << "row " << i;
        EXPECT_EQ((std::vector<int>{score.left, score.top, score.right, score.bottom}),
                  (std::vector<int>{165, top, 215, top + 20}))
            << "row " << i;
    }
}

struct BackCase {
    int x, y;
    bool leaves;
};

class RankingBackTest : public ::testing::TestWithParam<BackCase> {};

// The stylus is held down: the back area must clear the latch itself, or the menu's first
// pass takes the same touch for a press on its Back button.
TEST_P(RankingBackTest, BackAreaLeavesForTheMenuWithTheStylusUp) {
    const BackCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_RANKING, 6}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 2) {
            headless::PenDown(c.x, c.y);
        } else if (k == 4) {
            EXPECT_EQ(g_screen, c.leaves ? SCREEN_OPTIONS : SCREEN_RANKING);
            EXPECT_EQ(g_penDown, c.leaves ? 0 : 1);
        } else if (k == 5 && c.leaves) {
            EXPECT_EQ(g_menuArmed, 0) << "the menu saw the touch as its own press";
            EXPECT_EQ(screens_test::CueCount("\\menu.mc8"), 1);
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Bounds, RankingBackTest,
                         ::testing::Values(BackCase{20, 275, true}, BackCase{49, 271, true},
                                           BackCase{0, 292, true}, BackCase{20, 270, false},
                                           BackCase{50, 275, false}),
                         [](const ::testing::TestParamInfo<BackCase>& info) {
                             return "x" + std::to_string(info.param.x) + "_y" +
                                    std::to_string(info.param.y);
                         });

// A second round's ranking shows its background with the reveal and grows its list again.
TEST(RankingTest, EveryVisitStartsWithTheBackgroundAndAGrowingList) {
    std::vector<std::size_t> firstLines, secondLines, secondBlits;
    Route run;
    run.legs = {{SCREEN_RANKING, 13}, {SCREEN_OPTIONS, 1}, {SCREEN_RANKING, 13}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (k > 0 && leg != 1) {
            (leg == 0 ? firstLines : secondLines).push_back(TextCount() / 2);
            if (leg == 2) {
                secondBlits.push_back(screens_test::BlitCount());
            }
        }
        if (leg == 2 && k == 1) {
            EXPECT_EQ(g_rankingShown, 1);
        }
        headless::Log().Clear();
    });
    EXPECT_EQ(firstLines, kGrowth);
    EXPECT_EQ(secondLines, kGrowth);
    ASSERT_FALSE(secondBlits.empty());
    EXPECT_EQ(secondBlits[0], 300u) << "the second visit reveals its background";
}

TEST(RankingTest, MissingFileDrawsNoLines) {
    DeviceCopy device;
    device.WriteRanking(nullptr);
    EXPECT_EQ(LinesPerPass(device.path(), 13), std::vector<std::size_t>(13, 0));
}

// Four whole records and part of a fifth: four lines, never rows of leftover content.
TEST(RankingTest, ShortFileDrawsOnlyTheRecordsItHolds) {
    DeviceCopy device;
    std::vector<std::vector<std::uint8_t>> records;
    for (const char16_t* name : {u"Ann", u"Bob", u"Cid", u"Dee", u"Eve"}) {
        records.push_back(RankingRecord(name, u"00000100"));
    }
    auto file = RankingFile(records);
    file.resize(file.size() - 10);  // the fifth record cut short
    device.WriteRanking(&file);
    EXPECT_EQ(LinesPerPass(device.path(), 13),
              (std::vector<std::size_t>{0, 1, 2, 3, 4, 4, 4, 4, 4, 4, 4, 0, 0}));
}

// The file is only read: one that cannot be opened for writing (here the running test
// program itself, which the system keeps from being written) is still read, and every pass
// closes what it opened.
TEST(RankingTest, FileIsOpenedForReadingOnlyAndClosedEachPass) {
    DeviceCopy device;
    device.WriteRanking(nullptr);
    std::filesystem::create_symlink("/proc/self/exe", device.RankingPath());
    int filesAtStart = 0;
    std::vector<std::size_t> lines;
    std::size_t refused = 0;
    Route run;
    run.legs = {{SCREEN_RANKING, 13}};
    run.deviceDir = device.path();
    screens_test::Walk(run, [&](int, long k) {
        if (k == 0) {
            filesAtStart = OpenFiles();
        } else {
            lines.push_back(TextCount() / 2);
            refused += headless::Log().filesRefused.size();
            EXPECT_EQ(OpenFiles(), filesAtStart) << "pass " << k;
        }
        headless::Log().Clear();
    });
    EXPECT_EQ(refused, 0u);
    EXPECT_EQ(lines, kGrowth);
}

// Control units and lone surrogates, also a pair split between the name and the unit after
// it, are drawn as U+FFFD; a whole pair stays one character.
TEST(RankingTest, UnprintableUnitsAreDrawnAsReplacementCharacters) {
    const std::u16string name = {u'a',   0x0001, 0x0000, 0xD800, u'b',
                                 0xDC00, 0xD83D, 0xDC1F, u'c',   0xD83D};
    const std::u16string score = {u'1', u'2', 0x007F, 0x0085, u'5', 0xDFFF, u'7', 0xD800};
    auto record = RankingRecord(name, score);
    record[20] = 0x1F;  // the unit after the name: the other half of its last unit's pair
    record[21] = 0xDC;
    record[38] = 0x00;  // and after the score
    record[39] = 0xDC;
    DeviceCopy device;
    auto file = RankingFile({record});
    device.WriteRanking(&file);
    std::vector<platform::TextRecord> drawn;
    bool inked = false;
    Route run;
    run.legs = {{SCREEN_RANKING, 3}};
    run.deviceDir = device.path();
    screens_test::Walk(run, [&](int, long k) {
        if (k == 2) {
            drawn = headless::Log().texts;
            // Something was drawn over the background inside the score's box.
            for (int y = 95; y < 115; ++y) {
                for (int x = 165; x < 215; ++x) {
                    inked = inked || !screens_test::ScreenShowsFrameAt(x, y);
                }
            }
        }
        headless::Log().Clear();
    });
    ASSERT_EQ(drawn.size(), 2u);
    EXPECT_EQ(drawn[0].text, "A\uFFFD\uFFFD\uFFFDb\uFFFD\U0001F41Fc\uFFFD");
    EXPECT_EQ(drawn[1].text, "12\uFFFD\uFFFD5\uFFFD7\uFFFD");
    EXPECT_TRUE(inked);
}

}  // namespace
