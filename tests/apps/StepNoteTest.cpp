#include "apps/view/model/StepNote.h"

#include <gtest/gtest.h>

#include "reader/sound/ChartNotes.h"
#include "tests/tour/Samples.h"

namespace ax::view {

namespace {

using Notes = std::vector<StepNote>;

// A sample's charts, stepped through, beside the notes that play them as a whole.
class Sample {
 public:
  explicit Sample(const char* file, const char* locale = "en_US")
      : presented_(tour::samplesFolder() / file, locale),
        model_([this] { return reader::takeSnapshot(presented_.run->screen()); }) {
    for (const reader::Node& node : model_.snapshot().nodes()) {
      if (node.series) charts_.push_back(model_.find(model_.itemOf(node.id)));
    }
  }

  // A step without a note counts as none.
  Notes stepped(std::size_t chart) const {
    const std::vector<ChartStep> steps = stepsOfChart(model_, *charts_.at(chart));
    Notes notes;
    for (std::size_t i = 0; i < steps.size(); ++i) {
      const auto note = noteOfStep(model_, *charts_.at(chart), steps, i);
      if (note) notes.push_back(*note);
    }
    return notes;
  }
  // Each group of so many notes as one, their average; rests are in no group's average.
  Notes played(std::size_t chart, std::size_t together = 1) const {
    const auto all =
        reader::notesOfChart(model_.snapshot(), *model_.snapshot().node(charts_.at(chart)->node.id));
    Notes notes;
    for (std::size_t i = 0; i < all.notes.size(); i += together) {
      StepNote sum;
      double count = 0;
      for (std::size_t j = i; j < std::min(i + together, all.notes.size()); ++j) {
        if (!all.notes[j].value) continue;
        sum = {sum.height + all.heightOf(*all.notes[j].value), sum.place + all.notes[j].place};
        count += 1;
      }
      if (count > 0) notes.push_back({sum.height / count, sum.place / count});
    }
    return notes;
  }

 private:
  tour::Presented presented_;
  ScreenModel model_;
  std::vector<const Item*> charts_;
};

void expectSame(const Notes& stepped, const Notes& played) {
  ASSERT_EQ(stepped.size(), played.size());
  for (std::size_t i = 0; i < stepped.size(); ++i) {
    EXPECT_NEAR(stepped[i].height, played[i].height, 1e-9) << "step " << i;
    EXPECT_NEAR(stepped[i].place, played[i].place, 1e-9) << "step " << i;
  }
}

}  // namespace

TEST(StepNoteTest, AStepSoundsAsItDoesInTheWholeChart) {
  const Sample bars("trend.json"), values("workout-heart-rate.json");
  expectSame(bars.stepped(0), bars.played(0));  // bars, gaps between them
  EXPECT_EQ(bars.stepped(0).size(), 11u);
  expectSame(values.stepped(0), values.played(0));  // values without elements
  EXPECT_EQ(values.stepped(0).size(), 53u);
}

TEST(StepNoteTest, ABarOfSeveralValuesSoundsAsTheirAverage) {
  const Sample pairs("trend.json"), hours("day.json");
  expectSame(pairs.stepped(1), pairs.played(1, 2));
  expectSame(hours.stepped(0), hours.played(0, 3));
}

TEST(StepNoteTest, MirroredBarsKeepTheDirectionOfTheAxis) {
  const Sample mirrored("day.json", "ar_SA");
  expectSame(mirrored.stepped(0), mirrored.played(0, 3));
}

}  // namespace ax::view
