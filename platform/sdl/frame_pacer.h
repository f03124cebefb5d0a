// Paces the game's busy main loop to a fixed number of passes per second.
#pragma once

#include <cstdint>

namespace sdl {

class FramePacer {
public:
    explicit FramePacer(int framesPerSecond);

    // Takes the time (microseconds) at which a pass ended and returns when the next pass may
    // begin. Slots stay on a fixed grid so the rate does not drift; a pass that ran late moves
    // the grid to its end instead of earning a burst of catch-up passes.
    std::uint64_t NextSlot(std::uint64_t nowUs);

    std::uint64_t PeriodUs() const { return periodUs_; }

private:
    std::uint64_t periodUs_;
    std::uint64_t nextUs_ = 0;
    bool started_ = false;
};

}  // namespace sdl
