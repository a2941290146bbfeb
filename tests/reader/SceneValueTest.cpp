#include <gtest/gtest.h>

#include <bit>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <limits>
#include <random>

#include "platform/foundation/Array.h"
#include "platform/health/Quantity.h"
#include "platform/runtime/Value.h"
#include "reader/scene/Reply.h"
#include "reader/text/TraitNames.h"
#include "tests/reader/SceneProbe.h"

namespace ax::reader {
namespace {

using Json = nlohmann::ordered_json;

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

std::string written(const Ref<Object>& reply) {
  return replyAsJson(reply, [](const Object&) { return std::string(); }).dump();
}

// What a member of the probe gives back after values were written into it, one after the other.
Json readBack(const std::vector<Json>& values, const std::string& zone = "UTC",
              const std::string& member = "_anything") {
  Json steps = Json::array();
  for (const Json& value : values) {
    steps.push_back({{"set", {{member, value}}}, {"on", "p"}});
    steps.push_back({{"read", member}, {"of", "p"}});
  }
  StandingScene standing(R"("environment": {"timeZone": ")" + zone +
                         R"("}, "objects": [{"class": "Tests.SceneProbe", "id": "p"}], "steps": )" +
                         steps.dump());
  Json replies = Json::array();
  const Json document = standing.run.runSteps();
  for (const Json& result : document["results"]) replies.push_back(result["reply"]);
  return replies;
}

// Written and read kinds are spelt alike, so that a reply can be copied into a scene.
TEST(SceneValueTest, GeometryAndMeasuresReturnAsTheyAreSpelt) {
  std::vector<Json> values;
  for (const char* text :
       {R"({"point": [-0.5, 1e-300]})", R"({"size": [0.0, 390.25]})", R"({"insets": [1.0, 2.0, 3.0, -4.0]})",
        R"({"rect": ["nan", "inf", "-inf", 0.1]})", R"({"quantity": [-12.5, "km"]})",
        R"({"quantity": ["nan", "count/min"]})", R"({"unit": "count/min"})", R"({"selector": "set:for:"})",
        R"([[], [[1, "a"], {"point": [1.0, 2.0]}], [{"unit": "mi"}, true]])", R"("")",
        R"("\u0000\"\\ ü 日本 \ud83d\udeb4")"}) {
    values.push_back(Json::parse(text));
  }
  const Json replies = readBack(values);
  ASSERT_EQ(replies.size(), values.size());
  for (std::size_t i = 0; i < values.size(); ++i) EXPECT_EQ(replies[i].dump(), values[i].dump());
}

TEST(SceneValueTest, NoNumberChangesOnItsWay) {
  std::mt19937_64 random(7);
  std::vector<Json> values, expected;
  const auto add = [&](const Json& value, const char* as) {
    values.push_back({{"number", value}, {"as", as}});
    expected.push_back(value);
  };
  for (int i = 0; i < 200; ++i) {
    const std::uint64_t bits = random();
    add(std::bit_cast<std::int64_t>(bits), "int");
    add(bits, "uint");
    const double real = std::bit_cast<double>(bits);
    if (std::isfinite(real)) add(real, "double");
  }
  add(std::numeric_limits<std::int64_t>::min(), "int");
  add(std::numeric_limits<std::uint64_t>::max(), "uint");
  add(std::numeric_limits<double>::denorm_min(), "double");
  add(-0.0, "double");
  const Json replies = readBack(values);
  ASSERT_EQ(replies.size(), expected.size());
  for (std::size_t i = 0; i < expected.size(); ++i) {
    EXPECT_EQ(replies[i].dump(), expected[i].dump()) << values[i];
  }
}

TEST(SceneValueTest, FloatsAreToldByTheirShortestDecimal) {
  std::mt19937 random(8);
  std::vector<float> floats = {0.1F, 16777216.F, std::numeric_limits<float>::max(),
                               std::numeric_limits<float>::denorm_min(), -0.F};
  while (floats.size() < 200) {
    const float next = std::bit_cast<float>(std::uint32_t(random()));
    if (std::isfinite(next)) floats.push_back(next);
  }
  std::vector<Json> values;
  for (const float value : floats) values.push_back({{"number", double(value)}, {"as", "float"}});
  const Json replies = readBack(values, "UTC", "_fraction");
  for (std::size_t i = 0; i < floats.size(); ++i) {
    EXPECT_EQ(replies[i].get<float>(), floats[i]) << values[i];
  }
  EXPECT_EQ(replies[0].dump(), "0.1");
  EXPECT_EQ(replies[2].get<double>(), 3.4028235e38);
}

