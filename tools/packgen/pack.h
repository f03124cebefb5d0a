// The whole device folder: which pictures and cues exist, and writing them out.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/packgen/canvas.h"

namespace packgen {

struct PictureSpec {
    std::string file;  // lower-case file name in the image folder
    int width, height;
    bool keyed;  // drawn with the colour key of its top-left pixel
    std::function<Canvas()> draw;
};

// Every picture the game loads, in catalogue order.
const std::vector<PictureSpec>& Pictures();

// Draws one picture and checks it has its expected size; exits on a mismatch, since a picture
// of the wrong size would make the game read outside it.
Canvas Render(const PictureSpec& spec);

// The sample ranking: names that exercise the game's clean-up of the name field.
std::vector<std::uint8_t> SampleRanking();

// Writes registry.txt, the image and sound folders and the ranking into dir. Returns false and
// fills *error when something cannot be written.
bool WritePack(const std::string& dir, std::string* error);

// Writes every picture on one labelled PNG, scaled up by `scale`; key pixels are shown as a
// checkerboard.
bool WriteContactSheet(const std::string& file, int scale, std::string* error);

}  // namespace packgen
