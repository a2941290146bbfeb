#include <algorithm>
#include <cmath>
#include <memory>

#include "bench/BundleSides.h"
#include "bench/HostObjects.h"
#include "bench/Sides.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "reader/snapshot/Charts.h"
#include "reader/sound/ChartNotes.h"
#include "reader/sound/ChartSound.h"
#include "reader/sound/Tone.h"

// A chart of a snapshot made into the samples of its notes. The spoken introduction is left out: it is as
// long for every chart, and the speech library's work.
namespace bench {

namespace {

using namespace ax;

// As many sines as there are notes, and every value read once.
struct Sines {
  std::vector<double> values;

  std::vector<float> write() const {
    double sum = 0;
    for (const double value : values) sum += value;
    std::vector<float> samples;
    const auto length = std::size_t(reader::noteSeconds * reader::Sound::rate);
    for (std::size_t note = 0; note < std::min(values.size(), reader::mostNotes); ++note) {
      for (std::size_t i = 0; i < length; ++i) {
        const auto sample = float(std::sin(0.03 * double(i) + sum));
        samples.insert(samples.end(), {sample, sample});
      }
    }
    return samples;
  }
};

}  // namespace

void addSoundSides() {
  for (const int count : soundSizes) {
    const std::string name = sized("sound ", count);
    RegisteredSide(
        name, "ours",
        [=] {
          const Ref<View> trend = trendChart(count);
          messages::_accessibilityLoadAccessibilityInformation(trend);
          const auto snapshot = std::make_shared<reader::Snapshot>(reader::takeSnapshot(trend));
          const auto charts = reader::charts(*snapshot);
          check(charts.size() == 1, "a screen of one chart has none");
          check(reader::notesSound(*snapshot, *charts[0]).pairs() > 0, "a chart does not sound");
          return [snapshot, chart = charts[0]] {
            benchmark::DoNotOptimize(reader::notesSound(*snapshot, *chart).samples().data());
          };
        },
        count);
    RegisteredSide(
        name, "floor",
        [=] {
          return [sines = Sines{std::vector<double>(std::size_t(count), 1.0)}] {
            benchmark::DoNotOptimize(sines.write().data());
          };
        },
        count);
  }
}

}  // namespace bench
