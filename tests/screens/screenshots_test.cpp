// Pictures of the front-end screens for the documentation, written only when asked:
//   REDIZOR_SCREENSHOT_DIR=$PWD/docs/screenshots ctest --test-dir build -R ScreenshotsTest
#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "app/shell.h"
#include "platform/headless/headless.h"
#include "screen_driver.h"

namespace {

using screens_test::Leg;

TEST(ScreenshotsTest, WritesTitleOptionsIntroAndRanking) {
    const char* dir = std::getenv("REDIZOR_SCREENSHOT_DIR");
    if (dir == nullptr || *dir == '\0') {
        GTEST_SKIP() << "set REDIZOR_SCREENSHOT_DIR to write the screenshots";
    }
    const std::string out = dir;
    int written = 0;
    auto shoot = [&](const char* name) {
        written += headless::SaveScreenshot(out + "/" + name + ".png") ? 1 : 0;
    };
    screens_test::Route run;
    // Leg 1 picks Amazon and Hard on the way; the intro still shows the round's difficulty.
    run.legs = {{SCREEN_TITLE, 6}, {SCREEN_OPTIONS, 12}, {SCREEN_INTRO, 200}, {SCREEN_RANKING, 14}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 0 && k == 5) {
            shoot("title");
        } else if (leg == 1 && k == 1) {
            headless::Tap(120, 147);
        } else if (leg == 1 && k == 5) {
            headless::Tap(140, 260);
        } else if (leg == 1 && k == 10) {
            shoot("options");
        } else if (leg == 2 && k == 199) {
            shoot("intro");
        } else if (leg == 3 && k == 13) {
            shoot("ranking");
        }
    });
    EXPECT_EQ(written, 4);
}

}  // namespace
