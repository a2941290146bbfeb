#include "reader/sound/Tone.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace ax::reader {

namespace {

using std::numbers::pi;

constexpr double fadeSeconds = 0.01;
constexpr double loudest = 0.5;  // the amplitude of the lowest pitch, which the ear hears least

constexpr double squared(double number) {
  return number * number;
}

// How strongly the ear hears a pitch: the A-weighting of IEC 61672-1, without its constant.
double hearing(double pitch) {
  const double f = squared(pitch);
  const double low = f + squared(20.598997), high = f + squared(12194.217);
  const double middle = std::sqrt((f + squared(107.65265)) * (f + squared(737.86223)));
  return squared(f) / (low * middle * high);
}

double amplitudeOf(double pitch) {
  return std::min(loudest, loudest * hearing(lowestPitch) / hearing(pitch));
}

// From 0 to 1 over the first samples, back over the last.
double fade(std::size_t sample, std::size_t count) {
  constexpr double faded = fadeSeconds * Sound::rate;
  const double fromEnd = double(std::min(sample, count - 1 - sample));
  return fromEnd >= faded ? 1 : (1 - std::cos(pi * fromEnd / faded)) / 2;
}

}  // namespace

double pitchOf(double height) {
  return lowestPitch * std::pow(highestPitch / lowestPitch, std::clamp(height, 0.0, 1.0));
}

Sound note(double pitch, double pan, double seconds) {
  Sound sound;
  const double side = std::clamp(pan, 0.0, 1.0) * pi / 2;  // both sides together carry the same power
  const double left = amplitudeOf(pitch) * std::cos(side), right = amplitudeOf(pitch) * std::sin(side);
  const auto count = std::size_t(std::lround(std::max(seconds, 0.0) * Sound::rate));
  for (std::size_t i = 0; i < count; ++i) {
    const double wave = fade(i, count) * std::sin(2 * pi * pitch * double(i) / Sound::rate);
    sound.add(float(left * wave), float(right * wave));
  }
  return sound;
}

}  // namespace ax::reader
