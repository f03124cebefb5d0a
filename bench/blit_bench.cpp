// Single copies of every size the game draws: the memory limit (memcpy of the same rows),
// Image::Draw opaque and keyed, and SDL's blitter on the same 8-bit pixels.
#include <benchmark/benchmark.h>

#include <cstring>
#include <string>

#include "bench/bench_util.h"

namespace bench {

const std::vector<Size>& GameSizes() {
    static const std::vector<Size> sizes = {{3, 3},    {20, 20},  {54, 30},   {55, 60},  {63, 35},
                                            {300, 30}, {300, 53}, {240, 293}, {300, 293}};
    return sizes;
}

std::unique_ptr<Sprite> MakeSprite(int w, int h, Coverage coverage, unsigned seed) {
    std::mt19937 rng(seed);
    auto sprite = std::make_unique<Sprite>();
    struct {
        BITMAPINFOHEADER header;
        RGBQUAD palette[256];
    } info{};
    info.header = BITMAPINFOHEADER{40, w, h, 1, 8, 0, 0, 0, 0, 0, 0};
    int stride = (w + 3) & ~3;
    info.header.biSizeImage = static_cast<DWORD>(stride * h);
    std::vector<BYTE> pixels(static_cast<std::size_t>(stride * h));
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            BYTE colour = static_cast<BYTE>(16 + rng() % 200);
            bool key = false;
            if (coverage == Coverage::kEllipse) {
                double dx = (x + 0.5 - w / 2.0) / (w / 2.0), dy = (y + 0.5 - h / 2.0) / (h / 2.0);
                key = dx * dx + dy * dy > 1.0;
            } else if (coverage == Coverage::kRandom) {
                key = rng() % 2 == 0;
            }
            pixels[static_cast<std::size_t>((h - 1 - y) * stride + x)] = key ? kKey : colour;
        }
    }
    if (coverage != Coverage::kOpaque) {
        pixels[static_cast<std::size_t>((h - 1) * stride)] = kKey;  // the corner gives the key
    }
    sprite->CreateSection(&info.header, pixels.data());
    sprite->TakeKeyFromCorner();
    return sprite;
}

SDL_Surface* ToSurface(Image& image, bool keyed, bool rle) {
    SDL_Surface* s =
        SDL_CreateRGBSurfaceWithFormat(0, image.Width(), image.Height(), 8, SDL_PIXELFORMAT_INDEX8);
    for (int y = 0; y < image.Height(); ++y) {
        std::memcpy(static_cast<BYTE*>(s->pixels) + y * s->pitch, image.PixelAddress(0, y),
                    static_cast<std::size_t>(image.Width()));
    }
    if (keyed) {
        SDL_SetColorKey(s, SDL_TRUE, kKey);
    }
    if (rle) {
        SDL_SetSurfaceRLE(s, 1);
    }
    return s;
}

namespace {

// Destination large enough for every size, like the scene picture.
Image& Destination() {
    static std::unique_ptr<Sprite> dest = MakeSprite(480, 293, Coverage::kOpaque, 7);
    return *dest;
}

void MemcpyRows(benchmark::State& state, Size size) {
    auto src = MakeSprite(size.w, size.h, Coverage::kOpaque);
    Image& dst = Destination();
    for (auto _ : state) {
        for (int y = 0; y < size.h; ++y) {
            std::memcpy(dst.PixelAddress(10, y), src->PixelAddress(0, y),
                        static_cast<std::size_t>(size.w));
        }
        benchmark::ClobberMemory();
    }
}

void Draw(benchmark::State& state, Size size, Coverage coverage, bool keyed) {
    auto src = MakeSprite(size.w, size.h, coverage);
    Image& dst = Destination();
    DWORD key = keyed ? (src->key | KEY_FLAG) : NO_KEY;
    for (auto _ : state) {
        src->Draw(&dst, 10, 0, static_cast<UINT>(size.w), static_cast<UINT>(size.h), 0, 0, key);
        benchmark::ClobberMemory();
    }
}

void SdlBlit(benchmark::State& state, Size size, Coverage coverage, bool keyed, bool rle) {
    auto src = MakeSprite(size.w, size.h, coverage);
    SDL_Surface* s = ToSurface(*src, keyed, rle);
    static SDL_Surface* d = ToSurface(Destination(), false, false);
    SDL_Rect to{10, 0, size.w, size.h};
    for (auto _ : state) {
        SDL_Rect r = to;
        SDL_BlitSurface(s, nullptr, d, &r);
        benchmark::ClobberMemory();
    }
    SDL_FreeSurface(s);
}

}  // namespace

void RegisterBlitBenchmarks() {
    for (Size size : GameSizes()) {
        std::string n = "/" + std::to_string(size.w) + "x" + std::to_string(size.h);
        benchmark::RegisterBenchmark(("memcpy_rows" + n).c_str(), MemcpyRows, size);
        benchmark::RegisterBenchmark(("draw_opaque" + n).c_str(), Draw, size, Coverage::kOpaque,
                                     false);
        benchmark::RegisterBenchmark(("draw_keyed_ellipse" + n).c_str(), Draw, size,
                                     Coverage::kEllipse, true);
        benchmark::RegisterBenchmark(("draw_keyed_random" + n).c_str(), Draw, size,
                                     Coverage::kRandom, true);
        benchmark::RegisterBenchmark(("sdl_blit_opaque" + n).c_str(), SdlBlit, size,
                                     Coverage::kOpaque, false, false);
        benchmark::RegisterBenchmark(("sdl_blit_key_ellipse" + n).c_str(), SdlBlit, size,
                                     Coverage::kEllipse, true, false);
        benchmark::RegisterBenchmark(("sdl_blit_key_rle_ellipse" + n).c_str(), SdlBlit, size,
                                     Coverage::kEllipse, true, true);
        benchmark::RegisterBenchmark(("sdl_blit_key_random" + n).c_str(), SdlBlit, size,
                                     Coverage::kRandom, true, false);
    }
}

}  // namespace bench
