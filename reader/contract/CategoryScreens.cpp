#include "reader/contract/CategoryScreens.h"

#include <array>

namespace ax::reader {

namespace {

struct Row {
  std::string_view category;
  std::string_view screen;
};

// In the order of installation.
constexpr std::array rows = {
    Row{"", "Month calendar"},
    Row{"", "Week palette"},
    Row{"", "Day list"},
    Row{"CHWorkoutsListSummaryTableViewCellAccessibility", "Workout list"},
    Row{"CHAchievementsCellContentViewAccessibility", "Achievements"},
    Row{"TrendPairTableViewCellAccessibility", "Trends"},
    Row{"FriendListSortTableViewCellAccessibility", "Friend list"},
    Row{"DayViewActivityRingsTableViewCellAccessibility", "Day detail"},
    Row{"TrendDetailDailyAverageViewAccessibility", "Trend detail"},
    Row{"TrendDetailChartViewAccessibility", "Trend detail"},
    Row{"TrendDetailSummaryViewAccessibility", "Trend detail"},
    Row{"TrendListHeaderViewAccessibility", "Trends"},
    Row{"TrendingDownTableViewCellAccessibility", "Trends"},
    Row{"TrendListMetricViewAccessibility", "Trends"},
    Row{"TrendingUpTableViewCellAccessibility", "Trends"},
    Row{"DayViewStandChartTableViewCellAccessibility", "Day detail"},
    Row{"ActivityStandChartViewAccessibility", "Day detail"},
    Row{"DayViewMoveAndExerciseChartTableViewCellAccessibility", "Day detail"},
    Row{"ActivityMoveAndExerciseChartViewAccessibility", "Day detail"},
    Row{"CHFriendListCompetitionTableViewCellAccessibility", "Friend list"},
    Row{"CHNoHeartRateDataViewControllerAccessibility", "Workout detail"},
    Row{"CHFriendInboxTableViewControllerAccessibility", "Friend inbox"},
    Row{"CHFriendListViewControllerAccessibility", "Friend list"},
    Row{"CHWorkoutDetailHeartRateChartTableViewCellAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailHeartRateChartViewAccessibility", "Workout detail"},
    Row{"CHFriendListTableViewCellAccessibility", "Friend list"},
    Row{"CHAchievementsSectionHeaderViewAccessibility", "Achievements"},
    Row{"CHWorkoutsListTableViewCellAccessibility", "Workout list"},
    Row{"CHFriendInboxBarButtonViewAccessibility", "Friend list"},
    Row{"CHFriendDetailCollectionViewControllerAccessibility", "Friend detail"},
    Row{"CHFriendDetailActionCellAccessibility", "Friend detail"},
    Row{"CHFriendDetailGoalCellAccessibility", "Friend detail"},
    Row{"CHAchievementCollectionViewCellAccessibility", "Achievements"},
    Row{"_CHWorkoutDetailWeatherViewAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailMapViewAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailExpandingHeaderViewAccessibility", "Workout detail"},
    Row{"CHWorkoutListTableHeaderViewAccessibility", "Workout list"},
    Row{"_CHWorkoutSummaryTabbedLabelContainerAccessibility", "Workout detail"},
    Row{"CHWorkoutSummaryTableViewCellAccessibility", "Workout detail"},
    Row{"PaletteViewControllerAccessibility", "Week palette"},
    Row{"CHAchievementDetailTransitionAnimatorAccessibility", "Achievement detail"},
    Row{"CHWorkoutDetailMapAndWeatherTableViewCellAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailTwoValueTableViewCellAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailPaceTableViewCellAccessibility", "Workout detail"},
    Row{"CHWorkoutDetailSplitTableViewCellAccessibility", "Workout detail"},
    Row{"CHWorkoutFormattingManagerAccessibility", "Workout list"},
    Row{"_VeltoMonthTitleLabelAccessibility", "Month calendar"},
    Row{"VeltoUIScrollViewAccessibility", "Every screen"},
    Row{"MonthScrollViewControllerAccessibility", "Month calendar"},
    Row{"LoadingViewAccessibility", "Loading"},
    Row{"MoveChartDetailCellAccessibility", "Day detail"},
    Row{"ExerciseChartDetailCellAccessibility", "Day detail"},
    Row{"CHAchievementDetailViewControllerAccessibility", "Achievement detail"},
    Row{"VeltoUIButtonAccessibility", "Every screen"},
    Row{"ActivityActiveHoursChartAccessibility", "Day detail"},
    Row{"ActivityQuantityChartAccessibility", "Day detail"},
    Row{"ChartDetailCellAccessibility", "Day detail"},
    Row{"VeltoUIPageControlAccessibility", "Every screen"},
    Row{"StepsDistanceCellAccessibility", "Day detail"},
    Row{"DayPagingViewControllerAccessibility", "Day detail"},
    Row{"MonthViewControllerAccessibility", "Month calendar"},
    Row{"MonthDayCellLayerAccessibility", "Month calendar"},
    Row{"MonthWeekViewAccessibility", "Month calendar"},
    Row{"_PairedLabelsAccessibility", "Day detail"},
    Row{"PaletteWeekdayHeaderViewAccessibility", "Week palette"},
    Row{"WeekPaletteTappableDayAccessibility", "Week palette"},
    Row{"ActivityThreeRingCellAccessibility", "Day list"},
    Row{"AX_VeltoNSStringAccessibility", "Every screen"},
};

}  // namespace

std::vector<std::string> screensOfCategory(std::string_view category) {
  std::vector<std::string> screens;
  for (const Row& row : rows) {
    if (row.category == category) screens.emplace_back(row.screen);
  }
  return screens;
}

}  // namespace ax::reader
