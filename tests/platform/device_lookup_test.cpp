// Finding the data without options: the environment, the player's data folder, the
// installed data, then beside the binary.
#include <gtest/gtest.h>

#include "platform/host/device_lookup.h"
#include "support/temp_device.h"

namespace {

TEST(DeviceLookupTest, TriesThePlacesInOrderAndTakesTheFirstThatHoldsData) {
    test::TempDevice root;
    const std::string r = root.path();
    host::LookupPlaces places{r + "/env", r + "/xdg", r + "/usr/share/redizor", r + "/bin"};
    EXPECT_EQ(host::DeviceCandidates(places),
              (std::vector<std::string>{r + "/env", r + "/xdg/redizor/device",
                                        r + "/usr/share/redizor/device",
                                        r + "/bin/../share/redizor/device", r + "/bin/device"}));
    EXPECT_EQ(host::FindDeviceFolder(places), "");

    root.WriteText("bin/device/registry.txt", "x");
    EXPECT_EQ(host::FindDeviceFolder(places), r + "/bin/device");
    root.WriteText("usr/share/redizor/device/Program Files/Redizor/image/a.dc8", "x");
    EXPECT_EQ(host::FindDeviceFolder(places), r + "/usr/share/redizor/device");
    root.WriteText("xdg/redizor/device/registry.txt", "x");
    EXPECT_EQ(host::FindDeviceFolder(places), r + "/xdg/redizor/device");
    root.WriteText("env/unrelated.txt", "x");
    EXPECT_EQ(host::FindDeviceFolder(places), r + "/xdg/redizor/device")
        << "a folder without the game's data is passed over";
    root.WriteText("env/registry.txt", "x");
    EXPECT_EQ(host::FindDeviceFolder(places), r + "/env");
}

TEST(DeviceLookupTest, EmptyPlacesAreSkipped) {
    host::LookupPlaces places{"", "", "/opt/x", ""};
    EXPECT_EQ(host::DeviceCandidates(places), (std::vector<std::string>{"/opt/x/device"}));
}

}  // namespace
