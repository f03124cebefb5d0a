// Input scripts for headless runs and replays: one event a line, "<pass> <verb> [args]",
// '#' starting a comment. Verbs: keydown VK, keyup VK, pendown X Y, penup X Y, timer ID, close.
#pragma once

#include <string>
#include <vector>

namespace host {

struct ScriptEvent {
    enum class Verb { kKeyDown, kKeyUp, kPenDown, kPenUp, kTimer, kClose };
    long pass = 0;
    Verb verb = Verb::kClose;
    long a = 0;  // the key, the x, or the timer id
    long b = 0;  // the y
};

// Parses a whole script; the events come out ordered by pass, keeping file order within one.
// On a malformed line returns false with error naming the line, and events untouched.
bool ParseScript(const std::string& text, std::vector<ScriptEvent>& events, std::string& error);
// The line that ParseScript reads back as this event.
std::string FormatEvent(const ScriptEvent& event);

}  // namespace host
