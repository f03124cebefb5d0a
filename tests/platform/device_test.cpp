// The device folder: paths matched without regard to case, the registry file, and files.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "platform/core/device.h"
#include "platform/files.h"
#include "platform/headless/headless.h"
#include "platform/registry.h"
#include "support/temp_device.h"

namespace {

class DeviceTest : public ::testing::Test {
protected:
    void SetUp() override {
        headless::Config config;
        config.deviceDir = device.path();
        config.quiet = true;
        headless::Install(config);
    }
    test::TempDevice device;
};

TEST_F(DeviceTest, NamesMatchWithoutRegardToCase) {
    device.WriteText("Program Files/Redizor/image/Start.DC8", "x");
    struct {
        const char* path;
        bool found;
    } cases[] = {
        {"\\Program Files\\Redizor\\image\\Start.DC8", true},
        {"\\program files\\REDIZOR\\IMAGE\\start.dc8", true},
        {"\\Program Files\\\\Redizor\\image\\start.dc8", true},  // doubled separators
        {"\\Program Files\\Redizor\\image\\start.dc", false},
        {"\\Program Files\\Redizor\\..\\Redizor\\image\\start.dc8", false},
        {"\\..\\etc\\passwd", false},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(!platform::ResolveDevicePath(c.path).empty(), c.found) << c.path;
    }
}

TEST_F(DeviceTest, ReadOnlyAccessToAReadOnlyFileWorksButWriteAccessDoesNot) {
    device.WriteText("vorndc8/score.uc2", "abcdef");
    ASSERT_EQ(::chmod((device.path() + "/vorndc8/score.uc2").c_str(), 0444), 0);
    HANDLE ro = CreateFileW(u"\\vorndc8\\score.uc2", GENERIC_READ, FILE_SHARE_READ, nullptr,
                            OPEN_EXISTING, 0, nullptr);
    ASSERT_NE(ro, INVALID_HANDLE_VALUE);
    char buf[8] = {};
    DWORD got = 0;
    EXPECT_TRUE(ReadFile(ro, buf, 8, &got, nullptr));
    EXPECT_EQ(got, 6u) << "the end of the file is a short read, not a failure";
    EXPECT_EQ(GetFileSize(ro, nullptr), 6u);
    EXPECT_EQ(SetFilePointer(ro, 2, nullptr, FILE_BEGIN), 2u);
    EXPECT_TRUE(ReadFile(ro, buf, 1, &got, nullptr));
    EXPECT_EQ(buf[0], 'c');
    EXPECT_TRUE(CloseHandle(ro));
    if (::geteuid() != 0) {  // root may write anything
        EXPECT_EQ(CreateFileW(u"\\vorndc8\\score.uc2", GENERIC_READ | GENERIC_WRITE,
                              FILE_SHARE_READ, nullptr, OPEN_EXISTING, 0, nullptr),
                  INVALID_HANDLE_VALUE);
    }
    EXPECT_EQ(CreateFileW(u"\\vorndc8", GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr),
              INVALID_HANDLE_VALUE)
        << "a folder is not a file";
}

TEST_F(DeviceTest, RegistryFileGivesKeysAndValues) {
    device.WriteText("registry.txt",
                     "; comment\r\n"
                     "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Other]\n\"InstallDir\"=\"\\wrong\"\n"
                     "[hkey_local_machine\\software\\apps\\vorn redizor demo]\n"
                     "\"InstallDir\"=\"\\Program Files\\Redizor\\\"\r\n");
    HKEY key = nullptr;
    ASSERT_EQ(RegOpenKeyExW(HKEY_LOCAL_MACHINE, u"\\SOFTWARE\\Apps\\Vorn Redizor Demo", 0,
                            KEY_ALL_ACCESS, &key),
              ERROR_SUCCESS);
    WCHAR value[64] = {};
    DWORD size = sizeof value;
    ASSERT_EQ(RegQueryValueExW(key, u"installdir", nullptr, nullptr, reinterpret_cast<BYTE*>(value),
                               &size),
              ERROR_SUCCESS);
    EXPECT_EQ(std::u16string(value), u"\\Program Files\\Redizor\\") << "taken as written";
    EXPECT_EQ(size, 24u * 2) << "bytes, with the terminator";
    DWORD small = 10;
    EXPECT_EQ(RegQueryValueExW(key, u"InstallDir", nullptr, nullptr, reinterpret_cast<BYTE*>(value),
                               &small),
              ERROR_MORE_DATA);
    EXPECT_EQ(
        RegQueryValueExW(key, u"Missing", nullptr, nullptr, reinterpret_cast<BYTE*>(value), &size),
        ERROR_FILE_NOT_FOUND);
    EXPECT_EQ(RegCloseKey(key), ERROR_SUCCESS);

    EXPECT_NE(
        RegOpenKeyExW(HKEY_LOCAL_MACHINE, u"\\SOFTWARE\\Apps\\Nothing", 0, KEY_ALL_ACCESS, &key),
        ERROR_SUCCESS);
    device.Remove("registry.txt");
    EXPECT_NE(RegOpenKeyExW(HKEY_LOCAL_MACHINE, u"\\SOFTWARE\\Apps\\Vorn Redizor Demo", 0,
                            KEY_ALL_ACCESS, &key),
              ERROR_SUCCESS)
        << "a missing registry file is a missing key";
}

}  // namespace
