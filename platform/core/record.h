// A log of the platform calls that tests and replays need to see: block copies to the window,
// cues, message boxes, opened files and text. Off unless a backend turns it on.
#pragma once

#include <string>
#include <vector>

namespace platform {

struct BlitRecord {
    int x, y, width, height, srcX, srcY;
};

struct DispatchRecord {
    unsigned message;
    unsigned long long wParam;
    long long lParam;
};

struct MessageBoxRecord {
    std::string text;
    std::string caption;
};

struct TextRecord {
    std::string text;  // as drawn (UTF-8), unprintable units already replaced
    int left, top, right, bottom;
};

struct Record {
    bool enabled = false;
    std::vector<BlitRecord> windowBlits;  // BitBlt calls whose destination is the window
    std::vector<std::string> cues;        // device paths given to sndPlaySoundW, in order
    std::vector<MessageBoxRecord> messageBoxes;
    std::vector<std::string> filesOpened;    // device paths that CreateFileW opened
    std::vector<std::string> filesRefused;   // device paths that CreateFileW could not open
    std::vector<DispatchRecord> dispatched;  // messages handed to DispatchMessageW
    std::vector<TextRecord> texts;           // DrawTextW calls on the window
    long presents = 0;                       // frames shown (window DC released after drawing)

    void Clear() {
        bool keep = enabled;
        *this = Record();
        enabled = keep;
    }
};

Record& CallRecord();

}  // namespace platform
