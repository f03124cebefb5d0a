#include "tools/packgen/sound.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <functional>

namespace packgen {

namespace {

constexpr double kPi = 3.14159265358979323846;

// A mixing buffer of float samples with a few instruments.
class Track {
public:
    explicit Track(double seconds) : s_(std::size_t(seconds * kSampleRate), 0.0) {}

    // A bell-like note: a few decaying partials.
    void bell(double t0, double freq, double dur, double amp) {
        voice(t0, dur, [&](double t) {
            double env = std::exp(-t * 5.0 / dur);
            return amp * env *
                   (std::sin(2 * kPi * freq * t) +
                    0.4 * std::sin(2 * kPi * freq * 2.01 * t) * std::exp(-t * 6.0) +
                    0.2 * std::sin(2 * kPi * freq * 3.0 * t) * std::exp(-t * 10.0));
        });
    }

    // A soft square-ish lead, the sound of a small handheld's speaker.
    void lead(double t0, double freq, double dur, double amp) {
        voice(t0, dur, [&](double t) {
            double att = std::min(1.0, t / 0.01);
            double env = att * std::exp(-t * 2.5 / dur);
            double ph = 2 * kPi * freq * t;
            return amp * env *
                   (std::sin(ph) + 0.3 * std::sin(3 * ph) + 0.15 * std::sin(5 * ph) +
                    0.1 * std::sin(2 * ph));
        });
    }

    // A sine whose pitch glides from f0 to f1.
    void glide(double t0, double f0, double f1, double dur, double amp, double decay = 3.0) {
        double phase = 0;
        std::size_t start = std::size_t(t0 * kSampleRate);
        std::size_t n = std::size_t(dur * kSampleRate);
        for (std::size_t i = 0; i < n && start + i < s_.size(); ++i) {
            double t = double(i) / kSampleRate;
            double f = f0 * std::pow(f1 / f0, t / dur);
            phase += 2 * kPi * f / kSampleRate;
            double env = std::min(1.0, t / 0.005) * std::exp(-t * decay / dur);
            s_[start + i] += amp * env * (std::sin(phase) + 0.2 * std::sin(2 * phase));
        }
    }

    // Band-limited noise burst (a splash), shaped by a one-pole low-pass filter.
    void splash(double t0, double dur, double amp, double brightness) {
        double lp = 0, lp2 = 0;
        std::size_t start = std::size_t(t0 * kSampleRate);
        std::size_t n = std::size_t(dur * kSampleRate);
        for (std::size_t i = 0; i < n && start + i < s_.size(); ++i) {
            double t = double(i) / kSampleRate;
            double k = brightness * (1.0 - 0.7 * t / dur);
            lp += k * (noise() - lp);
            lp2 += k * (lp - lp2);
            double env = std::min(1.0, t / 0.004) * std::exp(-t * 4.0 / dur);
            s_[start + i] += amp * env * (lp - 0.5 * lp2) * 3.0;
        }
    }

    // A ratchet: clicks whose rate runs from r0 to r1 per second, like a spinning reel.
    void ratchet(double t0, double dur, double r0, double r1, double amp) {
        double t = 0;
        while (t < dur) {
            double rate = r0 + (r1 - r0) * (t / dur);
            click(t0 + t, amp * (0.6 + 0.4 * std::sin(kPi * t / dur)));
            t += 1.0 / rate;
        }
    }

    void click(double t0, double amp) {
        std::size_t start = std::size_t(t0 * kSampleRate);
        for (std::size_t i = 0; i < 90 && start + i < s_.size(); ++i) {
            double t = double(i) / kSampleRate;
            s_[start + i] += amp * std::exp(-t * 900.0) *
                             (std::sin(2 * kPi * 2900 * t) + 0.5 * std::sin(2 * kPi * 4700 * t));
        }
    }

    // Normalised to the common peak with short fades at both ends, as 16-bit samples.
    std::vector<std::int16_t> finish() {
        std::size_t fadeIn = std::size_t(0.003 * kSampleRate);
        std::size_t fadeOut = std::size_t(0.04 * kSampleRate);
        for (std::size_t i = 0; i < s_.size(); ++i) {
            if (i < fadeIn) {
                s_[i] *= double(i) / fadeIn;
            }
            if (i + fadeOut > s_.size()) {
                s_[i] *= double(s_.size() - i) / fadeOut;
            }
        }
        double peak = 1e-9;
        for (double v : s_) {
            peak = std::max(peak, std::fabs(v));
        }
        std::vector<std::int16_t> out(s_.size());
        for (std::size_t i = 0; i < s_.size(); ++i) {
            out[i] = std::int16_t(std::lround(s_[i] / peak * kPeak * 32767.0));
        }
        return out;
    }

private:
    void voice(double t0, double dur, const std::function<double(double)>& f) {
        std::size_t start = std::size_t(t0 * kSampleRate);
        std::size_t n = std::size_t(dur * kSampleRate);
        std::size_t rel = std::size_t(0.01 * kSampleRate);
        for (std::size_t i = 0; i < n && start + i < s_.size(); ++i) {
            double v = f(double(i) / kSampleRate);
            if (i + rel > n) {
                v *= double(n - i) / rel;  // no click where a note stops
            }
            s_[start + i] += v;
        }
    }

    double noise() {
        seed_ = seed_ * 1664525u + 1013904223u;
        return double(seed_ >> 8) / double(1u << 24) * 2.0 - 1.0;
    }

