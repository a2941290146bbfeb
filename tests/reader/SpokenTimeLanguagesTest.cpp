#include <gtest/gtest.h>

#include <random>

#include "platform/runtime/Number.h"
#include "reader/speech/SpokenLine.h"
#include "reader/speech/SpokenTime.h"
#include "reader/transcript/Transcript.h"
#include "tests/formatting/RegionScope.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {
namespace {

std::string withTime(const std::string& before, const std::string& time, const std::string& after, Key key) {
  const Ref<AccessibilityAttributedString> text = make<AccessibilityAttributedString>(before + time + after);
  text->setAttributeForKeyWithRange(number(true), key, {before.size(), time.size()});
  return plainSpaces(withSpokenTimes(attributedText(*text)));
}

struct Language {
  const char* locale;
  const char* minutes;  // 5:01 as hours, minutes and seconds
  const char* hours;    // 1:01:02 likewise
  const char* pace;     // 61:02 as minutes and seconds
};

constexpr Language languages[] = {
    {"en_US", "5 minutes, 1 second", "1 hour, 1 minute, 2 seconds", "61 minutes, 2 seconds"},
    {"de_DE", "5 Minuten und 1 Sekunde", "1 Stunde, 1 Minute und 2 Sekunden", "61 Minuten und 2 Sekunden"},
    {"fr_FR", "5 minutes et 1 seconde", "1 heure, 1 minute et 2 secondes", "61 minutes et 2 secondes"},
    {"es_ES", "5 minutos y 1 segundo", "1 hora, 1 minuto y 2 segundos", "61 minutos y 2 segundos"},
    {"ja_JP", "5分1秒", "1時間1分2秒", "61分2秒"},
    {"ar_EG", "٥ دقائق وثانية واحدة", "ساعة واحدة ودقيقة واحدة وثانيتان", "٦١ دقيقة وثانيتان"},
};

TEST(SpokenTimeLanguagesTest, SpeakInWholeWords) {
  for (const Language& language : languages) {
    const RegionScope region(language.locale);
    EXPECT_EQ(withTime("", "5:01", "", DurationTimeHHMMSS), language.minutes) << language.locale;
    EXPECT_EQ(withTime("", "1:01:02", "", DurationTimeHHMMSS), language.hours) << language.locale;
    EXPECT_EQ(withTime("", "61:02", "", DurationTimeMMSS), language.pace) << language.locale;
  }
}

// The digits of a number as the region writes them.
std::string inDigitsOf(const std::string& locale, const std::string& text) {
  if (locale != "ar_EG") return text;
  std::string result;
  for (const char c : text) {
    if (c < '0' || c > '9') {
      result += c;
    } else {
      result += {'\xD9', char('\xA0' + (c - '0'))};
    }
  }
  return result;
}

// However a time is written, it is spoken alike, and nothing of what stands around it is lost.
TEST(SpokenTimeLanguagesTest, SpeakEveryWritingOfATimeAlike) {
  std::mt19937 random(10);
  for (const Language& language : languages) {
    const RegionScope region(language.locale);
    for (int i = 0; i < 60; ++i) {
      const int seconds = int(random() % 20000);
      char colons[64], minutes[64];
      std::snprintf(colons, sizeof colons, "%d:%02d:%02d", seconds / 3600, seconds / 60 % 60, seconds % 60);
      std::snprintf(minutes, sizeof minutes, "%d:%02d", seconds / 60, seconds % 60);
      for (const Key& key : {DurationTimeMMSS, DurationTimeHHMMSS}) {
        const std::string plain = withTime("«", std::to_string(seconds), "»é", key);
        EXPECT_TRUE(plain.starts_with("«") && plain.ends_with("»é")) << plain;
        EXPECT_EQ(plain.find(':'), std::string::npos) << plain;
        for (const char* writing : {colons, minutes}) {
          EXPECT_EQ(withTime("«", inDigitsOf(language.locale, writing), "»é", key), plain) << writing;
        }
      }
      EXPECT_EQ(secondsFromText(inDigitsOf(language.locale, colons)), seconds);
    }
  }
}

TEST(SpokenTimeLanguagesTest, RoundFractionsOnce) {
  const RegionScope region("en_US");
  EXPECT_EQ(withTime("", "59.5", "", DurationTimeMMSS), "1 minute");
  EXPECT_EQ(withTime("", "0:59.4", "", DurationTimeMMSS), "59 seconds");
  EXPECT_EQ(withTime("", "59:59.5", "", DurationTimeHHMMSS), "1 hour");
  EXPECT_EQ(withTime("", "3600", "", DurationTimeMMSS), "60 minutes");
  EXPECT_EQ(withTime("", "3599.5", "", DurationTimeMMSS), "60 minutes") << "as a pace, not an hour";
}

TEST(SpokenTimeLanguagesTest, TheWordsOfTheReaderChangeWithTheLanguageAndTheTextsDoNot) {
  const Ref<View> screen = view({button("OK")});
  const Snapshot snapshot = takeSnapshot(screen);
  const std::pair<const char*, const char*> words[] = {{"en_US", "OK, button"}, {"de_DE", "OK, Taste"},
                                                       {"fr_FR", "OK, bouton"}, {"es_ES", "OK, botón"},
                                                       {"ja_JP", "OK、ボタン"}, {"ar_EG", "OK، زر"}};
  for (const auto& [locale, line] : words) {
    const RegionScope region(locale);
    EXPECT_EQ(spokenLine(snapshot.nodes().front()), line) << locale;
  }
}

}  // namespace
}  // namespace ax::reader::testing
