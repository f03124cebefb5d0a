// redizor-pack: draws every picture and synthesises every cue of the game into a device folder.
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include "tools/packgen/pack.h"

namespace {

int Usage() {
    std::fprintf(stderr,
                 "usage: redizor-pack --out DIR\n"
                 "       redizor-pack --contact-sheet FILE.png [--scale N]\n");
    return 1;
}

}  // namespace

int main(int argc, char** argv) {
    std::string out, sheet;
    int scale = 1;
    for (int i = 1; i < argc; ++i) {
        std::string a = argv[i];
        if (a == "--out" && i + 1 < argc) {
            out = argv[++i];
        } else if (a == "--contact-sheet" && i + 1 < argc) {
            sheet = argv[++i];
        } else if (a == "--scale" && i + 1 < argc) {
            scale = std::atoi(argv[++i]);
        } else {
            return Usage();
        }
    }
    if (out.empty() == sheet.empty()) {
        return Usage();
    }
    std::string error;
    bool ok = out.empty() ? packgen::WriteContactSheet(sheet, scale, &error)
                          : packgen::WritePack(out, &error);
    if (!ok) {
        std::fprintf(stderr, "redizor-pack: %s\n", error.c_str());
        return 2;
    }
    return 0;
}
