#include "tools/sounds/synth.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace kr::sounds {

Track::Track(double seconds) : samples_(static_cast<size_t>(std::lround(seconds * kRate)), 0.0f) {}

void Track::Add(double start, double length, const std::function<double(double)>& voice)
{
    const auto first = static_cast<size_t>(std::lround(start * kRate));
    const auto count = static_cast<size_t>(std::lround(length * kRate));
    for (size_t i = 0; i < count && first + i < samples_.size(); ++i)
        samples_[first + i] += static_cast<float>(voice(static_cast<double>(i) / kRate));
}

void Track::Normalise(double peak)
{
    float loudest = 0;
    for (float s : samples_) loudest = std::max(loudest, std::fabs(s));
    if (loudest == 0) return;
    const auto gain = static_cast<float>(peak / loudest);
    for (float& s : samples_) s *= gain;
}

void Track::FadeOut(double seconds)
{
    const size_t count = std::min(samples_.size(), static_cast<size_t>(std::lround(seconds * kRate)));
    for (size_t i = 1; i <= count; ++i)
        samples_[samples_.size() - i] *= static_cast<float>(i - 1) / static_cast<float>(count);
}

double Noise::Next()
{
    state_ ^= state_ << 13;
    state_ ^= state_ >> 17;
    state_ ^= state_ << 5;
    return static_cast<double>(state_) / 2147483648.0 - 1.0;
}

double Percussive(double t, double attack, double decay)
{
    if (t < attack) return t / attack;
    return std::exp(-(t - attack) / decay);
}

double Swell(double t, double length)
{
    if (t <= 0 || t >= length) return 0;
    return std::sin(std::numbers::pi * t / length);
}

double Glide(double t, double length, double from, double to)
{
    const double x = std::clamp(t / length, 0.0, 1.0);
    return from * std::pow(to / from, x);
}

double Oscillator::Step(double hz)
{
    const double now = phase_;
    phase_ += hz / kRate;
    phase_ -= std::floor(phase_);
    return now;
}

double SineOf(double turns) { return std::sin(2 * std::numbers::pi * turns); }

double SquareOf(double turns, double hz)
{
    double sum = 0;
    for (int n = 1; n * hz < 8000 && n < 40; n += 2) sum += SineOf(turns * n) / n;
    return sum * 4 / std::numbers::pi;
}

double BrassOf(double turns, double hz)
{
    double sum = 0;
    for (int n = 1; n <= 8 && n * hz < 12000; ++n) sum += SineOf(turns * n) / n;
    return sum * 0.6;
}

double BandPass::Step(double in, double hz)
{
    const double f = 2 * std::sin(std::numbers::pi * std::min(hz, kRate / 6.0) / kRate);
    low_ += f * band_;
    const double high = in - low_ - damping_ * band_;
    band_ += f * high;
    return band_;
}

double LowPass::Step(double in, double hz)
{
    const double k = 1 - std::exp(-2 * std::numbers::pi * hz / kRate);
    out_ += k * (in - out_);
    return out_;
}

}  // namespace kr::sounds
