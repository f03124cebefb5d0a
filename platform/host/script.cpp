#include "platform/host/script.h"

#include <algorithm>
#include <cstdlib>
#include <sstream>

namespace host {

namespace {

struct VerbInfo {
    const char* name;
    ScriptEvent::Verb verb;
    int args;
    long max;  // largest value an argument may take
};

const VerbInfo kVerbs[] = {
    {"keydown", ScriptEvent::Verb::kKeyDown, 1, 0xFFFF},
    {"keyup", ScriptEvent::Verb::kKeyUp, 1, 0xFFFF},
    {"pendown", ScriptEvent::Verb::kPenDown, 2, 0xFFFF},
    {"penup", ScriptEvent::Verb::kPenUp, 2, 0xFFFF},
    {"timer", ScriptEvent::Verb::kTimer, 1, 0x7FFFFFFF},
    {"close", ScriptEvent::Verb::kClose, 0, 0},
};

bool Number(const std::string& token, long max, long& out) {
    if (token.empty() || token.size() > 12 ||
        token.find_first_not_of("0123456789") != std::string::npos) {
        return false;
    }
    long long v = std::strtoll(token.c_str(), nullptr, 10);
    if (v > max) {
        return false;
    }
    out = static_cast<long>(v);
    return true;
}

}  // namespace

bool ParseScript(const std::string& text, std::vector<ScriptEvent>& events, std::string& error) {
    std::vector<ScriptEvent> parsed;
    std::istringstream in(text);
    std::string line;
    for (int lineNumber = 1; std::getline(in, line); ++lineNumber) {
        line = line.substr(0, line.find('#'));
        std::istringstream words(line);
        std::vector<std::string> tokens;
        for (std::string w; words >> w;) {
            tokens.push_back(w);
        }
        if (tokens.empty()) {
            continue;
        }
        auto fail = [&](const std::string& why) {
            error = "script line " + std::to_string(lineNumber) + ": " + why;
            return false;
        };
        ScriptEvent event;
        if (!Number(tokens[0], 0x7FFFFFFF, event.pass)) {
            return fail("expected a pass number, found '" + tokens[0] + "'");
        }
        if (tokens.size() < 2) {
            return fail("expected a verb after the pass number");
        }
        const VerbInfo* info = nullptr;
        for (const VerbInfo& v : kVerbs) {
            if (tokens[1] == v.name) {
                info = &v;
            }
        }
        if (info == nullptr) {
            return fail("unknown verb '" + tokens[1] + "'");
        }
        if (static_cast<int>(tokens.size()) != 2 + info->args) {
            return fail("'" + tokens[1] + "' takes " + std::to_string(info->args) + " argument(s)");
        }
        event.verb = info->verb;
        long* args[] = {&event.a, &event.b};
        for (int i = 0; i < info->args; ++i) {
            if (!Number(tokens[2 + i], info->max, *args[i])) {
                return fail("bad argument '" + tokens[2 + i] + "'");
            }
        }
        parsed.push_back(event);
    }
    std::stable_sort(parsed.begin(), parsed.end(),
                     [](const ScriptEvent& x, const ScriptEvent& y) { return x.pass < y.pass; });
    events = std::move(parsed);
    return true;
}

std::string FormatEvent(const ScriptEvent& e) {
    for (const VerbInfo& v : kVerbs) {
        if (v.verb == e.verb) {
            std::string line = std::to_string(e.pass) + " " + v.name;
            if (v.args >= 1) {
                line += " " + std::to_string(e.a);
            }
            if (v.args >= 2) {
                line += " " + std::to_string(e.b);
            }
            return line;
        }
    }
    return {};
}

}  // namespace host
