// Key and stylus messages only set the latch; what each message does to it.
#include <gtest/gtest.h>

#include "app/input.h"
#include "app/shell.h"
#include "platform/window.h"

namespace {

struct Latch {
    INT up, down, left, right, enter, penDown, penX, penY;
    bool operator==(const Latch& o) const {
        return up == o.up && down == o.down && left == o.left && right == o.right &&
               enter == o.enter && penDown == o.penDown && penX == o.penX && penY == o.penY;
    }
};

Latch Now() {
    return {g_keyUp, g_keyDown, g_keyLeft, g_keyRight, g_keyEnter, g_penDown, g_penX, g_penY};
}

std::ostream& operator<<(std::ostream& os, const Latch& l) {
    return os << "up " << l.up << " down " << l.down << " left " << l.left << " right " << l.right
              << " enter " << l.enter << " pen " << l.penDown << " (" << l.penX << ", " << l.penY
              << ")";
}

void Send(UINT message, WPARAM wParam, LPARAM lParam = 0) {
    EXPECT_EQ(WndProc(nullptr, message, wParam, lParam), 0);
}

class InputLatchTest : public ::testing::Test {
protected:
    void SetUp() override {
        g_keyUp = g_keyDown = g_keyLeft = g_keyRight = g_keyEnter = 0;
        g_penDown = g_penX = g_penY = 0;
    }
};

TEST_F(InputLatchTest, EachKeySetsAndClearsItsOwnFlag) {
    struct Case {
        WPARAM vk;
        INT* flag;
        bool clearedOnRelease;
    } cases[] =
        {
            {VK_UP, &g_keyUp, true},         {VK_DOWN, &g_keyDown, true},
            {VK_LEFT, &g_keyLeft, true},     {VK_RIGHT, &g_keyRight, true},
            {VK_RETURN, &g_keyEnter, false},  // a press waits for its consumer
        };
    for (const Case& c : cases) {
        SetUp();
        Send(WM_KEYDOWN, c.vk);
        Latch after = Now();
        EXPECT_EQ(*c.flag, 1) << "key " << c.vk;
        INT set = 0;
        for (INT v : {after.up, after.down, after.left, after.right, after.enter}) {
            set += v;
        }
        EXPECT_EQ(set, 1) << "key " << c.vk << " touches only its own flag";
        Send(WM_KEYDOWN, c.vk);  // auto-repeat
        EXPECT_EQ(*c.flag, 1);
        Send(WM_KEYUP, c.vk);
        EXPECT_EQ(*c.flag, c.clearedOnRelease ? 0 : 1) << "key " << c.vk;
    }
}

TEST_F(InputLatchTest, OtherKeysChangeNothing) {
    Send(WM_KEYDOWN, VK_DOWN);
    Send(WM_LBUTTONDOWN, 0, MAKELPARAM(7, 9));
    Latch before = Now();
    for (WPARAM vk : {0u, 12u, 14u, 32u, 36u, 41u, 65u, 255u, 0x10000u + 38u}) {
        Send(WM_KEYDOWN, vk);
        Send(WM_KEYUP, vk);
        EXPECT_EQ(Now(), before) << "key " << vk;
    }
}

TEST_F(InputLatchTest, UpThenDownThenUpReleased) {
    Send(WM_KEYDOWN, VK_UP);
    Send(WM_KEYDOWN, VK_DOWN);
    Send(WM_KEYUP, VK_UP);
    EXPECT_EQ(g_keyUp, 0);
    EXPECT_EQ(g_keyDown, 1);
}

TEST_F(InputLatchTest, StylusKeepsTheTouchAndReleasePoints) {
    Send(WM_LBUTTONDOWN, 0, MAKELPARAM(10, 20));
    EXPECT_EQ(Now(), (Latch{0, 0, 0, 0, 0, 1, 10, 20}));
    Send(WM_LBUTTONUP, 0, MAKELPARAM(200, 250));
    EXPECT_EQ(Now(), (Latch{0, 0, 0, 0, 0, 0, 200, 250}));
    // The two halves are unsigned 16-bit values.
    Send(WM_LBUTTONDOWN, 0, MAKELPARAM(65535, 40000));
    EXPECT_EQ(g_penX, 65535);
    EXPECT_EQ(g_penY, 40000);
}

}  // namespace
