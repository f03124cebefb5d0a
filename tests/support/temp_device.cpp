#include "support/temp_device.h"

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace test {

namespace fs = std::filesystem;

TempDevice::TempDevice() {
    std::string pattern = (fs::temp_directory_path() / "redizor-test-XXXXXX").string();
    char* made = ::mkdtemp(pattern.data());
    path_ = made != nullptr ? made : pattern;
}

TempDevice::~TempDevice() {
    std::error_code ignored;
    fs::remove_all(path_, ignored);
}

void TempDevice::Write(const std::string& relative, const std::vector<std::uint8_t>& bytes) const {
    fs::path file = fs::path(path_) / relative;
    fs::create_directories(file.parent_path());
    std::ofstream out(file, std::ios::binary);
    out.write(reinterpret_cast<const char*>(bytes.data()),
              static_cast<std::streamsize>(bytes.size()));
}

void TempDevice::WriteText(const std::string& relative, const std::string& text) const {
    Write(relative, std::vector<std::uint8_t>(text.begin(), text.end()));
}

void TempDevice::Remove(const std::string& relative) const {
    std::error_code ignored;
    fs::remove(fs::path(path_) / relative, ignored);
}

void TempDevice::WriteRegistry(const std::string& installDir) const {
    WriteText("registry.txt",
              "; test registry\n[HKEY_LOCAL_MACHINE\\SOFTWARE\\Apps\\Vorn Redizor Demo]\n"
              "\"InstallDir\"=\"" +
                  installDir + "\"\n");
}

std::uint32_t Dc8PaletteRgb(int i) {
    return (static_cast<std::uint32_t>(i / 2) << 16) | (static_cast<std::uint32_t>(255 - i) << 8) |
           static_cast<std::uint32_t>(i);
}

namespace {

void Put16(std::vector<std::uint8_t>& b, std::size_t at, std::uint32_t v) {
    b[at] = static_cast<std::uint8_t>(v);
    b[at + 1] = static_cast<std::uint8_t>(v >> 8);
}

void Put32(std::vector<std::uint8_t>& b, std::size_t at, std::uint32_t v) {
    Put16(b, at, v & 0xFFFF);
    Put16(b, at + 2, v >> 16);
}

}  // namespace

std::vector<std::uint8_t> Dc8::Bytes() const {
    int entries = paletteEntries;
    if (entries < 0) {
        entries = bitsPerPixel == 8 ? 256 : bitsPerPixel == 4 ? 16 : bitsPerPixel == 1 ? 2 : 0;
    }
    long stride = ((static_cast<long>(width < 0 ? -width : width) * bitsPerPixel + 31) / 32) * 4;
    long rows = height < 0 ? -height : height;
    std::vector<std::uint8_t> pix = pixels;
    if (pix.empty()) {
        pix.resize(static_cast<std::size_t>(stride * rows));
        for (long r = 0; r < rows; ++r) {
            for (long c = 0; c < stride; ++c) {
                pix[static_cast<std::size_t>(r * stride + c)] =
                    static_cast<std::uint8_t>(r * 16 + c);
            }
        }
    }
    long offset = pixelOffset >= 0 ? pixelOffset : 54 + entries * 4;
    std::vector<std::uint8_t> b(static_cast<std::size_t>(std::max<long>(offset, 54 + entries * 4)),
                                0);
    Put16(b, 0, type);
    Put32(b, 10, static_cast<std::uint32_t>(offset));
    Put32(b, 14, headerSize);
    Put32(b, 18, static_cast<std::uint32_t>(width));
    Put32(b, 22, static_cast<std::uint32_t>(height));
    Put16(b, 26, 1);
    Put16(b, 28, bitsPerPixel);
    Put32(b, 34, static_cast<std::uint32_t>(pix.size()));
    Put32(b, 46, coloursUsed);
    for (int i = 0; i < entries; ++i) {
        std::uint32_t rgb = Dc8PaletteRgb(i);
        b[54 + 4 * i] = static_cast<std::uint8_t>(rgb);
        b[55 + 4 * i] = static_cast<std::uint8_t>(rgb >> 8);
        b[56 + 4 * i] = static_cast<std::uint8_t>(rgb >> 16);
    }
    b.resize(static_cast<std::size_t>(offset));
    b.insert(b.end(), pix.begin(), pix.end());
    Put32(b, 2,
          static_cast<std::uint32_t>(fileSizeField >= 0 ? fileSizeField
                                                        : static_cast<long>(b.size())));
    return b;
}

}  // namespace test
