// Any text given as an input script: parsed or refused with a line number, never a crash.
#include <cstdint>
#include <string>

#include "platform/host/script.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string text(reinterpret_cast<const char*>(data), size);
    std::vector<host::ScriptEvent> events;
    std::string error;
    if (host::ParseScript(text, events, error)) {
        // What was read writes back to lines that read the same.
        std::string again;
        for (const host::ScriptEvent& e : events) {
            again += host::FormatEvent(e) + "\n";
        }
        std::vector<host::ScriptEvent> reread;
        if (!host::ParseScript(again, reread, error) || reread.size() != events.size()) {
            __builtin_trap();
        }
    } else if (error.find("line ") == std::string::npos) {
        __builtin_trap();
    }
    return 0;
}
