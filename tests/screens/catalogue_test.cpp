// The catalogue as the game loads it: what the first LoadAssets opens, presents and plays, the
// later call from the menu's Back, and every pointer cleared when the window is closed.
#include <gtest/gtest.h>

#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/headless/headless.h"
#include "screen_driver.h"

namespace {

using screens_test::Route;

struct Census {
    int live = 0;      // pointers that hold an object
    int loaded = 0;    // objects with pixels
    int slotTwo = 0;   // non-null slot-2 entries (there should be none)
    int slotZero = 0;  // slot-0 objects that hold pixels (there should be none)
};

template <typename T>
void Count(Census& c, T* object) {
    if (object != nullptr) {
        ++c.live;
        c.loaded += object->bitmap != nullptr ? 1 : 0;
    }
}

template <typename T>
void CountGround(Census& c, T** table) {
    for (int i = 0; i < REGION_COUNT; ++i) {
        Count(c, table[i]);
    }
    c.slotTwo += table[2] != nullptr ? 1 : 0;
    c.slotZero += table[0] != nullptr && table[0]->bitmap != nullptr ? 1 : 0;
}

template <typename T, std::size_t N, std::size_t M>
void CountGround(Census& c, T* (&table)[N][M]) {
    for (std::size_t i = 0; i < N; ++i) {
        for (std::size_t j = 0; j < M; ++j) {
            Count(c, table[i][j]);
        }
    }
    for (std::size_t j = 0; j < M; ++j) {
        c.slotTwo += table[2][j] != nullptr ? 1 : 0;
        c.slotZero += table[0][j] != nullptr && table[0][j]->bitmap != nullptr ? 1 : 0;
    }
}

Census TakeCensus() {
    Census c;
    for (Image* single :
         {g_img_load, g_sceneImage, g_frameImage, g_img_start, g_img_menu, g_img_menu_pacific,
          g_img_menu_south, g_img_menu_amazon, g_img_menu_easy, g_img_menu_normal, g_img_menu_hard,
          g_img_menu_go, g_img_menu_back, g_img_intro, g_img_eng_bar, g_img_ranking}) {
        Count(c, single);
    }
    for (Sprite* single :
         {g_img_start_flag, g_img_intro_p, g_img_intro_p2, g_img_intro_j, g_img_intro_n,
          g_img_profile, g_img_favorite, g_img_story, g_img_bar_case}) {
        Count(c, single);
    }
    CountGround(c, g_img_back);
    CountGround(c, g_img_fisherman);
    for (Sprite** table :
         {g_img_exit, g_img_number, g_img_rope, g_img_hook, g_img_spray, g_img_eng_man, g_img_wave,
          g_img_bottom, g_img_sheep, g_img_basket, g_img_taken_basket, g_img_dark, g_img_light}) {
        Sprite*(&ground)[REGION_COUNT] = *reinterpret_cast<Sprite*(*)[REGION_COUNT]>(table);
        CountGround(c, ground);
    }
    CountGround(c, g_img_fish);
    CountGround(c, g_img_shell_fish);
    CountGround(c, g_img_taken_fish);
    return c;
}

// 91 objects made: the 90 that stay (25 single pictures with the ranking background less the
// loading art, 34 ground slots, 32 fish slots) and the loading art, destroyed at the end.
// 57 files: the loading art and backdrop, 54 catalogue pictures, the title for the frame.
TEST(CatalogueTest, FirstLoadOpensPresentsAndPlaysWhatItShould) {
    Census loaded;
    std::size_t files = 0, cues = 0;
    long presents = 0;
    bool startCue = false;
    headless::SetLoopStartHook([&] {
        files = headless::Log().filesOpened.size();
        presents = headless::Log().presents;
        cues = headless::Log().cues.size();
        startCue = screens_test::CueCount("\\start.mc8") == 1;
        loaded = TakeCensus();
    });
    test::RunGame(test::PackConfig(2), [](long) {});
    EXPECT_EQ(files, 57u);
    EXPECT_EQ(presents, 7) << "seven loading screens before the title";
    EXPECT_EQ(cues, 1u);
    EXPECT_TRUE(startCue);
    EXPECT_EQ(loaded.live, 90);
    // Empty: slot 0 of every ground table (1 + 3 + 13 + 16) and the South fisherman at
    // difficulties 2 and 3.
    EXPECT_EQ(loaded.loaded, 90 - 35);
    EXPECT_EQ(loaded.slotTwo, 0);
    EXPECT_EQ(loaded.slotZero, 0);
    EXPECT_EQ(g_img_load, nullptr);
    // Closed after two passes: WM_DESTROY released everything.
    EXPECT_EQ(TakeCensus().live, 0);
}

// Back from the menu: no loading screen, one more title picture and start cue.
TEST(CatalogueTest, LaterLoadOnlyReplacesTheFrameAndPlaysTheStartCue) {
    Census before, after;
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 1}, {SCREEN_TITLE, 1}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 1 && k == 1) {
            before = TakeCensus();
            headless::Log().Clear();
        } else if (leg == 2 && k == 0) {
            after = TakeCensus();
            EXPECT_EQ(headless::Log().filesOpened.size(), 1u);
            EXPECT_EQ(screens_test::OpenedCount("\\image\\start.dc8"), 1);
            EXPECT_EQ(headless::Log().cues.size(), 1u);
            EXPECT_EQ(screens_test::CueCount("\\start.mc8"), 1);
            // The menu's three frames up to the leaving reveal, and no loading screen.
            EXPECT_EQ(headless::Log().presents, 3);
            EXPECT_EQ(screens_test::BlitCount(), 1u + 1u + 300u);
        }
    });
    EXPECT_EQ(after.live, before.live);
    EXPECT_EQ(after.loaded, before.loaded);
}

}  // namespace
