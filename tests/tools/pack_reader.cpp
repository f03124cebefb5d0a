#include "pack_reader.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "tools/packgen/pack.h"

namespace packtest {

std::vector<std::uint8_t> ReadBytes(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    return std::vector<std::uint8_t>(std::istreambuf_iterator<char>(in), {});
}

std::uint16_t U16(const std::vector<std::uint8_t>& b, std::size_t at) {
    return std::uint16_t(b[at] | (b[at + 1] << 8));
}

std::uint32_t U32(const std::vector<std::uint8_t>& b, std::size_t at) {
    return std::uint32_t(U16(b, at)) | (std::uint32_t(U16(b, at + 2)) << 16);
}

int Dc8::lum(int x, int y) const {
    return (2 * red(x, y) + 5 * green(x, y) + blue(x, y)) / 8;
}

Dc8 ParseDc8(const std::vector<std::uint8_t>& b) {
    Dc8 d;
    d.bytesOnDisk = b.size();
    if (b.size() < 54 + 1024) {
        d.error = "shorter than its headers and palette";
        return d;
    }
    if (U16(b, 0) != 0x4D42) {
        d.error = "not BM";
        return d;
    }
    d.fileSizeField = U32(b, 2);
    d.pixelOffset = U32(b, 10);
    d.headerSize = U32(b, 14);
    d.width = std::int32_t(U32(b, 18));
    d.height = std::int32_t(U32(b, 22));
    d.planes = U16(b, 26);
    d.bitsPerPixel = U16(b, 28);
    d.compression = U32(b, 30);
    d.imageSize = U32(b, 34);
    d.coloursUsed = U32(b, 46);
    d.palette.assign(b.begin() + 54, b.begin() + 54 + 1024);
    if (d.width <= 0 || d.height <= 0 || d.bitsPerPixel != 8) {
        d.error = "not a positive 8-bit picture";
        return d;
    }
    std::size_t stride = (std::size_t(d.width) + 3) / 4 * 4;
    if (d.pixelOffset + stride * std::size_t(d.height) > b.size()) {
        d.error = "pixel rows run past the end of the file";
        return d;
    }
    d.rows.resize(std::size_t(d.width) * d.height);
    for (int y = 0; y < d.height; ++y) {
        // Rows are stored bottom-up.
        std::size_t from = d.pixelOffset + stride * std::size_t(d.height - 1 - y);
        for (int x = 0; x < d.width; ++x) {
            d.rows[std::size_t(y) * d.width + x] = b[from + x];
        }
    }
    return d;
}

Wav ParseWav(const std::vector<std::uint8_t>& b) {
    Wav w;
    auto tag = [&](std::size_t at, const char* t) {
        return at + 4 <= b.size() && std::equal(t, t + 4, b.begin() + long(at));
    };
    if (!tag(0, "RIFF") || !tag(8, "WAVE")) {
        w.error = "not RIFF/WAVE";
        return w;
    }
    if (U32(b, 4) + 8 != b.size()) {
        w.error = "RIFF size disagrees with the file";
        return w;
    }
    std::size_t at = 12;
    bool haveFmt = false;
    while (at + 8 <= b.size()) {
        std::uint32_t len = U32(b, at + 4);
        if (tag(at, "fmt ")) {
            w.format = U16(b, at + 8);
            w.channels = U16(b, at + 10);
            w.rate = int(U32(b, at + 12));
            w.bits = U16(b, at + 22);
            haveFmt = true;
        } else if (tag(at, "data")) {
            if (!haveFmt || at + 8 + len > b.size()) {
                w.error = "data before fmt or past the end";
                return w;
            }
            for (std::size_t i = 0; i + 1 < len; i += 2) {
                w.samples.push_back(std::int16_t(U16(b, at + 8 + i)));
            }
            return w;
        }
        at += 8 + len + (len & 1);
    }
    w.error = "no data chunk";
    return w;
}

const std::string& PackDir() {
    static const std::string dir = [] {
        std::string base =
            (std::filesystem::temp_directory_path() / "packgen_test_XXXXXX").string();
        if (!mkdtemp(base.data())) {
            std::abort();
        }
        std::string error;
        if (!packgen::WritePack(base + "/device", &error)) {
            std::abort();
        }
        // Left for the process to remove on exit; a leaked copy outlives every static.
        static const std::string* root = new std::string(base);
        std::atexit([] { std::filesystem::remove_all(*root); });
        return base + "/device";
    }();
    return dir;
}

std::string ImagePath(const std::string& file) {
    return PackDir() + "/Program Files/Redizor/image/" + file;
}

std::string SoundPath(const std::string& file) {
    return PackDir() + "/Program Files/Redizor/sound/" + file;
}

}  // namespace packtest
