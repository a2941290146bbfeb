
#include "apps/axvelto/Command.h"
#include "apps/axvelto/Progress.h"
#include "apps/axvelto/SceneCharts.h"
#include "apps/axvelto/SoundOutput.h"
#include "apps/shared/Complaint.h"
#include "reader/sound/ChartSound.h"

namespace ax::app {

namespace {

constexpr double pauseBetweenCharts = 1;

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  declareChart(app, arguments);
  app.add_option("-o", arguments.output, "the sound file: .wav, .flac, .ogg or .opus")->required();
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
}

ExitCode run(const Arguments& arguments) {
  SoundOutput output(arguments.output);
  ShownScene shown(arguments);
  const SceneCharts charts(shown, arguments.chart);
  const std::string& file = shown.scene().file;
  if (charts.found().empty()) {
    complain(file + ": no chart, so there is nothing to hear");
    return exitFallsShort;
  }
  tellOfMissingVoice(file);
  const Progress progress("Chart");
  std::size_t done = 0;
  for (const auto& [snapshot, chart] : charts.found()) {
    progress.show(++done, charts.found().size());
    reader::Sound sound = reader::chartSound(*snapshot, *chart);
    if (done < charts.found().size()) sound.addSilence(pauseBetweenCharts);
    output.add(sound);
  }
  output.write();
  return exitDone;
}

}  // namespace

const Command soundCommand = {"sound", "Each chart as sound: introduction, reference tones, a note a value",
                              declare, run};

}  // namespace ax::app
