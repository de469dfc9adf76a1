#pragma once
#include <cstddef>
#include <cstdint>
#include <functional>
#include <vector>

namespace kr::sounds {

inline constexpr int kRate = 44100;

// A mono sound being built: samples at kRate, mixed into by the instruments below.
class Track {
public:
    explicit Track(double seconds);

    // Adds `voice(t)` (t in seconds since `start`) for `length` seconds from `start`, cut at the track's end.
    void Add(double start, double length, const std::function<double(double)>& voice);
    // Scales the whole track so that its loudest sample sits at `peak` (linear, full scale 1).
    void Normalise(double peak);
    // Fades the last `seconds` to silence, so no sound ends in a click.
    void FadeOut(double seconds);

    const std::vector<float>& Samples() const { return samples_; }

private:
    std::vector<float> samples_;
};

// Seeded white noise in [-1, 1): the same seed gives the same sound on every build.
class Noise {
public:
    explicit Noise(uint32_t seed) : state_(seed ? seed : 1) {}
    double Next();

private:
    uint32_t state_;
};

// Rises linearly over `attack` seconds, then dies away exponentially with time constant `decay`.
double Percussive(double t, double attack, double decay);
// Zero at both ends, one in the middle: a smooth swell of `length` seconds.
double Swell(double t, double length);
// Glides exponentially from `from` to `to` over `length` seconds, then holds `to`.
double Glide(double t, double length, double from, double to);

// A phase that follows a changing frequency, so pitch sweeps stay smooth.
class Oscillator {
public:
    // Advances by one sample at `hz` and returns the phase in turns [0, 1).
    double Step(double hz);

private:
    double phase_ = 0;
};

double SineOf(double turns);
// A band-limited-enough square for low buzzes: the sum of its first odd harmonics below 8 kHz.
double SquareOf(double turns, double hz);
// A brassy tone: the first eight harmonics, falling off as 1/n.
double BrassOf(double turns, double hz);

// A state-variable filter whose centre may move every sample (whooshes, whizzes, ringing clicks).
class BandPass {
public:
    explicit BandPass(double damping) : damping_(damping) {}
    // Filters one sample at centre `hz`; returns the band-passed output.
    double Step(double in, double hz);
    double LowPass() const { return low_; }

private:
    double damping_;
    double low_ = 0, band_ = 0;
};

// A one-pole low-pass whose cutoff may move every sample.
class LowPass {
public:
    double Step(double in, double hz);

private:
    double out_ = 0;
};

}  // namespace kr::sounds
