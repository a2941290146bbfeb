#include <gtest/gtest.h>

#include "host/trends/TrendDetailSummaryView.h"
#include "host/trends/TrendListHeaderView.h"
#include "host/trends/TrendListMetricView.h"
#include "host/trends/TrendPairTableViewCell.h"
#include "host/trends/TrendingDownTableViewCell.h"
#include "host/trends/TrendingUpTableViewCell.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What scenes cannot show of the list of trends: rows that are used again, and what a row does to its parts.
namespace ax {

namespace {

class TrendRowsTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static Ref<Label> label(const char* text) {
    const Ref<Label> made = make<Label>();
    made->setText(string(text));
    return made;
  }
  static Ref<host::TrendListMetricView> metric(const char* title, const char* value) {
    const auto made = make<host::TrendListMetricView>();
    made->setTitleLabel(label(title));
    made->setTrendString(string("up"));
    made->setValueLabel(label(value));
    return made;
  }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .now = 1780000000}};
};

TEST_F(TrendRowsTest, AHalfStaysAButtonHoweverOftenItIsListed) {
  const auto row = make<host::TrendingUpTableViewCell>();
  const auto plainHalf = label("Stand");
  row->setLeadingView(plainHalf);
  row->setTrailingView(metric("Move", "500"));
  const Traits before = messages::accessibilityTraits(plainHalf);
  const Ref<Array> halves = messages::accessibilityElements(row);
  const Ref<Array> again = messages::accessibilityElements(row);
  EXPECT_NE(halves, again) << "made anew at each query";
  EXPECT_TRUE(halves->isEqual(*again));
  EXPECT_EQ(messages::accessibilityTraits(plainHalf), before | TraitButton) << "beside what it was";
}

TEST_F(TrendRowsTest, ARowListsTheHalvesThatItHasNow) {
  const auto row = make<host::TrendingUpTableViewCell>();
  EXPECT_TRUE(messages::accessibilityElements(row)->isEmpty());
  const auto silent = make<View>();
  const auto spoken = metric("Move", "500");
  row->setLeadingView(silent);
  row->setTrailingView(spoken);
  EXPECT_TRUE(messages::accessibilityElements(row)->isEqual(*array({spoken})));
  EXPECT_EQ(messages::accessibilityTraits(silent), 0u) << "what is not listed is left alone";
  messages::setAccessibilityLabel(silent, string("Stand"));
  EXPECT_TRUE(messages::accessibilityElements(row)->isEqual(*array({silent, spoken})));
  row->setTrailingView(nullptr);
  EXPECT_TRUE(messages::accessibilityElements(row)->isEqual(*array({silent})));
  ASSERT_TRUE(setScriptedAnswer(*row, "leadingView"_key,
                                [](auto) -> Ref<Object> { throw std::runtime_error("no half"); }));
  EXPECT_TRUE(messages::accessibilityElements(row)->isEmpty());
}

TEST_F(TrendRowsTest, APairSilencesEveryButtonThatIsInItWhenItIsLoaded) {
  const auto row = make<host::TrendPairTableViewCell>();
  const auto leading = make<View>();
  const auto inner = make<View>();
  const auto nested = make<Button>();
  nested->setTitle(string("Details"));
  inner->addSubview(nested);
  leading->addSubview(inner);
  row->setLeadingView(leading);
  row->setTrailingButton(make<Button>());
  row->trailingButton()->setTitle(string("Open"));
  row->layoutSubviews();
  EXPECT_TRUE(messages::isAccessibilityElement(nested));
  load(row);
  EXPECT_FALSE(messages::isAccessibilityElement(nested));
  EXPECT_FALSE(messages::isAccessibilityElement(row->trailingButton()));
  const auto late = make<Button>();
  late->setTitle(string("Late"));
  leading->addSubview(late);
  EXPECT_TRUE(messages::isAccessibilityElement(late));
  // What lists its elements shows only those.
  messages::setAccessibilityElements(leading, array({}));
  load(row);
  EXPECT_TRUE(messages::isAccessibilityElement(late));
}

TEST_F(TrendRowsTest, AMetricFollowsItsParts) {
  const auto made = metric("Move", "500");
  EXPECT_EQ(labelOf(made), "Move, up, 500");
  made->setTrendString(nullptr);
  EXPECT_EQ(labelOf(made), "Move, 500");
  made->titleLabel()->setText(string(""));
  EXPECT_EQ(labelOf(made), "500");
  const Ref<String> short_ = string("up");
  messages::setAccessibilityLabel(short_, string("going up"));
  made->setTrendString(short_);
  EXPECT_EQ(labelOf(made), "going up, 500");
  const auto row = make<host::TrendingDownTableViewCell>();
  row->setView(made);
  row->setDetailLabel(label("Keep going"));
  EXPECT_EQ(labelOf(row), "going up, 500, Keep going");
  const EnvironmentScope arabic(Environment{.locale = "ar_EG", .now = 1780000000});
  EXPECT_EQ(labelOf(row), "going up، 500، Keep going");
}

TEST_F(TrendRowsTest, HeadingsAreLeftToTheHeadingsAndTextsToTheTexts) {
  const auto summary = make<host::TrendDetailSummaryView>();
  summary->setTitleLabel(label("Move"));
  summary->setSummaryLabel(label("You are up"));
  summary->setCoachingLabel(label("Keep going"));
  EXPECT_EQ(labelOf(summary), "") << "nothing is shown yet";
  messages::layoutSubviews(summary);
  EXPECT_EQ(labelOf(summary), "You are up, Keep going");
  summary->summaryLabel()->setHidden(true);
  EXPECT_EQ(labelOf(summary), "Keep going");

  const auto header = make<host::TrendListHeaderView>();
  header->setTitleLabel(label("Trending up"));
  header->setLinkView(label("About"));
  messages::layoutSubviews(header);
  EXPECT_EQ(labelOf(header), "Trending up");
  _accessibilityAddTrait(header->linkView(), TraitHeader);
  EXPECT_EQ(labelOf(header), "Trending up, About");
}

}  // namespace

}  // namespace ax
