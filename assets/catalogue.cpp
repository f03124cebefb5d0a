#include "assets/catalogue.h"

#include <initializer_list>

#include "app/paths.h"
#include "app/shell.h"
#include "assets/cues.h"

Image* g_img_load = nullptr;
Image* g_sceneImage = nullptr;
Image* g_frameImage = nullptr;
Image* g_img_start = nullptr;
Sprite* g_img_start_flag = nullptr;
Image* g_img_menu = nullptr;
Image* g_img_menu_pacific = nullptr;
Image* g_img_menu_south = nullptr;
Image* g_img_menu_amazon = nullptr;
Image* g_img_menu_easy = nullptr;
Image* g_img_menu_normal = nullptr;
Image* g_img_menu_hard = nullptr;
Image* g_img_menu_go = nullptr;
Image* g_img_menu_back = nullptr;
Image* g_img_intro = nullptr;
Sprite* g_img_intro_p = nullptr;
Sprite* g_img_intro_p2 = nullptr;
Sprite* g_img_intro_j = nullptr;
Sprite* g_img_intro_n = nullptr;
Sprite* g_img_profile = nullptr;
Sprite* g_img_favorite = nullptr;
Sprite* g_img_story = nullptr;
Image* g_img_eng_bar = nullptr;
Sprite* g_img_bar_case = nullptr;
Image* g_img_ranking = nullptr;

Image* g_img_back[REGION_COUNT] = {};
Sprite* g_img_fisherman[REGION_COUNT][DIFFICULTY_COUNT] = {};
Sprite* g_img_exit[REGION_COUNT] = {};
Sprite* g_img_number[REGION_COUNT] = {};
Sprite* g_img_rope[REGION_COUNT] = {};
Sprite* g_img_hook[REGION_COUNT] = {};
Sprite* g_img_spray[REGION_COUNT] = {};
Sprite* g_img_eng_man[REGION_COUNT] = {};
Sprite* g_img_wave[REGION_COUNT] = {};
Sprite* g_img_bottom[REGION_COUNT] = {};
Sprite* g_img_sheep[REGION_COUNT] = {};
Sprite* g_img_basket[REGION_COUNT] = {};
Sprite* g_img_taken_basket[REGION_COUNT] = {};
Sprite* g_img_dark[REGION_COUNT] = {};
Sprite* g_img_light[REGION_COUNT] = {};
Sprite* g_img_fish[REGION_COUNT][SWIM_KINDS] = {};
Sprite* g_img_shell_fish[REGION_COUNT][BOTTOM_KINDS] = {};
Sprite* g_img_taken_fish[REGION_COUNT][HOOKED_KINDS] = {};

BYTE g_assetsLoaded = 0;
BYTE g_titleShown = 0;

