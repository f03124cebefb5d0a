#include "screens/ranking.h"

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/files.h"
#include "platform/gdi.h"
#include "platform/timer.h"
#include "screens/present.h"
#include "screens/transitions.h"

INT g_rankingPass = 0;
BYTE g_rankingDrawn = 0;
BYTE g_rankingShown = 0;

namespace {

constexpr LPCWSTR RANKING_FILE = u"\\vorndc8\\score.uc2";
constexpr INT PASS_WRAP = 50000;
constexpr INT LAST_GROWING_PASS = 11;  // the pass that draws all ten lines
constexpr DWORD LINE_PAUSE_MS = 50;
constexpr int NAME_UNITS = 10;
constexpr int SCORE_UNITS = 8;
constexpr WCHAR REPLACEMENT = 0xFFFD;

struct Record {
    WCHAR name[NAME_UNITS];
    WCHAR score[SCORE_UNITS];
};

bool ReadExactly(HANDLE file, void* buffer, DWORD bytes) {
    DWORD got = 0;
    return ReadFile(file, buffer, bytes, &got, nullptr) && got == bytes;
}

// A record counts only when all of its 40 bytes are in the file.
bool ReadRecord(HANDLE file, Record* record) {
    WCHAR ignored;
    return ReadExactly(file, record->name, sizeof record->name) &&
           ReadExactly(file, &ignored, sizeof ignored) &&
           ReadExactly(file, record->score, sizeof record->score) &&
           ReadExactly(file, &ignored, sizeof ignored);
}

bool IsHighSurrogate(WCHAR c) {
    return c >= 0xD800 && c <= 0xDBFF;
}

bool IsLowSurrogate(WCHAR c) {
    return c >= 0xDC00 && c <= 0xDFFF;
}

// The file comes from outside: control units and lone surrogates become the replacement
// character, so what is drawn never depends on anything past the field's own units.
void ReplaceUnprintable(WCHAR* text, int count) {
    for (int i = 0; i < count; ++i) {
        WCHAR c = text[i];
        if (c < 0x20 || (c >= 0x7F && c <= 0x9F)) {
            text[i] = REPLACEMENT;
        } else if (IsHighSurrogate(c)) {
            if (i + 1 < count && IsLowSurrogate(text[i + 1])) {
                ++i;  // a whole pair
            } else {
                text[i] = REPLACEMENT;
            }
        } else if (IsLowSurrogate(c)) {
            text[i] = REPLACEMENT;
        }
    }
}

void CleanName(WCHAR* name) {
    for (int i = 0; i < NAME_UNITS; ++i) {
        if (name[i] == u'_') {
            name[i] = u' ';
        }
    }
    if (name[0] == u' ') {
        name[0] = name[1] = name[2] = u'.';
    }
    if (name[0] >= u'a' && name[0] <= u'z') {
        name[0] = static_cast<WCHAR>(name[0] - 0x20);
    }
}

void DrawRow(HDC dc, int row, Record* record) {
    CleanName(record->name);
    ReplaceUnprintable(record->name, NAME_UNITS);
    ReplaceUnprintable(record->score, SCORE_UNITS);
    SIZE extent{0, 0};
    GetTextExtentExPointW(dc, record->name, NAME_UNITS, 0, nullptr, nullptr, &extent);
    LONG top = 95 + 18 * row;
    // The name's box ends 10 pixels short of the text's full width.
    RECT nameRect{100, top, 90 + extent.cx, top + 20};
    DrawTextW(dc, record->name, NAME_UNITS, &nameRect, DT_SINGLELINE);
    RECT scoreRect{165, top, 215, top + 20};
    DrawTextW(dc, record->score, SCORE_UNITS, &scoreRect, DT_SINGLELINE);
}

// Draws the first `rows` lines from the start of the file, only as many as it holds.
void DrawList(int rows) {
    HANDLE file = CreateFileW(RANKING_FILE, GENERIC_READ, FILE_SHARE_READ, nullptr, OPEN_EXISTING,
                              0, nullptr);
    WCHAR header;
    bool readable = file != INVALID_HANDLE_VALUE && ReadExactly(file, &header, sizeof header);
    g_hdc = GetDC(g_hWnd);
    SetBkMode(g_hdc, TRANSPARENT);
    Record record;
    for (int row = 0; readable && row < rows; ++row) {
        if (!ReadRecord(file, &record)) {
            break;
        }
        DrawRow(g_hdc, row, &record);
        Sleep(LINE_PAUSE_MS);
    }
    ReleaseDC(g_hWnd, g_hdc);
    if (file != INVALID_HANDLE_VALUE) {
        CloseHandle(file);
    }
}

}  // namespace

void RankingFrame() {
    if (g_penDown == 1 && g_penY > 270 && g_penX < 50) {
        EnterMenu();
        g_screen = SCREEN_OPTIONS;
        // The menu must not take this touch for a press on its own buttons.
        g_penDown = 0;
        return;
    }
    if (g_rankingPass == 0 || g_rankingDrawn == 0) {
        g_img_ranking->Draw(g_sceneImage, 0, 0, 240, 293, 0, 0, NO_KEY);
        g_sceneImage->Draw(g_frameImage, 0, 0, 240, 293, 0, 0, NO_KEY);
        PresentFrame(g_rankingShown);
        if (g_rankingDrawn == 0) {
            g_rankingShown = 1;
        }
        g_rankingDrawn = 1;
    }
    g_rankingPass += 1;
    if (g_rankingPass > PASS_WRAP) {
        g_rankingPass = 0;
    }
    if (g_rankingPass > LAST_GROWING_PASS || g_rankingPass == 0) {
        return;
    }
    DrawList(g_rankingPass - 1);
}
