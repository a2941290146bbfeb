#include <optional>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/axvelto/Progress.h"
#include "apps/axvelto/SoundOutput.h"
#include "apps/shared/ShownScene.h"
#include "reader/sound/ScreenSound.h"
#include "reader/transcript/Transcript.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  app.add_option("--audio", arguments.output, "speak into a sound file instead: .wav, .flac, .ogg or .opus");
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
}

ExitCode speakInto(SoundOutput& output, ShownScene& shown) {
  const reader::Snapshot snapshot = shown.snapshot();
  tellOfMissingVoice(shown.scene().file);
  const Progress progress("Line");
  reader::soundScreen(snapshot, shown.run().title(),
                      [&](const reader::Sound& sound, std::size_t before, std::size_t all) {
                        progress.show(before + 1, all);
                        output.add(sound);
                      });
  output.write();
  return exitDone;
}

ExitCode run(const Arguments& arguments) {
  std::optional<SoundOutput> output;
  if (!arguments.output.empty()) output.emplace(arguments.output);
  ShownScene shown(arguments);
  if (output) return speakInto(*output, shown);
  print(reader::transcript(shown.snapshot(), shown.run().title()));
  return exitDone;
}

}  // namespace

const Command speakCommand = {"speak", "What a screen reader says, element by element, in reading order",
                              declare, run};

}  // namespace ax::app
