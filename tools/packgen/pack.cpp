#include "tools/packgen/pack.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <map>

#include "tools/packgen/art.h"
#include "tools/packgen/files.h"
#include "tools/packgen/sound.h"

#define STB_IMAGE_WRITE_IMPLEMENTATION
#include <stb/stb_image_write.h>

namespace packgen {

namespace fs = std::filesystem;

const std::vector<PictureSpec>& Pictures() {
    static const std::vector<PictureSpec> list = [] {
        std::vector<PictureSpec> v = {
            {"load.dc8", 120, 125, false, DrawLoadPanel},
            {"n_set_scr.dc8", 240, 293, false, [] { return DrawGroundBackdrop(2); }},
            {"p_set_scr.dc8", 240, 293, false, [] { return DrawGroundBackdrop(1); }},
            {"j_set_scr.dc8", 240, 293, false, [] { return DrawGroundBackdrop(3); }},
            {"start.dc8", 240, 293, false, DrawTitle},
            {"start_flag.dc8", 132, 31, true, DrawTitleFlag},
            {"menu.dc8", 240, 293, false, [] { return DrawMenu(""); }},
            {"menu_pacific.dc8", 210, 23, false,
             [] { return DrawMenu("pacific").crop(15, 87, 210, 23); }},
            {"menu_south.dc8", 210, 23, false,
             [] { return DrawMenu("south").crop(15, 111, 210, 23); }},
            {"menu_amazon.dc8", 210, 23, false,
             [] { return DrawMenu("amazon").crop(15, 136, 210, 23); }},
            {"menu_easy.dc8", 120, 23, false,
             [] { return DrawMenu("easy").crop(90, 200, 120, 23); }},
            {"menu_normal.dc8", 120, 23, false,
             [] { return DrawMenu("normal").crop(90, 224, 120, 23); }},
            {"menu_hard.dc8", 120, 23, false,
             [] { return DrawMenu("hard").crop(90, 248, 120, 23); }},
            {"menu_go.dc8", 60, 23, false, [] { return DrawMenu("go").crop(180, 268, 60, 23); }},
            {"menu_back.dc8", 90, 23, false, [] { return DrawMenu("back").crop(0, 267, 90, 23); }},
            {"intro.dc8", 240, 293, false, DrawIntroPage},
            {"intro_p.dc8", 88, 54, true, DrawIntroP},
            {"intro_p2.dc8", 172, 40, true, DrawIntroP2},
            {"intro_j.dc8", 200, 110, true, DrawIntroJ},
            {"intro_n.dc8", 400, 110, true, DrawIntroN},
            {"profile.dc8", 252, 75, true, DrawProfile},
            {"favorite.dc8", 192, 72, true, DrawFavorite},
            {"story.dc8", 232, 334, true, DrawStory},
            {"end.dc8", 240, 293, false, DrawEndScreen},
            {"ranking.dc8", 240, 293, false, DrawRankingScreen},
            {"eng_bar.dc8", 170, 6, false, DrawEnergyBar},
            {"bar_case.dc8", 180, 10, true, DrawBarCase},
            {"n_back.dc8", 480, 293, false, DrawRoundBack},
            {"nn_fisherman.dc8", 188, 49, true, DrawFisherman},
            {"n_exit.dc8", 50, 25, true, DrawExitButton},
            {"n_number.dc8", 90, 11, true, DrawNumbers},
            {"n_rope.dc8", 6, 3, true, DrawRope},
            {"n_hook.dc8", 40, 20, true, DrawHook},
            {"n_spray.dc8", 55, 37, true, DrawSpray},
            {"n_eng_man.dc8", 42, 27, true, DrawEnergyMan},
            {"n_wave.dc8", 392, 30, true, DrawWave},
            {"n_bottom.dc8", 900, 53, true, DrawBottom},
            {"n_sheep.dc8", 108, 30, true, DrawBoatStrip},
            {"n_basket.dc8", 110, 60, true, [] { return DrawBasket(false); }},
            {"n_taken_basket.dc8", 220, 60, true, [] { return DrawBasket(true); }},
            {"n_dark.dc8", 240, 145, true, DrawDark},
            {"n_light.dc8", 50, 50, true, DrawLight},
        };
        const int swimW[6] = {252, 176, 176, 256, 148, 152};
        const int swimH[6] = {35, 34, 34, 36, 29, 23};
        for (int k = 0; k < 6; ++k) {
            v.push_back({"n_fish" + std::to_string(k) + ".dc8", swimW[k], swimH[k], true,
                         [k] { return DrawFishStrip(k); }});
        }
        v.push_back({"n_shell_fish0.dc8", 284, 41, true, [] { return DrawShellStrip(0); }});
        v.push_back({"n_shell_fish1.dc8", 112, 30, true, [] { return DrawShellStrip(1); }});
        const int takenW[8] = {88, 56, 76, 76, 50, 58, 132, 44};
        const int takenH[8] = {68, 37, 36, 68, 34, 34, 38, 22};
        for (int k = 0; k < 8; ++k) {
            v.push_back({"n_taken_fish" + std::to_string(k) + ".dc8", takenW[k], takenH[k], true,
                         [k] { return DrawTakenStrip(k); }});
        }
        return v;
    }();
    return list;
}

Canvas Render(const PictureSpec& spec) {
    Canvas c = spec.draw();
    if (c.width() != spec.width || c.height() != spec.height) {
        std::fprintf(stderr, "redizor-pack: %s drawn %d x %d, the game reads %d x %d\n",
                     spec.file.c_str(), c.width(), c.height(), spec.width, spec.height);
        std::exit(3);
    }
    if (spec.keyed) {
        c.set(0, 0, kKey);  // the game takes a sprite's key from this corner
    }
    return c;
}

std::vector<std::uint8_t> SampleRanking() {
    return EncodeRanking({
        {u"Marlin____", u"00048500"},
        {u"Tomi_Reef_", u"00031200"},
        {u"oren______", u"00027650"},
        {u" Gull_____", u"00019800"},
        {u"Mira______", u"00015400"},
        {u"7Seas_____", u"00012000"},
        {u"_Skipper__", u"00009350"},
        {u"Bo_Nets___", u"00006100"},
        {u"kelp______", u"00003300"},
        {u"__________", u"00000500"},
    });
}

bool WritePack(const std::string& dir, std::string* error) {
    const fs::path root(dir);
    const fs::path install = root / "Program Files" / "Redizor";
    std::error_code ec;
    for (const fs::path& p : {install / "image", install / "sound", root / "vorndc8"}) {
        fs::create_directories(p, ec);
        if (ec) {
            *error = "cannot create " + p.string() + ": " + ec.message();
            return false;
        }
    }
    auto put = [&](const fs::path& p, const std::vector<std::uint8_t>& bytes) {
        if (!WriteFile(p.string(), bytes)) {
            *error = "cannot write " + p.string();
            return false;
        }
        return true;
    };
    if (!WriteFile((root / "registry.txt").string(), RegistryText())) {
        *error = "cannot write the registry";
        return false;
    }
    for (const PictureSpec& spec : Pictures()) {
        if (!put(install / "image" / spec.file, EncodeDc8(Render(spec)))) {
            return false;
        }
    }
    for (const std::string& cue : CueNames()) {
        if (!put(install / "sound" / cue, EncodeWav(SynthCue(cue), kSampleRate))) {
            return false;
        }
    }
    return put(root / "vorndc8" / "score.uc2", SampleRanking());
}

bool WriteContactSheet(const std::string& file, int scale, std::string* error) {
    if (scale < 1 || scale > 8) {
        *error = "the scale must be 1 to 8";
        return false;
    }
    // Lay the pictures out in rows, each under its label, at most `maxWidth` wide.
    struct Placed {
        const PictureSpec* spec;
        Canvas canvas;
        int x, y;
    };
    const int pad = 6, label = 14, maxWidth = 1000;
    std::vector<Placed> placed;
    int x = pad, y = pad, rowHeight = 0, sheetW = 0;
    for (const PictureSpec& spec : Pictures()) {
        Canvas c = Render(spec);
        int w = std::max(c.width(), 60);
        if (x + w + pad > maxWidth && x > pad) {
            x = pad;
            y += rowHeight + pad;
            rowHeight = 0;
        }
        placed.push_back({&spec, std::move(c), x, y});
        x += w + pad;
        sheetW = std::max(sheetW, x);
        rowHeight = std::max(rowHeight, label + spec.height);
    }
    int sheetH = y + rowHeight + pad;
    Canvas labels(sheetW, sheetH, ramp::kGrey.at(3));
    TextStyle st;
    st.size = 10;
    st.colour = {255, 255, 255};
    for (const Placed& p : placed) {
        DrawText(labels, p.x, p.y + 10, p.spec->file, st);
    }
    const int W = sheetW * scale, H = sheetH * scale;
    std::vector<unsigned char> rgb(std::size_t(W) * H * 3);
    auto plot = [&](int px, int py, Rgb c) {
        for (int j = 0; j < scale; ++j) {
            for (int i = 0; i < scale; ++i) {
                std::size_t o = (std::size_t(py * scale + j) * W + std::size_t(px * scale + i)) * 3;
                rgb[o] = std::uint8_t(c.r);
                rgb[o + 1] = std::uint8_t(c.g);
                rgb[o + 2] = std::uint8_t(c.b);
            }
        }
    };
    for (int py = 0; py < sheetH; ++py) {
        for (int px = 0; px < sheetW; ++px) {
            plot(px, py, Palette()[labels.get(px, py)]);
        }
    }
    for (const Placed& p : placed) {
        for (int py = 0; py < p.canvas.height(); ++py) {
            for (int px = 0; px < p.canvas.width(); ++px) {
                std::uint8_t v = p.canvas.get(px, py);
                Rgb c = Palette()[v];
                if (p.spec->keyed && v == kKey) {
                    bool light = ((px / 4) + (py / 4)) % 2 == 0;
                    c = light ? Rgb{200, 200, 200} : Rgb{160, 160, 160};
                }
                plot(p.x + px, p.y + label + py, c);
            }
        }
    }
    if (!stbi_write_png(file.c_str(), W, H, 3, rgb.data(), W * 3)) {
        *error = "cannot write " + file;
        return false;
    }
    return true;
}

}  // namespace packgen
