// Running the game through the headless backend, the way the host's entry does.
#pragma once

#include <functional>
#include <string>

#include "platform/headless/headless.h"

namespace test {

// The data pack the build generates.
std::string DeviceDir();

// Thrown from the headless exit hook when the game ends itself through ExitProcess.
struct ProcessExited {
    int code;
};

struct RunResult {
    int exitCode = 0;
    bool exitedThroughExitProcess = false;
};

// Runs WinMain once with the headless backend. onPass is called at the end of every
// main-loop pass; the window is closed after maxPasses passes. A process may run the game
// only once: the program's globals start as the program starts.
RunResult RunGame(const headless::Config& config, const std::function<void(long pass)>& onPass);

// A config for the generated data pack, quiet, closing after maxPasses.
headless::Config PackConfig(long maxPasses);

}  // namespace test
