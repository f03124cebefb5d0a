#include "platform/sdl/frame_pacer.h"

#include <algorithm>

namespace sdl {

namespace {
constexpr int kDefaultFramesPerSecond = 25;  // the handheld's pace
}

FramePacer::FramePacer(int framesPerSecond)
    : periodUs_(1000000u / static_cast<unsigned>(framesPerSecond > 0 ? framesPerSecond
                                                                     : kDefaultFramesPerSecond)) {}

std::uint64_t FramePacer::NextSlot(std::uint64_t nowUs) {
    if (!started_) {
        started_ = true;
        nextUs_ = nowUs;
    }
    nextUs_ = std::max(nextUs_ + periodUs_, nowUs);
    return nextUs_;
}

}  // namespace sdl
