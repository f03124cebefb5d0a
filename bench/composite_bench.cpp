// A whole frame as the round draws it: the 300 x 293 background strip, about thirty-six
// sprites, sixteen line dots and the 240 x 293 window copy; with Image::Draw and with SDL.
#include <benchmark/benchmark.h>

#include "bench/bench_util.h"

namespace bench {

namespace {

struct Piece {
    Size size;
    int x, y;
};

// Boat, fisherman, basket, waves, twenty fish, six bottom fish, hooked fish, hook, splash,
// bottom strip and status bar pieces.
std::vector<Piece> FramePieces() {
    std::vector<Piece> pieces = {{{55, 60}, 100, 81}, {{54, 30}, 60, 112}, {{47, 49}, 60, 82},
                                 {{300, 30}, 0, 120}, {{20, 20}, 80, 200}, {{55, 37}, 100, 76},
                                 {{300, 53}, 0, 240}, {{44, 68}, 70, 190}, {{38, 36}, 72, 192}};
    const Size fish[] = {{63, 35}, {44, 34}, {44, 34}, {64, 36}, {37, 29}, {38, 23}};
    for (int i = 0; i < 20; ++i) {
        pieces.push_back({fish[i % 6], (i * 37) % 380, 150 + (i * 7) % 40});
    }
    for (int i = 0; i < 6; ++i) {
        pieces.push_back({i % 2 ? Size{28, 30} : Size{71, 41}, (i * 61) % 380, 220 + i * 4});
    }
    return pieces;
}

void CompositeDraw(benchmark::State& state) {
    auto back = MakeSprite(480, 293, Coverage::kOpaque, 2);
    auto scene = MakeSprite(480, 293, Coverage::kOpaque, 3);
    auto frame = MakeSprite(240, 293, Coverage::kOpaque, 4);
    auto dot = MakeSprite(6, 3, Coverage::kEllipse, 5);
    std::vector<Piece> pieces = FramePieces();
    std::vector<std::unique_ptr<Sprite>> sprites;
    for (const Piece& p : pieces) {
        sprites.push_back(MakeSprite(p.size.w, p.size.h, Coverage::kEllipse, 9));
    }
    for (auto _ : state) {
        back->Draw(scene.get(), 70, 0, 300, 293, 70, 0, NO_KEY);
        for (std::size_t i = 0; i < pieces.size(); ++i) {
            sprites[i]->Draw(scene.get(), pieces[i].x, pieces[i].y,
                             static_cast<UINT>(pieces[i].size.w),
                             static_cast<UINT>(pieces[i].size.h), 0, 0, sprites[i]->key | KEY_FLAG);
        }
        for (int n = 0; n < 16; ++n) {
            dot->Draw(scene.get(), 100 + n, 100 + 6 * n, 3, 3, 0, 0, dot->key | KEY_FLAG);
        }
        scene->Draw(frame.get(), 0, 0, 240, 293, 100, 0, NO_KEY);
        benchmark::ClobberMemory();
    }
}

void CompositeSdl(benchmark::State& state, bool rle) {
    auto backImage = MakeSprite(480, 293, Coverage::kOpaque, 2);
    auto sceneImage = MakeSprite(480, 293, Coverage::kOpaque, 3);
    auto frameImage = MakeSprite(240, 293, Coverage::kOpaque, 4);
    SDL_Surface* back = ToSurface(*backImage, false, false);
    SDL_Surface* scene = ToSurface(*sceneImage, false, false);
    SDL_Surface* frame = ToSurface(*frameImage, false, false);
    auto dotImage = MakeSprite(6, 3, Coverage::kEllipse, 5);
    SDL_Surface* dot = ToSurface(*dotImage, true, rle);
    std::vector<Piece> pieces = FramePieces();
    std::vector<SDL_Surface*> sprites;
    for (const Piece& p : pieces) {
        auto image = MakeSprite(p.size.w, p.size.h, Coverage::kEllipse, 9);
        sprites.push_back(ToSurface(*image, true, rle));
    }
    for (auto _ : state) {
        SDL_Rect strip{70, 0, 300, 293}, at{70, 0, 0, 0};
        SDL_BlitSurface(back, &strip, scene, &at);
        for (std::size_t i = 0; i < pieces.size(); ++i) {
            SDL_Rect to{pieces[i].x, pieces[i].y, 0, 0};
            SDL_BlitSurface(sprites[i], nullptr, scene, &to);
        }
        for (int n = 0; n < 16; ++n) {
            SDL_Rect from{0, 0, 3, 3}, to{100 + n, 100 + 6 * n, 0, 0};
            SDL_BlitSurface(dot, &from, scene, &to);
        }
        SDL_Rect window{100, 0, 240, 293}, origin{0, 0, 0, 0};
        SDL_BlitSurface(scene, &window, frame, &origin);
        benchmark::ClobberMemory();
    }
    for (SDL_Surface* s : sprites) {
        SDL_FreeSurface(s);
    }
    for (SDL_Surface* s : {back, scene, frame, dot}) {
        SDL_FreeSurface(s);
    }
}

}  // namespace

void RegisterCompositeBenchmarks() {
    benchmark::RegisterBenchmark("composite_frame_draw", CompositeDraw);
    benchmark::RegisterBenchmark("composite_frame_sdl_key", CompositeSdl, false);
    benchmark::RegisterBenchmark("composite_frame_sdl_key_rle", CompositeSdl, true);
}

}  // namespace bench
