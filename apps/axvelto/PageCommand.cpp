#include <fstream>
#include <iostream>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Progress.h"
#include "apps/shared/ShownScene.h"
#include "reader/page/Page.h"
#include "reader/picture/ScreenPicture.h"
#include "reader/text/Fault.h"

namespace ax::app {

namespace {

void declare(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files, "scenes or workout files; - is standard input")->required();
  app.add_option("-o", arguments.output,
                 "the file to write; one that ends with .svg gets the picture of one screen alone");
  declareLocale(app, arguments);
  declareWorkouts(app, arguments);
  declareWithout(app, arguments);
}

void write(const std::string& text, const std::string& file) {
  if (file.empty()) {
    std::cout << text << '\n';
    return;
  }
  std::ofstream out(file, std::ios::binary);
  out << text << '\n';
  if (!out.flush()) throw reader::Fault{file, "", "cannot be written", "a file to write to"};
}

ExitCode drawPicture(const Arguments& arguments) {
  if (arguments.files.size() != 1) throw reader::Fault{"FILE", "", "several screens", "one for a picture"};
  ShownScene shown(arguments);
  const reader::Snapshot snapshot = shown.snapshot();
  write(reader::screenPicture(snapshot, reader::ReadingOrder(snapshot), shown.run().title()),
        arguments.output);
  return exitDone;
}

ExitCode run(const Arguments& arguments) {
  if (arguments.output.ends_with(".svg")) return drawPicture(arguments);
  reader::Page page;
  const Progress progress("Screen");
  for (std::size_t i = 0; i < arguments.files.size(); ++i) {
    progress.show(i + 1, arguments.files.size());
    Arguments one = arguments;
    one.files = {arguments.files[i]};
    ShownScene shown(one);
    page.add(shown.snapshot(), shown.run().title());
  }
  write(page.html(), arguments.output);
  return exitDone;
}

}  // namespace

const Command pageCommand = {"page", "Screens as one page: picture, reading order, charts", declare, run};

}  // namespace ax::app
