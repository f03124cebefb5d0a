#include "platform/sdl/sdl_audio.h"

namespace sdl {

namespace {

// The handheld's cues are low-rate mono; 22050 Hz mono keeps them as they were meant.
constexpr int kRate = 22050;
constexpr Uint8 kChannels = 1;
constexpr Uint16 kBufferSamples = 1024;

// The whole cue in one go: an audio stream would hold back its tail at rate changes.
std::vector<Uint8> Convert(const SDL_AudioSpec& from, const Uint8* data, Uint32 length,
                           const SDL_AudioSpec& to) {
    SDL_AudioCVT cvt;
    if (SDL_BuildAudioCVT(&cvt, from.format, from.channels, from.freq, to.format, to.channels,
                          to.freq) < 0) {
        return {};
    }
    std::vector<Uint8> out(data, data + length);
    if (cvt.needed == 0) {
        return out;
    }
    out.resize(static_cast<std::size_t>(length) * static_cast<std::size_t>(cvt.len_mult));
    cvt.buf = out.data();
    cvt.len = static_cast<int>(length);
    if (SDL_ConvertAudio(&cvt) != 0) {
        return {};
    }
    out.resize(static_cast<std::size_t>(cvt.len_cvt));
    return out;
}

}  // namespace

bool CuePlayer::Open() {
    Close();
    SDL_AudioSpec want{};
    want.freq = kRate;
    want.format = AUDIO_S16SYS;
    want.channels = kChannels;
    want.samples = kBufferSamples;
    // No changes allowed: SDL adapts to the hardware, and cues are converted once to this.
    device_ = SDL_OpenAudioDevice(nullptr, 0, &want, &format_, 0);
    if (device_ == 0) {
        return false;
    }
    SDL_PauseAudioDevice(device_, 0);
    return true;
}

void CuePlayer::Close() {
    if (device_ != 0) {
        SDL_CloseAudioDevice(device_);
        device_ = 0;
    }
    cache_.clear();
}

const std::vector<Uint8>& CuePlayer::Decoded(const std::string& hostPath) {
    auto found = cache_.find(hostPath);
    if (found != cache_.end()) {
        return found->second;
    }
    std::vector<Uint8>& cue = cache_[hostPath];
    SDL_AudioSpec spec{};
    Uint8* data = nullptr;
    Uint32 length = 0;
    if (SDL_LoadWAV(hostPath.c_str(), &spec, &data, &length) != nullptr) {
        cue = Convert(spec, data, length, format_);
        SDL_FreeWAV(data);
    }
    return cue;
}

void CuePlayer::Play(const std::string& hostPath) {
    if (device_ == 0) {
        return;
    }
    SDL_ClearQueuedAudio(device_);
    if (hostPath.empty()) {
        return;
    }
    const std::vector<Uint8>& cue = Decoded(hostPath);
    if (!cue.empty()) {
        SDL_QueueAudio(device_, cue.data(), static_cast<Uint32>(cue.size()));
    }
}

}  // namespace sdl
