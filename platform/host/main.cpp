// The process entry on the desktop: host options, backend choice, then the game's WinMain.
#include <sys/stat.h>
#include <unistd.h>

#include <climits>
#include <cstdio>
#include <fstream>
#include <sstream>
#include <string>

#include "platform/headless/headless.h"
#include "platform/host.h"
#include "platform/host/device_lookup.h"
#include "platform/host/options.h"
#include "platform/host/runner.h"
#include "platform/sdl/sdl_backend.h"
#include "platform/window.h"

#ifndef REDIZOR_VERSION
#define REDIZOR_VERSION "0.0.0"
#endif
#ifndef REDIZOR_INSTALLED_DATA_DIR
#define REDIZOR_INSTALLED_DATA_DIR ""
#endif

namespace {

bool IsFolder(const std::string& path) {
    struct stat st {};
    return !path.empty() && ::stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

}  // namespace

int main(int argc, char** argv) {
    host::Options options;
    std::string error;
    if (!host::ParseOptions(argc, argv, options, error)) {
        std::fprintf(stderr, "redizor: %s\nTry 'redizor --help'.\n", error.c_str());
        return 2;
    }
    if (options.help) {
        std::fputs(host::UsageText().c_str(), stdout);
        return 0;
    }
    if (options.version) {
        std::printf("redizor %s\n", REDIZOR_VERSION);
        return 0;
    }
    std::string device = options.deviceDir;
    if (device.empty()) {
        device = host::FindDeviceFolder(host::CurrentPlaces(REDIZOR_INSTALLED_DATA_DIR));
    }
    if (!IsFolder(device)) {
        std::fprintf(stderr,
                     "redizor: no device folder found%s%s (give one with --device DIR or "
                     "REDIZOR_DEVICE)\n",
                     device.empty() ? "" : " at ", device.c_str());
        return 2;
    }
    if (options.headless) {
        host::RunnerConfig config;
        config.deviceDir = device;
        config.passMs = options.passMs;
        config.passes = options.passes;
        config.traceFile = options.trace;
        config.screenshotDir = options.screenshotDir.empty() ? "." : options.screenshotDir;
        config.screenshotAt = options.screenshotAt;
        if (!options.script.empty()) {
            std::ifstream in(options.script);
            if (!in) {
                std::fprintf(stderr, "redizor: cannot read the script '%s'\n",
                             options.script.c_str());
                return 2;
            }
            std::stringstream text;
            text << in.rdbuf();
            if (!host::ParseScript(text.str(), config.script, error)) {
                std::fprintf(stderr, "redizor: %s: %s\n", options.script.c_str(), error.c_str());
                return 2;
            }
        }
        return host::RunHeadless(config);
    }
    {
        sdl::Config config;
        config.deviceDir = device;
        config.scale = options.scale;
        config.fullscreen = options.fullscreen;
        config.framesPerSecond = options.framesPerSecond;
        if (!sdl::Install(config)) {
            return 1;
        }
    }
    static WCHAR commandLine[] = u"";
    return WinMain(nullptr, nullptr, commandLine, SW_SHOW);
}
