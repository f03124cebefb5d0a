// Headless sessions from the command line: scripted input, a trace of every pass and
// screenshots, on the headless backend's virtual clock.
#pragma once

#include <string>
#include <vector>

#include "platform/host/script.h"

namespace host {

struct RunnerConfig {
    std::string deviceDir;
    int passMs = 40;
    long passes = -1;  // close the window after this many passes; -1: run until the game ends
    std::vector<ScriptEvent> script;
    std::string traceFile;  // empty: no trace
    std::string screenshotDir;
    std::vector<long> screenshotAt;
};

// Runs WinMain headless. Returns the program's exit code, or 2 when a file cannot be written.
int RunHeadless(const RunnerConfig& config);

}  // namespace host
