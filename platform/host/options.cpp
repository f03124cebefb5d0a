#include "platform/host/options.h"

#include <cstdlib>
#include <sstream>

namespace host {

namespace {

bool ParseLong(const std::string& text, long min, long max, long& out) {
    if (text.empty()) {
        return false;
    }
    char* end = nullptr;
    long v = std::strtol(text.c_str(), &end, 10);
    if (*end != '\0' || v < min || v > max) {
        return false;
    }
    out = v;
    return true;
}

bool ParseList(const std::string& text, std::vector<long>& out) {
    std::stringstream in(text);
    std::string item;
    while (std::getline(in, item, ',')) {
        long v = 0;
        if (!ParseLong(item, 0, 1L << 40, v)) {
            return false;
        }
        out.push_back(v);
    }
    return !out.empty();
}

}  // namespace

bool ParseOptions(int argc, const char* const* argv, Options& o, std::string& error) {
    for (int i = 1; i < argc; ++i) {
        std::string arg = argv[i];
        std::string value;
        std::size_t eq = arg.find('=');
        bool hasInlineValue = arg.rfind("--", 0) == 0 && eq != std::string::npos;
        if (hasInlineValue) {
            value = arg.substr(eq + 1);
            arg = arg.substr(0, eq);
        }
        auto next = [&](std::string& out) {
            if (hasInlineValue) {
                out = value;
                return true;
            }
            if (i + 1 >= argc) {
                error = arg + " needs a value";
                return false;
            }
            out = argv[++i];
            return true;
        };
        auto number = [&](long min, long max, long& out) {
            std::string text;
            if (!next(text)) {
                return false;
            }
            if (!ParseLong(text, min, max, out)) {
                error = arg + ": not a number from " + std::to_string(min) + " to " +
                        std::to_string(max) + ": " + text;
                return false;
            }
            return true;
        };
        long n = 0;
        if (arg == "--help" || arg == "-h") {
            o.help = true;
        } else if (arg == "--version") {
            o.version = true;
        } else if (arg == "--headless") {
            o.headless = true;
        } else if (arg == "--fullscreen") {
            o.fullscreen = true;
        } else if (arg == "--device") {
            if (!next(o.deviceDir)) {
                return false;
            }
        } else if (arg == "--scale") {
            if (!number(1, 16, n)) {
                return false;
            }
            o.scale = static_cast<int>(n);
        } else if (arg == "--fps") {
            if (!number(1, 1000, n)) {
                return false;
            }
            o.framesPerSecond = static_cast<int>(n);
        } else if (arg == "--passes") {
            if (!number(0, 1L << 40, o.passes)) {
                return false;
            }
        } else if (arg == "--pass-ms") {
            if (!number(1, 60000, n)) {
                return false;
            }
            o.passMs = static_cast<int>(n);
        } else if (arg == "--script") {
            if (!next(o.script)) {
                return false;
            }
        } else if (arg == "--trace") {
            if (!next(o.trace)) {
                return false;
            }
        } else if (arg == "--screenshot-dir") {
            if (!next(o.screenshotDir)) {
                return false;
            }
        } else if (arg == "--screenshot-at") {
            std::string list;
            if (!next(list)) {
                return false;
            }
            if (!ParseList(list, o.screenshotAt)) {
                error = "--screenshot-at: expected pass numbers separated by commas: " + list;
                return false;
            }
        } else {
            error = "unknown option: " + arg;
            return false;
        }
    }
    return true;
}

std::string UsageText() {
    return "Usage: redizor [options]\n"
           "\n"
           "A fishing game for a 240 x 293 handheld screen.\n"
           "\n"
           "Options:\n"
           "  --device DIR        folder that stands in for the handheld's file system\n"
           "                      (default: the data pack made by the build)\n"
           "  --scale N           window scale factor, 1-16 (default: largest that fits, at least "
           "2)\n"
           "  --fullscreen        start in full screen\n"
           "  --fps N             frames per second shown (default 25, the handheld's pace)\n"
           "  --headless          run without a window or sound, on a virtual clock\n"
           "  --passes N          headless: close the window after N main-loop passes\n"
           "  --pass-ms M         headless: virtual milliseconds per pass (default 40)\n"
           "  --script FILE       headless: input events, one '<pass> <verb> [args]' a line\n"
           "  --trace FILE        headless: write the state after every pass as JSON lines\n"
           "  --screenshot-dir DIR --screenshot-at P1,P2,...\n"
           "                      headless: write the screen after those passes as PNG files\n"
           "  --version           print the version and exit\n"
           "  --help              print this text and exit\n"
           "\n"
           "Keys: arrow keys move the boat and the hook, Enter or Space strikes;\n"
           "the mouse is the stylus.\n";
}

}  // namespace host
