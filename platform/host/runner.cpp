#include "platform/host/runner.h"

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <sstream>

#include "platform/core/record.h"
#include "platform/headless/headless.h"
#include "platform/host.h"
#include "platform/window.h"

namespace host {

namespace {

std::string JsonString(const std::string& s) {
    std::string out = "\"";
    for (char c : s) {
        switch (c) {
            case '"':
                out += "\\\"";
                break;
            case '\\':
                out += "\\\\";
                break;
            default:
                if (static_cast<unsigned char>(c) < 0x20) {
                    char buf[8];
                    std::snprintf(buf, sizeof buf, "\\u%04x", c);
                    out += buf;
                } else {
                    out += c;
                }
        }
    }
    return out + "\"";
}

// The height argument of each PresentImage call, read back from the copies it made: a plain
// copy is one 293-row block; a reveal is 300 strips.
std::vector<int> PresentHeights(const std::vector<platform::BlitRecord>& blits) {
    std::vector<int> heights;
    for (std::size_t i = 0; i < blits.size();) {
        if (blits[i].height == 293) {
            heights.push_back(293);
            ++i;
        } else {
            heights.push_back(blits[i].height);
            i += 300;
        }
    }
    return heights;
}

std::string CueName(const std::string& devicePath) {
    std::size_t slash = devicePath.find_last_of('\\');
    return slash == std::string::npos ? devicePath : devicePath.substr(slash);
}

void Post(const ScriptEvent& e) {
    using V = ScriptEvent::Verb;
    switch (e.verb) {
        case V::kKeyDown:
            headless::KeyDown(static_cast<UINT>(e.a));
            break;
        case V::kKeyUp:
            headless::KeyUp(static_cast<UINT>(e.a));
            break;
        case V::kPenDown:
            headless::PenDown(static_cast<int>(e.a), static_cast<int>(e.b));
            break;
        case V::kPenUp:
            headless::PenUp(static_cast<int>(e.a), static_cast<int>(e.b));
            break;
        case V::kTimer:
            headless::Timer(static_cast<UINT_PTR>(e.a));
            break;
        case V::kClose:
            headless::Close();
            break;
    }
}

class Session {
public:
    explicit Session(const RunnerConfig& c) : config(c) {}

    bool Open() {
        if (!config.traceFile.empty()) {
            trace.open(config.traceFile);
            if (!trace) {
                std::fprintf(stderr, "redizor: cannot write the trace '%s'\n",
                             config.traceFile.c_str());
                return false;
            }
        }
        return true;
    }

    void LoopStarting() {
        if (trace) {
            trace << "{\"trace\": 1, \"passMs\": " << config.passMs
                  << ", \"state\": " << GameStateJson() << "}\n";
        }
        headless::Log().Clear();
        BeginPass(0);
    }

    void PassEnded(long pass) {
        platform::Record& log = headless::Log();
        if (trace) {
            trace << "{\"pass\": " << pass << ", \"t\": " << passStart
                  << ", \"handler\": " << handler << ", \"presents\": [";
            std::vector<int> heights = PresentHeights(log.windowBlits);
            for (std::size_t i = 0; i < heights.size(); ++i) {
                trace << (i ? ", " : "") << heights[i];
            }
            trace << "], \"cues\": [";
            for (std::size_t i = 0; i < log.cues.size(); ++i) {
                trace << (i ? ", " : "") << JsonString(CueName(log.cues[i]));
            }
            trace << "], \"msg\": ";
            if (log.dispatched.empty()) {
                trace << "null";
            } else {
                const platform::DispatchRecord& m = log.dispatched.back();
                trace << "{\"message\": " << m.message << ", \"wParam\": " << m.wParam
                      << ", \"lParam\": " << m.lParam << "}";
            }
            trace << ", \"state\": " << GameStateJson() << "}\n";
        }
        if (std::binary_search(shots.begin(), shots.end(), pass)) {
            std::string file = config.screenshotDir + "/pass" + std::to_string(pass) + ".png";
            if (!headless::SaveScreenshot(file)) {
                std::fprintf(stderr, "redizor: cannot write '%s'\n", file.c_str());
            }
        }
        log.Clear();
        BeginPass(pass + 1);
    }

    RunnerConfig config;
    std::vector<long> shots;

private:
    void BeginPass(long pass) {
        passStart = headless::Now();
        while (next < config.script.size() && config.script[next].pass <= pass) {
            Post(config.script[next++]);
        }
        handler = GameScreenState();
    }

    std::ofstream trace;
    std::size_t next = 0;
    DWORD passStart = 0;
    int handler = 0;
};

}  // namespace

int RunHeadless(const RunnerConfig& config) {
    Session session(config);
    session.shots = config.screenshotAt;
    std::sort(session.shots.begin(), session.shots.end());
    if (!session.Open()) {
        return 2;
    }
    headless::Config hc;
    hc.deviceDir = config.deviceDir;
    hc.passMs = static_cast<DWORD>(config.passMs);
    hc.maxPasses = config.passes;
    hc.automaticTimer =
        std::none_of(config.script.begin(), config.script.end(),
                     [](const ScriptEvent& e) { return e.verb == ScriptEvent::Verb::kTimer; });
    headless::Install(hc);
    headless::SetLoopStartHook([&] { session.LoopStarting(); });
    headless::SetPassHook([&](long pass) { session.PassEnded(pass); });
    static WCHAR commandLine[] = u"";
    return WinMain(nullptr, nullptr, commandLine, SW_SHOW);
}

}  // namespace host
