#include "screen_driver.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>

#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/round_state.h"
#include "platform/headless/headless.h"

namespace screens_test {

namespace fs = std::filesystem;

namespace {

constexpr long kPassLimit = 20000;  // a route that never arrives must still end
constexpr long kTapSettle = 4;      // passes for a tap to be seen down and then up

struct Walker {
    const Route* run = nullptr;
    const LegHook* hook = nullptr;
    std::size_t leg = 0;
    bool arrived = false;
    bool closed = false;
    long k = 0;
    long nextAct = 0;

    void Arrive() {
        arrived = true;
        k = 0;
        (*hook)(static_cast<int>(leg), 0);
    }

    // One step towards the leg's screen from wherever the game is.
    void Act(BYTE target) {
        switch (g_screen) {
            case SCREEN_TITLE:
                if (target == SCREEN_OPTIONS || target == SCREEN_INTRO) {
                    headless::Tap(10, 265);
                } else {
                    headless::Tap(10, 225);
                }
                break;
            case SCREEN_OPTIONS:
                headless::Tap(target == SCREEN_TITLE ? 30 : 220, 280);
                break;
            case SCREEN_INTRO:
                headless::Tap(target == SCREEN_OPTIONS || target == SCREEN_TITLE ? 60 : 170, 275);
                break;
            case SCREEN_FISHING:
                if (target == SCREEN_RANKING) {
                    g_energy = 0;  // the drain ends the round within a few frames
                } else {
                    headless::Tap(20, 280);  // the round's exit button
                }
                break;
            case SCREEN_RANKING:
                headless::Tap(20, 275);
                break;
            default:
                break;
        }
    }

    void Pass(long pass) {
        if (closed) {
            return;
        }
        if (arrived) {
            ++k;
            (*hook)(static_cast<int>(leg), k);
            if (k < run->legs[leg].stay) {
                return;
            }
            arrived = false;
            ++leg;
            nextAct = pass;
            if (leg == run->legs.size()) {
                closed = true;
                headless::Close();
                return;
            }
        }
        if (g_screen == run->legs[leg].screen) {
            Arrive();
        } else if (pass >= nextAct) {
            Act(run->legs[leg].screen);
            nextAct = pass + kTapSettle;
        }
        if (pass > kPassLimit && !closed) {
            ADD_FAILURE() << "route leg " << leg << " never reached";
            closed = true;
            headless::Close();
        }
    }
};

}  // namespace

test::RunResult Walk(const Route& run, const LegHook& onPass) {
    static Walker walker;
    walker.run = &run;
    walker.hook = &onPass;
    headless::Config config = test::PackConfig(-1);
    if (!run.deviceDir.empty()) {
        config.deviceDir = run.deviceDir;
    }
    config.automaticTimer = run.clock;
    headless::SetLoopStartHook([] {
        if (walker.run->legs.front().screen == SCREEN_TITLE) {
            walker.Arrive();
        }
    });
    test::RunResult result = test::RunGame(config, [](long pass) { walker.Pass(pass); });
    headless::SetLoopStartHook(nullptr);
    return result;
}

DeviceCopy::DeviceCopy() {
    std::string pattern = (fs::temp_directory_path() / "redizor-screens-XXXXXX").string();
    char* made = ::mkdtemp(pattern.data());
    path_ = made != nullptr ? made : pattern;
    fs::copy(test::DeviceDir(), path_, fs::copy_options::recursive);
}

DeviceCopy::~DeviceCopy() {
    std::error_code ignored;
    fs::remove_all(path_, ignored);
}

std::string DeviceCopy::RankingPath() const {
    return path_ + "/vorndc8/score.uc2";
}

void DeviceCopy::WriteRanking(const std::vector<std::uint8_t>* bytes) const {
    std::error_code ignored;
    fs::remove(RankingPath(), ignored);
    if (bytes == nullptr) {
        return;
    }
    std::ofstream out(RankingPath(), std::ios::binary);
    out.write(reinterpret_cast<const char*>(bytes->data()),
              static_cast<std::streamsize>(bytes->size()));
}

namespace {

void PutUnits(std::vector<std::uint8_t>& out, const std::u16string& text, std::size_t units) {
    for (std::size_t i = 0; i < units; ++i) {
        char16_t c = i < text.size() ? text[i] : u'_';
        out.push_back(static_cast<std::uint8_t>(c & 0xFF));
        out.push_back(static_cast<std::uint8_t>(c >> 8));
    }
}

}  // namespace

std::vector<std::uint8_t> RankingRecord(const std::u16string& name, const std::u16string& score) {
    std::vector<std::uint8_t> out;
    PutUnits(out, name, 10);
    PutUnits(out, u" ", 1);
    PutUnits(out, score, 8);
    PutUnits(out, u" ", 1);
    return out;
}

std::vector<std::uint8_t> RankingFile(const std::vector<std::vector<std::uint8_t>>& records) {
    std::vector<std::uint8_t> out{0xFF, 0xFE};
    for (const auto& r : records) {
        out.insert(out.end(), r.begin(), r.end());
    }
    return out;
}

std::size_t BlitCount() {
    return headless::Log().windowBlits.size();
}

bool AllBlitsWholeFrames() {
    for (const platform::BlitRecord& b : headless::Log().windowBlits) {
        if (b.x != 0 || b.y != 0 || b.width != 240 || b.height != 293 || b.srcY != 0) {
            return false;
        }
    }
    return true;
}

namespace {

bool EndsWith(const std::string& s, const std::string& tail) {
    return s.size() >= tail.size() && s.compare(s.size() - tail.size(), tail.size(), tail) == 0;
}

int CountEnding(const std::vector<std::string>& list, const std::string& tail) {
    int n = 0;
    for (const std::string& s : list) {
        n += EndsWith(s, tail) ? 1 : 0;
    }
    return n;
}

}  // namespace

int CueCount(const std::string& fileName) {
    return CountEnding(headless::Log().cues, fileName);
}

int OpenedCount(const std::string& fileName) {
    return CountEnding(headless::Log().filesOpened, fileName);
}

BYTE PixelOf(Image* image, int x, int y) {
    return *image->PixelAddress(x, y);
}

bool ShowsBlock(Image* dest, int dx, int dy, Image* src, int sx, int sy, int w, int h, bool keyed) {
    BYTE key = keyed ? static_cast<Sprite*>(src)->key : 0;
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            BYTE s = PixelOf(src, sx + x, sy + y);
            if (keyed && s == key) {
                continue;
            }
            if (PixelOf(dest, dx + x, dy + y) != s) {
                return false;
            }
        }
    }
    return true;
}

bool ScreenShowsFrameAt(int x, int y) {
    const RGBQUAD& q = g_frameImage->info->bmiColors[PixelOf(g_frameImage, x, y)];
    std::uint32_t rgb = (std::uint32_t{q.rgbRed} << 16) | (q.rgbGreen << 8) | q.rgbBlue;
    return headless::Screen().At(x, y) == rgb;
}

bool ScreenShowsFrame() {
    for (int y = 0; y < 293; ++y) {
        for (int x = 0; x < 240; ++x) {
            if (!ScreenShowsFrameAt(x, y)) {
                return false;
            }
        }
    }
    return true;
}

}  // namespace screens_test
