#include "reader/sound/Sound.h"

#include <algorithm>
#include <cmath>

namespace ax::reader {

void Sound::add(float left, float right) {
  samples_.push_back(left);
  samples_.push_back(right);
}

void Sound::add(const Sound& other) {
  samples_.insert(samples_.end(), other.samples_.begin(), other.samples_.end());
}

void Sound::addSilence(double seconds) {
  const long pairs = std::lround(std::max(seconds, 0.0) * rate);
  samples_.resize(samples_.size() + 2 * std::size_t(pairs));
}

}  // namespace ax::reader
