// The SDL backend's parts that need no display: pacing, input translation, the
// single-instance channel and cue playback (on SDL's dummy audio driver).
#include <SDL.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "platform/sdl/frame_pacer.h"
#include "platform/sdl/input.h"
#include "platform/sdl/sdl_audio.h"
#include "platform/sdl/single_instance.h"
#include "platform/window.h"

namespace {

// ---- pacing ----

struct PacerCase {
    const char* name;
    int fps;
    std::vector<std::pair<std::uint64_t, std::uint64_t>> passEndToSlot;  // microseconds
};

TEST(FramePacer, SlotsFollowAFixedGridWithoutDriftOrBurst) {
    const PacerCase cases[] = {
        {"first pass waits one period", 25, {{1000, 41000}}},
        {"passes on time keep the grid", 25, {{1000, 41000}, {41000, 81000}, {81000, 121000}}},
        {"a slightly late pass does not shift later slots",
         25,
         {{1000, 41000}, {52000, 81000}, {81000, 121000}}},
        {"a pass late by more than a period moves the grid, no catch-up burst",
         25,
         {{1000, 41000}, {300000, 300000}, {300500, 340000}, {340000, 380000}}},
        {"60 frames per second", 60, {{0, 16666}, {16666, 33332}}},
        {"no rate given falls back to the handheld's 25", 0, {{0, 40000}, {40000, 80000}}},
    };
    for (const PacerCase& c : cases) {
        SCOPED_TRACE(c.name);
        sdl::FramePacer pacer(c.fps);
        for (auto [passEnd, slot] : c.passEndToSlot) {
            EXPECT_EQ(pacer.NextSlot(passEnd), slot) << "pass ending at " << passEnd;
        }
    }
}

// ---- input ----

constexpr Uint32 kWindowId = 7;

SDL_Event Key(Uint32 type, SDL_Keycode sym, Uint8 repeat = 0, Uint16 mod = KMOD_NONE) {
    SDL_Event e{};
    e.type = type;
    e.key.windowID = kWindowId;
    e.key.state = type == SDL_KEYDOWN ? SDL_PRESSED : SDL_RELEASED;
    e.key.repeat = repeat;
    e.key.keysym.sym = sym;
    e.key.keysym.mod = mod;
    return e;
}
SDL_Event Down(SDL_Keycode sym) {
    return Key(SDL_KEYDOWN, sym);
}
SDL_Event Up(SDL_Keycode sym) {
    return Key(SDL_KEYUP, sym);
}

SDL_Event Button(Uint32 type, int x, int y, Uint8 button = SDL_BUTTON_LEFT, Uint32 which = 0) {
    SDL_Event e{};
    e.type = type;
    e.button.windowID = kWindowId;
    e.button.which = which;
    e.button.button = button;
    e.button.x = x;
    e.button.y = y;
    return e;
}

SDL_Event Finger(Uint32 type, SDL_FingerID id, float x, float y) {
    SDL_Event e{};
    e.type = type;
    e.tfinger.fingerId = id;
    e.tfinger.x = x;
    e.tfinger.y = y;
    return e;
}

SDL_Event WindowEvent(Uint8 what, Uint32 id = kWindowId) {
    SDL_Event e{};
    e.type = SDL_WINDOWEVENT;
    e.window.windowID = id;
    e.window.event = what;
    return e;
}

SDL_Event Quit() {
    SDL_Event e{};
    e.type = SDL_QUIT;
    return e;
}

using Kind = sdl::HostAction::Kind;
struct Expect {
    Kind kind;
    UINT message = 0;
    WPARAM wParam = 0;
    LPARAM lParam = 0;
};
Expect None() {
    return {Kind::kNone};
}
Expect Msg(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
    return {Kind::kPost, message, wParam, lParam};
}
Expect Toggle() {
    return {Kind::kToggleFullScreen};
}
Expect Redraw() {
    return {Kind::kRedraw};
}

struct InputCase {
    const char* name;
    std::vector<SDL_Event> events;
    std::vector<Expect> actions;  // one per event
};

TEST(InputTranslator, EventsBecomeTheHandheldsMessages) {
    const InputCase cases[] = {
        {"d-pad",
         {Down(SDLK_LEFT), Up(SDLK_LEFT), Down(SDLK_UP), Up(SDLK_UP), Down(SDLK_RIGHT),
          Up(SDLK_RIGHT), Down(SDLK_DOWN), Up(SDLK_DOWN)},
         {Msg(WM_KEYDOWN, 37), Msg(WM_KEYUP, 37), Msg(WM_KEYDOWN, 38), Msg(WM_KEYUP, 38),
          Msg(WM_KEYDOWN, 39), Msg(WM_KEYUP, 39), Msg(WM_KEYDOWN, 40), Msg(WM_KEYUP, 40)}},
        {"Enter, keypad Enter and Space are the action key",
         {Down(SDLK_RETURN), Up(SDLK_RETURN), Down(SDLK_KP_ENTER), Up(SDLK_KP_ENTER),
          Down(SDLK_SPACE), Up(SDLK_SPACE)},
         {Msg(WM_KEYDOWN, 13), Msg(WM_KEYUP, 13), Msg(WM_KEYDOWN, 13), Msg(WM_KEYUP, 13),
          Msg(WM_KEYDOWN, 13), Msg(WM_KEYUP, 13)}},
        {"a held key repeats as further presses",
         {Down(SDLK_DOWN), Key(SDL_KEYDOWN, SDLK_DOWN, 1), Key(SDL_KEYDOWN, SDLK_DOWN, 1),
          Up(SDLK_DOWN)},
         {Msg(WM_KEYDOWN, 40), Msg(WM_KEYDOWN, 40), Msg(WM_KEYDOWN, 40), Msg(WM_KEYUP, 40)}},
        {"keys the handheld lacks are ignored",
         {Down(SDLK_a), Up(SDLK_a), Down(SDLK_ESCAPE), Up(SDLK_ESCAPE)},
         {None(), None(), None(), None()}},
        {"a release without its press (held before focus) is ignored",
         {Up(SDLK_RIGHT), Key(SDL_KEYDOWN, SDLK_RIGHT, 1)},
         {None(), None()}},
        {"F11 toggles full screen and is not a game key",
         {Down(SDLK_F11), Key(SDL_KEYDOWN, SDLK_F11, 1), Up(SDLK_F11)},
         {Toggle(), None(), None()}},
        {"Alt+Enter toggles full screen; its repeat and release do not reach the game",
         {Key(SDL_KEYDOWN, SDLK_RETURN, 0, KMOD_LALT), Key(SDL_KEYDOWN, SDLK_RETURN, 1, KMOD_LALT),
          Key(SDL_KEYUP, SDLK_RETURN, 0, KMOD_LALT)},
         {Toggle(), None(), None()}},
        {"Alt+keypad Enter toggles too",
         {Key(SDL_KEYDOWN, SDLK_KP_ENTER, 0, KMOD_RALT)},
         {Toggle()}},
        {"left button presses and lifts the stylus at the client pixel",
         {Button(SDL_MOUSEBUTTONDOWN, 100, 200), Button(SDL_MOUSEBUTTONUP, 101, 201)},
         {Msg(WM_LBUTTONDOWN, 0, MAKELPARAM(100, 200)),
          Msg(WM_LBUTTONUP, 0, MAKELPARAM(101, 201))}},
        {"positions beyond the picture are clamped to its edge",
         {Button(SDL_MOUSEBUTTONDOWN, -3, -1), Button(SDL_MOUSEBUTTONUP, 240, 293),
          Button(SDL_MOUSEBUTTONDOWN, 5000, 150)},
         {Msg(WM_LBUTTONDOWN, 0, MAKELPARAM(0, 0)), Msg(WM_LBUTTONUP, 0, MAKELPARAM(239, 292)),
          Msg(WM_LBUTTONDOWN, 0, MAKELPARAM(239, 150))}},
        {"other buttons and SDL's mouse copies of touches are not the stylus",
         {Button(SDL_MOUSEBUTTONDOWN, 10, 10, SDL_BUTTON_RIGHT),
          Button(SDL_MOUSEBUTTONDOWN, 10, 10, SDL_BUTTON_MIDDLE),
          Button(SDL_MOUSEBUTTONDOWN, 10, 10, SDL_BUTTON_LEFT, SDL_TOUCH_MOUSEID)},
         {None(), None(), None()}},
        {"a finger is the stylus, at its normalised position in the picture",
         {Finger(SDL_FINGERDOWN, 1, 0.5f, 0.25f), Finger(SDL_FINGERUP, 1, 1.0f, 0.0f)},
         {Msg(WM_LBUTTONDOWN, 0, MAKELPARAM(120, 73)), Msg(WM_LBUTTONUP, 0, MAKELPARAM(239, 0))}},
        {"only the first finger plays the stylus",
         {Finger(SDL_FINGERDOWN, 1, 0.1f, 0.1f), Finger(SDL_FINGERDOWN, 2, 0.9f, 0.9f),
          Finger(SDL_FINGERUP, 2, 0.9f, 0.9f), Finger(SDL_FINGERUP, 1, 0.1f, 0.1f),
          Finger(SDL_FINGERUP, 1, 0.1f, 0.1f)},
         {Msg(WM_LBUTTONDOWN, 0, MAKELPARAM(24, 29)), None(), None(),
          Msg(WM_LBUTTONUP, 0, MAKELPARAM(24, 29)), None()}},
        {"closing the window or quitting asks the window to close",
         {WindowEvent(SDL_WINDOWEVENT_CLOSE), Quit()},
         {Msg(WM_CLOSE), Msg(WM_CLOSE)}},
        {"another window's events (a message box) are not the game's",
         {WindowEvent(SDL_WINDOWEVENT_CLOSE, kWindowId + 1),
          WindowEvent(SDL_WINDOWEVENT_EXPOSED, kWindowId + 1)},
         {None(), None()}},
        {"a lost or resized picture is drawn again",
         {WindowEvent(SDL_WINDOWEVENT_EXPOSED), WindowEvent(SDL_WINDOWEVENT_SIZE_CHANGED),
          WindowEvent(SDL_WINDOWEVENT_MOVED)},
         {Redraw(), Redraw(), None()}},
    };
    for (const InputCase& c : cases) {
        SCOPED_TRACE(c.name);
        ASSERT_EQ(c.events.size(), c.actions.size());
        sdl::InputTranslator translator;
        translator.SetWindowId(kWindowId);
        for (std::size_t i = 0; i < c.events.size(); ++i) {
            sdl::HostAction got = translator.Translate(c.events[i]);
            const Expect& want = c.actions[i];
            EXPECT_EQ(static_cast<int>(got.kind), static_cast<int>(want.kind)) << "event " << i;
            if (want.kind == Kind::kPost && got.kind == Kind::kPost) {
                EXPECT_EQ(got.message, want.message) << "event " << i;
                EXPECT_EQ(got.wParam, want.wParam) << "event " << i;
                EXPECT_EQ(got.lParam, want.lParam) << "event " << i;
            }
        }
    }
}

// ---- single instance ----

// Unique per test process, so parallel test runs do not find each other (nor the window
// tests' own listener when every test runs in one process).
std::string Scope() {
    return "parts" + std::to_string(::getpid());
}

bool RaiseArrives(sdl::SingleInstance& running) {
    for (int i = 0; i < 100; ++i) {
        if (running.RaiseRequested()) {
            return true;
        }
        ::usleep(1000);
    }
    return false;
}

TEST(SingleInstance, ASecondCopyFindsTheFirstAndAsksItToComeToTheFront) {
    sdl::SingleInstance running, starting;
    running.SetScope(Scope());
    starting.SetScope(Scope());
    ASSERT_TRUE(running.Listen("Redizor"));

    EXPECT_FALSE(starting.ConnectToRunningCopy("Another game"));
    ASSERT_TRUE(starting.ConnectToRunningCopy("Redizor"));
    starting.AskRunningCopyToRaise();
    EXPECT_TRUE(RaiseArrives(running));
    EXPECT_FALSE(running.RaiseRequested()) << "one request raises once";

    // A copy that connects and goes away without asking raises nothing.
    {
        sdl::SingleInstance silent;
        silent.SetScope(Scope());
        ASSERT_TRUE(silent.ConnectToRunningCopy("Redizor"));
    }
    EXPECT_FALSE(RaiseArrives(running));
}

TEST(SingleInstance, TheNameIsHeldOnlyWhileTheCopyRuns) {
    auto copy = std::make_unique<sdl::SingleInstance>();
    copy->SetScope(Scope());
    ASSERT_TRUE(copy->Listen("Redizor"));
    sdl::SingleInstance other;
    other.SetScope(Scope());
    EXPECT_FALSE(other.Listen("Redizor")) << "two copies cannot both hold the name";

    copy.reset();  // the copy ends (or crashes): nothing is left behind
    EXPECT_FALSE(other.ConnectToRunningCopy("Redizor"));
    EXPECT_TRUE(other.Listen("Redizor"));
}

TEST(SingleInstance, NamesAreAbstractPerUserAndScopeAndFitAnAddress) {
    sdl::SingleInstance a, b;
    b.SetScope("elsewhere");
    std::string name = a.AddressName("Redizor");
    ASSERT_FALSE(name.empty());
    EXPECT_EQ(name[0], '\0') << "abstract namespace: no file on disk";
    EXPECT_NE(name.find(std::to_string(::getuid())), std::string::npos);
    EXPECT_NE(a.AddressName("Redizor"), b.AddressName("Redizor"));
    EXPECT_NE(a.AddressName("Redizor"), a.AddressName("Other"));

    std::string longTitle(300, 'x');
    a.SetScope(Scope());
    EXPECT_LE(a.AddressName(longTitle).size(), 108u);
    ASSERT_TRUE(a.Listen(longTitle));
    sdl::SingleInstance c;
    c.SetScope(Scope());
    EXPECT_TRUE(c.ConnectToRunningCopy(longTitle));
}

// ---- cues ----

struct Wav {
    int rate;
    int bits;
    int channels;
    int frames;
};

void WriteWav(const std::string& path, const Wav& w) {
    std::vector<unsigned char> data(static_cast<std::size_t>(w.frames) * w.channels * (w.bits / 8),
                                    w.bits == 8 ? 192 : 0x40);
    auto u32 = [](std::ofstream& f, std::uint32_t v) { f.write(reinterpret_cast<char*>(&v), 4); };
    auto u16 = [](std::ofstream& f, std::uint16_t v) { f.write(reinterpret_cast<char*>(&v), 2); };
    std::ofstream f(path, std::ios::binary);
    f.write("RIFF", 4);
    u32(f, 36 + static_cast<std::uint32_t>(data.size()));
    f.write("WAVEfmt ", 8);
    u32(f, 16);
    u16(f, 1);
    u16(f, static_cast<std::uint16_t>(w.channels));
    u32(f, static_cast<std::uint32_t>(w.rate));
    u32(f, static_cast<std::uint32_t>(w.rate * w.channels * w.bits / 8));
    u16(f, static_cast<std::uint16_t>(w.channels * w.bits / 8));
    u16(f, static_cast<std::uint16_t>(w.bits));
    f.write("data", 4);
    u32(f, static_cast<std::uint32_t>(data.size()));
    f.write(reinterpret_cast<char*>(data.data()), static_cast<std::streamsize>(data.size()));
}

class CuePlayerTest : public ::testing::Test {
protected:
    void SetUp() override {
        // The dummy driver plays nothing but keeps the real queueing behaviour.
        SDL_SetHint(SDL_HINT_AUDIODRIVER, "dummy");
        if (SDL_InitSubSystem(SDL_INIT_AUDIO) != 0) {
            GTEST_SKIP() << "SDL audio did not start: " << SDL_GetError();
        }
        if (!player_.Open()) {
            // The dummy driver has one device; the window tests' backend may hold it when
            // every test runs in one process (ctest runs each in its own).
            GTEST_SKIP() << "no audio device free: " << SDL_GetError();
        }
        // Held still so what is queued stays queued while the test looks at it.
        SDL_PauseAudioDevice(player_.Device(), 1);
        char folder[] = "/tmp/redizor-cues-XXXXXX";
        ASSERT_NE(::mkdtemp(folder), nullptr);
        folder_ = folder;
    }
    void TearDown() override {
        player_.Close();
        SDL_QuitSubSystem(SDL_INIT_AUDIO);
        for (const std::string& f : files_) {
            std::remove(f.c_str());
        }
        if (!folder_.empty()) {
            ::rmdir(folder_.c_str());
        }
    }
    std::string Make(const std::string& name, const Wav& w) {
        std::string path = folder_ + "/" + name;
        WriteWav(path, w);
        files_.push_back(path);
        return path;
    }
    std::string MakeRaw(const std::string& name, const std::string& bytes) {
        std::string path = folder_ + "/" + name;
        std::ofstream(path, std::ios::binary) << bytes;
        files_.push_back(path);
        return path;
    }
    // What a cue of this many frames at this rate takes in the device's format.
    double DeviceBytes(const Wav& w) const {
        const SDL_AudioSpec& f = player_.Format();
        return static_cast<double>(w.frames) * f.freq / w.rate * f.channels *
               SDL_AUDIO_BITSIZE(f.format) / 8;
    }
    Uint32 Queued() const { return SDL_GetQueuedAudioSize(player_.Device()); }

