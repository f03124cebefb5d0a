#include "support/game_run.h"

#include <gtest/gtest.h>

#include "platform/host.h"
#include "platform/window.h"

namespace test {

std::string DeviceDir() {
    return REDIZOR_TEST_DEVICE_DIR;
}

headless::Config PackConfig(long maxPasses) {
    headless::Config config;
    config.deviceDir = DeviceDir();
    config.maxPasses = maxPasses;
    config.quiet = true;
    return config;
}

RunResult RunGame(const headless::Config& config, const std::function<void(long)>& onPass) {
    static bool ran = false;
    if (ran) {
        ADD_FAILURE() << "the game ran twice in one process; run the tests through ctest";
        return {};
    }
    ran = true;
    headless::Install(config);
    headless::SetPassHook(onPass);
    headless::SetExitHook([](int code) { throw ProcessExited{code}; });
    static WCHAR commandLine[] = u"";
    RunResult result;
    try {
        result.exitCode = WinMain(nullptr, nullptr, commandLine, SW_SHOW);
    } catch (const ProcessExited& exited) {
        result.exitCode = exited.code;
        result.exitedThroughExitProcess = true;
    }
    headless::SetPassHook(nullptr);
    return result;
}

}  // namespace test
