// The install directory from the registry and the paths built from it.
#include <gtest/gtest.h>

#include "app/paths.h"
#include "assets/cues.h"
#include "platform/core/utf.h"
#include "platform/headless/headless.h"
#include "support/temp_device.h"

namespace {

class PathsTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.deviceDir = device.path();
        config.quiet = true;
        headless::Install(config);
        headless::Log().Clear();
        g_installDir[0] = 0;
    }
    static std::string Utf8(const WCHAR* s) { return platform::ToUtf8(s); }
    test::TempDevice device;
};

TEST_F(PathsTest, PathsAreThePlainConcatenation) {
    struct Case {
        const char* stored;
        const char* image;
        const char* sound;
    } cases[] = {
        {"\\Program Files\\Redizor", "\\Program Files\\Redizor\\image\\menu.dc8",
         "\\Program Files\\Redizor\\sound\\menu.mc8"},
        {"\\Games\\", "\\Games\\\\image\\menu.dc8", "\\Games\\\\sound\\menu.mc8"},  // doubled
        {"", "\\image\\menu.dc8", "\\sound\\menu.mc8"},
    };
    for (const Case& c : cases) {
        device.WriteRegistry(c.stored);
        g_installDir[0] = 0;
        ReadInstallDir();
        EXPECT_EQ(Utf8(ImagePath(u"\\menu.dc8")), c.image);
        EXPECT_EQ(Utf8(SoundPath(u"\\menu.mc8")), c.sound);
    }
    EXPECT_TRUE(headless::Log().messageBoxes.empty());
}

TEST_F(PathsTest, BothPathsShareOneBuffer) {
    device.WriteRegistry("\\D");
    ReadInstallDir();
    LPWSTR image = ImagePath(u"\\a.dc8");
    LPWSTR sound = SoundPath(u"\\b.mc8");
    EXPECT_EQ(image, sound);
    EXPECT_EQ(image, g_pathBuf);
    EXPECT_EQ(Utf8(image), "\\D\\sound\\b.mc8") << "the sound path overwrote the image path";
}

TEST_F(PathsTest, MissingKeyIsReportedEachTimeAndKeepsTheEarlierDirectory) {
    ReadInstallDir();
    ASSERT_EQ(headless::Log().messageBoxes.size(), 1u);
    EXPECT_EQ(headless::Log().messageBoxes[0].text,
              "This is a problem in process of installation please reinstall");
    EXPECT_EQ(headless::Log().messageBoxes[0].caption, "Message");
    EXPECT_EQ(Utf8(g_installDir), "");

    device.WriteRegistry("\\First");
    ReadInstallDir();
    device.Remove("registry.txt");
    ReadInstallDir();
    EXPECT_EQ(headless::Log().messageBoxes.size(), 2u);
    EXPECT_EQ(Utf8(g_installDir), "\\First");
}

TEST_F(PathsTest, ValueTooLongOrMissingKeepsTheDirectorySilently) {
    device.WriteRegistry("\\First");
    ReadInstallDir();
    device.WriteRegistry(std::string(126, 'a'));  // 126 units fit
    ReadInstallDir();
    EXPECT_EQ(Utf8(g_installDir), std::string(126, 'a'));
    device.WriteRegistry(std::string(127, 'b'));  // one more does not
    ReadInstallDir();
    EXPECT_EQ(Utf8(g_installDir), std::string(126, 'a'));
    device.WriteText("registry.txt", "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Apps\\Vorn Redizor Demo]\n");
    ReadInstallDir();
    EXPECT_EQ(Utf8(g_installDir), std::string(126, 'a'));
    EXPECT_TRUE(headless::Log().messageBoxes.empty());
}

TEST_F(PathsTest, CuesPlayFromTheSoundFolderInOrder) {
    device.WriteRegistry("\\Program Files\\Redizor");
    ReadInstallDir();
    PlayCue(u"\\start.mc8");
    PlayCue(u"\\taken_fish.mc8");
    const auto& cues = headless::Log().cues;
    ASSERT_EQ(cues.size(), 2u);
    EXPECT_EQ(cues[0], "\\Program Files\\Redizor\\sound\\start.mc8");
    EXPECT_EQ(cues[1], "\\Program Files\\Redizor\\sound\\taken_fish.mc8");
    EXPECT_EQ(CueForDifficulty(1, u"n", u"j", u"p"), std::u16string(u"n"));
    EXPECT_EQ(CueForDifficulty(3, u"n", u"j", u"p"), std::u16string(u"p"));
    EXPECT_EQ(CueForDifficulty(0, u"n", u"j", u"p"), nullptr);
    EXPECT_EQ(CueForDifficulty(4, u"n", u"j", u"p"), nullptr);
}

}  // namespace
