// The message queue and the window timer, as the main loop sees them through the headless
// backend's virtual clock.
#include <gtest/gtest.h>

#include "platform/headless/headless.h"
#include "platform/timer.h"
#include "support/window.h"

namespace {

class MessagesTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.quiet = true;
        config.passMs = 40;
        headless::Install(config);
        window = test::OpenTestWindow();
        ASSERT_NE(window, nullptr);
        test::ReceivedMessages().clear();
    }
    // One pass of a main loop that does nothing else: at most one message.
    bool Pass(MSG& msg) {
        if (!PeekMessageW(&msg, nullptr, 0, 0, PM_NOREMOVE)) {
            return false;
        }
        if (!GetMessageW(&msg, nullptr, 0, 0)) {
            quit = true;
            return true;
        }
        DispatchMessageW(&msg);
        return true;
    }
    HWND window = nullptr;
    bool quit = false;
};

TEST_F(MessagesTest, TimerTicksEveryPeriodWithAtMostOneWaiting) {
    ASSERT_EQ(SetTimer(window, 10, 100, nullptr), 10u);
    DWORD start = headless::Now();
    // Let 1000 ms pass without taking a message: only one tick may wait.
    Sleep(1000);
    MSG msg{};
    int ticks = 0;
    while (PeekMessageW(&msg, nullptr, 0, 0, PM_REMOVE)) {
        ticks += msg.message == WM_TIMER && msg.wParam == 10;
    }
    EXPECT_EQ(ticks, 1) << "a late loop sees one tick, not a burst";
    // From now on, taking every message, ticks arrive at the 100 ms pace of the virtual clock.
    test::ReceivedMessages().clear();
    DWORD before = headless::Now();
    while (headless::Now() - before < 1000) {
        Pass(msg);
    }
    int received = 0;
    for (const MSG& m : test::ReceivedMessages()) {
        received += m.message == WM_TIMER && m.wParam == 10;
    }
    EXPECT_GE(received, 9);
    EXPECT_LE(received, 11);
    EXPECT_GT(headless::Now(), start);
}

TEST_F(MessagesTest, PostedMessagesArriveInOrderOnePerPass) {
    headless::KeyDown(38);
    headless::PenDown(10, 20);
    headless::KeyUp(38);
    MSG msg{};
    ASSERT_TRUE(Pass(msg));
    ASSERT_TRUE(Pass(msg));
    ASSERT_TRUE(Pass(msg));
    const auto& got = test::ReceivedMessages();
    ASSERT_EQ(got.size(), 3u);
    EXPECT_EQ(got[0].message, WM_KEYDOWN);
    EXPECT_EQ(got[0].wParam, 38u);
    EXPECT_EQ(got[1].message, WM_LBUTTONDOWN);
    EXPECT_EQ(got[1].lParam, MAKELPARAM(10, 20));
    EXPECT_EQ(got[2].message, WM_KEYUP);
}

TEST_F(MessagesTest, ClosingDestroysTheWindowAndQuitEndsTheLoop) {
    headless::Close();
    MSG msg{};
    ASSERT_TRUE(Pass(msg));
    EXPECT_FALSE(IsWindow(window));
    const auto& got = test::ReceivedMessages();
    ASSERT_FALSE(got.empty());
    EXPECT_EQ(got.back().message, WM_DESTROY);
    PostQuitMessage(0);
    ASSERT_TRUE(Pass(msg));
    EXPECT_TRUE(quit);
    EXPECT_EQ(msg.wParam, 0u);
}

}  // namespace
