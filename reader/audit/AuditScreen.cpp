#include "reader/audit/AuditScreen.h"

#include "platform/formatting/Lists.h"
#include "platform/formatting/Region.h"
#include "reader/speech/SpokenLine.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

constexpr const char* roleKeys[] = {"role.button", "role.header",     "role.link",
                                    "role.image",  "role.adjustable", "role.chart"};

}  // namespace

AuditScreen readAuditScreen(Snapshot snapshot, ShownContent shown, LanguageWords words) {
  AuditScreen screen;
  screen.locale = formatting::currentRegion().locale;
  screen.isRightToLeft = formatting::currentLanguageIsRightToLeft();
  screen.separator = formatting::listSeparator();
  for (const char* key : roleKeys) screen.roleWords.push_back(readerText(key));
  screen.words = std::move(words);
  screen.snapshot = std::move(snapshot);
  screen.shown = std::move(shown);
  for (const Node& node : screen.snapshot.nodes()) {
    if (node.isElement) {
      screen.elements.push_back({&node, screen.elements.size() + 1, spokenLine(node)});
    }
  }
  return screen;
}

}  // namespace ax::reader
