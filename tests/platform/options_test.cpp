// The host's own command-line options.
#include <gtest/gtest.h>

#include "platform/host/options.h"

namespace {

bool Parse(std::vector<const char*> args, host::Options& o, std::string& error) {
    args.insert(args.begin(), "redizor");
    return host::ParseOptions(static_cast<int>(args.size()), args.data(), o, error);
}

TEST(OptionsTest, ReadsEveryOptionBothWays) {
    host::Options o;
    std::string error;
    ASSERT_TRUE(Parse({"--headless", "--device", "/d", "--passes=300", "--pass-ms", "20",
                       "--screenshot-at", "1,50,299", "--scale=3", "--fullscreen", "--fps", "50"},
                      o, error))
        << error;
    EXPECT_TRUE(o.headless);
    EXPECT_EQ(o.deviceDir, "/d");
    EXPECT_EQ(o.passes, 300);
    EXPECT_EQ(o.passMs, 20);
    EXPECT_EQ(o.screenshotAt, (std::vector<long>{1, 50, 299}));
    EXPECT_EQ(o.scale, 3);
    EXPECT_TRUE(o.fullscreen);
    EXPECT_EQ(o.framesPerSecond, 50);
}

TEST(OptionsTest, RefusesWhatItCannotUse) {
    const std::vector<std::vector<const char*>> bad = {
        {"--bogus"},       {"--scale"},     {"--scale", "0"},
        {"--scale", "2x"}, {"--fps", "-1"}, {"--screenshot-at", "1,,2"},
        {"--pass-ms", ""},
    };
    for (const auto& args : bad) {
        host::Options o;
        std::string error;
        EXPECT_FALSE(Parse(args, o, error)) << args[0];
        EXPECT_FALSE(error.empty());
    }
}

TEST(OptionsTest, HelpNamesEveryOption) {
    std::string help = host::UsageText();
    for (const char* name :
         {"--device", "--scale", "--fullscreen", "--fps", "--headless", "--passes", "--pass-ms",
          "--script", "--trace", "--screenshot-dir", "--version"}) {
        EXPECT_NE(help.find(name), std::string::npos) << name;
    }
}

}  // namespace