    std::vector<double> s_;
    std::uint32_t seed_ = 12345;
};

double Note(int semitonesFromA4) {
    return 440.0 * std::pow(2.0, semitonesFromA4 / 12.0);
}

// Semitones from A4 of a few notes used below.
constexpr int C5 = 3, D5 = 5, E5 = 7, F5 = 8, G5 = 10, A5 = 12, B5 = 14, C6 = 15, D6 = 17, E6 = 19,
              G6 = 22, G4 = -2, A4 = 0, C4 = -9, E4 = -5;

std::vector<std::int16_t> StartJingle() {
    Track t(1.1);
    const int notes[] = {C5, E5, G5, C6};
    for (int i = 0; i < 4; ++i) {
        t.bell(i * 0.12, Note(notes[i]), 0.5, 0.5);
    }
    t.bell(0.48, Note(E6), 0.6, 0.35);
    t.bell(0.48, Note(G5), 0.6, 0.3);
    t.lead(0.48, Note(C4), 0.6, 0.25);
    return t.finish();
}

std::vector<std::int16_t> ExitChime() {
    Track t(1.3);
    const int notes[] = {G5, E5, C5};
    for (int i = 0; i < 3; ++i) {
        t.bell(i * 0.2, Note(notes[i]), 0.8, 0.5);
    }
    t.bell(0.6, Note(G4), 0.7, 0.3);
    return t.finish();
}

std::vector<std::int16_t> MenuStinger() {
    Track t(0.4);
    t.lead(0.0, Note(G5), 0.12, 0.5);
    t.lead(0.1, Note(D6), 0.28, 0.5);
    return t.finish();
}

std::vector<std::int16_t> IntroStinger() {
    Track t(0.7);
    t.bell(0.0, Note(E5), 0.3, 0.4);
    t.bell(0.12, Note(A5), 0.3, 0.4);
    t.bell(0.24, Note(C6), 0.45, 0.45);
    t.lead(0.24, Note(A4), 0.45, 0.25);
    return t.finish();
}

std::vector<std::int16_t> EndPhrase() {
    Track t(1.45);
    const int notes[] = {G5, F5, E5, D5, C5};
    const double at[] = {0.0, 0.18, 0.36, 0.54, 0.78};
    for (int i = 0; i < 5; ++i) {
        t.lead(at[i], Note(notes[i]), i == 4 ? 0.65 : 0.2, 0.45);
    }
    t.bell(0.78, Note(C4), 0.65, 0.3);
    t.bell(0.78, Note(E4), 0.65, 0.25);
    return t.finish();
}

std::vector<std::int16_t> ReelWhizz() {
    Track t(0.55);
    t.ratchet(0.0, 0.5, 35, 110, 0.5);
    t.glide(0.0, 300, 1400, 0.45, 0.25, 1.5);
    t.splash(0.0, 0.3, 0.2, 0.35);
    return t.finish();
}

std::vector<std::int16_t> Bubble() {
    Track t(0.25);
    t.glide(0.0, 380, 1100, 0.09, 0.6, 2.0);
    t.glide(0.1, 520, 1500, 0.08, 0.45, 2.0);
    return t.finish();
}

std::vector<std::int16_t> Landing(int variant) {
    Track t(0.8);
    t.splash(0.0, 0.35, 0.6, 0.25 + 0.1 * variant);
    const int sets[3][3] = {{C5, E5, G5}, {D5, G5, B5}, {E5, A5, C6}};
    for (int i = 0; i < 3; ++i) {
        if (variant == 1) {
            t.lead(0.12 + i * 0.08, Note(sets[variant][i]), 0.3, 0.3);
        } else {
            t.bell(0.12 + i * 0.09, Note(sets[variant][i]), 0.45, 0.35);
        }
    }
    t.bell(0.4, Note(sets[variant][0] + 12), 0.4, 0.25);
    return t.finish();
}

std::vector<std::int16_t> Escape(int variant) {
    Track t(0.7);
    const double from[3] = {Note(E5), Note(G5), Note(C5)};
    t.glide(0.0, from[variant], from[variant] / 2.2, 0.45, 0.5, 2.0);
    if (variant != 1) {
        t.glide(0.18, from[variant] * 0.75, from[variant] * 0.35, 0.4, 0.35, 2.5);
    }
    t.splash(0.3, 0.35, 0.45, 0.2 + 0.08 * variant);
    return t.finish();
}

}  // namespace

const std::vector<std::string>& CueNames() {
    static const std::vector<std::string> names = {
        "start.mc8",        "exit.mc8",         "menu.mc8",         "intro.mc8",
        "end.mc8",          "taken_fish.mc8",   "p_sound.mc8",      "n_taken_succ.mc8",
        "j_taken_succ.mc8", "p_taken_succ.mc8", "n_taken_fail.mc8", "j_taken_fail.mc8",
        "p_taken_fail.mc8"};
    return names;
}

std::vector<std::int16_t> SynthCue(const std::string& name) {
    if (name == "start.mc8")
        return StartJingle();
    if (name == "exit.mc8")
        return ExitChime();
    if (name == "menu.mc8")
        return MenuStinger();
    if (name == "intro.mc8")
        return IntroStinger();
    if (name == "end.mc8")
        return EndPhrase();
    if (name == "taken_fish.mc8")
        return ReelWhizz();
    if (name == "p_sound.mc8")
        return Bubble();
    const char* letters = "njp";
    for (int v = 0; v < 3; ++v) {
        if (name == std::string(1, letters[v]) + "_taken_succ.mc8")
            return Landing(v);
        if (name == std::string(1, letters[v]) + "_taken_fail.mc8")
            return Escape(v);
    }
    return {};
}

}  // namespace packgen