namespace {

constexpr int SOUTH = 1;  // the one fishing ground whose art the game carries

// The per-ground tables of single pictures, for creating and releasing them together.
Sprite** const kGroundSpriteTables[] = {
    g_img_exit,         g_img_number, g_img_rope,   g_img_hook,  g_img_spray,
    g_img_eng_man,      g_img_wave,   g_img_bottom, g_img_sheep, g_img_basket,
    g_img_taken_basket, g_img_dark,   g_img_light,
};

void LoadImage(Image* image, LPCWSTR fileName) {
    if (image != nullptr) {
        image->LoadDC8(ImagePath(fileName));
    }
}

void LoadSprite(Sprite* sprite, LPCWSTR fileName) {
    if (sprite != nullptr) {
        sprite->Load(ImagePath(fileName));
    }
}

template <typename T>
void Destroy(T*& object) {
    delete object;
    object = nullptr;
}

void PresentLoadingScreen() {
    g_hdc = GetDC(g_hWnd);
    PresentImage(g_frameImage, g_hdc, 0, 0, 240, 293);
    ReleaseDC(g_hWnd, g_hdc);
}

// Cells are drawn cumulatively: cell k joins those drawn before it.
void ShowProgress(int cell) {
    g_img_load->Draw(g_frameImage, 62 + 17 * cell, 199, 15, 9, 17 * cell, 99, NO_KEY);
    PresentLoadingScreen();
}

void CreateCatalogue() {
    g_img_load = new Image;
    g_sceneImage = new Image;
    g_frameImage = new Image;
    g_img_start = new Image;
    g_img_start_flag = new Sprite;
    g_img_menu = new Image;
    g_img_menu_pacific = new Image;
    g_img_menu_south = new Image;
    g_img_menu_amazon = new Image;
    g_img_menu_easy = new Image;
    g_img_menu_normal = new Image;
    g_img_menu_hard = new Image;
    g_img_menu_go = new Image;
    g_img_menu_back = new Image;
    g_img_intro = new Image;
    g_img_intro_p = new Sprite;
    g_img_intro_p2 = new Sprite;
    g_img_intro_j = new Sprite;
    g_img_intro_n = new Sprite;
    g_img_profile = new Sprite;
    g_img_favorite = new Sprite;
    g_img_story = new Sprite;
    g_img_eng_bar = new Image;
    g_img_bar_case = new Sprite;
    g_img_ranking = new Image;

    // Slots 0 and 1 of every table hold objects; slot 2 stays null.
    for (int region = 0; region <= SOUTH; ++region) {
        g_img_back[region] = new Image;
        for (Sprite*& s : g_img_fisherman[region]) {
            s = new Sprite;
        }
        for (Sprite** table : kGroundSpriteTables) {
            table[region] = new Sprite;
        }
        for (Sprite*& s : g_img_fish[region]) {
            s = new Sprite;
        }
        for (Sprite*& s : g_img_shell_fish[region]) {
            s = new Sprite;
        }
        for (Sprite*& s : g_img_taken_fish[region]) {
            s = new Sprite;
        }
    }
}

void LoadCatalogue() {
    CreateCatalogue();

    Destroy(g_frameImage);
    g_frameImage = new Image;
    LoadImage(g_frameImage, u"\\n_set_scr.dc8");
    LoadImage(g_img_load, u"\\load.dc8");
    g_img_load->Draw(g_frameImage, 62, 100, 116, 99, 0, 0, NO_KEY);
    g_img_load->Draw(g_frameImage, 62, 208, 116, 17, 0, 108, NO_KEY);
    ShowProgress(0);

    LoadImage(g_sceneImage, u"\\n_back.dc8");
    LoadImage(g_img_start, u"\\start.dc8");
    LoadSprite(g_img_start_flag, u"\\start_flag.dc8");
    LoadImage(g_img_menu, u"\\menu.dc8");
    LoadImage(g_img_menu_pacific, u"\\menu_pacific.dc8");
    LoadImage(g_img_menu_south, u"\\menu_south.dc8");
    LoadImage(g_img_menu_amazon, u"\\menu_amazon.dc8");
    LoadImage(g_img_menu_easy, u"\\menu_easy.dc8");
    LoadImage(g_img_menu_normal, u"\\menu_normal.dc8");
    LoadImage(g_img_menu_hard, u"\\menu_hard.dc8");
    LoadImage(g_img_menu_go, u"\\menu_go.dc8");
    LoadImage(g_img_menu_back, u"\\menu_back.dc8");
    LoadImage(g_img_intro, u"\\intro.dc8");
    LoadSprite(g_img_intro_p, u"\\intro_p.dc8");
    LoadSprite(g_img_intro_p2, u"\\intro_p2.dc8");
    LoadSprite(g_img_intro_j, u"\\intro_j.dc8");
    LoadSprite(g_img_intro_n, u"\\intro_n.dc8");
    LoadSprite(g_img_profile, u"\\profile.dc8");
    LoadSprite(g_img_favorite, u"\\favorite.dc8");
    LoadSprite(g_img_story, u"\\story.dc8");
    LoadImage(g_img_ranking, u"\\ranking.dc8");
    ShowProgress(1);

    LoadImage(g_img_eng_bar, u"\\eng_bar.dc8");
    LoadSprite(g_img_bar_case, u"\\bar_case.dc8");
    ShowProgress(2);

    ShowProgress(3);

    LoadImage(g_img_back[SOUTH], u"\\n_back.dc8");
    LoadSprite(g_img_fisherman[SOUTH][0], u"\\nn_fisherman.dc8");
    LoadSprite(g_img_exit[SOUTH], u"\\n_exit.dc8");
    LoadSprite(g_img_number[SOUTH], u"\\n_number.dc8");
    LoadSprite(g_img_rope[SOUTH], u"\\n_rope.dc8");
    LoadSprite(g_img_hook[SOUTH], u"\\n_hook.dc8");
    LoadSprite(g_img_spray[SOUTH], u"\\n_spray.dc8");
    LoadSprite(g_img_eng_man[SOUTH], u"\\n_eng_man.dc8");
    LoadSprite(g_img_wave[SOUTH], u"\\n_wave.dc8");
    LoadSprite(g_img_bottom[SOUTH], u"\\n_bottom.dc8");
    LoadSprite(g_img_sheep[SOUTH], u"\\n_sheep.dc8");
    LoadSprite(g_img_basket[SOUTH], u"\\n_basket.dc8");
    LoadSprite(g_img_taken_basket[SOUTH], u"\\n_taken_basket.dc8");
    LoadSprite(g_img_dark[SOUTH], u"\\n_dark.dc8");
    LoadSprite(g_img_light[SOUTH], u"\\n_light.dc8");
    ShowProgress(4);

    static const WCHAR* const kFish[SWIM_KINDS] = {
        u"\\n_fish0.dc8", u"\\n_fish1.dc8", u"\\n_fish2.dc8",
        u"\\n_fish3.dc8", u"\\n_fish4.dc8", u"\\n_fish5.dc8",
    };
    static const WCHAR* const kShellFish[BOTTOM_KINDS] = {u"\\n_shell_fish0.dc8",
                                                          u"\\n_shell_fish1.dc8"};
    static const WCHAR* const kTakenFish[HOOKED_KINDS] = {
        u"\\n_taken_fish0.dc8", u"\\n_taken_fish1.dc8", u"\\n_taken_fish2.dc8",
        u"\\n_taken_fish3.dc8", u"\\n_taken_fish4.dc8", u"\\n_taken_fish5.dc8",
        u"\\n_taken_fish6.dc8", u"\\n_taken_fish7.dc8",
    };
    for (int kind = 0; kind < SWIM_KINDS; ++kind) {
        LoadSprite(g_img_fish[SOUTH][kind], kFish[kind]);
    }
    for (int kind = 0; kind < BOTTOM_KINDS; ++kind) {
        LoadSprite(g_img_shell_fish[SOUTH][kind], kShellFish[kind]);
    }
    for (int kind = 0; kind < HOOKED_KINDS; ++kind) {
        LoadSprite(g_img_taken_fish[SOUTH][kind], kTakenFish[kind]);
    }
    ShowProgress(5);
    ShowProgress(6);

    Destroy(g_img_load);
    g_assetsLoaded = 1;
}

}  // namespace

