// Plays the game's cues: one at a time, without blocking, each cutting off the one before.
#pragma once

#include <SDL.h>

#include <map>
#include <string>
#include <vector>

namespace sdl {

class CuePlayer {
public:
    CuePlayer() = default;
    CuePlayer(const CuePlayer&) = delete;
    CuePlayer& operator=(const CuePlayer&) = delete;
    ~CuePlayer() { Close(); }

    // Opens the output device (the audio subsystem must be up). False: cues stay silent.
    bool Open();
    void Close();
    bool IsOpen() const { return device_ != 0; }

    // Stops the cue playing, then starts the WAV file at hostPath. An empty path or a file
    // that cannot be decoded leaves silence.
    void Play(const std::string& hostPath);

    SDL_AudioDeviceID Device() const { return device_; }
    const SDL_AudioSpec& Format() const { return format_; }

private:
    // The cue in the device's format; empty when the file cannot be used.
    const std::vector<Uint8>& Decoded(const std::string& hostPath);

    SDL_AudioDeviceID device_ = 0;
    SDL_AudioSpec format_{};
    // Cues are a dozen short files played again and again: decode each once.
    std::map<std::string, std::vector<Uint8>> cache_;
};

}  // namespace sdl
