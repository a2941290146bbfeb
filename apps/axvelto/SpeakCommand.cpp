#include "apps/axvelto/Output.h"
#include "apps/axvelto/Presentation.h"
#include "reader/transcript/Transcript.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  declareFile(app, arguments);
  declareLocale(app, arguments);
  declareWithout(app, arguments);
}

ExitCode run(const Arguments& arguments) {
  Presentation presentation(arguments);
  print(reader::transcript(presentation.snapshot(), presentation.run().title()));
  return exitDone;
}

}  // namespace

const Command speakCommand = {"speak", "What a screen reader says, element by element, in reading order",
                              declare, run};

}  // namespace ax::app
