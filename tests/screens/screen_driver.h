// Walking the front-end screens through the headless backend with real stylus messages, the
// way a player does: a route of screens, each visited for a number of passes.
//
// Timing of a tap posted after pass n: the press is dispatched after frame n + 1, so frame
// n + 2 is the only one to see the stylus down; frame n + 3 sees it lifted.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "gfx/image.h"
#include "platform/types.h"
#include "support/game_run.h"

namespace screens_test {

struct Leg {
    BYTE screen;  // where to go next
    long stay;    // passes to spend there before moving on (or closing, after the last leg)
};

// onPass(leg, k): k 0 at the end of the pass that arrived on the leg's screen (or at the loop's
// start for a route that begins on the title), then k 1, 2, ... after each of its frames.
// Only the screens' own stylus areas move the player along; a round is ended by running its
// energy out.
using LegHook = std::function<void(int leg, long k)>;

struct Route {
    std::vector<Leg> legs;
    std::string deviceDir;  // empty: the generated data pack
    bool clock = false;     // automatic 100 ms ticks (they take turns with input messages)
};

test::RunResult Walk(const Route& run, const LegHook& onPass);

// A device folder with the data pack's pictures and sounds and a ranking file of its own.
class DeviceCopy {
public:
    DeviceCopy();
    ~DeviceCopy();
    DeviceCopy(const DeviceCopy&) = delete;
    DeviceCopy& operator=(const DeviceCopy&) = delete;
    const std::string& path() const { return path_; }
    // Replaces the ranking file (header unit then the records' bytes); nullptr removes it.
    void WriteRanking(const std::vector<std::uint8_t>* bytes) const;
    std::string RankingPath() const;

private:
    std::string path_;
};

// One 40-byte ranking record: a name of 10 units and a score of 8, padded with '_'.
std::vector<std::uint8_t> RankingRecord(const std::u16string& name, const std::u16string& score);
// A whole ranking file from its records.
std::vector<std::uint8_t> RankingFile(const std::vector<std::vector<std::uint8_t>>& records);

// Window blits since the log was last cleared.
std::size_t BlitCount();
// True when every window blit since the log was cleared copied the whole frame at once.
bool AllBlitsWholeFrames();
// Cues played since the log was cleared whose path ends with fileName.
int CueCount(const std::string& fileName);
// Picture files opened since the log was cleared whose path ends with fileName.
int OpenedCount(const std::string& fileName);

// Pixel (x, y) of a picture, top row first.
BYTE PixelOf(Image* image, int x, int y);
// True when the w x h block of dest at (dx, dy) shows src's block at (sx, sy) on every pixel
// where src is not its key (keyed true) or on every pixel (keyed false).
bool ShowsBlock(Image* dest, int dx, int dy, Image* src, int sx, int sy, int w, int h, bool keyed);
// True when the window shows g_frameImage as it is now, pixel for pixel through its palette.
bool ScreenShowsFrame();
bool ScreenShowsFrameAt(int x, int y);

}  // namespace screens_test
