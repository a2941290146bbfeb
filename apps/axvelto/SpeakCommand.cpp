#include <optional>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/axvelto/Progress.h"
#include "apps/axvelto/SoundOutput.h"
#include "apps/shared/Presentation.h"
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

ExitCode speakInto(SoundOutput& output, Presentation& presentation) {
  const reader::Snapshot snapshot = presentation.snapshot();
  tellOfMissingVoice(presentation.scene().file);
  const Progress progress("Line");
  reader::soundScreen(snapshot, presentation.run().title(),
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
  Presentation presentation(arguments);
  if (output) return speakInto(*output, presentation);
  print(reader::transcript(presentation.snapshot(), presentation.run().title()));
  return exitDone;
}

}  // namespace

const Command speakCommand = {"speak", "What a screen reader says, element by element, in reading order",
                              declare, run};

}  // namespace ax::app
