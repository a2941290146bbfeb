#pragma once

#include <array>
#include <string_view>

#include "platform/accessibility/CategoryRegistration.h"

namespace ax {

// A category and the screen that it speaks for.
struct InstallationRow {
  std::string_view category;
  std::string_view screen;

  consteval InstallationRow(std::string_view categoryName, std::string_view screenName)
      : category(categoryName), screen(screenName) {
    if (categoryName.empty() || screenName.empty()) throw "a category has a name and a screen";
  }
};

// The categories in the order in which they are installed.
inline constexpr std::array<InstallationRow, 65> installationList = {{
    {"CHWorkoutsListSummaryTableViewCellAccessibility", "Workout list"},
    {"CHAchievementsCellContentViewAccessibility", "Achievements"},
    {"TrendPairTableViewCellAccessibility", "Trends"},
    {"FriendListSortTableViewCellAccessibility", "Friend list"},
    {"DayViewActivityRingsTableViewCellAccessibility", "Day detail"},
    {"TrendDetailDailyAverageViewAccessibility", "Trend detail"},
    {"TrendDetailChartViewAccessibility", "Trend detail"},
    {"TrendDetailSummaryViewAccessibility", "Trend detail"},
    {"TrendListHeaderViewAccessibility", "Trends"},
    {"TrendingDownTableViewCellAccessibility", "Trends"},
    {"TrendListMetricViewAccessibility", "Trends"},
    {"TrendingUpTableViewCellAccessibility", "Trends"},
    {"DayViewStandChartTableViewCellAccessibility", "Day detail"},
    {"ActivityStandChartViewAccessibility", "Day detail"},
    {"DayViewMoveAndExerciseChartTableViewCellAccessibility", "Day detail"},
    {"ActivityMoveAndExerciseChartViewAccessibility", "Day detail"},
    {"CHFriendListCompetitionTableViewCellAccessibility", "Friend list"},
    {"CHNoHeartRateDataViewControllerAccessibility", "Workout detail"},
    {"CHFriendInboxTableViewControllerAccessibility", "Friend inbox"},
    {"CHFriendListViewControllerAccessibility", "Friend list"},
    {"CHWorkoutDetailHeartRateChartTableViewCellAccessibility", "Workout detail"},
    {"CHWorkoutDetailHeartRateChartViewAccessibility", "Workout detail"},
    {"CHFriendListTableViewCellAccessibility", "Friend list"},
    {"CHAchievementsSectionHeaderViewAccessibility", "Achievements"},
    {"CHWorkoutsListTableViewCellAccessibility", "Workout list"},
    {"CHFriendInboxBarButtonViewAccessibility", "Friend list"},
    {"CHFriendDetailCollectionViewControllerAccessibility", "Friend detail"},
    {"CHFriendDetailActionCellAccessibility", "Friend detail"},
    {"CHFriendDetailGoalCellAccessibility", "Friend detail"},
    {"CHAchievementCollectionViewCellAccessibility", "Achievements"},
    {"_CHWorkoutDetailWeatherViewAccessibility", "Workout detail"},
    {"CHWorkoutDetailMapViewAccessibility", "Workout detail"},
    {"CHWorkoutDetailExpandingHeaderViewAccessibility", "Workout detail"},
    {"CHWorkoutListTableHeaderViewAccessibility", "Workout list"},
    {"_CHWorkoutSummaryTabbedLabelContainerAccessibility", "Workout detail"},
    {"CHWorkoutSummaryTableViewCellAccessibility", "Workout detail"},
    {"PaletteViewControllerAccessibility", "Week palette"},
    {"CHAchievementDetailTransitionAnimatorAccessibility", "Achievement detail"},
    {"CHWorkoutDetailMapAndWeatherTableViewCellAccessibility", "Workout detail"},
    {"CHWorkoutDetailTwoValueTableViewCellAccessibility", "Workout detail"},
    {"CHWorkoutDetailPaceTableViewCellAccessibility", "Workout detail"},
    {"CHWorkoutDetailSplitTableViewCellAccessibility", "Workout detail"},
    {"CHWorkoutFormattingManagerAccessibility", "Workout list"},
    {"_VeltoMonthTitleLabelAccessibility", "Month calendar"},
    {"VeltoUIScrollViewAccessibility", "Every screen"},
    {"MonthScrollViewControllerAccessibility", "Month calendar"},
    {"LoadingViewAccessibility", "Loading"},
    {"MoveChartDetailCellAccessibility", "Day detail"},
    {"ExerciseChartDetailCellAccessibility", "Day detail"},
    {"CHAchievementDetailViewControllerAccessibility", "Achievement detail"},
    {"VeltoUIButtonAccessibility", "Every screen"},
    {"ActivityActiveHoursChartAccessibility", "Day detail"},
    {"ActivityQuantityChartAccessibility", "Day detail"},
    {"ChartDetailCellAccessibility", "Day detail"},
    {"VeltoUIPageControlAccessibility", "Every screen"},
    {"StepsDistanceCellAccessibility", "Day detail"},
    {"DayPagingViewControllerAccessibility", "Day detail"},
    {"MonthViewControllerAccessibility", "Month calendar"},
    {"MonthDayCellLayerAccessibility", "Month calendar"},
    {"MonthWeekViewAccessibility", "Month calendar"},
    {"_PairedLabelsAccessibility", "Day detail"},
    {"PaletteWeekdayHeaderViewAccessibility", "Week palette"},
    {"WeekPaletteTappableDayAccessibility", "Week palette"},
    {"ActivityThreeRingCellAccessibility", "Day list"},
    {"AX_VeltoNSStringAccessibility", "Every screen"},
}};

// Of the category that a class stands for. C++ keeps names that begin with an underscore and a capital to
// itself, so the class leaves the underscore off.
consteval std::size_t placeInInstallationList(std::string_view className) {
  for (std::size_t i = 0; i < installationList.size(); ++i) {
    const std::string_view name = installationList[i].category;
    if (name == className || (name.front() == '_' && name.substr(1) == className)) return i;
  }
  throw "the category stands in no row of the installation list";
}

// The category in that row; its source file defines it, with AX_CATEGORY, or the module does not link.
template <std::size_t Place>
const CategoryRecord& categoryAt();

}  // namespace ax