// Days from 1970-01-01 to a civil date, and the seconds of an ISO text with an offset.
std::int64_t instantOf(const std::string& iso) {
  using namespace std::chrono;
  int y = 0, hour = 0, minute = 0, second = 0, offsetHours = 0, offsetMinutes = 0;
  unsigned m = 0, d = 0;
  char sign = '?';
  EXPECT_EQ(std::sscanf(iso.c_str(), "%d-%u-%uT%d:%d:%d%c%d:%d", &y, &m, &d, &hour, &minute, &second, &sign,
                        &offsetHours, &offsetMinutes),
            9)
      << iso;
  const std::int64_t days = sys_days(year(y) / month(m) / day(d)).time_since_epoch().count();
  const int offset = (offsetHours * 60 + offsetMinutes) * (sign == '-' ? -60 : 60);
  return days * 86400 + hour * 3600 + minute * 60 + second - offset;
}

TEST(SceneValueTest, DatesKeepTheirInstantInEveryZone) {
  std::mt19937_64 random(9);
  for (const char* zone : {"America/New_York", "Asia/Kathmandu", "Pacific/Kiritimati", "Pacific/Pago_Pago",
                           "Australia/Lord_Howe", "Europe/Dublin"}) {
    std::vector<Json> values;
    std::vector<std::int64_t> instants;
    for (int i = 0; i < 60; ++i) {
      const auto instant =
          std::chrono::sys_seconds(std::chrono::seconds(std::int64_t(random() % 3786912000)));  // until 2090
      const auto today = std::chrono::floor<std::chrono::days>(instant);
      const std::chrono::year_month_day date(today);
      const auto rest = (instant - today).count();
      char text[96];
      std::snprintf(text, sizeof text, "%04d-%02u-%02uT%02d:%02d:%02dZ", int(date.year()),
                    unsigned(date.month()), unsigned(date.day()), int(rest / 3600), int(rest / 60 % 60),
                    int(rest % 60));
      values.push_back({{"date", text}});
      instants.push_back(instant.time_since_epoch().count());
    }
    const Json replies = readBack(values, zone);
    for (std::size_t i = 0; i < values.size(); ++i) {
      EXPECT_EQ(instantOf(replies[i]["date"]), instants[i]) << zone << " " << values[i];
    }
    EXPECT_EQ(readBack({replies.begin(), replies.end()}, zone), replies)
        << "a reply is read as it is written";
  }
}

TEST(SceneValueTest, LocalTimesFollowTheClocks) {
  const std::pair<const char*, const char*> times[] = {
      {"2026-03-08T01:59:59", "2026-03-08T01:59:59-05:00"},
      {"2026-03-08T02:30:00", "2026-03-08T03:30:00-04:00"},  // skipped
      {"2026-11-01T00:59:59", "2026-11-01T00:59:59-04:00"},
      {"2026-11-01T01:30:00", "2026-11-01T01:30:00-05:00"},  // twice
      {"2026-11-01T01:30:00-04:00", "2026-11-01T01:30:00-04:00"},
      {"2026-12-31T23:30:00-08:00", "2027-01-01T02:30:00-05:00"},
  };
  for (const auto& [given, told] : times) {
    const Json value = {{"date", given}};
    EXPECT_EQ(readBack(std::vector<Json>{value}, "America/New_York")[0]["date"], told) << given;
  }
}

TEST(ReplyTest, AttributesAreCountedInTheBytesOfTheText) {
  const Ref<AccessibilityAttributedString> text =
      make<AccessibilityAttributedString>("\u0635 5\u203230\u2033 \U0001F6B4");
  text->setAttributeForKeyWithRange(array({number(std::int64_t(1)), string("é")}), DurationTimeMMSS, {3, 9});
  text->setAttributeForKeyWithRange(string("all"), "Tone"_key, {0, 1000});
  EXPECT_EQ(written(text),
            "{\"string\":\"\u0635 5\u203230\u2033 \U0001F6B4\",\"attributes\":["
            "{\"key\":\"DurationTimeMMSS\",\"range\":[3,9],\"value\":[1,\"é\"]},"
            "{\"key\":\"Tone\",\"range\":[0,17],\"value\":\"all\"}]}");
}

TEST(ReplyTest, WhatIsNoNumberIsNamed) {
  EXPECT_EQ(written(array({number(notANumber), number(infinity), number(-infinity)})),
            R"(["nan","inf","-inf"])");
  EXPECT_EQ(written(make<Value>(Value::Content(Rect{notANumber, -infinity, infinity, 1}))),
            R"({"rect":["nan","-inf","inf",1.0]})");
  EXPECT_EQ(written(quantity(infinity, Unit::unitFromString("kcal"))), R"({"quantity":["inf","kcal"]})");
}

TEST(ReplyTest, ClassesAndStrangersAreKnownByName) {
  EXPECT_EQ(written(Ref<Object>(&View::staticClass())), R"({"classNamed":"View"})");
  EXPECT_EQ(written(make<Object>()), R"({"id":null,"class":"Object"})");
  EXPECT_EQ(traitNames((Traits(1) << 63) | (Traits(1) << 8) | TraitButton),
            (std::vector<std::string>{"button", "bit 8", "bit 63"}));
}

}  // namespace
}  // namespace ax::reader
