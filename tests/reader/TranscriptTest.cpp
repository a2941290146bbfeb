#include "reader/transcript/Transcript.h"

#include <gtest/gtest.h>

#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "reader/speech/SpokenLine.h"
#include "reader/speech/SpokenTime.h"
#include "tests/formatting/RegionScope.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

using Lines = std::vector<std::string>;

std::string spoken(const Ref<Responder>& object) {
  const Snapshot snapshot = takeSnapshot(object);
  return snapshot.nodes().empty() ? "no node" : spokenLine(snapshot.nodes().front());
}

Ref<Responder> described(const char* label, const char* value, Traits traits, const char* hint) {
  const Ref<AccessibilityElement> result = element(label);
  messages::setAccessibilityValue(result, string(value));
  messages::setAccessibilityTraits(result, traits);
  messages::setAccessibilityHint(result, string(hint));
  return result;
}

std::string withTime(const char* text, Key key, TextRange range) {
  const Ref<AccessibilityAttributedString> attributed = make<AccessibilityAttributedString>(text);
  attributed->setAttributeForKeyWithRange(number(true), key, range);
  return withSpokenTimes(attributedText(*attributed));
}

TEST(SpokenLineTest, SaysLabelValueRolesStatesAndHintInThisOrder) {
  EXPECT_EQ(spoken(described("Share", "3", TraitButton | TraitSelected | TraitNotEnabled, "Opens a list")),
            "Share, 3, button, selected, not available, Opens a list");
  EXPECT_EQ(spoken(described("Today", "", TraitHeader | TraitStaticText, "")), "Today, heading");
  EXPECT_EQ(spoken(label("Just a text")), "Just a text");
  EXPECT_EQ(spoken(described("", "", 0, "")), "");
}

TEST(SpokenLineTest, SaysNothingTwice) {
  EXPECT_EQ(spoken(described("42", "42", 0, "42")), "42");
  EXPECT_EQ(spoken(described("Move, 5 minutes", "5 minutes", TraitButton, "button")),
            "Move, 5 minutes, button");
  EXPECT_EQ(spoken(described("Lap 11", "1", 0, "Lap")), "Lap 11, 1, Lap");
}

TEST(SpokenLineTest, IsOneLineWithoutStrayBlanks) {
  EXPECT_EQ(spoken(described(" First\nsecond \r\n third  ", " \t", 0, "\n")), "First, second, third");
}

TEST(SpokenLineTest, SpeaksTheReadersLanguage) {
  setEnvironment({.locale = "ja_JP"});
  EXPECT_EQ(spoken(described("共有", "三", TraitButton, "")).substr(0, 12), "共有、三");
  setEnvironment({.locale = "ar_EG"});
  EXPECT_NE(spoken(described("س", "ص", 0, "")).find("س، ص"), std::string::npos);
  setEnvironment({});
}

TEST(SpokenTimeTest, CountsSecondsMinutesAndHours) {
  EXPECT_EQ(secondsFromText("330"), 330);
  EXPECT_EQ(secondsFromText("42:10"), 2530);
  EXPECT_EQ(secondsFromText(" 1:05:30 "), 3930);
  EXPECT_EQ(secondsFromText("90:00"), 5400);
  EXPECT_EQ(secondsFromText("0:00.5"), 0.5);
  for (const char* text : {"", ":", "5:", ":30", "1:2:3:4", "5:75", "-5", "1.5:00", "--:--", "5'30", "abc"}) {
    EXPECT_EQ(secondsFromText(text), std::nullopt) << text;
  }
}

TEST(SpokenTimeTest, UnderstandsTheDigitsOfTheRegion) {
  const RegionScope region("ar_EG");
  EXPECT_EQ(secondsFromText("\u200f٤٢:١٠"), 2530);
  EXPECT_EQ(secondsFromText("٣٣٠"), 330);
  EXPECT_EQ(secondsFromText("42:10"), 2530);
}

TEST(SpokenTimeTest, ReplacesTheMarkedRangeAlone) {
  EXPECT_EQ(withTime("330 per mile", DurationTimeMMSS, {0, 3}), "5 minutes, 30 seconds per mile");
  EXPECT_EQ(withTime("Total 1:05:30.", DurationTimeHHMMSS, {6, 7}), "Total 1 hour, 5 minutes, 30 seconds.");
  EXPECT_EQ(withTime("12:34", DurationTimeHHMMSS, {0, 5}), "12 minutes, 34 seconds");
  EXPECT_EQ(withTime("0", DurationTimeMMSS, {0, 1}), "0 minutes");
  EXPECT_EQ(withTime("no data", DurationTimeMMSS, {0, 7}), "no data");
  EXPECT_EQ(withTime("330", "SomethingElse"_key, {0, 3}), "330");
  // A pace beyond an hour stays in minutes, a duration does not.
  EXPECT_EQ(withTime("3700", DurationTimeMMSS, {0, 4}), "61 minutes, 40 seconds");
  EXPECT_EQ(withTime("3700", DurationTimeHHMMSS, {0, 4}), "1 hour, 1 minute, 40 seconds");
}

TEST(SpokenTimeTest, ReplacesSeveralRangesAndIgnoresOverlaps) {
  const Ref<AccessibilityAttributedString> text = make<AccessibilityAttributedString>("1:00 ä 2:00");
  text->setAttributeForKeyWithRange(number(true), DurationTimeMMSS, {8, 4});
  text->setAttributeForKeyWithRange(number(true), DurationTimeMMSS, {0, 4});
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {2, 2});
  EXPECT_EQ(withSpokenTimes(attributedText(*text)), "1 minute ä 2 minutes");
}

// A sheet that covers the screen, and a row that can be opened.
class Sheet : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Sheet>("TranscriptTestSheet", View::staticClass())
                               .method<&Sheet::isModal>("accessibilityViewIsModal")
                               .build();
    return result;
  }
  bool isModal() { return true; }
};

class Row : public Label {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Row>("TranscriptTestRow", Label::staticClass())
                               .method<&Row::status>("_accessibilityExpandedStatus")
                               .build();
    return result;
  }
  std::int64_t status() { return isOpen ? 1 : 2; }
  bool isOpen = false;
};

TEST(TranscriptTest, BeginsWithTheTitle) {
  EXPECT_EQ(transcript(takeSnapshot(label("Hello")), "Day"), (Lines{"Screen: Day", "Hello"}));
  EXPECT_EQ(transcript(takeSnapshot(nullptr), ""), (Lines{"Screen without a title", "Nothing to speak"}));
}

TEST(TranscriptTest, LeavesOutElementsThatSayNothing) {
  const Ref<View> screen = view({label("a"), label(" ", {0, 40, 100, 20})});
  EXPECT_EQ(transcript(takeSnapshot(screen), "T"), (Lines{"Screen: T", "a"}));
}

TEST(TranscriptTest, TellsOnceThatTheRestIsCovered) {
  const Ref<View> screen = view({view<Sheet>({label("Loading"), label("Please wait", {0, 40, 100, 20})})});
  EXPECT_EQ(transcript(takeSnapshot(screen), "T"),
            (Lines{"Screen: T", "Loading, covers the rest of the screen", "Please wait"}));
}

TEST(TranscriptTest, TellsWhatIsOpenAndWhatIsClosed) {
  const Ref<Row> row = make<Row>();
  row->setText(string("Splits"));
  EXPECT_EQ(spoken(row), "Splits, collapsed");
  row->isOpen = true;
  EXPECT_EQ(spoken(row), "Splits, expanded");
}

}  // namespace

}  // namespace ax::reader::testing
