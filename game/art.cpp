#include "game/art.h"

#include "game/round_state.h"

bool HasArt(const Image* image) {
    return image != nullptr && image->bits != nullptr;
}

namespace {

template <typename T>
T* PickRegion(T* const (&table)[REGION_COUNT]) {
    if (g_regionIndex < REGION_COUNT && HasArt(table[g_regionIndex])) {
        return table[g_regionIndex];
    }
    return table[ART_REGION];
}

template <typename T, int N>
T* PickKind(T* const (&table)[REGION_COUNT][N], int kind) {
    if (kind < 0 || kind >= N) {
        return nullptr;
    }
    if (g_regionIndex < REGION_COUNT && HasArt(table[g_regionIndex][kind])) {
        return table[g_regionIndex][kind];
    }
    return table[ART_REGION][kind];
}

}  // namespace

Image* RegionArt(Image* const (&table)[REGION_COUNT]) {
    return PickRegion(table);
}

Sprite* RegionArt(Sprite* const (&table)[REGION_COUNT]) {
    return PickRegion(table);
}

Sprite* FishermanArt() {
    if (g_regionIndex < REGION_COUNT && g_difficultyIndex < DIFFICULTY_COUNT &&
        HasArt(g_img_fisherman[g_regionIndex][g_difficultyIndex])) {
        return g_img_fisherman[g_regionIndex][g_difficultyIndex];
    }
    return g_img_fisherman[ART_REGION][ART_DIFFICULTY];
}

Sprite* SwimFishArt(int kind) {
    return PickKind(g_img_fish, kind);
}

Sprite* BottomFishArt(int kind) {
    return PickKind(g_img_shell_fish, kind);
}

Sprite* HookedFishArt(int kind) {
    return PickKind(g_img_taken_fish, kind);
}

void DrawKeyedAs(Sprite* art, const Sprite* keySource, Image* dest, INT dx, INT dy, INT width,
                 INT height, INT sx, INT sy) {
    if (art == nullptr || keySource == nullptr || width <= 0 || height <= 0) {
        return;
    }
    art->Draw(dest, dx, dy, static_cast<UINT>(width), static_cast<UINT>(height), sx, sy,
              keySource->key | KEY_FLAG);
}

void DrawKeyed(Sprite* art, Image* dest, INT dx, INT dy, INT width, INT height, INT sx, INT sy) {
    DrawKeyedAs(art, art, dest, dx, dy, width, height, sx, sy);
}

void DrawOpaque(Image* art, Image* dest, INT dx, INT dy, INT width, INT height, INT sx, INT sy) {
    if (art == nullptr || width <= 0 || height <= 0) {
        return;
    }
    art->Draw(dest, dx, dy, static_cast<UINT>(width), static_cast<UINT>(height), sx, sy, NO_KEY);
}
