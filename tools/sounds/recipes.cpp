#include "tools/sounds/recipes.h"

#include <cmath>
#include <numbers>

#include "tools/sounds/synth.h"

namespace kr::sounds {
namespace {

// A gunshot: a crack of bright noise darkening fast, a low thump and a short room tail.
Track Gunshot(uint32_t seed, double crackHz, double thumpHz, double tail)
{
    Track track(0.55);
    Noise noise(seed);
    LowPass crack;
    track.Add(0, 0.55, [&](double t) {
        const double n = noise.Next();
        return crack.Step(n, Glide(t, 0.08, crackHz, 700)) * Percussive(t, 0.0008, 0.035) * 1.6 +
               n * Percussive(t, 0.0005, 0.004) * 0.5;
    });
    Oscillator thump;
    track.Add(0, 0.3, [&](double t) {
        return SineOf(thump.Step(Glide(t, 0.12, thumpHz, thumpHz * 0.45))) * Percussive(t, 0.002, 0.06) * 0.9;
    });
    Noise room(seed + 1);
    LowPass roomTone;
    track.Add(0.01, 0.54, [&](double t) { return roomTone.Step(room.Next(), 900) * Percussive(t, 0.02, tail) * 0.8; });
    return track;
}

std::vector<float> Done(Track track)
{
    track.FadeOut(0.02);
    track.Normalise(kPeak);
    return track.Samples();
}

std::vector<float> Shot1() { return Done(Gunshot(11, 9000, 110, 0.07)); }

// The second gun is heavier and answered by an echo off a far wall.
std::vector<float> Shot2()
{
    Track track = Gunshot(23, 5000, 75, 0.11);
    Noise echoNoise(29);
    LowPass echo;
    track.Add(0.16, 0.3, [&](double t) { return echo.Step(echoNoise.Next(), 1400) * Percussive(t, 0.002, 0.05) * 0.9; });
    return Done(std::move(track));
}

// A bullet passing by: a narrow band of noise and a faint whistle, both falling in pitch as it flies past.
std::vector<float> Miss()
{
    Track track(0.42);
    Noise noise(37);
    BandPass band(0.25);
    track.Add(0, 0.42, [&](double t) {
        return band.Step(noise.Next(), Glide(t, 0.42, 4200, 900)) * std::pow(Swell(t, 0.42), 3) * 0.6;
    });
    Oscillator whistle;
    track.Add(0.05, 0.32, [&](double t) {
        return SineOf(whistle.Step(Glide(t, 0.32, 3200, 1300))) * std::pow(Swell(t, 0.32), 2) * 0.12;
    });
    return Done(std::move(track));
}

// Something hit hard: a dull body thud with a short clank of metal.
std::vector<float> Impact()
{
    Track track(0.32);
    Oscillator body;
    track.Add(0, 0.32, [&](double t) { return SineOf(body.Step(Glide(t, 0.15, 150, 55))) * Percussive(t, 0.001, 0.07); });
    Noise noise(41);
    LowPass thud, muffle;
    track.Add(0, 0.2, [&](double t) {
        return muffle.Step(thud.Step(noise.Next(), 1500), 1500) * Percussive(t, 0.001, 0.03) * 2.5;
    });
    Oscillator clank1, clank2;
    track.Add(0.004, 0.2, [&](double t) {
        return (SineOf(clank1.Step(1230)) + SineOf(clank2.Step(1877))) * Percussive(t, 0.001, 0.04) * 0.12;
    });
    return Done(std::move(track));
}

// One mechanical click: a tick of noise ringing at the part's own pitch.
void Click(Track& track, double at, uint32_t seed, double ringHz, double loudness)
{
    Noise noise(seed);
    BandPass ring(0.08);
    track.Add(at, 0.06, [&, noise, ring](double t) mutable {
        const double tick = noise.Next() * Percussive(t, 0.0003, 0.0025);
        return (ring.Step(tick, ringHz) * 0.5 + tick * 0.6) * loudness;
    });
}

// The magazine out and back in: a light click, then a heavier clack with a knock.
std::vector<float> Reload()
{
    Track track(0.36);
    Click(track, 0, 43, 3400, 0.7);
    Click(track, 0.012, 44, 2600, 0.4);
    Click(track, 0.2, 47, 1700, 1.0);
    Click(track, 0.21, 48, 2300, 0.6);
    Oscillator knock;
    track.Add(0.2, 0.12, [&](double t) { return SineOf(knock.Step(Glide(t, 0.05, 220, 120))) * Percussive(t, 0.001, 0.025) * 0.6; });
    return Done(std::move(track));
}

// A ratchet turned in quick strokes: a train of clicks, every third stroke a little harder.
std::vector<float> Engineer()
{
    Track track(0.5);
    for (int i = 0; i < 11; ++i)
        Click(track, 0.042 * i, 53 + static_cast<uint32_t>(i), 3800 - 60 * i, i % 3 == 0 ? 1.0 : 0.65);
    return Done(std::move(track));
}

// A struck bell-like note with a quiet octave shimmer.
void Chime(Track& track, double at, double hz, double length, double loudness)
{
    Oscillator tone, shimmer;
    track.Add(at, length, [=](double t) mutable {
        const double env = Percussive(t, 0.012, length / 3) * loudness;
        return (SineOf(tone.Step(hz)) + 0.25 * SineOf(shimmer.Step(hz * 2.01))) * env;
    });
}

// Healing: a soft chime rising through a major chord.
std::vector<float> Heal()
{
    Track track(0.85);
    const double notes[] = {523.25, 659.26, 783.99, 1046.5};
    for (int i = 0; i < 4; ++i) Chime(track, 0.09 * i, notes[i], 0.85 - 0.09 * i, 0.5);
    return Done(std::move(track));
}

// A held brass note with a gentle attack and a touch of vibrato once it sounds.
void Horn(Track& track, double at, double hz, double length, double loudness)
{
    Oscillator tone;
    LowPass mellow;
    track.Add(at, length, [=](double t) mutable {
        const double vibrato = 1 + 0.004 * std::sin(2 * std::numbers::pi * 5.5 * t) * std::min(1.0, t / 0.2);
        const double release = std::min(1.0, (length - t) / 0.06);
        const double env = std::min(1.0, t / 0.02) * (0.75 + 0.25 * std::exp(-t / 0.08)) * release * loudness;
        return mellow.Step(BrassOf(tone.Step(hz * vibrato), hz), 3000) * env;
    });
}

// The stage won: a short rising call ending on a held note.
std::vector<float> GoalDone()
{
    Track track(1.3);
    Horn(track, 0.0, 392.0, 0.14, 0.8);
    Horn(track, 0.15, 523.25, 0.14, 0.8);
    Horn(track, 0.3, 659.26, 0.14, 0.8);
    Horn(track, 0.45, 783.99, 0.85, 1.0);
    Horn(track, 0.45, 523.25, 0.85, 0.5);
    return Done(std::move(track));
}

// Defeat: three falling notes and a last one that sags in pitch.
std::vector<float> Defeat()
{
    Track track(0.9);
    Horn(track, 0.0, 392.0, 0.17, 0.8);
    Horn(track, 0.18, 369.99, 0.17, 0.8);
    Horn(track, 0.36, 349.23, 0.17, 0.8);
    Oscillator tone;
    LowPass mellow;
    track.Add(0.54, 0.36, [&](double t) {
        const double hz = Glide(t, 0.36, 329.63, 260);
        const double env = std::min(1.0, t / 0.02) * std::min(1.0, (0.36 - t) / 0.15);
        return mellow.Step(BrassOf(tone.Step(hz), hz), 2200) * env;
    });
    return Done(std::move(track));
}

// An explosion: a roar of noise closing from bright to deep, a heavy low thump and scattered crackle.
std::vector<float> Boom()
{
    Track track(0.92);
    Noise noise(61);
    LowPass roar, roar2;
    track.Add(0, 0.92, [&](double t) {
        const double hz = Glide(t, 0.5, 4000, 180);
        return roar2.Step(roar.Step(noise.Next(), hz), hz) * Percussive(t, 0.004, 0.22) * 3.0;
    });
    Oscillator thump;
    track.Add(0, 0.7, [&](double t) {
        return SineOf(thump.Step(Glide(t, 0.4, 70, 28))) * Percussive(t, 0.005, 0.18) * 0.8;
    });
    Noise crackle(67);
    track.Add(0.03, 0.6, [&](double t) {
        const double n = crackle.Next();
        return std::fabs(n) > 0.997 ? n * 0.5 * Percussive(t, 0.01, 0.2) : 0.0;
    });
    return Done(std::move(track));
}

// A radio chirp before the action: two bright beeps, the second higher and longer.
std::vector<float> Start()
{
    Track track(0.36);
    const auto beep = [&](double at, double hz, double length) {
        Oscillator tone;
        LowPass soft;
        track.Add(at, length, [=](double t) mutable {
            const double env = std::min(1.0, t / 0.005) * std::min(1.0, (length - t) / 0.01);
            return soft.Step(SquareOf(tone.Step(hz), hz), 4000) * env * 0.5;
        });
    };
    beep(0.0, 880, 0.08);
    beep(0.11, 1318.5, 0.2);
    return Done(std::move(track));
}

// The penalty: a flat, harsh, slightly detuned low buzz.
std::vector<float> Penalty()
{
    Track track(0.42);
    Oscillator a, b;
    track.Add(0, 0.42, [&](double t) {
        const double env = std::min(1.0, t / 0.01) * std::min(1.0, (0.42 - t) / 0.04);
        return (SquareOf(a.Step(110), 110) + SquareOf(b.Step(116.5), 116.5)) * env * 0.5;
    });
    return Done(std::move(track));
}

// Time slowing down: a long whoosh whose band falls and stretches, over a tone sinking to a growl.
std::vector<float> BulletTime()
{
    Track track(0.95);
    Noise noise(71);
    BandPass band(0.5);
    track.Add(0, 0.95, [&](double t) {
        return band.Step(noise.Next(), Glide(t, 0.9, 2600, 160)) * Swell(std::pow(t / 0.95, 0.6) * 0.95, 0.95) * 0.9;
    });
    Oscillator tone;
    track.Add(0, 0.95, [&](double t) {
        const double hz = Glide(t, 0.9, 420, 70);
        return SineOf(tone.Step(hz)) * Swell(t, 0.95) * 0.35;
    });
    return Done(std::move(track));
}

// The mission won: three quick calls, then a full chord held high.
std::vector<float> MissionDone()
{
    Track track(1.9);
    for (int i = 0; i < 3; ++i) Horn(track, 0.12 * i, 523.25, 0.1, 0.8);
    Horn(track, 0.36, 392.0, 0.22, 0.8);
    Horn(track, 0.6, 523.25, 1.25, 0.7);
    Horn(track, 0.6, 659.26, 1.25, 0.55);
    Horn(track, 0.6, 783.99, 1.25, 0.55);
    Horn(track, 0.6, 1046.5, 1.25, 0.35);
    return Done(std::move(track));
}

}  // namespace

const std::array<Recipe, 14>& Recipes()
{
    static const std::array<Recipe, 14> recipes{{
        {"strzal1.wav", Shot1},
        {"strzal2.wav", Shot2},
        {"pudlo1.wav", Miss},
        {"odglos.wav", Impact},
        {"reload.wav", Reload},
        {"inzynier.wav", Engineer},
        {"leczenie.wav", Heal},
        {"koniec.wav", GoalDone},
        {"przegrana.wav", Defeat},
        {"bum.wav", Boom},
        {"start.wav", Start},
        {"uzyj.wav", Penalty},
        {"bullettime.wav", BulletTime},
        {"koniecmisji.wav", MissionDone},
    }};
    return recipes;
}

}  // namespace kr::sounds
