#include "reader/sound/Speech.h"

#include <gtest/gtest.h>

#include "tests/reader/Hearing.h"

namespace ax::reader::testing {

namespace {

TEST(SpeechTest, TakesTheVoiceOfTheLanguage) {
  for (const char* locale : {"en_US", "en", "de_DE", "de_AT", "fr_CA", "es_MX", "ar_EG"}) {
    EXPECT_TRUE(hasVoice(locale)) << locale;
  }
  for (const char* locale : {"ja_JP", "zu_ZA", "../de", ""}) {
    EXPECT_FALSE(hasVoice(locale)) << locale;
    EXPECT_EQ(speakingTime("one", locale), -1) << locale;
    EXPECT_FALSE(spokenSound("one", locale)) << locale;
  }
  EXPECT_NE(std::lround(100 * speakingTime("777", "de_DE")), std::lround(100 * speakingTime("777", "en_US")));
  // Arabic figures are read as numbers, decimals and groups included.
  EXPECT_NEAR(speakingTime("٤٫٩٨", "ar_EG"), speakingTime("4.98", "ar_EG"), 0.05);
  EXPECT_GT(speakingTime("٩١٪", "ar_EG"), speakingTime("٩١", "ar_EG") + 0.3);
  EXPECT_NEAR(speakingTime("١٬٣٣٧\u200F", "ar_EG"), speakingTime("1337", "ar_EG"), 0.05);
}

TEST(SpeechTest, TakesAsLongAsItsSound) {
  const std::string line = "Heart rate, from 60 to 189 beats per minute, chart";
  const double seconds = speakingTime(line, "en_US");
  EXPECT_GT(seconds, 2.5);
  EXPECT_LT(seconds, 5.5);
  EXPECT_NEAR(speakingTime(line + ". " + line, "en_US"), 2 * seconds, 1);
  EXPECT_LT(speakingTime("", "en_US"), 0.1);
  const std::optional<Sound> sound = spokenSound(line, "en_US");
  ASSERT_TRUE(sound);
  EXPECT_NEAR(sound->seconds(), seconds, 0.1);
  const Heard heard = hear(sound->samples(), 0, sound->seconds());
  EXPECT_LT(heard.peak, 0.9);
  EXPECT_GT(heard.peak, 0.2);
  EXPECT_NEAR(heard.pan, 0.5, 1e-3);
}

}  // namespace

}  // namespace ax::reader::testing
