// The game's sound cues, synthesised: short, clean, one loudness.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace packgen {

constexpr int kSampleRate = 22050;
// Every cue is normalised to this peak, about -3 dB below full scale.
constexpr double kPeak = 0.707;

// File names of every cue, as the game plays them.
const std::vector<std::string>& CueNames();
// The samples of one cue; empty for an unknown name.
std::vector<std::int16_t> SynthCue(const std::string& name);

}  // namespace packgen
