// Every picture of the game, created and loaded once behind the loading screen and owned
// through these pointers until the window is destroyed.
#pragma once

#include "gfx/image.h"

constexpr int REGION_COUNT = 3;  // table slots: 0 Pacific, 1 South, 2 Amazon
constexpr int DIFFICULTY_COUNT = 3;
constexpr int SWIM_KINDS = 6;
constexpr int BOTTOM_KINDS = 2;
constexpr int HOOKED_KINDS = 8;

extern Image* g_img_load;
extern Image* g_sceneImage;
extern Image* g_frameImage;
extern Image* g_img_start;
extern Sprite* g_img_start_flag;
extern Image* g_img_menu;
extern Image* g_img_menu_pacific;
extern Image* g_img_menu_south;
extern Image* g_img_menu_amazon;
extern Image* g_img_menu_easy;
extern Image* g_img_menu_normal;
extern Image* g_img_menu_hard;
extern Image* g_img_menu_go;
extern Image* g_img_menu_back;
extern Image* g_img_intro;
extern Sprite* g_img_intro_p;
extern Sprite* g_img_intro_p2;
extern Sprite* g_img_intro_j;
extern Sprite* g_img_intro_n;
extern Sprite* g_img_profile;
extern Sprite* g_img_favorite;
extern Sprite* g_img_story;
extern Image* g_img_eng_bar;
extern Sprite* g_img_bar_case;
extern Image* g_img_ranking;

// Per fishing ground; only the South slot (1) holds art, slot 0 empty objects, slot 2 null.
extern Image* g_img_back[REGION_COUNT];
extern Sprite* g_img_fisherman[REGION_COUNT][DIFFICULTY_COUNT];
extern Sprite* g_img_exit[REGION_COUNT];
extern Sprite* g_img_number[REGION_COUNT];
extern Sprite* g_img_rope[REGION_COUNT];
extern Sprite* g_img_hook[REGION_COUNT];
extern Sprite* g_img_spray[REGION_COUNT];
extern Sprite* g_img_eng_man[REGION_COUNT];
extern Sprite* g_img_wave[REGION_COUNT];
extern Sprite* g_img_bottom[REGION_COUNT];
extern Sprite* g_img_sheep[REGION_COUNT];
extern Sprite* g_img_basket[REGION_COUNT];
extern Sprite* g_img_taken_basket[REGION_COUNT];
extern Sprite* g_img_dark[REGION_COUNT];
extern Sprite* g_img_light[REGION_COUNT];
extern Sprite* g_img_fish[REGION_COUNT][SWIM_KINDS];
extern Sprite* g_img_shell_fish[REGION_COUNT][BOTTOM_KINDS];
extern Sprite* g_img_taken_fish[REGION_COUNT][HOOKED_KINDS];

extern BYTE g_assetsLoaded;
extern BYTE g_titleShown;  // the title screen's first-present flag

// Start-up and the options menu's Back: (re)reads the install directory, loads the catalogue
// the first time, puts the title picture into g_frameImage and plays the start cue.
void LoadAssets();
// WM_DESTROY: destroys every picture and clears every pointer.
void ReleaseAssets();
// Replaces g_frameImage with a new Image loaded from the picture file.
void ReplaceFrameImage(LPCWSTR fileName);
