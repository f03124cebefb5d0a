// Input scripts of headless runs and replays.
#include <gtest/gtest.h>

#include "platform/host/script.h"

namespace {

using host::ScriptEvent;
using V = ScriptEvent::Verb;

TEST(ScriptTest, ReadsEveryVerbInPassOrderKeepingFileOrderWithinAPass) {
    std::vector<ScriptEvent> events;
    std::string error;
    ASSERT_TRUE(
        host::ParseScript("# a session\n"
                          "5 pendown 10 225   # start a round\n"
                          "3 keydown 39\n"
                          "\n"
                          "5 penup 10 225\n"
                          "3 keyup 39\n"
                          "7 timer 10\n"
                          "9 close\n",
                          events, error))
        << error;
    ASSERT_EQ(events.size(), 6u);
    EXPECT_EQ(events[0].pass, 3);
    EXPECT_EQ(events[0].verb, V::kKeyDown);
    EXPECT_EQ(events[0].a, 39);
    EXPECT_EQ(events[1].verb, V::kKeyUp) << "file order within a pass";
    EXPECT_EQ(events[2].verb, V::kPenDown);
    EXPECT_EQ(events[2].a, 10);
    EXPECT_EQ(events[2].b, 225);
    EXPECT_EQ(events[3].verb, V::kPenUp);
    EXPECT_EQ(events[4].verb, V::kTimer);
    EXPECT_EQ(events[4].a, 10);
    EXPECT_EQ(events[5].verb, V::kClose);
    for (const ScriptEvent& e : events) {
        std::vector<ScriptEvent> again;
        ASSERT_TRUE(host::ParseScript(host::FormatEvent(e), again, error)) << error;
        ASSERT_EQ(again.size(), 1u);
        EXPECT_EQ(again[0].pass, e.pass);
        EXPECT_EQ(again[0].verb, e.verb);
        EXPECT_EQ(again[0].a, e.a);
        EXPECT_EQ(again[0].b, e.b);
    }
}

TEST(ScriptTest, MalformedLinesAreRefusedByNumberAndNothingIsKept) {
    const struct {
        const char* text;
        const char* line;
    } cases[] = {
        {"1 keydown 13\nx keydown 13\n", "line 2"},
        {"1 keydown\n", "line 1"},
        {"1 keydown 13 14\n", "line 1"},
        {"\n\n1 pendown 10\n", "line 3"},
        {"1 jump 3\n", "line 1"},
        {"-1 close\n", "line 1"},
        {"1 keydown -5\n", "line 1"},
        {"1 pendown 70000 5\n", "line 1"},
        {"1 close now\n", "line 1"},
        {"99999999999999 close\n", "line 1"},
        {"1\n", "line 1"},
    };
    for (const auto& c : cases) {
        std::vector<ScriptEvent> events(1);
        std::string error;
        EXPECT_FALSE(host::ParseScript(c.text, events, error)) << c.text;
        EXPECT_NE(error.find(c.line), std::string::npos) << c.text << " -> " << error;
        EXPECT_EQ(events.size(), 1u) << "a refused script leaves nothing behind";
    }
}

}  // namespace
