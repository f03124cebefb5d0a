#include "game/score.h"

#include "assets/catalogue.h"
#include "game/art.h"
#include "game/round_state.h"

namespace {

constexpr INT DIGIT_W = 9;
constexpr INT DIGIT_H = 11;
constexpr INT SCORE_Y = 277;
constexpr INT UNITS_X = 225;
constexpr INT COUNT_STEP = 50;  // every landing is worth a multiple of this

void DrawDigit(Sprite* digits, INT digit, INT x) {
    DrawKeyed(digits, g_frameImage, x, SCORE_Y, DIGIT_W, DIGIT_H, DIGIT_W * digit, 0);
}

}  // namespace

void DrawScore() {
    Sprite* digits = RegionArt(g_img_number);
    if (g_score == 0 && g_scoreShown == 0) {
        DrawDigit(digits, 0, UNITS_X);
    }
    if (g_score != 0 && g_scoreShown == 0) {
        g_scoreShown = COUNT_STEP;
    }
    if (g_score < g_scoreShown) {
        return;
    }
    // Eight places, right-aligned, leading zeros left blank.
    bool started = false;
    INT place = 10000000;
    for (int k = 7; k >= 0; --k, place /= 10) {
        const INT digit = (g_scoreShown % (place * 10)) / place;
        if (digit != 0 || started) {
            DrawDigit(digits, digit, UNITS_X - 10 * k);
            started = true;
        }
    }
    if (g_score > g_scoreShown) {
        g_scoreShown += COUNT_STEP;
    }
}
