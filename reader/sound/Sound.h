#pragma once

#include <cstddef>
#include <span>
#include <vector>

namespace ax::reader {

// Stereo samples in memory, 48,000 pairs a second, from -1 to 1.
class Sound {
 public:
  static constexpr int rate = 48'000;

  // Pairs in a row, left before right.
  std::span<const float> samples() const { return samples_; }
  std::size_t pairs() const { return samples_.size() / 2; }
  double seconds() const { return double(pairs()) / rate; }

  void add(float left, float right);
  void add(const Sound& other);
  // Whole pairs, to the nearest; nothing for a length below zero.
  void addSilence(double seconds);

 private:
  std::vector<float> samples_;
};

}  // namespace ax::reader
