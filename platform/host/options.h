// The host's command-line options. They belong to the host, not the game: they are parsed
// before WinMain, which takes none.
#pragma once

#include <string>
#include <vector>

namespace host {

struct Options {
    bool headless = false;
    bool help = false;
    bool version = false;
    std::string deviceDir;  // empty: the default device folder
    int scale = 0;
    bool fullscreen = false;
    int framesPerSecond = 25;
    // headless only
    long passes = -1;
    int passMs = 40;
    std::string script;
    std::string trace;
    std::string screenshotDir;
    std::vector<long> screenshotAt;
};

// Parses argv; on an unknown option or a bad value returns false and sets error.
bool ParseOptions(int argc, const char* const* argv, Options& options, std::string& error);
// The text of --help.
std::string UsageText();

}  // namespace host
