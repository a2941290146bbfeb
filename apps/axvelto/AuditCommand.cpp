#include <algorithm>
#include <iostream>
#include <set>

#include "apps/axvelto/Command.h"
#include "apps/axvelto/Output.h"
#include "apps/axvelto/Progress.h"
#include "apps/shared/Input.h"
#include "apps/shared/ShownScene.h"
#include "platform/formatting/Region.h"
#include "platform/formatting/StringTable.h"
#include "reader/audit/AuditReport.h"
#include "reader/sound/Speech.h"

namespace ax::app {

namespace {

using reader::Audit;
using reader::AuditScreen;

constexpr std::string_view allLocales = "all";

void declare(CLI::App& app, Arguments& arguments) {
  app.add_option("FILE", arguments.files, "scenes or workout files; - is standard input");
  app.add_option("--locale", arguments.locale, "a region such as de_DE, or all: one of every language");
  declareWorkouts(app, arguments);
  app.add_option("--without", arguments.without, "a rule to leave out")->expected(1)->take_all();
  app.add_flag("--rules", arguments.listsRules, "list the rules and end");
  declareJson(app, arguments);
}

bool isRule(const std::string& name) {
  return std::ranges::any_of(reader::auditRules(), [&](const auto& rule) { return rule.name == name; });
}

std::set<std::string> rulesToLeaveOut(const Arguments& arguments) {
  for (const std::string& name : arguments.without) {
    if (!isRule(name)) {
      throw reader::Fault{"--without", "", "no rule \"" + name + "\"", "one that --rules lists"};
    }
  }
  return {arguments.without.begin(), arguments.without.end()};
}

std::vector<std::string> tableFolders() {
  static const char inThisProgram = 0;
  std::vector<std::string> folders;
  for (const char* folder : {"../share/axvelto/Host", "../share/axvelto/Platform", "../share/axvelto/Reader",
                             "../lib/AXVelto/resources/Accessibility"}) {
    folders.push_back(formatting::resourceFolderBeside(&inThisProgram, folder));
  }
  return folders;
}

// One of every language that the words of the project stand in, English first.
std::vector<std::string> spokenLocales() {
  std::vector<std::string> locales;
  for (const std::string& language : formatting::tableLanguages(tableFolders().front())) {
    locales.push_back(formatting::likelyLocale(language));
  }
  std::stable_partition(locales.begin(), locales.end(),
                        [](const std::string& locale) { return locale == "en_US"; });
  return locales;
}

AuditScreen screenOf(const Arguments& one) {
  ShownScene scene(one);
  reader::Snapshot snapshot = scene.snapshot();
  const auto names = [&](const Object& object) { return scene.run().idOf(object); };
  reader::ShownContent shown = reader::readShownContent(snapshot, scene.run().screen(), names);
  AuditScreen screen =
      reader::readAuditScreen(std::move(snapshot), std::move(shown), reader::LanguageWords(tableFolders()));
  screen.file = one.files.front();
  screen.names = {scene.scene().names.begin(), scene.scene().names.end()};
  return screen;
}

// What `without` holds are rules here, and the host does without nothing.
Audit auditOf(const std::string& file, const Arguments& arguments, const std::vector<std::string>& locales) {
  Audit audit;
  audit.speakingTime = &reader::speakingTime;
  for (const std::string& locale : locales) {
    Arguments one = arguments;
    one.files = {file};
    one.without.clear();
    one.locale = locale;
    audit.screens.push_back(screenOf(one));
  }
  return audit;
}

ExitCode run(const Arguments& arguments) {
  if (arguments.listsRules) {
    std::cout << reader::auditRulesAsMarkdown();
    return exitDone;
  }
  if (arguments.files.empty()) throw reader::Fault{"FILE", "", "no file given", "a scene or a workout file"};
  const std::set<std::string> without = rulesToLeaveOut(arguments);
  const bool isAll = arguments.locale == allLocales;
  reader::AuditReport report;
  const Progress progress("Screen");
  std::size_t done = 0;
  for (const std::string& file : arguments.files) {
    progress.show(++done, arguments.files.size());
    report.add(auditOf(file, arguments, isAll ? spokenLocales() : std::vector{arguments.locale}), without);
  }
  if (arguments.asJson) {
    print(report.json());
  } else {
    printText(report.text());
  }
  return report.holds() ? exitDone : exitFallsShort;
}

}  // namespace

const Command auditCommand = {"audit", "What a listener would stumble over, rule by rule", declare, run};

}  // namespace ax::app
