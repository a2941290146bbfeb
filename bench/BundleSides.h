#pragma once

#include <string>
#include <vector>

#include "bench/Report.h"
#include "platform/toolkit/View.h"

// What the bundle describes, beside the same work written directly. It is measured after everything else,
// because the bundle changes the classes of this process for good.
namespace bench {

// False when the bundle is not built; nothing is added then.
bool openBundleForSides(const std::string& program);

// Each source's sides; they need the open bundle.
void addChartSides();
void addSliceSides();
void addMonthSides();
void addSoundSides();

// A trend of that many days, laid out.
ax::Ref<ax::View> trendChart(int bars);

// After the run.
void compareBundleSides(std::vector<Row>& rows);

// Of one month, read again after it has been read once.
double formattersMadeByWarmMonth();

// Everything is said of this moment: noon of 2026-03-10 in New York.
inline constexpr double benchNow = 1773158400;
inline constexpr double benchDay = 86400;

inline constexpr int standSizes[] = {24, 10'000};
inline constexpr int trendSizes[] = {365, 10'000};
inline constexpr int readingSizes[] = {10'000, 100'000};
inline constexpr int soundSizes[] = {24, 30, 10'000};
inline constexpr int monthSizes[] = {42, 420, 4'200};

inline std::string sized(const char* what, int size) {
  return what + std::to_string(size);
}

}  // namespace bench
