#pragma once

#include <algorithm>
#include <cmath>
#include <complex>
#include <numbers>
#include <span>
#include <vector>

// Measures what stereo samples sound like.
namespace ax::reader::testing {

inline constexpr double heardRate = 48'000;

struct Heard {
  double pitch = 0;  // hertz; 0 for silence
  double pan = 0;    // from 0 on the left to 1 on the right
  double level = 0;  // of both sides, root of the mean square
  double peak = 0;   // the farthest sample
};

// How much of a pitch is in the samples: one sum of the Fourier transform, every `step`-th sample.
inline double amountOf(double pitch, std::span<const double> samples, std::size_t step) {
  const std::complex<double> turn = std::polar(1.0, 2 * std::numbers::pi * pitch * double(step) / heardRate);
  std::complex<double> sum, at = 1;
  for (std::size_t i = 0; i < samples.size(); i += step, at *= turn) sum += samples[i] * at;
  return std::abs(sum);
}

// The strongest pitch from 150 to 1600 hertz, to a tenth of a hertz.
inline double strongestPitch(std::span<const double> samples) {
  double best = 150;
  const auto search = [&](double from, double to, double by, std::size_t step) {
    double most = -1;
    for (double pitch = from; pitch <= to; pitch += by) {
      const double amount = amountOf(pitch, samples, step);
      if (amount > most) most = amount, best = pitch;
    }
  };
  search(150, 1600, 2, 12);  // alike for every pitch below 2,000
  search(best - 3, best + 3, 0.1, 6);
  return best;
}

// What is heard from one moment to another, in seconds.
inline Heard hear(std::span<const float> pairs, double from, double to) {
  Heard heard;
  double left = 0, right = 0;
  std::vector<double> both;
  const std::size_t end = std::min(std::size_t(std::lround(to * heardRate)) * 2, pairs.size());
  for (std::size_t i = std::size_t(std::lround(from * heardRate)) * 2; i < end; i += 2) {
    left += double(pairs[i]) * pairs[i];
    right += double(pairs[i + 1]) * pairs[i + 1];
    both.push_back(pairs[i] + pairs[i + 1]);
    heard.peak = std::max({heard.peak, std::abs(double(pairs[i])), std::abs(double(pairs[i + 1]))});
  }
  if (both.empty() || left + right < 1e-9) return heard;
  heard.level = std::sqrt((left + right) / double(both.size()));
  heard.pan = std::atan2(std::sqrt(right), std::sqrt(left)) * 2 / std::numbers::pi;
  constexpr std::size_t most = 19'200;  // of a longer stretch, the pitch of its beginning
  heard.pitch = strongestPitch(std::span(both).first(std::min(most, both.size())));
  return heard;
}

// How high a pitch is on the scale that values are told on: 0 at 200 hertz, 1 at 1,400.
inline double heightOfPitch(double pitch) {
  return std::log(pitch / 200) / std::log(7);
}

}  // namespace ax::reader::testing
