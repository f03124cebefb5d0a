#include "tools/packgen/files.h"

#include <fstream>

namespace packgen {

namespace {

void Put16(std::vector<std::uint8_t>& out, unsigned v) {
    out.push_back(std::uint8_t(v & 0xFF));
    out.push_back(std::uint8_t((v >> 8) & 0xFF));
}

void Put32(std::vector<std::uint8_t>& out, std::uint32_t v) {
    Put16(out, v & 0xFFFF);
    Put16(out, v >> 16);
}

void PutTag(std::vector<std::uint8_t>& out, const char* tag) {
    for (int i = 0; i < 4; ++i) {
        out.push_back(std::uint8_t(tag[i]));
    }
}

}  // namespace

std::vector<std::uint8_t> EncodeDc8(const Canvas& c) {
    const std::uint32_t stride = (std::uint32_t(c.width()) + 3) & ~3u;
    const std::uint32_t imageSize = stride * std::uint32_t(c.height());
    const std::uint32_t offset = 14 + 40 + 256 * 4;
    std::vector<std::uint8_t> out;
    out.reserve(offset + imageSize);
    Put16(out, 0x4D42);
    Put32(out, offset + imageSize);
    Put16(out, 0);
    Put16(out, 0);
    Put32(out, offset);
    Put32(out, 40);
    Put32(out, std::uint32_t(c.width()));
    Put32(out, std::uint32_t(c.height()));
    Put16(out, 1);
    Put16(out, 8);
    Put32(out, 0);
    Put32(out, imageSize);
    Put32(out, 2835);  // 72 dots per inch
    Put32(out, 2835);
    Put32(out, 256);
    Put32(out, 0);
    for (const Rgb& p : Palette()) {
        out.push_back(std::uint8_t(p.b));
        out.push_back(std::uint8_t(p.g));
        out.push_back(std::uint8_t(p.r));
        out.push_back(0);
    }
    for (int y = c.height() - 1; y >= 0; --y) {
        for (int x = 0; x < c.width(); ++x) {
            out.push_back(c.get(x, y));
        }
        for (std::uint32_t p = std::uint32_t(c.width()); p < stride; ++p) {
            out.push_back(0);
        }
    }
    return out;
}

std::vector<std::uint8_t> EncodeWav(const std::vector<std::int16_t>& samples, int rate) {
    const std::uint32_t dataBytes = std::uint32_t(samples.size() * 2);
    std::vector<std::uint8_t> out;
    out.reserve(44 + dataBytes);
    PutTag(out, "RIFF");
    Put32(out, 36 + dataBytes);
    PutTag(out, "WAVE");
    PutTag(out, "fmt ");
    Put32(out, 16);
    Put16(out, 1);  // PCM
    Put16(out, 1);  // mono
    Put32(out, std::uint32_t(rate));
    Put32(out, std::uint32_t(rate) * 2);
    Put16(out, 2);
    Put16(out, 16);
    PutTag(out, "data");
    Put32(out, dataBytes);
    for (std::int16_t s : samples) {
        Put16(out, std::uint16_t(s));
    }
    return out;
}

std::string RegistryText() {
    return "; Redizor device registry\n"
           "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Apps\\Vorn Redizor Demo]\n"
           "\"InstallDir\"=\"\\Program Files\\Redizor\"\n";
}

std::vector<std::uint8_t> EncodeRanking(const std::vector<RankEntry>& entries) {
    std::vector<std::uint8_t> out;
    Put16(out, 0xFEFF);  // a byte-order mark in the header unit, which readers skip
    for (std::size_t i = 0; i < 10; ++i) {
        RankEntry e = i < entries.size() ? entries[i] : RankEntry{u"__________", u"00000000"};
        std::u16string name = e.name.substr(0, 10);
        name.resize(10, u'_');
        std::u16string score = e.score.substr(0, 8);
        if (score.size() < 8) {
            score.insert(0, 8 - score.size(), u'0');
        }
        for (char16_t u : name) {
            Put16(out, u);
        }
        Put16(out, u' ');
        for (char16_t u : score) {
            Put16(out, u);
        }
        Put16(out, u' ');
    }
    return out;
}

bool WriteFile(const std::string& path, const std::vector<std::uint8_t>& bytes) {
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(reinterpret_cast<const char*>(bytes.data()), std::streamsize(bytes.size()));
    return bool(out);
}

bool WriteFile(const std::string& path, const std::string& text) {
    return WriteFile(path, std::vector<std::uint8_t>(text.begin(), text.end()));
}

}  // namespace packgen
