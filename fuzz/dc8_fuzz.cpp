// Any file given to the picture loader: it must refuse or load, never crash, hang or ask
// for more memory than a picture can need.
#include <sys/stat.h>
#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <string>

#include "gfx/image.h"
#include "platform/headless/headless.h"

namespace {

struct Exited {};

std::string Setup() {
    char folder[] = "/tmp/redizor-fuzz-XXXXXX";
    std::string root = ::mkdtemp(folder);
    std::string image = root + "/image";
    ::mkdir(image.c_str(), 0700);
    headless::Config config;
    config.deviceDir = root;
    config.quiet = true;
    headless::Install(config);
    headless::SetExitHook([](int) { throw Exited{}; });
    headless::Log().enabled = false;
    return image + "/f.dc8";
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const std::string file = Setup();
    FILE* f = std::fopen(file.c_str(), "wb");
    if (f == nullptr) {
        return 0;
    }
    std::fwrite(data, 1, size, f);
    std::fclose(f);
    Sprite sprite;
    try {
        if (sprite.Load(u"\\image\\f.dc8") == 1) {
            // A loaded picture must be safe to draw from and into, whatever its header said.
            Sprite other;
            other.Load(u"\\image\\f.dc8");
            sprite.Draw(&other, -3, -3, 1000, 1000, -2, -2, sprite.key | KEY_FLAG);
            sprite.Draw(&other, 0, 0, 1000, 1000, 0, 0, NO_KEY);
            sprite.HitTest(1, 1);
        }
    } catch (const Exited&) {
    }
    return 0;
}