    sdl::CuePlayer player_;
    std::string folder_;
    std::vector<std::string> files_;
};

TEST_F(CuePlayerTest, CuesAreConvertedToTheDeviceFormat) {
    const Wav cases[] = {
        {11025, 8, 1, 2205},  // the handheld's usual cue: 8-bit mono at a low rate
        {22050, 16, 1, 2205},
        {44100, 16, 2, 8820},
        {8000, 8, 2, 800},
    };
    int n = 0;
    for (const Wav& w : cases) {
        SCOPED_TRACE(testing::Message()
                     << w.rate << " Hz, " << w.bits << " bit, " << w.channels << " channel(s)");
        player_.Play(Make("cue" + std::to_string(n++) + ".mc8", w));
        double expected = DeviceBytes(w);
        EXPECT_NEAR(Queued(), expected, expected * 0.02);
    }
}

TEST_F(CuePlayerTest, EachCueCutsOffTheOnePlaying) {
    std::string longCue = Make("long.mc8", {11025, 8, 1, 11025});
    Wav shortWav{11025, 8, 1, 1102};
    std::string shortCue = Make("short.mc8", shortWav);
    player_.Play(longCue);
    ASSERT_GT(Queued(), DeviceBytes(shortWav) * 5);
    player_.Play(shortCue);
    EXPECT_NEAR(Queued(), DeviceBytes(shortWav), DeviceBytes(shortWav) * 0.02);
    player_.Play(shortCue);  // played again (from the cache): still one cue's worth
    EXPECT_NEAR(Queued(), DeviceBytes(shortWav), DeviceBytes(shortWav) * 0.02);
}

TEST_F(CuePlayerTest, MissingOrBrokenCuesLeaveSilence) {
    std::string good = Make("good.mc8", {11025, 8, 1, 5000});
    const std::pair<const char*, std::string> cases[] = {
        {"no file on the device (empty path)", ""},
        {"a path that does not exist", folder_ + "/missing.mc8"},
        {"not a wave file", MakeRaw("junk.mc8", "this is not audio at all, just some text")},
        {"a wave header cut short", MakeRaw("cut.mc8", std::string("RIFF\x24\0\0\0WAVEfmt ", 16))},
    };
    for (const auto& [name, path] : cases) {
        SCOPED_TRACE(name);
        player_.Play(good);
        ASSERT_GT(Queued(), 0u);
        player_.Play(path);
        EXPECT_EQ(Queued(), 0u) << "the playing cue must stop";
    }
}

TEST(CuePlayer, WithoutADeviceCuesAreSilentlyIgnored) {
    sdl::CuePlayer player;  // never opened: no audio on this host
    EXPECT_FALSE(player.IsOpen());
    player.Play("/nonexistent.mc8");
    player.Play("");
}

}  // namespace
