// Choosing the round's pictures and drawing them. The catalogue holds art for the South
// ground only; a round entered with any other ground or difficulty must still never draw from
// an empty or missing slot, so every lookup falls back to the South slot.
#pragma once

#include "assets/catalogue.h"
#include "gfx/image.h"

constexpr int ART_REGION = 1;      // the ground whose slots hold pictures
constexpr int ART_DIFFICULTY = 0;  // the fisherman column that holds a picture

// True when the picture exists and has pixels to draw.
bool HasArt(const Image* image);

// The entry of the current ground, or the South entry when that one holds no picture. Null
// only when the South entry is missing too; the drawing helpers then draw nothing.
Image* RegionArt(Image* const (&table)[REGION_COUNT]);
Sprite* RegionArt(Sprite* const (&table)[REGION_COUNT]);
// The fisherman of the current ground and difficulty, or the South easy fisherman.
Sprite* FishermanArt();
// Fish strips by kind: the current ground's, or South's.
Sprite* SwimFishArt(int kind);
Sprite* BottomFishArt(int kind);
Sprite* HookedFishArt(int kind);

// Copies with the sprite's own colour key (or another sprite's key, as the full basket
// does); clipped to both pictures by Image::Draw. A null sprite draws nothing.
void DrawKeyed(Sprite* art, Image* dest, INT dx, INT dy, INT width, INT height, INT sx, INT sy);
void DrawKeyedAs(Sprite* art, const Sprite* keySource, Image* dest, INT dx, INT dy, INT width,
                 INT height, INT sx, INT sy);
// Opaque copy; a null picture draws nothing.
void DrawOpaque(Image* art, Image* dest, INT dx, INT dy, INT width, INT height, INT sx, INT sy);