void ReplaceFrameImage(LPCWSTR fileName) {
    Destroy(g_frameImage);
    g_frameImage = new Image;
    LoadImage(g_frameImage, fileName);
}

void LoadAssets() {
    ReadInstallDir();
    g_titleShown = 0;
    if (g_assetsLoaded == 0) {
        LoadCatalogue();
    }
    ReplaceFrameImage(u"\\start.dc8");
    PlayCue(u"\\start.mc8");
}

void ReleaseAssets() {
    for (Image** single : {&g_img_load, &g_sceneImage, &g_frameImage, &g_img_start, &g_img_menu,
                           &g_img_menu_pacific, &g_img_menu_south, &g_img_menu_amazon,
                           &g_img_menu_easy, &g_img_menu_normal, &g_img_menu_hard, &g_img_menu_go,
                           &g_img_menu_back, &g_img_intro, &g_img_eng_bar, &g_img_ranking}) {
        Destroy(*single);
    }
    for (Sprite** single :
         {&g_img_start_flag, &g_img_intro_p, &g_img_intro_p2, &g_img_intro_j, &g_img_intro_n,
          &g_img_profile, &g_img_favorite, &g_img_story, &g_img_bar_case}) {
        Destroy(*single);
    }
    for (int region = 0; region < REGION_COUNT; ++region) {
        Destroy(g_img_back[region]);
        for (Sprite*& s : g_img_fisherman[region]) {
            Destroy(s);
        }
        for (Sprite** table : kGroundSpriteTables) {
            Destroy(table[region]);
        }
        for (Sprite*& s : g_img_fish[region]) {
            Destroy(s);
        }
        for (Sprite*& s : g_img_shell_fish[region]) {
            Destroy(s);
        }
        for (Sprite*& s : g_img_taken_fish[region]) {
            Destroy(s);
        }
    }
}
